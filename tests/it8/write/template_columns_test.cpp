// The template writers: appended columns, the white-point variant, its
// diagnostic lines and its refusals.
#include <gtest/gtest.h>

#include <filesystem>
#include <locale>
#include <stdexcept>
#include <string>

#include "it8/write/white_point_columns.h"
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

struct CommaDecimal : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
};

} // namespace

TEST(TemplateColumns, XYZColumnsAreNineCharactersWide) {
    TempDir dir;
    const auto source = dir.write("template.txt", kTemplate);
    CIT8ReaderWriter chart;
    chart.SetXYZList(
        {tagXYZ{41.25, 50, 8.5}, tagXYZ{0, 100, -1.004}, tagXYZ{1234.5, 0.004, 99.999}});
    ASSERT_EQ(chart.WriteChartFile(Wide(source), Wide(dir.file("out.txt")), true), 0);
    // "%9.2f": 41.25 -> four spaces + "41.25"; 99.999 rounds to "100.00".
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"CGATS.17", "NUMBER_OF_FIELDS\t5", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID SAMPLE_NAME\tXYZ_X\tXYZ_Y\tXYZ_Z", "END_DATA_FORMAT",
                        "NUMBER_OF_SETS 3", "BEGIN_DATA", "1 A\t    41.25\t    50.00\t     8.50",
                        "2 B\t     0.00\t   100.00\t    -1.00",
                        "3 C\t  1234.50\t     0.00\t   100.00", "END_DATA"}));
}

TEST(TemplateColumns, EveryBlockInOrderAndTheFieldCountGrows) {
    TempDir dir;
    const auto source = dir.write(
        "template.txt",
        Source({"CGATS.17", "NUMBER_OF_FIELDS\t2", "BEGIN_DATA_FORMAT", "SAMPLE_ID\tSAMPLE_NAME",
                "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA", "1\tA", "2\tB", "END_DATA"}));
    CIT8ReaderWriter chart;
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 12.345, 0, 0}});
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    chart.SetRGBList({tagRGB{0, 160, 227}, tagRGB{230, 0, 126}});
    chart.SetSpectralDataList({Spectrum(0.5, 0.25), Spectrum(0.123456, 1)}, false);
    ASSERT_EQ(chart.WriteChartFile(Wide(source), Wide(dir.file("out.txt")), true), 0);
    // 2 + CMYK 4 + Lab 3 + RGB 3 + spectral 2 = 14; spectral values follow two tabs.
    // 12.345 is stored a little above 12.345, so "%.2f" gives 12.35 (as Python's
    // "%.2f" % 12.345 does).
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText(
            {"CGATS.17", "NUMBER_OF_FIELDS\t14", "BEGIN_DATA_FORMAT",
             "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_"
             "B\tRGB_R\tRGB_G\tRGB_B\tSPECTRAL_NM_380\tSPECTRAL_NM_390",
             "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
             "1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00\t0\t160\t227\t\t0.50000\t0."
             "25000",
             "2\tB\t0.00\t12.35\t0.00\t0.00\t48.00\t74.00\t-3.00\t230\t0\t126\t\t0.12346\t1."
             "00000",
             "END_DATA"}));
}

TEST(TemplateColumns, EmptyStoreOnlyRewritesTheFieldCountLine) {
    TempDir dir;
    const auto source = dir.write("template.txt", kTemplate);
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.WriteChartFile(Wide(source), Wide(dir.file("out.txt")), true), 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"CGATS.17", "NUMBER_OF_FIELDS\t2", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID SAMPLE_NAME", "END_DATA_FORMAT", "NUMBER_OF_SETS 3",
                        "BEGIN_DATA", "1 A", "2 B", "3 C", "END_DATA"}));

    // Without a NUMBER_OF_FIELDS line none is added.
    const auto bare =
        dir.write("bare.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT",
                                      "BEGIN_DATA", "1", "END_DATA"}));
    chart.SetRGBList({tagRGB{1, 2, 3}});
    ASSERT_EQ(chart.WriteChartFile(Wide(bare), Wide(dir.file("bare-out.txt")), true), 0);
    EXPECT_EQ(ReadBytes(dir.file("bare-out.txt")),
              FileText({"BEGIN_DATA_FORMAT", "SAMPLE_ID\tRGB_R\tRGB_G\tRGB_B", "END_DATA_FORMAT",
                        "BEGIN_DATA", "1\t1\t2\t3", "END_DATA"}));
}

TEST(TemplateColumns, RefusalsLeaveNoTarget) {
    TempDir dir;
    const auto source = dir.write("template.txt", kTemplate);
    const auto noData = dir.write(
        "no-data.txt", Source({"CGATS.17", "BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT"}));
    const auto noFormat =
        dir.write("no-format.txt", Source({"CGATS.17", "BEGIN_DATA", "1", "END_DATA"}));
    const std::wstring target = Wide(dir.file("out.txt"));
    CIT8ReaderWriter chart;
    chart.SetXYZList({tagXYZ{1, 2, 3}, tagXYZ{4, 5, 6}}); // two entries for three rows
    EXPECT_EQ(chart.WriteChartFile(Wide(dir.file("missing.txt")), target, true), 21);
    EXPECT_EQ(chart.WriteChartFile(Wide(source), target, true), 24);
    EXPECT_EQ(chart.WriteChartFile(Wide(noData), target, true), 24);
    EXPECT_EQ(chart.WriteChartFile(Wide(noFormat), target, true), 24);
    testing::internal::CaptureStdout(); // the white-point writer prints the field names
    const CColorPatch white = WhitePatch(tagXYZ{96, 100, 82}, Spectrum(1, 1));
    EXPECT_EQ(chart.AppendColumnsWithWhitePoint(Wide(source), target, white, white), 24);
    EXPECT_EQ(chart.AppendColumnsWithWhitePoint(Wide(noFormat), target, white, white), 24);
    EXPECT_EQ(
        chart.AppendColumnsWithWhitePoint(Wide(dir.file("missing.txt")), target, white, white), 21);
    chart.SetXYZList({});
    EXPECT_EQ(chart.AppendColumnsWithWhitePoint(Wide(source), Wide(dir.file("no folder") / "x"),
                                                white, white),
              23);
    testing::internal::GetCapturedStdout();
    EXPECT_FALSE(std::filesystem::exists(dir.file("out.txt")));
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
        FileText({"CGATS.17",
                  "NUMBER_OF_FIELDS\t7",
                  "",
                  "KEYWORD\tWHITE_POINT_MEASURED_XYZ",
                  "WHITE_POINT_MEASURED_XYZ\t\"96.42\t100\t82.51\"",
                  "KEYWORD\tWHITE_POINT_MEASURED_SPECTRAL",
                  "WHITE_POINT_MEASURED_SPECTRAL\t\"0.8\t0.912346\t\"",
                  "KEYWORD\tWHITE_POINT_PROFILE_XYZ",
                  "WHITE_POINT_PROFILE_XYZ\t\"95.047\t100\t108.883\"",
                  "KEYWORD\tWHITE_POINT_PROFILE_SPECTRAL",
                  "WHITE_POINT_PROFILE_SPECTRAL\t\"1\t1\t\"",
                  "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tSPECTRAL_NM_380\tSPECTRAL_NM_390",
                  "END_DATA_FORMAT",
                  "NUMBER_OF_SETS 3",
                  "BEGIN_DATA",
                  "1\t100.00\t0.00\t0.00\t0.00\t\t0.10000\t0.20000",
                  "2\t0.00\t100.00\t0.00\t0.00\t\t0.30000\t0.40000",
                  "3\t0.00\t0.00\t100.00\t0.00\t\t0.50000\t0.60000",
                  "END_DATA"}));
    EXPECT_EQ(printed, "SAMPLE_ID SAMPLE_NAMESAMPLE_ID\nSPECTRAL_NM_380 : 0.10000\n"
                       "\nSPECTRAL_NM_390 : 0.20000\nsdMap.size(): 2\n");
}

TEST(WhitePointColumns, IdentifierFieldAndFieldCountValue) {
    TempDir dir;
    const CColorPatch white = WhitePatch(tagXYZ{1, 2, 3}, {});
    std::string printed;
    const it8::DiagnosticSink sink([&printed](const std::string& text) { printed += text; });
    const std::vector<tagCMYK> cmyk;
    const std::vector<tagXYZ> xyz;
    const std::vector<tagLAB> lab;
    const std::vector<tagRGB> rgb;
    const std::vector<std::map<std::string, double>> spectral;
    const it8::TemplateLists empty{cmyk, xyz, lab, rgb, spectral};

    // The first name containing "ID" is kept; a field count line without a value counts 0.
    const auto idLater = dir.write(
        "later.txt", Source({"NUMBER_OF_FIELDS", "BEGIN_DATA_FORMAT", "SAMPLE_NAME\tSAMPLE_ID\tX",
                             "END_DATA_FORMAT", "BEGIN_DATA", "a 1 2", "END_DATA"}));
    ASSERT_EQ(it8::WriteColumnsWithWhitePoint(Wide(idLater), Wide(dir.file("later-out.txt")), empty,
                                              white, white, sink),
              0);
    const std::string block =
        "\nKEYWORD\tWHITE_POINT_MEASURED_XYZ\nWHITE_POINT_MEASURED_XYZ\t\"1\t2\t3\""
        "\nKEYWORD\tWHITE_POINT_MEASURED_SPECTRAL\nWHITE_POINT_MEASURED_SPECTRAL\t\"\""
        "\nKEYWORD\tWHITE_POINT_PROFILE_XYZ\nWHITE_POINT_PROFILE_XYZ\t\"1\t2\t3\""
        "\nKEYWORD\tWHITE_POINT_PROFILE_SPECTRAL\nWHITE_POINT_PROFILE_SPECTRAL\t\"\"";
    EXPECT_EQ(ReadBytes(dir.file("later-out.txt")),
              FileText({"NUMBER_OF_FIELDS\t1", block, "BEGIN_DATA_FORMAT", "SAMPLE_ID",
                        "END_DATA_FORMAT", "BEGIN_DATA", "a 1 2", "END_DATA"}));
    EXPECT_EQ(printed, "SAMPLE_NAME\tSAMPLE_ID\tXSAMPLE_ID");

    // No name contains "ID": the first one is kept.
    const auto noId = dir.write("no-id.txt", Source({"BEGIN_DATA_FORMAT", "NAME\tX",
                                                     "END_DATA_FORMAT", "BEGIN_DATA", "END_DATA"}));
    ASSERT_EQ(it8::WriteColumnsWithWhitePoint(Wide(noId), Wide(dir.file("no-id-out.txt")), empty,
                                              white, white, sink),
              0);
    EXPECT_EQ(ReadBytes(dir.file("no-id-out.txt")),
              FileText({block, "BEGIN_DATA_FORMAT", "NAME", "END_DATA_FORMAT", "BEGIN_DATA",
                        "END_DATA"}));

    // A field count that is not a number leaves through the conversion error.
    const auto badCount =
        dir.write("bad.txt", Source({"NUMBER_OF_FIELDS two", "BEGIN_DATA_FORMAT", "SAMPLE_ID",
                                     "END_DATA_FORMAT", "BEGIN_DATA", "END_DATA"}));
    EXPECT_THROW(it8::WriteColumnsWithWhitePoint(Wide(badCount), Wide(dir.file("bad-out.txt")),
                                                 empty, white, white, sink),
                 std::invalid_argument);
    EXPECT_FALSE(std::filesystem::exists(dir.file("bad-out.txt")));
}

TEST(WhitePointColumns, StreamLocaleWithDecimalCommaDoesNotLeakIntoTheFile) {
    TempDir dir;
    const auto source =
        dir.write("template.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT",
                                          "BEGIN_DATA", "1", "END_DATA"}));
    const std::locale previous =
        std::locale::global(std::locale(std::locale::classic(), new CommaDecimal));
    CIT8ReaderWriter chart;
    chart.SetXYZList({tagXYZ{41.25, 0.5, 8}});
    const CColorPatch white = WhitePatch(tagXYZ{96.42, 100, 82.51}, {});
    testing::internal::CaptureStdout();
    const int result =
        chart.AppendColumnsWithWhitePoint(Wide(source), Wide(dir.file("out.txt")), white, white);
    testing::internal::GetCapturedStdout();
    std::locale::global(previous);
    ASSERT_EQ(result, 0);
    const std::string text = ReadBytes(dir.file("out.txt"));
    EXPECT_NE(text.find("WHITE_POINT_MEASURED_XYZ\t\"96.42\t100\t82.51\""), std::string::npos);
    EXPECT_NE(text.find("1\t    41.25\t     0.50\t     8.00"), std::string::npos);
    EXPECT_EQ(text.find(','), std::string::npos);
}
