#include "number_format.h"

#include <array>
#include <charconv>
#include <cmath>

namespace swatchlog {
namespace {

std::string NonFinite(double value) {
    if (std::isnan(value)) {
        return "nan";
    }
    return value < 0 ? "-inf" : "inf";
}

} // namespace

std::string FormatFixed(double value, int decimals) {
    if (!std::isfinite(value)) {
        return NonFinite(value);
    }
    std::array<char, 400> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value,
                                      std::chars_format::fixed, decimals);
    std::string text(buffer.data(), result.ptr);
    // "-0.00" reads badly in a table; a value that rounds to zero is shown unsigned.
    if (text[0] == '-' && text.find_first_not_of("-0.") == std::string::npos) {
        text.erase(0, 1);
    }
    return text;
}

double RoundToDecimals(double value, int decimals) {
    if (!std::isfinite(value)) {
        return value;
    }
    const std::string text = FormatFixed(value, decimals);
    double rounded = value;
    std::from_chars(text.data(), text.data() + text.size(), rounded);
    return rounded;
}

std::string FormatShortest(double value) {
    if (!std::isfinite(value)) {
        return NonFinite(value);
    }
    std::array<char, 64> buffer{};
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
    return std::string(buffer.data(), result.ptr);
}

} // namespace swatchlog
