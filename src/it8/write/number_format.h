// Locale-free number texts for chart files.
//
// Chart files always carry a decimal point, whatever the process locale says,
// so every writer formats its numbers through these functions instead of
// printf or a default-imbued stream.
#pragma once

#include <string>

namespace it8 {

/// Fixed notation with `decimals` digits after the point, as "%.<decimals>f" in
/// the classic locale: FormatFixed(41.254, 2) is "41.25".
std::string FormatFixed(double value, int decimals);

/// Fixed notation right-aligned with spaces to at least `width` characters, as
/// "%<width>.<decimals>f": FormatFixedWidth(41.25, 9, 2) is "    41.25".
std::string FormatFixedWidth(double value, int width, int decimals);

/// Six significant digits in general notation, as "%g" and as a text stream's
/// default: 50 gives "50", 0.1234567 gives "0.123457", 1e-5 gives "1e-05".
std::string FormatGeneral(double value);

/// Decimal integer, as "%d".
std::string FormatInteger(long long value);

} // namespace it8
