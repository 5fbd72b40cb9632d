// Numbers as text with a decimal point, whatever the process locale says.
#pragma once

#include <string>

namespace swatchlog {

/// `value` with exactly `decimals` digits after the point ("nan", "inf", "-inf" otherwise).
std::string FormatFixed(double value, int decimals);
/// `value` rounded to `decimals` places as its fixed text shows it.
double RoundToDecimals(double value, int decimals);
/// The shortest text that reads back as exactly `value` ("nan"/"inf" for non-finite).
std::string FormatShortest(double value);

} // namespace swatchlog
