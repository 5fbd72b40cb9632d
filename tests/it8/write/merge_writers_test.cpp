// The measurement merge writers: rebuilt data block, appended missing columns,
// identification line, field and set count lines, and their refusals.
#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::FileText;
using write_test::Source;

namespace {

const std::string kCmykSource =
    Source({"CGATS.17", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS 5", "BEGIN_DATA_FORMAT",
            "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT", "NUMBER_OF_SETS 2",
            "BEGIN_DATA", "1 100 0 0 0", "2 0 50.5 0 0", "END_DATA"});

// The store learns its set count by reading a chart with that many sets.
void ReadInto(CIT8ReaderWriter& chart, const std::filesystem::path& path) {
    ASSERT_EQ(chart.ReadChartFile(Wide(path)), 0);
}

} // namespace

TEST(MeasurementFile, RebuildsRowsWithTheStoreMeasurements) {
    TempDir dir;
    const auto source = dir.write("source.txt", kCmykSource);
    CIT8ReaderWriter chart;
    ReadInto(chart, source);
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    chart.SetXYZList({tagXYZ{41.25, 50, 0.1234567}, tagXYZ{0.00001, 100, 1234.5678}});
    ASSERT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(dir.file("out.txt"))), 0);
    // Fields: SAMPLE_ID + CMYK 4 + Lab 3 + XYZ 3 = 11. Values with six significant
    // digits: 0.1234567 -> 0.123457, 0.00001 -> 1e-05, 1234.5678 -> 1234.57.
    // The quoted header line keeps its space; the others get tabs.
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

TEST(MeasurementFile, AddsIdentificationAndFieldCountWhenTheSourceLacksThem) {
    TempDir dir;
    const auto source =
        dir.write("source.txt", Source({"IT8.7/1", "ORIGINATOR \"Test Lab\"", "BEGIN_DATA_FORMAT",
                                        "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT",
                                        "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 100 0 0 0",
                                        "2 0 50.5 0 0", "END_DATA"}));
    CIT8ReaderWriter chart;
    ReadInto(chart, source);
    chart.SetLABList({tagLAB{55.5, 0, 0}, tagLAB{0.25, 1, 2}});
    ASSERT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(dir.file("out.txt"))), 0);
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"CGATS.17", "IT8.7/1", "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t8",
                  "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\t",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\t100\t0\t0\t0\t55.5\t0\t0\t", "2\t0\t50.5\t0\t0\t0.25\t1\t2\t", "END_DATA"}));
}

TEST(MeasurementFile, ResultCodesAndNoTargetOnFailure) {
    TempDir dir;
    const auto source = dir.write("source.txt", kCmykSource);
    const auto notAChart = dir.write("empty.txt", "");
    const auto target = dir.write("out.txt", "old");
    CIT8ReaderWriter chart;
    // Nothing read into the store: its set count 0 does not fit two rows.
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(target)), 24);
    ReadInto(chart, source);
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(notAChart), Wide(target)), 22);
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(dir.file("missing.txt")), Wide(target)), 22);
    chart.SetXYZList({tagXYZ{1, 2, 3}, tagXYZ{1, 2, 3}, tagXYZ{1, 2, 3}}); // three for two rows
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(target)), 24);
    chart.SetXYZList({tagXYZ{1, 2, 3}, tagXYZ{1, 2, 3}});
    chart.SetLABList({tagLAB{1, 2, 3}}); // one for two rows
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(target)), 24);
    EXPECT_EQ(ReadBytes(target), "old");
    chart.SetLABList({});
    EXPECT_EQ(chart.WriteMeasurementFile(Wide(source), Wide(dir.file("no folder") / "out.txt")),
              23);
}

TEST(MissingColumns, AppendsOnlyTheSpacesTheSourceLacks) {
    TempDir dir;
    const auto source = dir.write("source.txt", kCmykSource);
    CIT8ReaderWriter chart;
    ReadInto(chart, source);
    chart.SetKeywordList({{"CREATED", "\"2026-12-06\""}, {"DESCRIPTOR", "two words"}});
    chart.SetCMYKList({tagCMYK{1, 1, 1, 1}, tagCMYK{2, 2, 2, 2}}); // the source has CMYK already
    chart.SetXYZList({tagXYZ{41.25, 50, 0.123}, tagXYZ{0, 100, 1234.5678}});
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    ASSERT_EQ(chart.AppendMissingColumns(Wide(source), Wide(dir.file("out.txt")), true), 0);
    // Fields: 5 read + XYZ 3 + Lab 3 = 11. Keyword lines keep their spaces, as
    // does the NUMBER_OF_SETS line rewritten after the tab rule.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"CREATED \"2026-12-06\"", "DESCRIPTOR two words", "CGATS.17",
                  "ORIGINATOR \"Test Lab\"", "NUMBER_OF_FIELDS\t11", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tXYZ_X\tXYZ_Y\tXYZ_Z\tLAB_L\tLAB_"
                  "A\tLAB_B",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS 2", "BEGIN_DATA",
                  "1\t100\t0\t0\t0\t41.25\t50.00\t0.12\t55.00\t-37.00\t-50.00",
                  "2\t0\t50.5\t0\t0\t0.00\t100.00\t1234.57\t48.00\t74.00\t-3.00", "END_DATA"}));
}

TEST(MissingColumns, LabSourceGainsRGBButNoLabAndFieldCountLineIsInserted) {
    TempDir dir;
    const auto source = dir.write(
        "source.txt",
        Source({"IT8.7/3", "BEGIN_DATA_FORMAT", "SAMPLE_ID LAB_L LAB_A LAB_B", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 50 0 0", "2 60 1 1", "END_DATA"}));
    CIT8ReaderWriter chart;
    ReadInto(chart, source);
    chart.SetLABList({tagLAB{1, 1, 1}, tagLAB{2, 2, 2}});
    chart.SetRGBList({tagRGB{255, 0, 0}, tagRGB{0, 255, 7}});
    ASSERT_EQ(chart.AppendMissingColumns(Wide(source), Wide(dir.file("out.txt")), false), 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"IT8.7/3", "NUMBER_OF_FIELDS\t7", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID\tLAB_L\tLAB_A\tLAB_B\tRGB_R\tRGB_G\tRGB_B", "END_DATA_FORMAT",
                        "NUMBER_OF_SETS 2", "BEGIN_DATA", "1\t50\t0\t0\t255\t0\t0",
                        "2\t60\t1\t1\t0\t255\t7", "END_DATA"}));
}

TEST(MissingColumns, CountChecksAnswer24AndWriteNothing) {
    TempDir dir;
    const auto source = dir.write("source.txt", kCmykSource);
    const auto threeSets =
        dir.write("three.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                                       "END_DATA_FORMAT", "NUMBER_OF_SETS 3", "BEGIN_DATA",
                                       "1 0 0 0 0", "2 0 0 0 0", "3 0 0 0 0", "END_DATA"}));
    const std::wstring target = Wide(dir.file("out.txt"));
    CIT8ReaderWriter chart;
    ReadInto(chart, source);
    chart.SetLABList(
        {tagLAB{1, 1, 1}, tagLAB{2, 2, 2}, tagLAB{3, 3, 3}}); // longer than the two rows
    EXPECT_EQ(chart.AppendMissingColumns(Wide(source), target, false), 24);
    EXPECT_EQ(chart.AppendMissingColumns(Wide(source), target, true), 24);
    EXPECT_EQ(chart.AppendMissingColumns(Wide(dir.file("missing.txt")), target, true), 22);

    // A store of three sets cannot work three rows of a two-row source.
    CIT8ReaderWriter larger;
    ReadInto(larger, threeSets);
    EXPECT_EQ(larger.AppendMissingColumns(Wide(source), target, true), 24);
    EXPECT_FALSE(std::filesystem::exists(dir.file("out.txt")));
}
