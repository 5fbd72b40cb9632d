// What a read puts into the store (keywords, sections, format line, patches) and
// the device queries on it.
#include <gtest/gtest.h>

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

#include "chart_text.h"
#include "color_patch_probe.h"

using namespace reader_test;
using test_support::TempDir;
using Strings = std::vector<std::string>;
using Lists = std::vector<std::vector<double>>;

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
               "number_of_sets 5", "NUMBER_OF_PAGES \"3\"", "PATCHES_PER_PAGE 12abc"},
              "\r\n") +
        Lines({"BEGIN_TARGET_FORMAT", "HIDDEN 1", "NUMBER_OF_SETS 7", "END_TARGET_FORMAT x",
               "BEGIN_MEASUREMENT_SCRIPT", "END_TARGET_FORMAT", "HIDDEN 2",
               "END_MEASUREMENT_SCRIPT"},
              "\r\n") +
        Lines({"BEGIN_DEVICE_CONTROL_SEQUENCE", "\tMOVE 10  20", "", "   ",
               "END_DEVICE_CONTROL_SEQUENCE ", "END_DEVICE_CONTROL_SEQUENCE"},
              "\r\n") +
        Lines({"PROCESSCOLOR_ID \"1 Cyan\"", "PROCESSCOLOR_ID",
               "PROCESSCOLOR_ID 2\t\"Deep Magenta\""},
              "\r\n");
    ASSERT_EQ(ReadText(reader, dir, header + kCmyk + "AFTER yes\n"), 0);
    const auto keywords = reader.GetKeywords();
    EXPECT_EQ(keywords.at("CGATS.17"), "");
    EXPECT_EQ(keywords.at("DESCRIPTOR"), "a \"b c\" ");
    EXPECT_EQ(keywords.at("CREATED"), "2 ");
    EXPECT_EQ(keywords.at("number_of_sets"), "5 "); // not the set count: 1 row read
    EXPECT_EQ(keywords.at("NUMBER_OF_SETS"), "1 ");
    EXPECT_EQ(keywords.at("PROCESSCOLOR_ID"), "2 \"Deep Magenta\" ");
    EXPECT_EQ(keywords.at("AFTER"), "yes ");
    EXPECT_EQ(keywords.count("HIDDEN") + keywords.count("SAMPLE_ID") + keywords.count("1"), 0u);
    EXPECT_EQ(reader.GetNumberOfPages(), 3);
    EXPECT_EQ(reader.GetPatchesPerPage(), 12);

    // Device-control lines keep their blanks, lose the empty line and the CRs;
    // with nothing captured, or no folder to write in, the writer answers 23.
    const auto out = dir.file("control.txt");
    ASSERT_EQ(reader.WriteDeviceControlSequence(out.string()), 0);
#if defined(_WIN32)
    const char* const eol = "\r\n"; // the file is written in text mode
#else
    const char* const eol = "\n";
#endif
    EXPECT_EQ(test_support::ReadBytes(out), std::string("\tMOVE 10  20") + eol + "   " + eol +
                                                "END_DEVICE_CONTROL_SEQUENCE " + eol);
    EXPECT_EQ(reader.WriteDeviceControlSequence((dir.path() / "no" / "x").string()), 23);
    EXPECT_EQ(CIT8ReaderWriter().WriteDeviceControlSequence(dir.file("none.txt").string()), 23);
    // Process colours: the last word of each value; the entry without one is skipped.
    Strings names{"stale"};
    EXPECT_EQ(reader.GetProcessColorNames(names), 0);
    EXPECT_EQ(names, (Strings{"Cyan", "Magenta"}));
}

TEST(ChartContent, LayoutKeywordsAndTheirErrors) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, "NUMBER_OF_STRIPS \"12\"\nNUMBER_OF_COLS 24\n" + kCmyk), 0);
    EXPECT_EQ(reader.GetNumberOfStrips(), 12);
    EXPECT_EQ(reader.GetNumberOfCols(), 24);
    ASSERT_EQ(ReadText(reader, dir, "NUMBER_OF_STRIPS 3x\n" + kCmyk), 0);
    EXPECT_EQ(reader.GetNumberOfStrips(), 3);
    EXPECT_EQ(reader.GetNumberOfCols(), 0);
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
    EXPECT_EQ(reader.GetKeywords().count("NUMBER_OF_FIELDS"), 0u);
    const CColorPatch patch = PatchOf(reader, 1);
    EXPECT_EQ(patch.GetLabel(), "name");
    EXPECT_EQ(patch.GetSpectralData(), (std::map<std::string, double>{{"NM400", 0.5}}));
    auto channels = patch.GetNColorMap();
    ASSERT_EQ(channels.size(), 2u);
    EXPECT_EQ(channels[0].name, "7CLR_2"); // byte order: "7CLR_2" before "PC_1"
    EXPECT_EQ(channels[0].value, 40.0);
    EXPECT_EQ(channels[0].colorantCount, 7);
    EXPECT_EQ(channels[1].value, 60.0);
    EXPECT_EQ(channels[1].channel, 1);
    EXPECT_EQ(channels[1].colorantCount, 0);
    // The format line survives a failed read that reaches no data format.
    EXPECT_EQ(ReadText(reader, dir, "garbage\n"), 9);
    EXPECT_EQ(reader.GetDataFormatLine(), formatLine);
}

TEST(ChartContent, RowsBecomeNumberedPatches) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, CmykLabChart()), 0);
    ASSERT_EQ(reader.GetPatchCount(), 2);
    // SAMPLE_IDs 101 and 102 play no part: the patches are 1 and 2.
    const CColorPatch first = PatchOf(reader, 1);
    EXPECT_EQ(first.GetLabel(), "A1");
    EXPECT_EQ(first.GetCMYK().k, 30.0);
    EXPECT_EQ(first.GetLAB().a, -1.25);
    // XYZ 0x20 | RGB 0x80 | SPECTRAL 0x100 | CMYKOG 0x200 | CMYKRGB 0x400 |
    // HTMLCOLOR 0x800 | NCOLOR 0x1000 | CMYKOGV 0x2000 | DENSITY 0x4000 = 0x7FA0.
    EXPECT_EQ(ColorPatchProbe::missingMask(first), 0x7FA0u);

    // A second block renumbers from 1 and overwrites; an empty one changes nothing.
    const std::string three =
        Chart("SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K", {"a 1 0 0 0", "b 2 0 0 0", "c 3 0 0 0"});
    ASSERT_EQ(
        ReadText(reader, dir, three + "BEGIN_DATA\nx 9 0 0 0\nEND_DATA\nBEGIN_DATA\nEND_DATA\n"),
        0);
    EXPECT_EQ(PatchOf(reader, 1).GetLabel(), "x");
    EXPECT_EQ(PatchOf(reader, 3).GetLabel(), "c");
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_CMYK));
    EXPECT_FALSE(reader.IsColorSpacePresent(COLORSPACE_XYZ));

    // SAMPLE_NAME before SAMPLE_LOC, quotes kept; reference samples, the later
    // row winning, quotes not removed ("5" reads 0).
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("SAMPLE_LOC SAMPLE_NAME REFERENCE_SAMPLE_ID",
                             {"A1 \"w\" 7", "A2 b 9", "A3 c 7", "A4 d \"5\"", "A5 e -3x"})),
              0);
    EXPECT_EQ(PatchOf(reader, 1).GetLabel(), "\"w\"");
    std::map<int, int> references;
    ASSERT_EQ(reader.GetReferenceSampleMap(references), 0);
    EXPECT_EQ(references, (std::map<int, int>{{-3, 5}, {0, 4}, {7, 3}, {9, 2}}));
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
    EXPECT_EQ(patch.GetCMYKRGB().r, 12.9);
    EXPECT_EQ(patch.GetCMYKRGB().k, 4.0);
    EXPECT_EQ(patch.GetCMYKOGV().v, 7.0);
    EXPECT_EQ(patch.GetDensity().green, 0.2);
    EXPECT_EQ(patch.GetDensity().visual, 0.4);
    EXPECT_EQ(patch.GetDensity().majorFilter, 0.0);
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_CMYKOGV));
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_DENSITY));

    // Without CMYK_K and D_BLUE, CMYK and densities count as missing.
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("CMYK_C CMYK_M CMYK_Y D_RED D_GREEN XYZ_X XYZ_Y XYZ_Z",
                             {"10 20 30 0.1 0.2 41 42 43"})),
              0);
    patch = PatchOf(reader, 1);
    EXPECT_FALSE(patch.IsCMYKPresent());
    EXPECT_EQ(patch.GetCMYK().c, 0.0);
    EXPECT_NE(ColorPatchProbe::missingMask(patch) & MISSING_DENSITY, 0u);
    EXPECT_EQ(patch.GetXYZ().z, 43.0);
    EXPECT_FALSE(reader.IsColorSpacePresent(COLORSPACE_CMYK));

    // HTML colours: "1G" reads up to the G; six digits without '#' are missing.
    ASSERT_EQ(
        ReadText(reader, dir, Chart("SAMPLE_ID DRGB", {"1 #1A2b3C", "2 #1G2345", "3 1A2B3C"})), 0);
    EXPECT_EQ(PatchOf(reader, 1).GetHTMLCOLOR().g, 0x2Bu);
    EXPECT_EQ(PatchOf(reader, 2).GetHTMLCOLOR().r, 1u);
    EXPECT_FALSE(PatchOf(reader, 3).IsHTMLCOLORPresent());
    EXPECT_FALSE(reader.IsColorSpacePresent(COLORSPACE_HTMLCOLOR)); // as the last row
}

TEST(DeviceQueries, SpacesChannelsAndValueLists) {
    TempDir dir;
    CIT8ReaderWriter reader;
    // Ten channels in name order: 10CLR_1, 10CLR_10, 10CLR_2 ... 10CLR_9.
    std::string tenFields = "SAMPLE_ID";
    std::string tenRow = "1";
    for (int channel = 1; channel <= 10; ++channel) {
        tenFields += " 10CLR_" + std::to_string(channel);
        tenRow += " " + std::to_string(channel);
    }
    const struct {
        std::string text;
        int space;
        int channels;
        int listsResult;
        Lists lists;
    } cases[] = {
        {CmykLabChart(), COLORSPACE_CMYK, 4, 0, {{0, 10, 20, 30}, {100, 0, 0, 0}}},
        // Six-colour fields stay n-colour channels.
        {Chart("SAMPLE_ID 6CLR_1 6CLR_2 6CLR_3 6CLR_4 6CLR_5 6CLR_6",
               {"1 10 20 30 40 50 60", "2 1 2 3 4 5 6"}),
         COLORSPACE_NCOLOR,
         6,
         0,
         {{10, 20, 30, 40, 50, 60}, {1, 2, 3, 4, 5, 6}}},
        {Chart(tenFields, {tenRow}), COLORSPACE_NCOLOR, 10, 0, {{1, 10, 2, 3, 4, 5, 6, 7, 8, 9}}},
        {Chart("RGB_R RGB_G RGB_B", {"1 2 3"}), COLORSPACE_RGB, 3, 12, {}},
        {Chart("CMYK_C CMYK_M CMYK_Y CMYK_K RGB_R RGB_G RGB_B", {"1 2 3 4 5 6 7"}),
         COLORSPACE_CMYKRGB,
         7,
         12,
         {}},
        // The CMYK+OGV record is not among the spaces asked for.
        {Chart("CMYK_C CMYK_M CMYK_Y CMYK_K ORANGE GREEN VIOLET", {"1 2 3 4 5 6 7"}),
         COLORSPACE_CMYK,
         4,
         0,
         {{1, 2, 3, 4}}},
        {Chart("LAB_L LAB_A LAB_B", {"50 0 0"}), COLORSPACE_LAB, 3, 12, {}},
        // An HTML colour means CMYK, whatever else the chart holds.
        {Chart("RGB_R RGB_G RGB_B DRGB", {"1 2 3 #010203"}), COLORSPACE_CMYK, 3, 12, {}},
        // A failed read: no space, the default four channels.
        {"PROCESSCOLOR_ID 1 Cyan\nNUMBER_OF_SETS 0\n", -1, 4, 12, {}},
    };
    for (const auto& c : cases) {
        ReadText(reader, dir, c.text);
        EXPECT_EQ(reader.GetDeviceColorSpace(), c.space) << c.text;
        EXPECT_EQ(reader.GetDeviceChannelCount(), c.channels) << c.text;
        Lists lists{{99.0}};
        EXPECT_EQ(reader.GetDeviceValueLists(lists), c.listsResult) << c.text;
        EXPECT_EQ(lists, c.lists) << c.text;
    }
    Strings names{"stale"};
    EXPECT_EQ(reader.GetProcessColorNames(names), 1);
    EXPECT_TRUE(names.empty());
}
