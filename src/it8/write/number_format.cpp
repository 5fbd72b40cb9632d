#include "it8/write/number_format.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <system_error>

namespace it8 {
namespace {

// The quick way to fixed notation: scale by 10^decimals, round to an integer
// and print its digits with the point put in. Below 2^40 every half-integer is
// a double and the fraction below is exact. Rounding the product to a double
// is monotonic and leaves those half-integers in place, so the computed
// product lies on the same side of every half-integer as the exact product,
// or on it: the rounded integer is the one printf's exact rounding gives,
// unless the computed product is a half-integer itself. That case (true
// halves such as 4.125, which printf rounds to even, and products rounded
// onto a half), huge values, NaN and infinities take the exact way.
constexpr double kQuickLimit = 1099511627776.0; // 2^40, below 10^13
constexpr int kMostQuickDecimals = 9;

constexpr char kDigitPairs[] = "00010203040506070809"
                               "10111213141516171819"
                               "20212223242526272829"
                               "30313233343536373839"
                               "40414243444546474849"
                               "50515253545556575859"
                               "60616263646566676869"
                               "70717273747576777879"
                               "80818283848586878889"
                               "90919293949596979899";

constexpr std::uint64_t PowerOfTen(int exponent) {
    std::uint64_t power = 1;
    for (int i = 0; i < exponent; ++i) {
        power *= 10;
    }
    return power;
}

// Digits of a non-negative number below 10^13.
int DigitCount(std::uint64_t number) {
    int digits = 1;
    for (std::uint64_t power = 10; digits < 13 && number >= power; power *= 10) {
        ++digits;
    }
    return digits;
}

// Writes the lowest `count` digits of `number` backwards, ending at `end`.
void WriteDigitsBackwards(char* end, std::uint64_t number, int count) {
    for (; count >= 2; count -= 2) {
        const auto pair = static_cast<std::size_t>(number % 100) * 2;
        number /= 100;
        *--end = kDigitPairs[pair + 1];
        *--end = kDigitPairs[pair];
    }
    if (count == 1) {
        *--end = static_cast<char>('0' + number % 10);
    }
}

// The same for a count known when compiling, which unrolls the loop; the
// digits fit 32 bits, whose arithmetic is cheaper.
template <int Count> void WriteDigitsBackwards(char* end, std::uint32_t number) {
    if constexpr (Count >= 2) {
        const std::uint32_t pair = (number % 100) * 2;
        end[-1] = kDigitPairs[pair + 1];
        end[-2] = kDigitPairs[pair];
        WriteDigitsBackwards<Count - 2>(end - 2, number / 100);
    } else if constexpr (Count == 1) {
        end[-1] = static_cast<char>('0' + number % 10);
    }
}

// The quick way for a number of decimals known when compiling, or nullptr
// when the value needs the exact way. `fits` becomes false when the quick text
// would not fit the room.
template <int Decimals>
char* FormatFixedQuickly(char* out, std::size_t room, double value, bool& fits) {
    constexpr std::uint64_t kScale = PowerOfTen(Decimals);
    const double scaled = std::fabs(value) * static_cast<double>(kScale);
    if (!(scaled < kQuickLimit)) {
        return nullptr; // too large, infinite or NaN
    }
    // Signed conversions are single instructions; the value is below 2^40.
    const auto truncated = static_cast<std::int64_t>(scaled);
    const double fraction = scaled - static_cast<double>(truncated); // exact
    if (fraction == 0.5) {
        return nullptr;
    }
    const std::uint64_t rounded =
        static_cast<std::uint64_t>(truncated) + (fraction > 0.5 ? 1U : 0U);
    const std::uint64_t whole = rounded / kScale;
    // Chart values mostly have one or two digits before the point; counting
    // those without a loop keeps the branches predictable.
    const int wholeDigits = whole < 100 ? 1 + (whole >= 10 ? 1 : 0) : DigitCount(whole);

    // printf keeps the sign of a negative value that rounds to zero, and of -0.
    const int sign = std::signbit(value) ? 1 : 0;
    const auto length =
        static_cast<std::size_t>(sign + wholeDigits + (Decimals > 0 ? Decimals + 1 : 0));
    if (length > room) {
        fits = false;
        return nullptr;
    }
    char* const end = out + length;
    out[0] = '-'; // overwritten by the first digit when the value is not negative
    char* const digits = out + sign;
    if (Decimals > 0 && whole < 100) {
        // Both digits of the pair are stored; a second one beyond a single
        // whole digit lands where the point goes and is overwritten below.
        const char* const pair = kDigitPairs + whole * 2;
        digits[0] = pair[2 - wholeDigits];
        digits[1] = pair[1];
    } else {
        WriteDigitsBackwards(digits + wholeDigits, whole, wholeDigits);
    }
    if (Decimals > 0) {
        digits[wholeDigits] = '.';
        WriteDigitsBackwards<Decimals>(end, static_cast<std::uint32_t>(rounded - whole * kScale));
    }
    return end;
}

char* FormatFixedQuickly(char* out, std::size_t room, double value, int decimals, bool& fits) {
    fits = true;
    switch (decimals) {
    case 0:
        return FormatFixedQuickly<0>(out, room, value, fits);
    case 1:
        return FormatFixedQuickly<1>(out, room, value, fits);
    case 2:
        return FormatFixedQuickly<2>(out, room, value, fits);
    case 3:
        return FormatFixedQuickly<3>(out, room, value, fits);
    case 4:
        return FormatFixedQuickly<4>(out, room, value, fits);
    case 5:
        return FormatFixedQuickly<5>(out, room, value, fits);
    case 6:
        return FormatFixedQuickly<6>(out, room, value, fits);
    case 7:
        return FormatFixedQuickly<7>(out, room, value, fits);
    case 8:
        return FormatFixedQuickly<8>(out, room, value, fits);
    case kMostQuickDecimals:
        return FormatFixedQuickly<kMostQuickDecimals>(out, room, value, fits);
    default:
        return nullptr;
    }
}

// std::to_chars is defined to give the same text as printf in the classic
// locale and never looks at the process locale. Fixed notation of a large
// value can need hundreds of digits, so the buffer grows until the text fits.
template <typename... Format> std::string ToChars(double value, Format... format) {
    std::string text(64, '\0');
    for (;;) {
        const auto result = std::to_chars(text.data(), text.data() + text.size(), value, format...);
        if (result.ec == std::errc()) {
            text.resize(static_cast<std::size_t>(result.ptr - text.data()));
            return text;
        }
        text.resize(text.size() * 2);
    }
}

} // namespace

char* FormatFixedInto(char* out, std::size_t room, double value, int decimals) {
    bool fits = true;
    if (char* const end = FormatFixedQuickly(out, room, value, decimals, fits)) {
        return end;
    }
    if (!fits) {
        return nullptr;
    }
    const auto result = std::to_chars(out, out + room, value, std::chars_format::fixed, decimals);
    return result.ec == std::errc() ? result.ptr : nullptr;
}

std::string FormatFixed(double value, int decimals) {
    char buffer[32];
    if (char* const end = FormatFixedInto(buffer, sizeof buffer, value, decimals)) {
        return std::string(buffer, end);
    }
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
    char buffer[32]; // "-1.23457e+308" is the longest six-digit text
    const auto result =
        std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, 6);
    if (result.ec == std::errc()) {
        return std::string(buffer, result.ptr);
    }
    return ToChars(value, std::chars_format::general, 6);
}

char* FormatIntegerInto(char* out, std::size_t room, long long value) {
    const auto result = std::to_chars(out, out + room, value);
    return result.ec == std::errc() ? result.ptr : nullptr;
}

std::string FormatInteger(long long value) {
    return std::to_string(value);
}

} // namespace it8
