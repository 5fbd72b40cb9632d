#include "it8/write/number_format.h"

#include <charconv>
#include <system_error>

namespace it8 {
namespace {

// std::to_chars is defined to give the same text as printf in the classic
// locale and never looks at the process locale. The buffer grows until the
// text fits (fixed notation of a large value can need hundreds of digits).
template <typename... Format> std::string ToChars(double value, Format... format) {
    std::string buffer(64, '\0');
    for (;;) {
        const auto result =
            std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, format...);
        if (result.ec == std::errc()) {
            buffer.resize(static_cast<std::size_t>(result.ptr - buffer.data()));
            return buffer;
        }
        buffer.resize(buffer.size() * 2);
    }
}

} // namespace

std::string FormatFixed(double value, int decimals) {
    return ToChars(value, std::chars_format::fixed, decimals);
}

std::string FormatFixedWidth(double value, int width, int decimals) {
    std::string text = FormatFixed(value, decimals);
    if (width > 0 && text.size() < static_cast<std::size_t>(width)) {
        text.insert(0, static_cast<std::size_t>(width) - text.size(), ' ');
    }
    return text;
}

std::string FormatGeneral(double value) {
    return ToChars(value, std::chars_format::general, 6);
}

std::string FormatInteger(long long value) {
    return std::to_string(value);
}

} // namespace it8
