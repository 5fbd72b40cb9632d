#include "chart/spectral_field_name.h"

#include <algorithm>

namespace spectral_field_name {

std::optional<std::string> WavelengthText(const std::string& name) {
    std::string text = name;
    for (const char* leadIn : {"SPECTRAL_NM_", "SPECTRAL_"}) {
        const std::string::size_type at = text.find(leadIn);
        if (at != std::string::npos) {
            return text.erase(at, std::char_traits<char>::length(leadIn));
        }
    }
    // The reader upper-cases field names, so "nm380" reaches the store as
    // "NM380"; both spellings name the same wavelength.
    const std::string::size_type lower = text.find("nm");
    const std::string::size_type upper = text.find("NM");
    const std::string::size_type at = std::min(lower, upper);
    if (at != std::string::npos) {
        return text.erase(at, 2);
    }
    return std::nullopt;
}

} // namespace spectral_field_name
