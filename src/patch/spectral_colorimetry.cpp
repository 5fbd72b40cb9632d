// CColorPatch: tristimulus values from a spectrum (built-in tables or the colour
// engine) and XYZ from Lab through the colour engine.
#include <array>
#include <cstddef>

#include "huekit.h"
#include "patch/colorimetry_tables.h"
#include "redavudeva/color_patch.h"

namespace {

// The largest spectrum a patch holds (SpectralDataStruct::values).
constexpr int kMaxSpectralValues = 50;

// The patch's spectrum as single-precision floats for the colour engine.
// Answers false for a count the spectrum record cannot hold.
bool ToEngineSpectrum(const SpectralDataStruct& spectral,
                      std::array<float, kMaxSpectralValues>& buffer) {
    if (spectral.count < 1 || spectral.count > kMaxSpectralValues) {
        return false;
    }
    for (int i = 0; i < spectral.count; ++i) {
        buffer[static_cast<std::size_t>(i)] = static_cast<float>(spectral.values[i]);
    }
    return true;
}

} // namespace

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

bool CColorPatch::calculateXYZ() {
    std::array<float, kMaxSpectralValues> spectrum{};
    if (!ToEngineSpectrum(m_spectral, spectrum)) {
        return false;
    }
    float xyz[3] = {};
    if (HUEKIT_fromSpectralToCIEXYZ(spectrum.data(), m_spectral.startNm, m_spectral.count, xyz) !=
        0) {
        return false;
    }
    m_XYZ.x = xyz[0];
    m_XYZ.y = xyz[1];
    m_XYZ.z = xyz[2];
    return true;
}

bool CColorPatch::calculateDensities() {
    std::array<float, kMaxSpectralValues> spectrum{};
    if (!ToEngineSpectrum(m_spectral, spectrum)) {
        return false;
    }
    float density[4] = {};
    if (HUEKIT_fromSpectralToDensity(spectrum.data(), m_spectral.startNm, m_spectral.count, density,
                                     0) != 0) {
        return false;
    }
    m_density.red = density[0];
    m_density.green = density[1];
    m_density.blue = density[2];
    m_density.visual = density[3];
    return true;
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
