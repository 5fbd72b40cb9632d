#include "patch/text_number.h"

#include <cstdint>
#include <limits>
#include <stdexcept>

namespace text_number {
namespace {

struct Scan {
    bool hasDigits = false;
    bool overflow = false;
    std::int64_t value = 0;
};

bool IsSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f' || c == '\v';
}

// Scans white space, sign and digits; stops accumulating once the value leaves
// the 32-bit range so that long digit runs cannot overflow.
Scan ScanInteger(std::string_view text) {
    Scan scan;
    std::size_t i = 0;
    while (i < text.size() && IsSpace(text[i])) {
        ++i;
    }
    bool negative = false;
    if (i < text.size() && (text[i] == '+' || text[i] == '-')) {
        negative = text[i] == '-';
        ++i;
    }
    constexpr std::int64_t limit = std::int64_t{std::numeric_limits<int>::max()} + 1;
    std::int64_t magnitude = 0;
    for (; i < text.size() && text[i] >= '0' && text[i] <= '9'; ++i) {
        scan.hasDigits = true;
        if (magnitude <= limit) {
            magnitude = magnitude * 10 + (text[i] - '0');
        }
    }
    const std::int64_t value = negative ? -magnitude : magnitude;
    scan.overflow =
        value > std::numeric_limits<int>::max() || value < std::numeric_limits<int>::min();
    scan.value = value;
    return scan;
}

} // namespace

int ParseLongStrict(const std::string& text) {
    const Scan scan = ScanInteger(text);
    if (!scan.hasDigits) {
        throw std::invalid_argument("invalid stol argument");
    }
    if (scan.overflow) {
        throw std::out_of_range("stol argument out of range");
    }
    return static_cast<int>(scan.value);
}

int ParseIntLenient(const std::string& text) {
    const Scan scan = ScanInteger(text);
    if (scan.value > std::numeric_limits<int>::max()) {
        return std::numeric_limits<int>::max();
    }
    if (scan.value < std::numeric_limits<int>::min()) {
        return std::numeric_limits<int>::min();
    }
    return static_cast<int>(scan.value);
}

std::optional<int> ReadInt(std::string_view text) {
    const Scan scan = ScanInteger(text);
    if (!scan.hasDigits || scan.overflow) {
        return std::nullopt;
    }
    return static_cast<int>(scan.value);
}

} // namespace text_number
