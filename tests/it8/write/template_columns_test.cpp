// The template writers: appended columns, the white-point variant and its
// diagnostic lines.
#include <gtest/gtest.h>

#include <filesystem>
#include <stdexcept>
#include <string>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::FileText;
using write_test::Source;

namespace {

// Spaces around lines, an empty line and CR LF line ends are all dropped when
// the template is read.
const std::string kTemplate =
    "CGATS.17\r\n  NUMBER_OF_FIELDS 2  \r\n\r\nBEGIN_DATA_FORMAT\r\nSAMPLE_ID SAMPLE_NAME\r\n"
    "END_DATA_FORMAT\r\nNUMBER_OF_SETS 3\r\nBEGIN_DATA\r\n1 A\r\n2 B\r\n3 C\r\nEND_DATA\r\n";

std::map<std::string, double> Spectrum(double at380, double at390) {
    return {{"SPECTRAL_NM_380", at380}, {"SPECTRAL_NM_390", at390}};
}

CColorPatch WhitePatch(tagXYZ xyz, std::map<std::string, double> spectrum) {
    return CColorPatch(tagCMYK(), xyz, tagLAB(), tagRGB(), tagCMYKOG(), tagCMYKOGV(), tagCMYKRGB(),
                       std::move(spectrum), tagHTMLCOLOR(), "white");
}

} // namespace

TEST(TemplateColumns, EveryBlockInOrderAndTheFieldCountGrows) {
    TempDir dir;
    const auto source = dir.write(
        "template.txt",
        Source({"CGATS.17", "NUMBER_OF_FIELDS\t2", "BEGIN_DATA_FORMAT", "SAMPLE_ID\tSAMPLE_NAME",
                "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA", "1\tA", "2\tB", "END_DATA"}));
    CIT8ReaderWriter chart;
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 12.345, 0, 0}});
    chart.SetXYZList({tagXYZ{41.25, 50, 8.5}, tagXYZ{1234.5, 0.004, 99.999}});
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    chart.SetRGBList({tagRGB{0, 160, 227}, tagRGB{230, 0, 126}});
    chart.SetSpectralDataList({Spectrum(0.5, 0.25), Spectrum(0.123456, 1)}, false);
    ASSERT_EQ(chart.WriteChartFile(Wide(source), Wide(dir.file("out.txt")), true), 0);
    // 2 + CMYK 4 + XYZ 3 + Lab 3 + RGB 3 + spectral 2 = 17; spectral values follow
    // two tabs. XYZ with "%9.2f": 41.25 -> four spaces + "41.25", 99.999 -> "100.00".
    // 12.345 is stored a little above 12.345, so "%.2f" gives 12.35 (as Python's
    // "%.2f" % 12.345 does).
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"CGATS.17", "NUMBER_OF_FIELDS\t17", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tXYZ_X\tXYZ_Y\tXYZ_"
                        "Z\tLAB_L\tLAB_A\tLAB_B\tRGB_R\tRGB_G\tRGB_B\tSPECTRAL_NM_380\tSPECTRAL_NM_"
                        "390",
                        "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                        "1\tA\t100.00\t0.00\t0.00\t0.00\t    41.25\t    50.00\t     8.50\t55.00\t-"
                        "37.00\t-50.00\t0\t160\t227\t\t0.50000\t0.25000",
                        "2\tB\t0.00\t12.35\t0.00\t0.00\t  1234.50\t     0.00\t   100.00\t48.00\t74."
                        "00\t-3.00\t230\t0\t126\t\t0.12346\t1.00000",
                        "END_DATA"}));
}

TEST(TemplateColumns, WithoutAFieldCountLineNoneIsAdded) {
    TempDir dir;
    CIT8ReaderWriter chart;
    const auto bare =
        dir.write("bare.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT",
                                      "BEGIN_DATA", "1", "END_DATA"}));
    chart.SetRGBList({tagRGB{1, 2, 3}});
    ASSERT_EQ(chart.WriteChartFile(Wide(bare), Wide(dir.file("bare-out.txt")), true), 0);
    EXPECT_EQ(ReadBytes(dir.file("bare-out.txt")),
              FileText({"BEGIN_DATA_FORMAT", "SAMPLE_ID\tRGB_R\tRGB_G\tRGB_B", "END_DATA_FORMAT",
                        "BEGIN_DATA", "1\t1\t2\t3", "END_DATA"}));
}

TEST(WhitePointColumns, ReducedFormatRenumberedRowsAndWhitePointBlock) {
    TempDir dir;
    const auto source = dir.write("template.txt", kTemplate);
    CIT8ReaderWriter chart;
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 0, 0}, tagCMYK{0, 0, 100, 0}});
    chart.SetSpectralDataList({Spectrum(0.1, 0.2), Spectrum(0.3, 0.4), Spectrum(0.5, 0.6)}, false);
    const CColorPatch measured = WhitePatch(tagXYZ{96.42, 100, 82.51}, Spectrum(0.8, 0.9123456));
    const CColorPatch profile = WhitePatch(tagXYZ{95.047, 100, 108.883}, Spectrum(1, 1));

    testing::internal::CaptureStdout();
    const int result = chart.AppendColumnsWithWhitePoint(Wide(source), Wide(dir.file("out.txt")),
                                                         measured, profile);
    const std::string printed = testing::internal::GetCapturedStdout();
    ASSERT_EQ(result, 0);
    // Six significant digits: 0.9123456 -> 0.912346, 100 -> 100. Fields: the
    // identifier 1 + CMYK 4 + spectral 2 = 7.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"CGATS.17", "NUMBER_OF_FIELDS\t7", "",
                  "KEYWORD\tWHITE_POINT_MEASURED_XYZ\n"
                  "WHITE_POINT_MEASURED_XYZ\t\"96.42\t100\t82.51\"",
                  "KEYWORD\tWHITE_POINT_MEASURED_SPECTRAL\n"
                  "WHITE_POINT_MEASURED_SPECTRAL\t\"0.8\t0.912346\t\"",
                  "KEYWORD\tWHITE_POINT_PROFILE_XYZ\n"
                  "WHITE_POINT_PROFILE_XYZ\t\"95.047\t100\t108.883\"",
                  "KEYWORD\tWHITE_POINT_PROFILE_SPECTRAL\n"
                  "WHITE_POINT_PROFILE_SPECTRAL\t\"1\t1\t\"",
                  "BEGIN_DATA_FORMAT\n"
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tSPECTRAL_NM_380\tSPECTRAL_NM_390\n"
                  "END_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA",
                  "1\t100.00\t0.00\t0.00\t0.00\t\t0.10000\t0.20000\n"
                  "2\t0.00\t100.00\t0.00\t0.00\t\t0.30000\t0.40000\n"
                  "3\t0.00\t0.00\t100.00\t0.00\t\t0.50000\t0.60000\nEND_DATA"}));
    EXPECT_EQ(printed, "SAMPLE_ID SAMPLE_NAMESAMPLE_ID\nSPECTRAL_NM_380 : 0.10000\n"
                       "\nSPECTRAL_NM_390 : 0.20000\nsdMap.size(): 2\n");
}

TEST(WhitePointColumns, IdentifierFieldAndFieldCountValue) {
    TempDir dir;
    CIT8ReaderWriter chart;
    const auto out = dir.file("out.txt");
    const CColorPatch white = WhitePatch(tagXYZ{1, 2, 3}, {});
    const auto write = [&](const std::string& head) {
        const auto source =
            dir.write("source.txt", head + Source({"END_DATA_FORMAT", "BEGIN_DATA", "END_DATA"}));
        return chart.AppendColumnsWithWhitePoint(Wide(source), Wide(out), white, white);
    };
    testing::internal::CaptureStdout(); // the field names printed
    // The first name containing "ID" is kept; a field count line without a value
    // counts 0, plus the one field kept.
    ASSERT_EQ(write(Source({"NUMBER_OF_FIELDS", "BEGIN_DATA_FORMAT", "SAMPLE_NAME\tSAMPLE_ID\tX"})),
              0);
    std::string text = ReadBytes(out);
    EXPECT_EQ(text.rfind(FileText({"NUMBER_OF_FIELDS\t1"}), 0), 0u);
    EXPECT_NE(text.find(FileText({"BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT"})),
              std::string::npos);
    // No name contains "ID": the first one is kept.
    ASSERT_EQ(write(Source({"BEGIN_DATA_FORMAT", "NAME\tX"})), 0);
    text = ReadBytes(out);
    EXPECT_NE(text.find(FileText({"BEGIN_DATA_FORMAT", "NAME", "END_DATA_FORMAT"})),
              std::string::npos);
    // A field count that is not a number leaves through the conversion error.
    std::filesystem::remove(out);
    EXPECT_THROW(write(Source({"NUMBER_OF_FIELDS two", "BEGIN_DATA_FORMAT", "SAMPLE_ID"})),
                 std::invalid_argument);
    EXPECT_FALSE(std::filesystem::exists(out));
    testing::internal::GetCapturedStdout();
}
