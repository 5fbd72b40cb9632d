#include "it8/read/number_text.h"

#include <charconv>
#include <cstring>
#include <limits>
#include <string>
#include <system_error>

#include "it8/it8_reader_writer.h"

namespace it8 {
namespace {

bool IsCSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\v' || c == '\f' || c == '\r';
}

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

bool IsHexDigit(char c) {
    return IsDigit(c) || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
}

int HexDigitValue(char c) {
    if (IsDigit(c)) {
        return c - '0';
    }
    return (c | 0x20) - 'a' + 10;
}

// Sign of the power of the radix of a number too large or too small for a double:
// the position of its first non-zero digit relative to the radix point, plus its
// exponent. Only called for out-of-range results, which lie hundreds of powers of
// ten away from 1, so the sign alone tells overflow from underflow.
bool IsOverflow(const char* first, const char* last, bool hex) {
    const int digitWeight = hex ? 4 : 1;
    const char exponentMark = hex ? 'p' : 'e';
    long long magnitude = 0;
    bool seenNonZero = false;
    bool afterPoint = false;
    const char* p = first;
    for (; p < last && ((hex ? IsHexDigit(*p) : IsDigit(*p)) || *p == '.'); ++p) {
        if (*p == '.') {
            afterPoint = true;
        } else if (!seenNonZero && HexDigitValue(*p) == 0) {
            magnitude -= afterPoint ? digitWeight : 0;
        } else if (!seenNonZero) {
            seenNonZero = true;
            magnitude += afterPoint ? 0 : digitWeight;
        } else if (!afterPoint) {
            magnitude += digitWeight;
        }
    }
    if (p < last && (*p | 0x20) == exponentMark) {
        ++p;
        const bool negative = p < last && *p == '-';
        p += (p < last && (*p == '-' || *p == '+')) ? 1 : 0;
        long long exponent = 0;
        for (; p < last && IsDigit(*p); ++p) {
            if (exponent < 1000000000LL) {
                exponent = exponent * 10 + (*p - '0');
            }
        }
        magnitude += negative ? -exponent : exponent;
    }
    return magnitude > 0;
}

// Converts [first, last) with from_chars; `used` is 0 when nothing converted.
double Convert(const char* first, const char* last, std::chars_format format, std::size_t& used) {
    double value = 0.0;
    const auto result = std::from_chars(first, last, value, format);
    if (result.ec == std::errc::invalid_argument) {
        used = 0;
        return 0.0;
    }
    used = static_cast<std::size_t>(result.ptr - first);
    if (result.ec == std::errc::result_out_of_range) {
        const bool hex = format == std::chars_format::hex;
        return IsOverflow(first, result.ptr, hex) ? std::numeric_limits<double>::infinity() : 0.0;
    }
    return value;
}

} // namespace

NumberScan ScanNumber(const char* text, std::size_t size) {
    std::size_t i = 0;
    while (i < size && IsCSpace(text[i])) {
        ++i;
    }
    bool negative = false;
    if (i < size && (text[i] == '+' || text[i] == '-')) {
        negative = text[i] == '-';
        ++i;
    }
    const char* const last = text + size;
    NumberScan scan;
    if (i + 1 < size && text[i] == '0' && (text[i + 1] == 'x' || text[i + 1] == 'X')) {
        const std::size_t digits = i + 2;
        const bool hasHexDigits =
            digits < size &&
            (IsHexDigit(text[digits]) ||
             (text[digits] == '.' && digits + 1 < size && IsHexDigit(text[digits + 1])));
        if (hasHexDigits) {
            std::size_t used = 0;
            scan.value = Convert(text + digits, last, std::chars_format::hex, used);
            scan.stop = digits + used;
        } else {
            scan.value = 0.0; // only the "0" before the 'x' is a number
            scan.stop = i + 1;
        }
    } else if (i < size && (IsDigit(text[i]) || text[i] == '.' || (text[i] | 0x20) == 'i' ||
                            (text[i] | 0x20) == 'n')) {
        std::size_t used = 0;
        scan.value = Convert(text + i, last, std::chars_format::general, used);
        if (used == 0) {
            return NumberScan{};
        }
        scan.stop = i + used;
    } else {
        return NumberScan{};
    }
    if (negative) {
        scan.value = -scan.value;
    }
    return scan;
}

double ParseNumberInPlace(char* text, std::size_t size) {
    const NumberScan first = ScanNumber(text, size);
    if (first.stop >= size) {
        return first.value;
    }
    const char stoppedAt = text[first.stop];
    if (stoppedAt != '.' && stoppedAt != ',') {
        return first.value;
    }
    char* const mark = static_cast<char*>(std::memchr(text, stoppedAt, size));
    *mark = stoppedAt == '.' ? ',' : '.';
    return ScanNumber(text, size).value;
}

} // namespace it8

double CIT8ReaderWriter::ParseNumber(std::string& token) {
    // Like the C conversion, the text ends at its first NUL character.
    const std::size_t size = token.find('\0');
    return it8::ParseNumberInPlace(token.data(), size == std::string::npos ? token.size() : size);
}
