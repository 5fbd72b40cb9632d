#include "result_messages.h"

namespace swatchlog {

std::string DescribeReadResult(int code) {
    switch (code) {
    case 0:
        return "the chart was read";
    case 3:
        return "the file cannot be opened for reading";
    case 4:
        return "the path is empty";
    case 5:
        return "the data format is unusable: END_DATA_FORMAT is missing or the number of "
               "field names differs from NUMBER_OF_FIELDS";
    case 6:
        return "NUMBER_OF_SETS is below 1";
    case 7:
        return "the data block ends before END_DATA";
    case 8:
        return "a data row or the number of rows disagrees with NUMBER_OF_FIELDS or "
               "NUMBER_OF_SETS";
    case 9:
        return "the file has no data block";
    default:
        return "the chart cannot be read";
    }
}

std::string DescribeWriteResult(int code) {
    switch (code) {
    case 0:
        return "the file was written";
    case 1:
        return "the chart has no clean and no white patch to write";
    case 21:
        return "the source file cannot be opened for reading";
    case 22:
        return "the source file is not a readable chart";
    case 23:
        return "the output file cannot be written";
    case 24:
        return "the data do not fit the source file (the numbers of patches differ)";
    default:
        return "the file cannot be written";
    }
}

std::string DescribeLibraryException(const std::exception& error) {
    const std::string what = error.what();
    if (what == "invalid stol argument" || what == "stol argument out of range") {
        return "a layout keyword (NUMBER_OF_STRIPS, NUMBER_OF_COLS) or a spectral field name "
               "does not hold a usable whole number (" +
               what + ")";
    }
    if (what == "invalid string position") {
        return "the spectral field names do not follow one naming scheme (" + what + ")";
    }
    return "the library stopped with an error: " + what;
}

std::string WithCode(const std::string& sentence, int code) {
    return sentence + " [code " + std::to_string(code) + "]";
}

} // namespace swatchlog
