// The new-file writer: field order, number formats, a long name and a read back
// through the reader; writers under a decimal-comma locale.
#include <gtest/gtest.h>

#include <clocale>
#include <filesystem>
#include <locale>
#include <map>
#include <string>
#include <vector>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using test_support::WriteBytes;
using write_test::FileText;
using write_test::Source;
using write_test::WriteNew;

TEST(NewChartFile, WritesTheTwoSetExampleByteForByte) {
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetSampleNameList({"A", "B"});
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 0, 0}});
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    ASSERT_EQ(WriteNew(chart, dir.file("out.txt")), 0);
    // Fields: SAMPLE_NAME 1 + CMYK 4 + Lab 3 + SAMPLE_ID 1 = 9. The CMYK block
    // ends with its own tab, so LAB_L follows two tabs.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"IT8", "NUMBER_OF_FIELDS\t9", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t\tLAB_L\tLAB_A\tLAB_B",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00",
                  "2\tB\t0.00\t100.00\t0.00\t0.00\t48.00\t74.00\t-3.00", "END_DATA"}));

    // The file reads back with the same values.
    CIT8ReaderWriter reader;
    ASSERT_EQ(reader.ReadChartFile(Wide(dir.file("out.txt"))), 0);
    std::vector<std::vector<double>> cmyk;
    ASSERT_EQ(reader.GetDeviceValueLists(cmyk), 0);
    EXPECT_EQ(cmyk, (std::vector<std::vector<double>>{{100, 0, 0, 0}, {0, 100, 0, 0}}));
}

TEST(NewChartFile, EmptyStoreWritesSevenLinesAlsoUnderALongName) {
    TempDir dir;
    const std::string sevenLines =
        FileText({"IT8", "NUMBER_OF_FIELDS\t0", "BEGIN_DATA_FORMAT", "END_DATA_FORMAT",
                  "NUMBER_OF_SETS\t0", "BEGIN_DATA", "END_DATA"});
    CIT8ReaderWriter chart;
    ASSERT_EQ(WriteNew(chart, dir.file("out.txt")), 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")), sevenLines);
#if !defined(_WIN32) // the folder and the name together pass the classic Windows path limit
    // 244 characters is a valid name (at most 255 on the usual file systems), which
    // the writers must create or replace like any other.
    const auto longName = dir.file(std::string(240, 'n') + ".txt");
    WriteBytes(longName, "old");
    ASSERT_EQ(WriteNew(chart, longName), 0);
    EXPECT_EQ(ReadBytes(longName), sevenLines);
    const auto source = dir.write("source.txt", "CGATS.17\n");
    ASSERT_EQ(chart.InsertKeywords(Wide(source), Wide(longName), {{"K", "v"}}), 0);
    EXPECT_EQ(ReadBytes(longName), FileText({"CGATS.17", "K\tv"}));
    EXPECT_EQ(write_test::EntryCount(dir.path()), 3); // no temporary file is left behind
#endif
}

namespace {

struct CommaDecimal : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
};

} // namespace

TEST(Writers, DecimalCommaLocalesStillWritePoints) {
    // The C library's locale where one with a decimal comma is installed, and
    // always a global stream locale with a decimal comma.
    const std::string previousC = std::setlocale(LC_ALL, nullptr);
    for (const char* name : {"de_DE.UTF-8", "de_DE.utf8", "fr_FR.UTF-8", "German_Germany.1252"}) {
        if (std::setlocale(LC_ALL, name) != nullptr) {
            break;
        }
    }
    const std::locale previous =
        std::locale::global(std::locale(std::locale::classic(), new CommaDecimal));
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetCMYKList({tagCMYK{1.5, 2, 3, 4.125}});
    const int newResult = WriteNew(chart, dir.file("new.txt"));
    const auto source =
        dir.write("template.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT",
                                          "BEGIN_DATA", "1", "END_DATA"}));
    chart.SetCMYKList({});
    chart.SetXYZList({tagXYZ{41.25, 0.5, 8}});
    const CColorPatch white(tagCMYK(), tagXYZ{96.42, 100, 82.51}, tagLAB(), tagRGB(), tagCMYKOG(),
                            tagCMYKOGV(), tagCMYKRGB(), {}, tagHTMLCOLOR(), "white");
    testing::internal::CaptureStdout();
    const int whiteResult =
        chart.AppendColumnsWithWhitePoint(Wide(source), Wide(dir.file("white.txt")), white, white);
    testing::internal::GetCapturedStdout();
    std::locale::global(previous);
    std::setlocale(LC_ALL, previousC.c_str());

    // CMYK as the last block leaves a trailing tab on the format line; 4.125 is
    // exact in binary and "%.2f" rounds the tie to even: 4.12.
    ASSERT_EQ(newResult, 0);
    EXPECT_EQ(
        ReadBytes(dir.file("new.txt")),
        FileText({"IT8", "NUMBER_OF_FIELDS\t5", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t", "END_DATA_FORMAT",
                  "NUMBER_OF_SETS\t1", "BEGIN_DATA", "1\t1.50\t2.00\t3.00\t4.12", "END_DATA"}));
    ASSERT_EQ(whiteResult, 0);
    const std::string text = ReadBytes(dir.file("white.txt"));
    EXPECT_NE(text.find("WHITE_POINT_MEASURED_XYZ\t\"96.42\t100\t82.51\""), std::string::npos);
    EXPECT_NE(text.find("1\t    41.25\t     0.50\t     8.00"), std::string::npos);
    EXPECT_EQ(text.find(','), std::string::npos);
}
