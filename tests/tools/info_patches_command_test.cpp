// swatchlog info and patches on charts written here.
#include <gtest/gtest.h>

#include "temp_files.h"
#include "tool_runner.h"

namespace tool_test {
namespace {

// Four patches in 2 strips of 2; names with non-ASCII letters.
std::string FourPatches() {
    return LabChart({"1 \"Weiß\" 0 0 0 0 95.5 0.5 -2.25", "2 \"Cyan\" 100 0 0 0 55 -37 -50",
                     "3 \"Magenta\" 0 100 0 0 48 74 -3", "4 \"Grün\" 100 0 100 0 50 -65 27"},
                    "KEYWORD \"NUMBER_OF_STRIPS\"\nNUMBER_OF_STRIPS 2\n"
                    "KEYWORD \"NUMBER_OF_COLS\"\nNUMBER_OF_COLS 2\n"
                    "PROCESSCOLOR_ID \"1 Cyan\"\nPROCESSCOLOR_ID \"2 Magenta\"\n");
}

// Two patches with spectra only, flat at 0.5 and 0.25 from 400 to 700 nm.
std::string SpectralChart() {
    std::string format = "SAMPLE_ID";
    std::string row1 = "1";
    std::string row2 = "2";
    for (int nm = 400; nm <= 700; nm += 10) {
        format += " SPECTRAL_NM_" + std::to_string(nm);
        row1 += " 0.5";
        row2 += " 0.25";
    }
    return "CGATS.17\nBEGIN_DATA_FORMAT\n" + format + "\nEND_DATA_FORMAT\nNUMBER_OF_SETS 2\n" +
           "BEGIN_DATA\n" + row1 + "\n" + row2 + "\nEND_DATA\n";
}

TEST(InfoCommand, DescribesTheChartInWordsAndJson) {
    test_support::TempDir dir;
    dir.write("four patches ü.it8", FourPatches());
    const RunResult text = RunSwatchlog({"info", "four patches ü.it8"}, dir.path());
    ASSERT_EQ(text.status, 0) << text.err;
    EXPECT_NE(text.out.find("identification   CGATS.17"), std::string::npos) << text.out;
    EXPECT_NE(text.out.find("4 (NUMBER_OF_SETS 4)"), std::string::npos);
    EXPECT_NE(text.out.find("2 strips of 2 patches"), std::string::npos);
    EXPECT_NE(text.out.find("CMYK, 4 channels"), std::string::npos);
    EXPECT_NE(text.out.find("Cyan, Magenta"), std::string::npos);
    EXPECT_NE(text.out.find("ORIGINATOR"), std::string::npos);

    if (!HaveJq()) {
        GTEST_SKIP() << "jq is not installed";
    }
    const RunResult json =
        RunSwatchlog({"info", "four patches ü.it8", "--format", "json"}, dir.path());
    ASSERT_EQ(json.status, 0) << json.err;
    EXPECT_TRUE(JqTrue(json.out, ".patch_count == 4 and .number_of_sets == 4"));
    EXPECT_TRUE(JqTrue(json.out, ".layout == {\"strips\": 2, \"columns\": 2, \"pages\": 0}"));
    EXPECT_TRUE(JqTrue(json.out, ".file == \"four patches ü.it8\""));
    EXPECT_TRUE(JqTrue(json.out, ".process_colors == [\"Cyan\", \"Magenta\"]"));
    // L*a*b* came from the file; XYZ is worked out from it by the library.
    EXPECT_TRUE(
        JqTrue(json.out, "[.color_spaces[] | select(.name == \"lab\")][0].derived == false"));
    EXPECT_TRUE(
        JqTrue(json.out, "[.color_spaces[] | select(.name == \"xyz\")][0].derived == true"));
    EXPECT_TRUE(JqTrue(json.out, ".keywords.ORIGINATOR == \"\\\"tool test\\\"\""));
}

TEST(InfoCommand, SpectraOnlyChartHasNoDeviceValues) {
    test_support::TempDir dir;
    dir.write("spectral.it8", SpectralChart());
    const RunResult text = RunSwatchlog({"info", "spectral.it8"}, dir.path());
    ASSERT_EQ(text.status, 0) << text.err;
    EXPECT_NE(text.out.find("device           none"), std::string::npos) << text.out;
    EXPECT_NE(text.out.find("400-700 nm in 10 nm steps, 31 values"), std::string::npos);
    EXPECT_NE(text.out.find("L*a*b* (derived)"), std::string::npos);
    EXPECT_NE(text.out.find("not given"), std::string::npos); // no layout keywords
}

TEST(PatchesCommand, TableTsvAndCsvCarryTheFileValues) {
    test_support::TempDir dir;
    dir.write("four.it8", FourPatches());
    const RunResult table =
        RunSwatchlog({"patches", "four.it8", "--spaces", "cmyk,lab"}, dir.path());
    ASSERT_EQ(table.status, 0) << table.err;
    // Header, then the rows aligned; "Weiß" is four characters wide like "Cyan".
    EXPECT_EQ(table.out.substr(0, table.out.find('\n')),
              "SAMPLE  NAME     CMYK_C  CMYK_M  CMYK_Y  CMYK_K  LAB_L   LAB_A   LAB_B");
    EXPECT_NE(
        table.out.find("     1  Weiß       0.00    0.00    0.00    0.00  95.50    0.50   -2.25"),
        std::string::npos)
        << table.out;

    const RunResult tsv =
        RunSwatchlog({"patches", "four.it8", "--spaces", "lab", "--format", "tsv"}, dir.path());
    ASSERT_EQ(tsv.status, 0);
    EXPECT_EQ(tsv.out, "SAMPLE\tNAME\tLAB_L\tLAB_A\tLAB_B\n1\tWeiß\t95.50\t0.50\t-2.25\n"
                       "2\tCyan\t55.00\t-37.00\t-50.00\n3\tMagenta\t48.00\t74.00\t-3.00\n"
                       "4\tGrün\t50.00\t-65.00\t27.00\n");

    const RunResult csv =
        RunSwatchlog({"patches", "four.it8", "--spaces", "xyz", "--format", "csv"}, dir.path());
    ASSERT_EQ(csv.status, 0);
    EXPECT_EQ(csv.out.substr(0, csv.out.find('\n')),
              "SAMPLE,NAME,XYZ_X (derived),XYZ_Y (derived),XYZ_Z (derived)");
}

TEST(PatchesCommand, JsonIsOneDocumentWithDerivedSpacesMarked) {
    if (!HaveJq()) {
        GTEST_SKIP() << "jq is not installed";
    }
    test_support::TempDir dir;
    dir.write("spectral.it8", SpectralChart());
    const RunResult json = RunSwatchlog(
        {"patches", "spectral.it8", "--spaces", "spectral,lab", "--format", "json"}, dir.path());
    ASSERT_EQ(json.status, 0) << json.err;
    EXPECT_EQ(JqRaw(json.out, "[inputs] | length"), "0"); // nothing after the one document
    EXPECT_TRUE(JqTrue(json.out, ".patch_count == 2 and (.patches | length) == 2"));
    EXPECT_TRUE(
        JqTrue(json.out, ".spaces[0].name == \"spectral\" and .spaces[0].derived == false"));
    EXPECT_TRUE(JqTrue(json.out, ".spaces[1].name == \"lab\" and .spaces[1].derived == true"));
    EXPECT_TRUE(JqTrue(json.out, ".spaces[0].fields[0] == \"SPECTRAL_NM_400\""));
    EXPECT_TRUE(JqTrue(json.out, ".patches[1].spectral | length == 31 and all(. == 0.25)"));
    // A flat reflectance of 0.5 is a neutral grey: L* = 116 * 0.5^(1/3) - 16 = 76.07.
    EXPECT_TRUE(JqTrue(json.out, ".patches[0].lab[0] > 75.5 and .patches[0].lab[0] < 76.6"));
}

TEST(PatchesCommand, RejectsUnknownAndAbsentSpaces) {
    test_support::TempDir dir;
    dir.write("spectral.it8", SpectralChart());
    const RunResult unknown =
        RunSwatchlog({"patches", "spectral.it8", "--spaces", "lab,hsv"}, dir.path());
    EXPECT_EQ(unknown.status, 2);
    EXPECT_NE(unknown.err.find("unknown colour space \"hsv\""), std::string::npos);
    const RunResult absent =
        RunSwatchlog({"patches", "spectral.it8", "--spaces", "cmyk"}, dir.path());
    EXPECT_EQ(absent.status, 1);
    EXPECT_NE(absent.err.find("spectral.it8: the chart carries no CMYK"), std::string::npos)
        << absent.err;
}

} // namespace
} // namespace tool_test
