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
std::string ChartText(const std::string& lineEnd);

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
