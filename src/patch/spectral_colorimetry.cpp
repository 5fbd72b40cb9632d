// CColorPatch: tristimulus values from a spectrum (built-in tables or the colour
// engine) and XYZ from Lab through the colour engine.
#include <cstddef>

#include "huekit.h"
#include "patch/colorimetry_tables.h"
#include "patch/engine_spectrum.h"
#include "redavudeva/color_patch.h"

namespace engine_spectrum {

bool ToXYZ(const EngineSpectrum& spectrum, tagXYZ& xyz) {
    float out[3] = {};
    if (HUEKIT_fromSpectralToCIEXYZ(spectrum.values.data(), spectrum.startNm, spectrum.count,
                                    out) != 0) {
        return false;
    }
    xyz.x = out[0];
    xyz.y = out[1];
    xyz.z = out[2];
    return true;
}

bool ToDensities(const EngineSpectrum& spectrum, tagDENSITY& density) {
    float out[4] = {};
    if (HUEKIT_fromSpectralToDensity(spectrum.values.data(), spectrum.startNm, spectrum.count, out,
                                     0) != 0) {
        return false;
    }
    density.red = out[0];
    density.green = out[1];
    density.blue = out[2];
    density.visual = out[3];
    return true;
}

} // namespace engine_spectrum

void CColorPatch::getXYZ(double* xyzOut, const double* spectrum, int type) {
    const colorimetry::WeightingSet* set = colorimetry::WeightingSetForType(type);
    if (set == nullptr) {
        return;
    }
    const double norm =
        m_normWeighting[static_cast<std::size_t>(colorimetry::NormWeightingIndexForType(type))];
    for (std::size_t axis = 0; axis < 3; ++axis) {
        double sum = 0.0;
        for (std::size_t i = 0; i < colorimetry::kGridCount; ++i) {
            sum += spectrum[i] * (*set)[axis][i];
        }
        xyzOut[axis] = 100.0 * sum / norm;
    }
}

void CColorPatch::computeNormWeighting() {
    for (std::size_t i = 0; i < colorimetry::kNormWeighting.size(); ++i) {
        m_normWeighting[i] = colorimetry::kNormWeighting[i];
    }
}

// The spectrum goes to the engine on its 10 nm grid (see engine_spectrum.h);
// one that cannot give colour derives nothing.
bool CColorPatch::calculateXYZ() {
    engine_spectrum::EngineSpectrum spectrum;
    return engine_spectrum::FromPatchSpectrum(m_spectralData, m_spectral, m_bSpectralOnEngineGrid,
                                              spectrum) &&
           engine_spectrum::ToXYZ(spectrum, m_XYZ);
}

bool CColorPatch::calculateDensities() {
    engine_spectrum::EngineSpectrum spectrum;
    return engine_spectrum::FromPatchSpectrum(m_spectralData, m_spectral, m_bSpectralOnEngineGrid,
                                              spectrum) &&
           engine_spectrum::ToDensities(spectrum, m_density);
}

bool CColorPatch::convertLabToXYZ() {
    if (!m_bLAB) {
        return false;
    }
    const float lab[3] = {static_cast<float>(m_LAB.l), static_cast<float>(m_LAB.a),
                          static_cast<float>(m_LAB.b)};
    float xyz[3] = {};
    if (HUEKIT_fromCIELABToCIEXYZ(lab, xyz) != 0) {
        return false;
    }
    m_XYZ.x = xyz[0] * 100.0;
    m_XYZ.y = xyz[1] * 100.0;
    m_XYZ.z = xyz[2] * 100.0;
    return true;
}
