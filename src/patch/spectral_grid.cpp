// CColorPatch: laying the spectral map out on its wavelength grid.
#include <cstddef>
#include <cstdint>
#include <limits>
#include <stdexcept>
#include <string>
#include <string_view>

#include "patch/engine_spectrum.h"
#include "patch/field_wavelength.h"
#include "patch/text_number.h"
#include "redavudeva/color_patch.h"

namespace {

constexpr std::size_t kGridCapacity = sizeof(SpectralDataStruct::values) / sizeof(double);

// The first marker that occurs anywhere in `key`; out_of_range when none does.
const char* ChooseMarker(const std::string& key) {
    const char* marker = field_wavelength::MarkerIn(key);
    if (marker == nullptr) {
        throw std::out_of_range("invalid string position");
    }
    return marker;
}

// The wavelength named by `key`: the key with the first occurrence of `marker`
// removed, read as a decimal integer. Throws out_of_range("invalid string
// position") when the marker is absent, and the number reader's invalid_argument
// or out_of_range when no digits follow or the number is too large.
int WavelengthOf(const std::string& key, std::string_view marker) {
    if (const auto nm = field_wavelength::WavelengthIn(key, marker)) {
        return *nm;
    }
    const std::size_t at = key.find(marker.data(), 0, marker.size());
    if (at == std::string::npos) {
        throw std::out_of_range("invalid string position");
    }
    std::string rest = key;
    rest.erase(at, marker.size());
    return text_number::ParseLongStrict(rest);
}

// (greatest - least) / (count - 1), truncated toward zero; 0 for a single value,
// where no step can be derived. Worked in 64 bits and clamped so that extreme
// wavelengths in malformed names cannot overflow.
int StepBetween(int least, int greatest, int count) {
    if (count < 2) {
        return 0;
    }
    const std::int64_t step = (std::int64_t{greatest} - least) / (count - 1);
    if (step > std::numeric_limits<int>::max()) {
        return std::numeric_limits<int>::max();
    }
    if (step < std::numeric_limits<int>::min()) {
        return std::numeric_limits<int>::min();
    }
    return static_cast<int>(step);
}

} // namespace

// Values are taken in ascending key order; at most the first 50 fit the grid and
// the rest are dropped, so the grid's greatest wavelength is that of the last
// value kept. The patch is changed only when every kept name could be read.
void CColorPatch::SetSpectralDataStruct() {
    if (m_spectralData.empty()) {
        return;
    }
    SpectralDataStruct grid;
    const std::string* leastKey = nullptr;
    const std::string* greatestKey = nullptr;
    // In the same walk: can the values go to the engine as they are?
    engine_spectrum::NameWatch names(m_spectralData.begin()->first);
    for (const auto& entry : m_spectralData) {
        if (static_cast<std::size_t>(grid.count) == kGridCapacity) {
            break;
        }
        grid.values[grid.count] = entry.second;
        ++grid.count;
        names.See(entry.first);
        if (leastKey == nullptr) {
            leastKey = &entry.first;
        }
        greatestKey = &entry.first;
    }

    const char* marker = ChooseMarker(*greatestKey);
    const int greatestNm = WavelengthOf(*greatestKey, marker);
    const int leastNm = WavelengthOf(*leastKey, marker);
    grid.startNm = leastNm;
    grid.stepNm = StepBetween(leastNm, greatestNm, grid.count);

    m_spectral = grid;
    m_bSpectral = true;
    m_bSpectralOnEngineGrid =
        static_cast<std::size_t>(grid.count) == m_spectralData.size() &&
        names.OnEngineGrid(*leastKey, *greatestKey, marker, grid.values, grid.count);
}
