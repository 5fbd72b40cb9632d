// The template writer's white-point variant: reduced format, renumbered rows
// and the white-point block.
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
    testing::internal::GetCapturedStdout(); // the diagnostic lines
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
}
