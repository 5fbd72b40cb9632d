// The store the permission tests' helper writes.
#pragma once

#include "it8/it8_reader_writer.h"

namespace write_test {

/// Two CMYK sets, so that the written chart is longer than any old content the
/// tests put in a target.
inline void FillHelperChart(CIT8ReaderWriter& chart) {
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 0, 0}});
}

/// The chart the new-file writer makes of that store, line by line: five fields
/// (SAMPLE_ID and the four CMYK ones), the format line ending in a tab since
/// CMYK is the last block, values with two decimals.
inline const char* const kHelperChartLines[] = {
    "IT8",
    "NUMBER_OF_FIELDS\t5",
    "BEGIN_DATA_FORMAT",
    "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t",
    "END_DATA_FORMAT",
    "NUMBER_OF_SETS\t2",
    "BEGIN_DATA",
    "1\t100.00\t0.00\t0.00\t0.00",
    "2\t0.00\t100.00\t0.00\t0.00",
    "END_DATA",
};

} // namespace write_test
