// What a read puts into the store: keywords, sections, format line and patches.
#include <gtest/gtest.h>

#include <map>
#include <stdexcept>
#include <string>

#include "chart_text.h"
#include "color_patch_probe.h"

using namespace reader_test;
using test_support::TempDir;

namespace {

const std::string kCmyk = Chart("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 10 20 30 40"});

// The message of the error of type Error that reading `text` throws.
template <typename Error>
std::string ErrorOf(CIT8ReaderWriter& reader, const TempDir& dir, const std::string& text) {
    try {
        ReadText(reader, dir, text);
    } catch (const Error& error) {
        return error.what();
    }
    return "no error";
}

} // namespace

TEST(ChartContent, HeaderKeywordsAndSections) {
    TempDir dir;
    CIT8ReaderWriter reader;
    const std::string header =
        Lines({"CGATS.17", "DESCRIPTOR  a\t\t\"b c\" ", "CREATED 1", "CREATED 2",
               "number_of_sets 5", "BEGIN_TARGET_FORMAT", "HIDDEN 1", "NUMBER_OF_SETS 7",
               "END_TARGET_FORMAT x", "BEGIN_MEASUREMENT_SCRIPT", "END_TARGET_FORMAT", "HIDDEN 2",
               "END_MEASUREMENT_SCRIPT", "BEGIN_DEVICE_CONTROL_SEQUENCE", "\tMOVE 10  20", "",
               "   ", "END_DEVICE_CONTROL_SEQUENCE ", "END_DEVICE_CONTROL_SEQUENCE"},
              "\r\n");
    ASSERT_EQ(ReadText(reader, dir, header + kCmyk + "AFTER yes\n"), 0);
    const auto keywords = reader.GetKeywords();
    EXPECT_EQ(keywords.at("DESCRIPTOR"), "a \"b c\" ");
    EXPECT_EQ(keywords.at("CREATED"), "2 ");
    EXPECT_EQ(keywords.at("number_of_sets"), "5 "); // not the set count: 1 row read
    EXPECT_EQ(keywords.at("NUMBER_OF_SETS"), "1 ");
    EXPECT_EQ(keywords.at("AFTER"), "yes ");
    EXPECT_EQ(keywords.count("HIDDEN") + keywords.count("SAMPLE_ID") + keywords.count("1"), 0u);

    // Device-control lines keep their blanks, lose the empty line and the CRs;
    // with nothing captured the writer answers 23.
    const auto out = dir.file("control.txt");
    ASSERT_EQ(reader.WriteDeviceControlSequence(out.string()), 0);
#if defined(_WIN32)
    const char* const eol = "\r\n"; // the file is written in text mode
#else
    const char* const eol = "\n";
#endif
    EXPECT_EQ(test_support::ReadBytes(out), std::string("\tMOVE 10  20") + eol + "   " + eol +
                                                "END_DEVICE_CONTROL_SEQUENCE " + eol);
    EXPECT_EQ(CIT8ReaderWriter().WriteDeviceControlSequence(dir.file("none.txt").string()), 23);
}

TEST(ChartContent, LayoutKeywordsAndTheirErrors) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, "NUMBER_OF_STRIPS \"12\"\nNUMBER_OF_COLS 3x\n" + kCmyk), 0);
    EXPECT_EQ(reader.GetNumberOfStrips(), 12);
    EXPECT_EQ(reader.GetNumberOfCols(), 3);
    EXPECT_EQ(ErrorOf<std::invalid_argument>(reader, dir, "NUMBER_OF_STRIPS x3\n" + kCmyk),
              "invalid stol argument");
    EXPECT_EQ(ErrorOf<std::out_of_range>(reader, dir, "NUMBER_OF_COLS 99999999999\n" + kCmyk),
              "stol argument out of range");
    // A spectral name the patch cannot read ends the read and empties the store.
    EXPECT_EQ(ErrorOf<std::invalid_argument>(reader, dir, Chart("SPECTRAL_X", {"0.5"})),
              "invalid stol argument");
    EXPECT_EQ(reader.GetPatchCount(), 0);
    EXPECT_TRUE(reader.GetKeywords().empty());
    // The file was closed on every way out, and the reader reads on.
    std::filesystem::remove(dir.file("chart.txt"));
    EXPECT_EQ(ReadText(reader, dir, CmykLabChart()), 0);
    EXPECT_EQ(reader.GetPatchCount(), 2);
}

TEST(ChartContent, FormatLineAndFieldKinds) {
    TempDir dir;
    CIT8ReaderWriter reader;
    // nm400 is spectral, 7clr_2 and PC_1 are n-colour channels, SAMPLE_NAME and
    // LAB_L general; the second line of names continues the columns.
    ASSERT_EQ(ReadText(reader, dir,
                       Lines({"NUMBER_OF_SETS 1", "BEGIN_DATA_FORMAT", "sample_name\tnm400",
                              "7clr_2  LAB_L PC_1", "END_DATA_FORMAT", "BEGIN_DATA",
                              "name 0.5 40 50 60", "END_DATA"})),
              0);
    const std::string formatLine = "SAMPLE_NAME\tNM400\t7CLR_2\tLAB_L\tPC_1\t";
    EXPECT_EQ(reader.GetDataFormatLine(), formatLine);
    const CColorPatch patch = PatchOf(reader, 1);
    auto channels = patch.GetNColorMap();
    ASSERT_EQ(channels.size(), 2u);
    EXPECT_EQ(channels[0].name, "7CLR_2"); // byte order: "7CLR_2" before "PC_1"
    EXPECT_EQ(channels[0].colorantCount, 7);
    EXPECT_EQ(channels[1].colorantCount, 0);
    // The format line survives a failed read that reaches no data format.
    EXPECT_EQ(ReadText(reader, dir, "garbage\n"), 9);
    EXPECT_EQ(reader.GetDataFormatLine(), formatLine);
}

TEST(ChartContent, ColourGroupsOfARow) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("CMYK_C CMYK_M CMYK_Y CMYK_K RGB_R RGB_G RGB_B ORANGE GREEN VIOLET "
                             "D_RED D_GREEN D_BLUE D_VIS",
                             {"1 2 3 4 12,9 -3.7 255 5 6 7 0.1 0,2 0.3 0.4"})),
              0);
    CColorPatch patch = PatchOf(reader, 1);
    EXPECT_EQ(patch.GetRGB().r, 12); // truncated toward zero
    EXPECT_EQ(patch.GetRGB().g, -3);
    EXPECT_EQ(patch.GetCMYKOGV().v, 7.0);
    EXPECT_EQ(patch.GetDensity().green, 0.2);
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_DENSITY));

    // Without CMYK_K and D_BLUE, CMYK and densities count as missing.
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("CMYK_C CMYK_M CMYK_Y D_RED D_GREEN XYZ_X XYZ_Y XYZ_Z",
                             {"10 20 30 0.1 0.2 41 42 43"})),
              0);
    patch = PatchOf(reader, 1);
    EXPECT_FALSE(patch.IsCMYKPresent());
    EXPECT_NE(ColorPatchProbe::missingMask(patch) & MISSING_DENSITY, 0u);

    // HTML colours: "1G" reads up to the G; six digits without '#' are missing.
    ASSERT_EQ(
        ReadText(reader, dir, Chart("SAMPLE_ID DRGB", {"1 #1A2b3C", "2 #1G2345", "3 1A2B3C"})), 0);
    EXPECT_EQ(PatchOf(reader, 1).GetHTMLCOLOR().g, 0x2Bu);
    EXPECT_EQ(PatchOf(reader, 2).GetHTMLCOLOR().r, 1u);
    EXPECT_FALSE(PatchOf(reader, 3).IsHTMLCOLORPresent());
    EXPECT_FALSE(reader.IsColorSpacePresent(COLORSPACE_HTMLCOLOR)); // as the last row
}
