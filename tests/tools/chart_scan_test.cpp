#include <gtest/gtest.h>

#include "chart_scan.h"

namespace swatchlog {
namespace {

// A chart of three fields and two rows; `rows` replaces its data block.
std::string Chart(const std::string& rows, const std::string& sets = "2") {
    return "CGATS.17\n"              // 1
           "NUMBER_OF_FIELDS 3\n"    // 2
           "BEGIN_DATA_FORMAT\n"     // 3
           "SAMPLE_ID LAB_L LAB_A\n" // 4
           "END_DATA_FORMAT\n"       // 5
           "NUMBER_OF_SETS " +
           sets +
           "\n"             // 6
           "BEGIN_DATA\n" + // 7
           rows;
}

TEST(ChartScan, NamesTheRowWithTheWrongNumberOfValues) {
    const ChartScan scan = ScanChartText(Chart("1 50 0\n\n2 40 1 7\nEND_DATA\n"));
    EXPECT_EQ(scan.rows.size(), 2u);
    EXPECT_EQ(ExplainReadFailure(8, scan),
              "row 2 (line 10) has 4 values but NUMBER_OF_FIELDS is 3");
}

TEST(ChartScan, CountsRowsAgainstNumberOfSets) {
    const ChartScan scan = ScanChartText(Chart("1 50 0\nEND_DATA\n"));
    EXPECT_EQ(ExplainReadFailure(8, scan),
              "NUMBER_OF_SETS on line 6 is 2 but the data block on line 7 holds 1 row");
}

TEST(ChartScan, MissingEndsAndBadCounts) {
    EXPECT_EQ(
        ExplainReadFailure(7, ScanChartText(Chart("1 50 0\r\n2 40 1\r\n"))),
        "the data block that begins on line 7 ends before END_DATA (the file ends on line 9)");
    EXPECT_EQ(ExplainReadFailure(6, ScanChartText(Chart("", "\"0\""))),
              "NUMBER_OF_SETS on line 6 is below 1");
    EXPECT_EQ(ExplainReadFailure(5, ScanChartText("BEGIN_DATA_FORMAT\nSAMPLE_ID\n")),
              "the data format that begins on line 1 has no END_DATA_FORMAT");
    EXPECT_EQ(ExplainReadFailure(5, ScanChartText("NUMBER_OF_FIELDS 4\nBEGIN_DATA_FORMAT\n"
                                                  "SAMPLE_ID lab_l LAB_L\nEND_DATA_FORMAT\n")),
              "the data format on line 2 names 2 different fields but NUMBER_OF_FIELDS on line 1 "
              "is 4");
}

TEST(ChartScan, SaysWhyThereIsNoDataBlock) {
    EXPECT_EQ(ExplainReadFailure(9, ScanChartText("")), "the file is empty");
    EXPECT_EQ(ExplainReadFailure(9, ScanChartText("CGATS.17\nORIGINATOR x\n")),
              "the file has no data block (no BEGIN_DATA line)");
    EXPECT_EQ(ExplainReadFailure(9, ScanChartText("NUMBER_OF_SETS 1\nBEGIN_DATA\n1\nEND_DATA\n")),
              "BEGIN_DATA on line 2 comes before the data format");
    EXPECT_EQ(ExplainReadFailure(9, ScanChartText("BEGIN_DATA_FORMAT\nSAMPLE_ID\nEND_DATA_FORMAT\n"
                                                  "BEGIN_DATA\n1\nEND_DATA\n")),
              "BEGIN_DATA on line 4 comes before NUMBER_OF_SETS");
    EXPECT_EQ(ExplainReadFailure(9, ScanChartText("CGATS.17\nBEGIN_MEASUREMENT_SCRIPT\nx\n")),
              "the section BEGIN_MEASUREMENT_SCRIPT on line 2 is never closed, so the file has no "
              "data block");
    // Without a finding the plain sentence of the code remains.
    EXPECT_EQ(ExplainReadFailure(3, ScanChartText("")), "the file cannot be opened for reading");
}

} // namespace
} // namespace swatchlog
