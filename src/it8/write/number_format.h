// Locale-free number texts for chart files.
//
// Chart files always carry a decimal point, whatever the process locale says,
// so every writer formats its numbers through these functions instead of
// printf or a default-imbued stream. The Into forms write into a caller's
// buffer, as std::to_chars does, for writers that format many numbers.
#pragma once

#include <cstddef>
#include <string>

namespace it8 {

/// Fixed notation with `decimals` digits after the point, as "%.<decimals>f" in
/// the classic locale: FormatFixed(41.254, 2) is "41.25".
std::string FormatFixed(double value, int decimals);

/// Writes FormatFixed(value, decimals) to [out, out + room) and returns the end
/// of the text, or nullptr when the text does not fit there.
char* FormatFixedInto(char* out, std::size_t room, double value, int decimals);

/// Fixed notation right-aligned with spaces to at least `width` characters, as
/// "%<width>.<decimals>f": FormatFixedWidth(41.25, 9, 2) is "    41.25".
std::string FormatFixedWidth(double value, int width, int decimals);

/// Six significant digits in general notation, as "%g" and as a text stream's
/// default: 50 gives "50", 0.1234567 gives "0.123457", 1e-5 gives "1e-05".
std::string FormatGeneral(double value);

/// Decimal integer, as "%d".
std::string FormatInteger(long long value);

/// Writes FormatInteger(value) to [out, out + room) and returns the end of the
/// text, or nullptr when the text does not fit there.
char* FormatIntegerInto(char* out, std::size_t room, long long value);

} // namespace it8
