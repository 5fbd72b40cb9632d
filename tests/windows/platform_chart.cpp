#include "platform_chart.h"

namespace platform_test {

std::vector<std::string> ChartLines() {
    std::vector<std::string> lines = {
        "CGATS.17",
        "ORIGINATOR\t\"Platform test\"",
        "DESCRIPTOR\t\"Line ends and paths\"",
        "NUMBER_OF_COLS\t3",
        "NUMBER_OF_STRIPS\t10",
        "BEGIN_DEVICE_CONTROL_SEQUENCE",
        "\tSET SPEED 2",
        "MOVE  TO 10 20",
        "END_DEVICE_CONTROL_SEQUENCE",
        "NUMBER_OF_FIELDS\t8",
        "BEGIN_DATA_FORMAT",
        "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B",
        "END_DATA_FORMAT",
        "NUMBER_OF_SETS\t30",
        "BEGIN_DATA",
        "1\t0\t0\t0\t0\t95.5\t-0.5\t2.25",
        "2\t100\t0\t0\t0\t55\t-37\t-50",
        "3\t0\t100\t0\t0\t48\t74\t-3",
        "4\t0\t0\t100\t0\t89\t-5\t93",
        "5\t0\t0\t0\t100\t16\t0\t0",
        "6\t0\t0\t0\t50\t60\t0\t0",
    };
    // Mixed patches 7 to 30: every channel printing, values in 5 % steps.
    for (int id = 7; id <= kChartSets; ++id) {
        const auto field = [](int value) { return "\t" + std::to_string(value); };
        lines.push_back(std::to_string(id) + field(5 + id % 19 * 5) + field(5 + id % 17 * 5) +
                        field(5 + id % 13 * 5) + field(5 + id % 7 * 5) + field(20 + id) + ".5" +
                        field(id) + field(-id));
    }
    lines.emplace_back("END_DATA");
    return lines;
}

std::string JoinLines(const std::vector<std::string>& lines, const std::string& lineEnd) {
    std::string text;
    for (const auto& line : lines) {
        text += line;
        text += lineEnd;
    }
    return text;
}

std::string NativeLineEnd() {
#if defined(_WIN32)
    return "\r\n";
#else
    return "\n";
#endif
}

::testing::AssertionResult HasOnlyNativeLineEnds(const std::string& bytes) {
    const std::string native = NativeLineEnd();
    if (bytes.size() < native.size() ||
        bytes.compare(bytes.size() - native.size(), native.size(), native) != 0) {
        return ::testing::AssertionFailure() << "the file does not end with a native line end";
    }
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const bool lineEndHere = bytes.compare(i, native.size(), native) == 0;
        if (lineEndHere) {
            i += native.size() - 1;
        } else if (bytes[i] == '\r' || bytes[i] == '\n') {
            return ::testing::AssertionFailure()
                   << "a foreign line-end character (" << (bytes[i] == '\r' ? "CR" : "LF")
                   << ") at byte " << i << " of " << bytes.size();
        }
    }
    return ::testing::AssertionSuccess();
}

ReaderWriterPtr NewReaderWriter() {
    return ReaderWriterPtr(CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
}

} // namespace platform_test
