// The chart and the helpers shared by the platform tests.
#pragma once

#include <memory>
#include <string>

#include "redavudeva/redavudeva.h"

namespace platform_test {

/// Data rows of the chart: white, cyan, then mixed patches.
constexpr int kChartSets = 30;

/// The chart, each line followed by `lineEnd`: a quoted ORIGINATOR, a COMMENT
/// holding a Ctrl-Z byte ("stop\x1Ahere"), 3 columns by 10 strips, a
/// device-control section of "\tSET SPEED 2" and "MOVE  TO 10 20", and
/// SAMPLE_ID, CMYK and Lab per row. Over 1023 characters, so that it is also
/// read CR-only.
inline std::string ChartText(const std::string& lineEnd) {
    std::string text;
    for (const char* line :
         {"CGATS.17", "COMMENT\tstop\x1Ahere", "ORIGINATOR\t\"Platform test\"", "NUMBER_OF_COLS\t3",
          "NUMBER_OF_STRIPS\t10", "BEGIN_DEVICE_CONTROL_SEQUENCE", "\tSET SPEED 2",
          "MOVE  TO 10 20", "END_DEVICE_CONTROL_SEQUENCE", "NUMBER_OF_FIELDS\t8",
          "BEGIN_DATA_FORMAT", "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B",
          "END_DATA_FORMAT", "NUMBER_OF_SETS\t30", "BEGIN_DATA", "1\t0\t0\t0\t0\t95.5\t-0.5\t2.25",
          "2\t100\t0\t0\t0\t55\t-37\t-50"}) {
        text += line + lineEnd;
    }
    // Mixed patches 3 to 30: every channel printing, values in 5 % steps.
    const auto field = [](int value) { return "\t" + std::to_string(value); };
    for (int id = 3; id <= kChartSets; ++id) {
        text += std::to_string(id) + field(5 + id % 19 * 5) + field(5 + id % 17 * 5) +
                field(5 + id % 13 * 5) + field(5 + id % 7 * 5) + field(20 + id) + ".5" + field(id) +
                field(-id) + lineEnd;
    }
    return text + "END_DATA" + lineEnd;
}

/// The line end a text-mode file gets on disk here: CR LF on Windows, LF elsewhere.
#if defined(_WIN32)
inline const std::string kNativeLineEnd = "\r\n";
#else
inline const std::string kNativeLineEnd = "\n";
#endif

/// A reader-writer from the library's factory, deleted through its base class.
using ReaderWriterPtr = std::unique_ptr<CSwatchlogBase>;
inline ReaderWriterPtr NewReaderWriter() {
    return ReaderWriterPtr(CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
}

} // namespace platform_test
