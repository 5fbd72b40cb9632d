// Writers that edit a source file: the measurement merge writers, keyword
// insertion and the target-file writer.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::FileText;
using write_test::Source;

// The store is read from the source first: the set count comes from the read.
TEST(MergeWriters, MeasurementFileRewritesTheFieldCount) {
    TempDir dir;
    const std::wstring source = Wide(dir.write(
        "source.txt",
        Source({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS 5", "BEGIN_DATA_FORMAT",
                "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT", "NUMBER_OF_SETS 2",
                "BEGIN_DATA", "1 100 0 0 0", "2 0 50.5 0 0", "END_DATA"})));
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(source), 0);
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    chart.SetXYZList({tagXYZ{41.25, 50, 0.1234567}, tagXYZ{0.00001, 100, 1234.5678}});
    ASSERT_EQ(chart.WriteMeasurementFile(source, Wide(dir.file("out.txt"))), 0);
    // Fields: SAMPLE_ID + CMYK 4 + Lab 3 + XYZ 3 = 11. Six significant digits:
    // 0.1234567 -> 0.123457, 0.00001 -> 1e-05, 1234.5678 -> 1234.57. The quoted
    // header line keeps its space; the others get tabs.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t11",
                  "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\tXYZ_X\tXYZ_"
                  "Y\tXYZ_Z\t",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\t100\t0\t0\t0\t55\t-37\t-50\t41.25\t50\t0.123457\t",
                  "2\t0\t50.5\t0\t0\t48\t74\t-3\t1e-05\t100\t1234.57\t", "END_DATA"}));
}

// A Lab source gains RGB but no Lab, and a NUMBER_OF_FIELDS line.
TEST(MergeWriters, MissingColumnsAddTheFieldCountWhereThereIsNone) {
    TempDir dir;
    const std::wstring source = Wide(dir.write(
        "source.txt",
        Source({"IT8.7/3", "BEGIN_DATA_FORMAT", "SAMPLE_ID LAB_L LAB_A LAB_B", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 50 0 0", "2 60 1 1", "END_DATA"})));
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(source), 0);
    chart.SetLABList({tagLAB{1, 1, 1}, tagLAB{2, 2, 2}});
    chart.SetRGBList({tagRGB{255, 0, 0}, tagRGB{0, 255, 7}});
    ASSERT_EQ(chart.AppendMissingColumns(source, Wide(dir.file("out.txt")), false), 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"IT8.7/3", "NUMBER_OF_FIELDS\t7", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID\tLAB_L\tLAB_A\tLAB_B\tRGB_R\tRGB_G\tRGB_B", "END_DATA_FORMAT",
                        "NUMBER_OF_SETS 2", "BEGIN_DATA", "1\t50\t0\t0\t255\t0\t0",
                        "2\t60\t1\t1\t0\t255\t7", "END_DATA"}));
}

TEST(InsertKeywords, KeywordsFollowTheIdentificationLine) {
    TempDir dir;
    const std::vector<std::pair<std::string, std::string>> keywords = {
        {"ORIGINATOR", "\"Test Lab\""}, {"CREATED", "2026-12-06"}};
    const auto cgats =
        dir.write("cgats.txt", "CGATS.17\r\n  NUMBER_OF_SETS 1  \r\n\r\nBEGIN_DATA\r\n");
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.InsertKeywords(Wide(cgats), Wide(dir.file("a.txt")), keywords), 0);
    EXPECT_EQ(ReadBytes(dir.file("a.txt")),
              FileText({"CGATS.17", "ORIGINATOR\t\"Test Lab\"", "CREATED\t2026-12-06",
                        "NUMBER_OF_SETS 1", "BEGIN_DATA"}));

    // Another first line follows a new "CGATS.17" line and the keywords.
    const auto other = dir.write("other.txt", Source({"IT8.7/2", "NUMBER_OF_SETS 1"}));
    ASSERT_EQ(chart.InsertKeywords(Wide(other), Wide(dir.file("b.txt")), keywords), 0);
    EXPECT_EQ(ReadBytes(dir.file("b.txt")),
              FileText({"CGATS.17", "ORIGINATOR\t\"Test Lab\"", "CREATED\t2026-12-06", "IT8.7/2",
                        "NUMBER_OF_SETS 1"}));
}

TEST(TargetFile, CMYKSourceKeepsCleanPatchesUpToTheFirstWhite) {
    TempDir dir;
    const auto source = dir.write(
        "source.txt",
        Source({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS 5", "PATCHES_PER_PAGE 5",
                "NUMBER_OF_STRIPS 3", "NUMBER_OF_COLS 2", "ORIGINAL_NUMBER_OF_SETS 5",
                "BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 5", "BEGIN_DATA", "1 100 0 0 0", "2 50 50 0 0", "3 0 0 40 0",
                "4 0 0 0 0", "5 0 0 0 100", "END_DATA"}));
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(Wide(source)), 0);
    chart.SetKeywordList({{"CREATED", "today"}});
    ASSERT_EQ(chart.WriteTargetFile(Wide(source), Wide(dir.file("out.txt"))), 0);
    // Clean: samples 1 and 3; sample 4 is white and ends the walk: M = 3, and
    // 3 patches in strips of 2 make 2 strips.
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"CREATED today", "CGATS.17", "ORIGINATOR \"Test Lab\"",
                        "NUMBER_OF_FIELDS\t5", "PATCHES_PER_PAGE 3", "NUMBER_OF_STRIPS 2",
                        "NUMBER_OF_COLS\t2", "ORIGINAL_NUMBER_OF_SETS 3", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID\tCMYK_C\t\tCMYK_M\tCMYK_Y\tCMYK_K", "END_DATA_FORMAT",
                        "NUMBER_OF_SETS 3", "BEGIN_DATA", "1\t100.00\t0.00\t0.00\t0.00",
                        "2\t0.00\t0.00\t40.00\t0.00", "3\t0.00\t0.00\t0.00\t0.00", "END_DATA"}));
}

TEST(TargetFile, NColorSourceWritesChannelColumnsOnly) {
    TempDir dir;
    const auto source = dir.write(
        "source.txt",
        Source({"CGATS.17", "NUMBER_OF_FIELDS 8", "NUMBER_OF_STRIPS 1", "BEGIN_DATA_FORMAT",
                "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K 3CLR_1 3CLR_2 3CLR_3", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 3", "BEGIN_DATA", "1 0 0 0 0 0 80 0", "2 0 0 0 0 0 0 0",
                "3 0 0 0 0 50 0 0", "END_DATA"}));
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(Wide(source)), 0);
    ASSERT_EQ(chart.WriteTargetFile(Wide(source), Wide(dir.file("out.txt"))), 0);
    // No column count is known, so no strips; the field count follows the new
    // format (SAMPLE_ID and three channels).
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"CGATS.17", "NUMBER_OF_FIELDS\t4", "NUMBER_OF_STRIPS 0", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\t3CLR_1\t3CLR_2\t3CLR_3", "END_DATA_FORMAT", "NUMBER_OF_SETS 2",
                  "BEGIN_DATA", "1\t\t0.00\t80.00\t0.00", "2\t\t0.00\t0.00\t0.00", "END_DATA"}));
}
