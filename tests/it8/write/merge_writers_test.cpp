// Writers that edit a source file: the measurement merge writers, keyword
// insertion and the target-file writer.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::FileText;
using write_test::Source;

TEST(MergeWriters, SourcesWithAndWithoutFieldCountOrIdentification) {
    const std::string cmykData =
        Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 100 0 0 0", "2 0 50.5 0 0", "END_DATA"});
    const std::string cgats =
        Source({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS 5"}) + cmykData;
    enum Writer { kMeasurement, kMissingColumns, kMissingColumnsKeywordsFirst };
    const struct {
        const char* what;
        std::string source;
        std::function<void(CIT8ReaderWriter&)> lists;
        Writer writer;
        std::string expected;
    } cases[] = {
        // Fields: SAMPLE_ID + CMYK 4 + Lab 3 + XYZ 3 = 11. Six significant digits:
        // 0.1234567 -> 0.123457, 0.00001 -> 1e-05, 1234.5678 -> 1234.57. The quoted
        // header line keeps its space; the others get tabs.
        {"measurement", cgats,
         [](CIT8ReaderWriter& c) {
             c.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
             c.SetXYZList({tagXYZ{41.25, 50, 0.1234567}, tagXYZ{0.00001, 100, 1234.5678}});
         },
         kMeasurement,
         FileText({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t11",
                   "BEGIN_DATA_FORMAT",
                   "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\tXYZ_X\tXYZ_"
                   "Y\tXYZ_Z\t",
                   "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                   "1\t100\t0\t0\t0\t55\t-37\t-50\t41.25\t50\t0.123457\t",
                   "2\t0\t50.5\t0\t0\t48\t74\t-3\t1e-05\t100\t1234.57\t", "END_DATA"})},
        // Another identification line and no NUMBER_OF_FIELDS line: both are added.
        {"measurement, no field count", Source({"IT8.7/1", "ORIGINATOR \"Test Lab\""}) + cmykData,
         [](CIT8ReaderWriter& c) {
             c.SetLABList({tagLAB{55.5, 0, 0}, tagLAB{0.25, 1, 2}});
         },
         kMeasurement,
         FileText({"CGATS.17", "IT8.7/1", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t8",
                   "BEGIN_DATA_FORMAT",
                   "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\t",
                   "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                   "1\t100\t0\t0\t0\t55.5\t0\t0\t", "2\t0\t50.5\t0\t0\t0.25\t1\t2\t", "END_DATA"})},
        // Fields: 5 read + XYZ 3 + Lab 3 = 11; the source's CMYK is not added again.
        // Keyword lines keep their spaces, as does the NUMBER_OF_SETS line rewritten
        // after the tab rule.
        {"missing columns", cgats,
         [](CIT8ReaderWriter& c) {
             c.SetKeywordList({{"CREATED", "\"2026-12-06\""}, {"DESCRIPTOR", "two words"}});
             c.SetCMYKList({tagCMYK{1, 1, 1, 1}, tagCMYK{2, 2, 2, 2}});
             c.SetXYZList({tagXYZ{41.25, 50, 0.123}, tagXYZ{0, 100, 1234.5678}});
             c.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
         },
         kMissingColumnsKeywordsFirst,
         FileText({"CREATED \"2026-12-06\"", "DESCRIPTOR two words", "CGATS.17",
                   "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t11", "BEGIN_DATA_FORMAT",
                   "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tXYZ_X\tXYZ_Y\tXYZ_Z\tLAB_L\tLAB_"
                   "A\tLAB_B",
                   "END_DATA_FORMAT", "NUMBER_OF_SETS 2", "BEGIN_DATA",
                   "1\t100\t0\t0\t0\t41.25\t50.00\t0.12\t55.00\t-37.00\t-50.00",
                   "2\t0\t50.5\t0\t0\t0.00\t100.00\t1234.57\t48.00\t74.00\t-3.00", "END_DATA"})},
        // A Lab source gains RGB but no Lab, and a NUMBER_OF_FIELDS line.
        {"missing columns, no field count",
         Source({"IT8.7/3", "BEGIN_DATA_FORMAT", "SAMPLE_ID LAB_L LAB_A LAB_B", "END_DATA_FORMAT",
                 "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 50 0 0", "2 60 1 1", "END_DATA"}),
         [](CIT8ReaderWriter& c) {
             c.SetLABList({tagLAB{1, 1, 1}, tagLAB{2, 2, 2}});
             c.SetRGBList({tagRGB{255, 0, 0}, tagRGB{0, 255, 7}});
         },
         kMissingColumns,
         FileText({"IT8.7/3", "NUMBER_OF_FIELDS\t7", "BEGIN_DATA_FORMAT",
                   "SAMPLE_ID\tLAB_L\tLAB_A\tLAB_B\tRGB_R\tRGB_G\tRGB_B", "END_DATA_FORMAT",
                   "NUMBER_OF_SETS 2", "BEGIN_DATA", "1\t50\t0\t0\t255\t0\t0",
                   "2\t60\t1\t1\t0\t255\t7", "END_DATA"})},
    };
    for (const auto& c : cases) {
        TempDir dir;
        const std::wstring source = Wide(dir.write("source.txt", c.source));
        const std::wstring target = Wide(dir.file("out.txt"));
        CIT8ReaderWriter chart;
        ASSERT_EQ(chart.ReadChartFile(source), 0) << c.what; // the set count comes from the read
        c.lists(chart);
        ASSERT_EQ(c.writer == kMeasurement
                      ? chart.WriteMeasurementFile(source, target)
                      : chart.AppendMissingColumns(source, target,
                                                   c.writer == kMissingColumnsKeywordsFirst),
                  0)
            << c.what;
        EXPECT_EQ(ReadBytes(dir.file("out.txt")), c.expected) << c.what;
    }
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

    // A source without lines gives the identification and the keywords.
    const auto empty = dir.write("empty.txt", "\r\n\n");
    ASSERT_EQ(chart.InsertKeywords(Wide(empty), Wide(dir.file("d.txt")), keywords), 0);
    EXPECT_EQ(ReadBytes(dir.file("d.txt")),
              FileText({"CGATS.17", "ORIGINATOR\t\"Test Lab\"", "CREATED\t2026-12-06"}));
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

    // The file written reads back as a chart of three patches.
    CIT8ReaderWriter reader;
    ASSERT_EQ(reader.ReadChartFile(Wide(dir.file("out.txt"))), 0);
    EXPECT_EQ(reader.GetPatchCount(), 3);
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
