// Spectra handed in by the host, and the XYZ, L*a*b* and densities the colour
// engine computes from them.
#include <optional>
#include <utility>

#include "chart/spectral_field_name.h"
#include "huekit.h"
#include "patch/engine_spectrum.h"
#include "patch/text_number.h"
#include "redavudeva/swatchlog_base.h"

namespace {

// One spectrum on the engine's grid, each value placed at the wavelength its own
// field name gives. Nothing when a name carries no readable wavelength or the
// spectrum cannot give colour.
std::optional<engine_spectrum::EngineSpectrum>
OnEngineGrid(const std::map<std::string, double>& spectrum) {
    std::vector<engine_spectrum::Sample> samples;
    samples.reserve(spectrum.size());
    for (const auto& [name, value] : spectrum) {
        const auto text = spectral_field_name::WavelengthText(name);
        const std::optional<int> nm = text ? text_number::ReadInt(*text) : std::nullopt;
        if (!nm) {
            return std::nullopt;
        }
        samples.push_back(engine_spectrum::Sample{*nm, value});
    }
    engine_spectrum::EngineSpectrum result;
    if (!engine_spectrum::Resample(std::move(samples), result)) {
        return std::nullopt;
    }
    return result;
}

} // namespace

// Each spectrum is taken on its own wavelengths: 10 nm values within 380..780 nm
// go to the engine unchanged, any other grid or range is resampled first, and a
// spectrum that cannot give colour is skipped like one the engine refuses.
void CSwatchlogBase::SetSpectralDataList(const std::vector<std::map<std::string, double>>& list,
                                         bool compute) {
    spectralList = list;
    if (!compute) {
        return;
    }
    xyzList.clear();
    labList.clear();
    densityList.clear();
    for (const auto& spectrum : list) {
        const auto onGrid = OnEngineGrid(spectrum);
        tagXYZ xyz;
        if (!onGrid || !engine_spectrum::ToXYZ(*onGrid, xyz)) {
            continue;
        }
        // The Lab conversion takes XYZ with white at Y = 1.
        const float scaledXyz[3] = {static_cast<float>(xyz.x / 100.0),
                                    static_cast<float>(xyz.y / 100.0),
                                    static_cast<float>(xyz.z / 100.0)};
        float engineLab[3] = {};
        if (HUEKIT_fromCIEXYZToCIELAB(scaledXyz, engineLab) != 0) {
            continue;
        }
        tagDENSITY density; // majorFilter stays 0.0
        if (!engine_spectrum::ToDensities(*onGrid, density)) {
            continue;
        }
        xyzList.push_back(xyz);
        labList.push_back(tagLAB{engineLab[0], engineLab[1], engineLab[2]});
        densityList.push_back(density);
    }
}
