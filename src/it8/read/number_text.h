// Decimal numbers in chart tokens, read alike with a decimal point or comma.
#pragma once

#include <cstddef>

namespace it8 {

/// Where a conversion in the manner of the C library's strtod under the "C"
/// locale stops, and what it gives.
struct NumberScan {
    double value = 0.0;
    std::size_t stop = 0; ///< characters used; 0 when no number was found
};

/// Converts text the way strtod does in the "C" locale (leading white space, sign,
/// decimal and hexadecimal forms, infinity and NaN, overflow to infinity and
/// underflow to zero) without touching any locale. The text ends at `size`.
NumberScan ScanNumber(const char* text, std::size_t size);

/// Reads a token with a decimal point or a decimal comma alike: when the first
/// conversion stops at a '.', the token's first '.' becomes ',' and it is read
/// again; when it stops at a ',', the first ',' becomes '.'. The rewrite is made
/// in the token itself.
double ParseNumberInPlace(char* text, std::size_t size);

} // namespace it8
