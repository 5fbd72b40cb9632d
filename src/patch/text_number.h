// Whole numbers in header values and spectral field names.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace text_number {

/// Reads a decimal integer the way the standard string-to-long conversion does:
/// leading white space, an optional sign, then digits up to the first other
/// character. Throws std::invalid_argument("invalid stol argument") when no digit
/// follows, and std::out_of_range("stol argument out of range") for a value
/// outside the signed 32-bit range.
int ParseLongStrict(const std::string& text);

/// The same reading, but a text without digits gives 0 and a value outside the
/// signed 32-bit range is clamped to it. Never throws.
int ParseIntLenient(const std::string& text);

/// The same reading without exceptions: nothing when no digit follows or the
/// value lies outside the signed 32-bit range.
std::optional<int> ReadInt(std::string_view text);

} // namespace text_number
