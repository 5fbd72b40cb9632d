// The chart's spectra and the wavelength grid their field names describe.
#include <algorithm>
#include <cstdint>
#include <limits>

#include "chart/spectral_field_name.h"
#include "patch/text_number.h"
#include "redavudeva/swatchlog_base.h"

std::vector<std::map<std::string, double>> CSwatchlogBase::GetSpectralDataList() {
    std::vector<std::map<std::string, double>> list;
    if (!hasSpectral) {
        return list;
    }
    list.reserve(patches.size());
    for (const auto& entry : patches) {
        list.push_back(entry.second.GetSpectralData());
    }
    return list;
}

SpectralRangeStruct CSwatchlogBase::GetSpectralRange() {
    if (!hasSpectral || patches.empty()) {
        return SpectralRangeStruct{};
    }
    return AnalyseSpectralKeys(patches.begin()->second.GetSpectralData());
}

// Start from the first field name, end from the last (in byte order of the
// names), count from the number of fields. A name whose wavelength text does not
// start with a number raises the conversion's exception.
SpectralRangeStruct
CSwatchlogBase::AnalyseSpectralKeys(const std::map<std::string, double>& spectral) {
    SpectralRangeStruct range;
    if (spectral.empty()) {
        return range;
    }
    const auto firstText = spectral_field_name::WavelengthText(spectral.begin()->first);
    if (!firstText) {
        return range;
    }
    range.startNm = text_number::ParseLongStrict(*firstText);
    range.count =
        static_cast<int>(std::min<std::size_t>(spectral.size(), std::numeric_limits<int>::max()));

    const auto lastText = spectral_field_name::WavelengthText(spectral.rbegin()->first);
    if (!lastText) {
        return range;
    }
    const int last = text_number::ParseLongStrict(*lastText);
    // One field gives no step. The difference is taken in 64 bits so that
    // extreme wavelengths cannot overflow.
    if (range.count > 1) {
        const std::int64_t step =
            (std::int64_t{last} - range.startNm) / (std::int64_t{range.count} - 1);
        range.stepNm = static_cast<int>(std::clamp<std::int64_t>(
            step, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()));
    }
    return range;
}
