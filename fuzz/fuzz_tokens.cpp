// Fuzz target: the input bytes are one line for the tokenizer, the number
// reader and the whole-number readers, checked against independent readings
// done with the C library.
#include <cctype>
#include <cerrno>
#include <climits>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <vector>

#include "fuzz_support.h"
#include "it8/it8_reader_writer.h"
#include "patch/text_number.h"

namespace {

// Tokens are never empty, hold no separator, and together are the line with
// its separators taken out.
void CheckSplit(const std::string& line, const std::string& separators) {
    const std::vector<std::string> tokens = CIT8ReaderWriter::SplitLine(line, separators);
    std::string joined;
    for (const std::string& token : tokens) {
        if (token.empty()) {
            fuzz::Fail("SplitLine", "gave an empty token");
        }
        if (token.find_first_of(separators) != std::string::npos) {
            fuzz::Fail("SplitLine", "left a separator inside a token");
        }
        joined += token;
    }
    std::string expected;
    for (char c : line) {
        if (separators.find(c) == std::string::npos) {
            expected += c;
        }
    }
    if (joined != expected) {
        fuzz::Fail("SplitLine", "lost or invented characters");
    }
}

// The C library's reading of a whole number: whether it found digits, and
// whether the number lies outside the signed 32-bit range.
struct WholeNumber {
    bool digits = false;
    bool outOfRange = false;
    long long value = 0;
};

WholeNumber ReadWholeNumber(const std::string& text) {
    WholeNumber result;
    const char* begin = text.c_str();
    char* end = nullptr;
    errno = 0;
    const long long value = std::strtoll(begin, &end, 10);
    result.digits = end != begin;
    result.outOfRange = errno == ERANGE || value < INT_MIN || value > INT_MAX;
    result.value = value;
    return result;
}

void CheckWholeNumbers(const std::string& text) {
    // The C library stops at the first NUL; the readers work on the text up to it.
    const std::string upToNul = text.substr(0, text.find('\0'));
    const WholeNumber reference = ReadWholeNumber(upToNul);
    try {
        const int value = text_number::ParseLongStrict(upToNul);
        if (!reference.digits || reference.outOfRange || value != reference.value) {
            fuzz::Fail("ParseLongStrict", "disagrees with strtoll on \"" + upToNul + "\"");
        }
    } catch (const std::invalid_argument& e) {
        if (reference.digits || std::string(e.what()) != "invalid stol argument") {
            fuzz::Fail("ParseLongStrict", "rejected a number: \"" + upToNul + "\"");
        }
    } catch (const std::out_of_range& e) {
        if (!reference.digits || !reference.outOfRange ||
            std::string(e.what()) != "stol argument out of range") {
            fuzz::Fail("ParseLongStrict", "called a number out of range: \"" + upToNul + "\"");
        }
    }
    const int lenient = text_number::ParseIntLenient(upToNul);
    long long expected = reference.digits ? reference.value : 0;
    if (reference.digits && reference.outOfRange) {
        expected = reference.value < 0 ? INT_MIN : INT_MAX;
    }
    if (lenient != expected) {
        fuzz::Fail("ParseIntLenient", "disagrees with strtoll on \"" + upToNul + "\"");
    }
}

// A token with one decimal point after a digit and the same token with that
// point written as a comma give the same number. Other tokens are left out:
// in "-,5" or " ,5" the reading stops before the mark, not at it.
void CheckDecimalMark(const std::string& token) {
    std::string copy = token;
    CIT8ReaderWriter::ParseNumber(copy);
    const std::size_t point = token.find('.');
    if (point == std::string::npos || point == 0 ||
        std::isdigit(static_cast<unsigned char>(token[point - 1])) == 0 ||
        token.find('.', point + 1) != std::string::npos || token.find(',') != std::string::npos ||
        token.find_first_of(" \t\n\v\f\r") != std::string::npos) {
        return;
    }
    std::string comma = token;
    comma[point] = ',';
    std::string pointCopy = token;
    const double withPoint = CIT8ReaderWriter::ParseNumber(pointCopy);
    const double withComma = CIT8ReaderWriter::ParseNumber(comma);
    if (withPoint == withPoint && withPoint != withComma) {
        fuzz::Fail("ParseNumber", "reads \"" + token + "\" and its comma form differently");
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string line(reinterpret_cast<const char*>(data), size);
    CheckSplit(line, "\t\n\r ");
    CheckSplit(line, "\n");
    CheckSplit(line, " ");
    CheckWholeNumbers(line);
    for (const std::string& token : CIT8ReaderWriter::SplitLine(line, "\t\n\r ")) {
        CheckDecimalMark(token);
    }
    return 0;
}
