// The tool as a whole, and the commands that only read: info, patches, validate.
#include "tool_runner.h"

namespace tool_test {
namespace {

// Four patches, names with non-ASCII letters and a comma; lines 9 to 12 of LabChart(kRows).
const std::vector<std::string> kRows{
    "1 \"Weiß\" 0 0 0 0 95.5 0.5 -2.25", "2 \"Cyan\" 100 0 0 0 55 -37 -50",
    "3 \"Mg,100%\" 0 100 0 0 48 74 -3", "4 \"Grün\" 100 0 100 0 50 -65 27"};

// Two patches with spectra only, flat at 0.5 and 0.25 from 400 to 700 nm.
std::string SpectralChart() {
    std::string text = "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID", row1 = "1", row2 = "2";
    for (int nm = 400; nm <= 700; nm += 10) {
        text += " SPECTRAL_NM_" + std::to_string(nm);
        row1 += " 0.5";
        row2 += " 0.25";
    }
    return text + "\nEND_DATA_FORMAT\nNUMBER_OF_SETS 2\nBEGIN_DATA\n" + row1 + "\n" + row2 +
           "\nEND_DATA\n";
}

TEST_F(ToolTest, HelpAndVersionSucceedOnStandardOutput) {
    const std::string help = Ok({"--help"});
    for (const char* command : {"info", "patches", "convert", "merge", "target", "keywords",
                                "compare", "render", "validate"}) {
        ExpectIn(help, {std::string("  ") + command});
        EXPECT_EQ(Ok({command, "--help"}).rfind(std::string("Usage: swatchlog ") + command, 0), 0u);
    }
    EXPECT_EQ(Ok({"--version"}).rfind("swatchlog ", 0), 0u);
}

TEST_F(ToolTest, UsageMistakesExitWithTwoFileErrorsWithOneOnStandardError) {
    dir.write("good.it8", LabChart(kRows));
    dir.write("spectral.it8", SpectralChart());
    dir.write("empty.it8", "");
    const struct {
        int status;
        std::string message;
        std::vector<std::string> args;
    } cases[] = {
        {2, "Usage:", {}},
        {2, "unknown command \"frobnicate\"", {"frobnicate"}},
        {2, "unknown option --colour", {"info", "good.it8", "--colour"}},
        {2, "", {"info"}},
        {2, "", {"info", "good.it8", "good.it8"}},
        {2, "", {"patches", "good.it8", "--format", "xml"}},
        {2, "unknown colour space \"hsv\"", {"patches", "good.it8", "--spaces", "lab,hsv"}},
        {2, "", {"convert", "good.it8"}}, // no -o
        {2, "", {"convert", "good.it8", "-o"}},
        {2, "", {"convert", "good.it8", "-o", "a.it8", "-o", "b.it8"}},
        {2, "", {"merge", "good.it8", "good.it8", "-o", "c.it8", "--append-missing", "--exact=1"}},
        {2, "", {"compare", "good.it8", "good.it8", "--by", "colour"}},
        {2,
         "",
         {"merge", "good.it8", "good.it8", "-o", "c.it8", "--exact"}}, // without --append-missing
        {1, "no such.it8: the file cannot be opened for reading [code 3]", {"info", "no such.it8"}},
        {1, "empty.it8: the file is empty [code 9]", {"patches", "empty.it8"}},
        {1,
         "spectral.it8: the chart carries no CMYK",
         {"patches", "spectral.it8", "--spaces=cmyk"}},
    };
    for (const auto& c : cases) {
        const RunResult run = Tool(c.args);
        EXPECT_EQ(run.status, c.status) << run.err;
        EXPECT_EQ(run.out, "");
        ExpectIn(run.err, {c.message});
    }
}

TEST_F(ToolTest, InfoDescribesTheChartInWordsAndJson) {
    dir.write("four patches ü.it8",
              LabChart(kRows, "KEYWORD \"NUMBER_OF_STRIPS\"\n"
                              "NUMBER_OF_STRIPS 2\nKEYWORD \"NUMBER_OF_COLS\"\n"
                              "NUMBER_OF_COLS 2\nPROCESSCOLOR_ID \"1 Cyan\"\n"
                              "PROCESSCOLOR_ID \"2 Magenta\"\n"));
    dir.write("spectral.it8", SpectralChart());
    ExpectIn(Ok({"info", "four patches ü.it8"}),
             {"identification   CGATS.17", "4 (NUMBER_OF_SETS 4)", "2 strips of 2 patches",
              "CMYK, 4 channels", "Cyan, Magenta", "ORIGINATOR"});
    ExpectIn(Ok({"info", "spectral.it8"}), {"device           none", "L*a*b* (derived)",
                                            "400-700 nm in 10 nm steps, 31 values", "not given"});
    REQUIRE_JQ();
    // L*a*b* came from the file; XYZ is worked out from it by the library.
    ExpectJson(Ok({"info", "four patches ü.it8", "--format", "json"}),
               {".patch_count == 4 and .number_of_sets == 4",
                ".layout == {\"strips\": 2, \"columns\": 2, \"pages\": 0}",
                ".file == \"four patches ü.it8\"", ".process_colors == [\"Cyan\", \"Magenta\"]",
                "[.color_spaces[] | {(.name): .derived}] | add | .lab == false and .xyz",
                ".keywords.ORIGINATOR == \"\\\"tool test\\\"\""});
}

TEST_F(ToolTest, PatchesTableTsvCsvAndJsonCarryTheValues) {
    dir.write("four.it8", LabChart(kRows));
    dir.write("spectral.it8", SpectralChart());
    // Right-aligned numbers; "Weiß" is four characters (five bytes) wide like "Cyan".
    ExpectIn(Ok({"patches", "four.it8", "--spaces", "cmyk,lab"}),
             {"SAMPLE  NAME     CMYK_C  CMYK_M  CMYK_Y  CMYK_K  LAB_L   LAB_A   LAB_B\n"
              "     1  Weiß       0.00    0.00    0.00    0.00  95.50    0.50   -2.25\n"});
    EXPECT_EQ(Ok({"patches", "four.it8", "--spaces", "lab", "--format", "tsv"}),
              "SAMPLE\tNAME\tLAB_L\tLAB_A\tLAB_B\n1\tWeiß\t95.50\t0.50\t-2.25\n"
              "2\tCyan\t55.00\t-37.00\t-50.00\n3\tMg,100%\t48.00\t74.00\t-3.00\n"
              "4\tGrün\t50.00\t-65.00\t27.00\n");
    ExpectIn(Ok({"patches", "four.it8", "--spaces", "xyz", "--format", "csv"}),
             {"SAMPLE,NAME,XYZ_X (derived),XYZ_Y (derived),XYZ_Z (derived)\n", "\n3,\"Mg,100%\","});
    REQUIRE_JQ();
    // A flat reflectance of 0.5 is a neutral grey: L* = 116 * 0.5^(1/3) - 16 = 76.07.
    ExpectJson(Ok({"patches", "spectral.it8", "--spaces", "spectral,lab", "--format", "json"}),
               {".patch_count == 2 and (.patches | length) == 2",
                ".spaces | map([.name, .derived]) == [[\"spectral\", false], [\"lab\", true]]",
                ".spaces[0].fields[0] == \"SPECTRAL_NM_400\"",
                ".patches[1].spectral | length == 31 and all(. == 0.25)",
                ".patches[0].lab[0] > 75.5 and .patches[0].lab[0] < 76.6"});
}

TEST_F(ToolTest, ValidateSaysWhatIsWrongWithLineNumbersInWordsAndJson) {
    dir.write("good.it8", LabChart(kRows));
    std::vector<std::string> wide = kRows;
    wide[2] += " 99";
    dir.write("wide row.it8", LabChart(wide));
    std::string open = LabChart(kRows);
    dir.write("open.it8", open.erase(open.find("END_DATA\n")));
    // After "--" a word that looks like an option is a file name.
    std::vector<std::string> args{"validate", "--", "good.it8", "wide row.it8", "open.it8", "-o"};
    const RunResult run = Tool(args);
    EXPECT_EQ(run.status, 1);
    EXPECT_EQ(run.out, "good.it8: ok, 4 patches (CMYK, L*a*b*)\n");
    ExpectIn(run.err,
             {"wide row.it8: row 3 (line 11) has 10 values but NUMBER_OF_FIELDS is 9 [code 8]",
              "open.it8: the data block that begins on line 8 ends before END_DATA (the file ends "
              "on line 12)",
              "-o: the file cannot be opened for reading [code 3]"});
    Ok({"validate", "good.it8"});
    REQUIRE_JQ();
    args.insert(args.begin() + 1, {"--format", "json"});
    const RunResult json = Tool(args);
    EXPECT_EQ(json.status, 1);
    EXPECT_EQ(json.err, "");
    ExpectJson(json.out, {".valid == false and (.files | map(.ok)) == [true, false, false, false]",
                          ".files[1].error | startswith(\"row 3 (line 11) has 10 values\")"});
}

} // namespace
} // namespace tool_test
