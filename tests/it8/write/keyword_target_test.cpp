// Reading source lines, keyword insertion, the target-file writer and the
// device-control writer.
#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::FileText;
using write_test::Source;

TEST(FileLines, SplitsAtEveryLineEndTrimsSpacesAndStopsAtNul) {
    TempDir dir;
    const auto file = dir.write("lines.txt", std::string("  A B  \r\n\r\nC\rD\n\n\tE \n\t\n", 22) +
                                                 std::string("F\0G\nH", 5));
    std::vector<std::string> lines{"left over"};
    ASSERT_EQ(CIT8ReaderWriter::ReadFileLines(Wide(file), lines), 0);
    EXPECT_EQ(lines, (std::vector<std::string>{"A B", "C", "D", "\tE", "\t", "F"}));

    EXPECT_EQ(CIT8ReaderWriter::ReadFileLines(Wide(dir.file("missing.txt")), lines), 21);
    EXPECT_TRUE(lines.empty());
    EXPECT_EQ(CIT8ReaderWriter::ReadFileLines(Wide(dir.path()), lines), 21);
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

    EXPECT_EQ(
        chart.InsertKeywords(Wide(dir.file("missing.txt")), Wide(dir.file("e.txt")), keywords), 21);
    EXPECT_EQ(chart.InsertKeywords(Wide(cgats), Wide(dir.file("no folder") / "f.txt"), keywords),
              23);
    EXPECT_FALSE(std::filesystem::exists(dir.file("e.txt")));
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

TEST(TargetFile, ResultCodes) {
    TempDir dir;
    const auto mixed =
        dir.write("mixed.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                                       "END_DATA_FORMAT", "NUMBER_OF_SETS 1", "BEGIN_DATA",
                                       "1 50 50 0 0", "END_DATA"}));
    const std::wstring target = Wide(dir.file("out.txt"));
    CIT8ReaderWriter chart;
    EXPECT_EQ(chart.WriteTargetFile(Wide(dir.file("missing.txt")), target), 22);
    // An empty store has neither clean nor white patches.
    EXPECT_EQ(chart.WriteTargetFile(Wide(mixed), target), 1);
    ASSERT_EQ(chart.ReadChartFile(Wide(mixed)), 0);
    EXPECT_EQ(chart.WriteTargetFile(Wide(mixed), target), 1);
    EXPECT_FALSE(std::filesystem::exists(dir.file("out.txt")));
}

TEST(DeviceControl, WritesTheCapturedLines) {
    TempDir dir;
    const auto source = dir.write(
        "source.txt", Source({"CGATS.17", "BEGIN_DEVICE_CONTROL_SEQUENCE", "SET speed 3",
                              "\tMOVE 10,20", "END_DEVICE_CONTROL_SEQUENCE", "BEGIN_DATA_FORMAT",
                              "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT",
                              "NUMBER_OF_SETS 1", "BEGIN_DATA", "1 0 0 0 0", "END_DATA"}));
    CIT8ReaderWriter chart;
    const std::string target = (dir.path() / "device.txt").string();
    EXPECT_EQ(chart.WriteDeviceControlSequence(target), 23); // nothing captured yet
    EXPECT_FALSE(std::filesystem::exists(target));

    ASSERT_EQ(chart.ReadChartFile(Wide(source)), 0);
    // The narrow path is a UTF-8 name: "ger\xC3\xA4t" is "gerät".
    const std::string utf8Name = (dir.path() / "ger\xC3\xA4t.txt").u8string();
    ASSERT_EQ(chart.WriteDeviceControlSequence(utf8Name), 0);
    EXPECT_EQ(ReadBytes(std::filesystem::u8path(utf8Name)),
              FileText({"SET speed 3", "\tMOVE 10,20"}));
    EXPECT_EQ(chart.WriteDeviceControlSequence((dir.path() / "no folder" / "x").string()), 23);
}
