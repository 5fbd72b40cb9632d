#include "patch/field_wavelength.h"

#include <array>

#include "patch/text_number.h"

namespace field_wavelength {

const char* MarkerIn(const std::string& name) {
    static constexpr std::array<const char*, 3> kMarkers{"SPECTRAL_NM_", "SPECTRAL_", "NM"};
    for (const char* marker : kMarkers) {
        if (name.find(marker) != std::string::npos) {
            return marker;
        }
    }
    return nullptr;
}

std::optional<int> WavelengthIn(const std::string& name, std::string_view marker) {
    const std::size_t at = name.find(marker.data(), 0, marker.size());
    if (at == std::string::npos) {
        return std::nullopt;
    }
    // The usual lead-in form is read in place; a marker elsewhere ("380NM") is
    // cut out of a copy first.
    if (at == 0) {
        return text_number::ReadInt(std::string_view(name).substr(marker.size()));
    }
    std::string rest = name;
    rest.erase(at, marker.size());
    return text_number::ReadInt(rest);
}

} // namespace field_wavelength
