// Spectra handed in by the host, and the XYZ, L*a*b* and densities the colour
// engine computes from them.
#include <algorithm>

#include "chart/spectral_field_name.h"
#include "huekit.h"
#include "patch/text_number.h"
#include "redavudeva/swatchlog_base.h"

namespace {

// Fills `buffer` with the spectrum's values in field-name order. Positions the
// spectrum does not reach read as 0; values beyond the buffer are not passed.
void FillValueBuffer(const std::map<std::string, double>& spectrum, std::vector<float>& buffer) {
    std::fill(buffer.begin(), buffer.end(), 0.0f);
    std::size_t position = 0;
    for (const auto& field : spectrum) {
        if (position == buffer.size()) {
            break;
        }
        buffer[position++] = static_cast<float>(field.second);
    }
}

} // namespace

void CSwatchlogBase::SetSpectralDataList(const std::vector<std::map<std::string, double>>& list,
                                         bool compute) {
    spectralList = list;
    if (!compute) {
        return;
    }
    xyzList.clear();
    labList.clear();
    densityList.clear();
    if (list.empty() || list.front().empty()) {
        return;
    }
    // Every spectrum is taken on the grid of the first one.
    const auto wavelengthText = spectral_field_name::WavelengthText(list.front().begin()->first);
    if (!wavelengthText) {
        return;
    }
    const int startNm = text_number::ParseIntLenient(*wavelengthText);
    const std::size_t valueCount = list.front().size();
    const int engineCount = static_cast<int>(valueCount);
    std::vector<float> values(valueCount);

    for (const auto& spectrum : list) {
        FillValueBuffer(spectrum, values);

        float engineXyz[3] = {};
        if (HUEKIT_fromSpectralToCIEXYZ(values.data(), startNm, engineCount, engineXyz) != 0) {
            continue;
        }
        const tagXYZ xyz{engineXyz[0], engineXyz[1], engineXyz[2]};
        // The Lab conversion takes XYZ with white at Y = 1.
        const float scaledXyz[3] = {static_cast<float>(xyz.x / 100.0),
                                    static_cast<float>(xyz.y / 100.0),
                                    static_cast<float>(xyz.z / 100.0)};
        float engineLab[3] = {};
        if (HUEKIT_fromCIEXYZToCIELAB(scaledXyz, engineLab) != 0) {
            continue;
        }
        float engineDensity[4] = {};
        if (HUEKIT_fromSpectralToDensity(values.data(), startNm, engineCount, engineDensity, 0) !=
            0) {
            continue;
        }
        xyzList.push_back(xyz);
        labList.push_back(tagLAB{engineLab[0], engineLab[1], engineLab[2]});
        densityList.push_back(tagDENSITY{engineDensity[0], engineDensity[1], engineDensity[2],
                                         engineDensity[3], 0.0});
    }
}
