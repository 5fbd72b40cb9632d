// The chart and the line-end checks shared by the platform tests.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "redavudeva/redavudeva.h"

namespace platform_test {

/// Data rows of the chart: six clean or white patches, then mixed ones.
constexpr int kChartSets = 30;

/// The chart as lines without line ends: identification, quoted keywords, the
/// layout keywords (3 columns, 10 strips), a device-control section holding
/// "\tSET SPEED 2" and "MOVE  TO 10 20", and SAMPLE_ID, CMYK and Lab per row.
std::vector<std::string> ChartLines();

/// The lines, each followed by `lineEnd`.
std::string JoinLines(const std::vector<std::string>& lines, const std::string& lineEnd);

/// The line end a text-mode file gets on disk here: "\r\n" on Windows, "\n" elsewhere.
std::string NativeLineEnd();

/// Success when `bytes` holds at least one line end, ends with one, and every
/// line end is the native one (no lone CR or LF, no CR CR LF).
::testing::AssertionResult HasOnlyNativeLineEnds(const std::string& bytes);

/// A reader-writer from the library's factory, deleted through its base class.
struct ReaderWriterDeleter {
    void operator()(CSwatchlogBase* readerWriter) const { delete readerWriter; }
};
using ReaderWriterPtr = std::unique_ptr<CSwatchlogBase, ReaderWriterDeleter>;
ReaderWriterPtr NewReaderWriter();

} // namespace platform_test
