// The tool as a whole, and the commands that only read: info, patches, validate.
#include "tool_runner.h"

namespace tool_test {
namespace {

// Four patches, names with non-ASCII letters and a comma; lines 9 to 12 of LabChart(kRows).
const std::vector<std::string> kRows{
    "1 \"Weiß\" 0 0 0 0 95.5 0.5 -2.25", "2 \"Cyan\" 100 0 0 0 55 -37 -50",
    "3 \"Mg,100%\" 0 100 0 0 48 74 -3", "4 \"Grün\" 100 0 100 0 50 -65 27"};

TEST_F(ToolTest, UsageMistakesExitWithTwoFileErrorsWithOneOnStandardError) {
    dir.write("good.it8", LabChart(kRows));
    dir.write("empty.it8", "");
    const struct {
        int status;
        std::string message;
        std::vector<std::string> args;
    } cases[] = {
        {2, "Usage:", {}},
        {2, "unknown command \"frobnicate\"", {"frobnicate"}},
        {2, "unknown colour space \"hsv\"", {"patches", "good.it8", "--spaces", "lab,hsv"}},
        {2, "", {"convert", "good.it8"}}, // no -o
        {1, "no such.it8: the file cannot be opened for reading [code 3]", {"info", "no such.it8"}},
        {1, "empty.it8: the file is empty [code 9]", {"patches", "empty.it8"}},
    };
    for (const auto& c : cases) {
        const RunResult run = Tool(c.args);
        EXPECT_EQ(run.status, c.status) << run.err;
        EXPECT_EQ(run.out, "");
        ExpectIn(run.err, {c.message});
    }
}

TEST_F(ToolTest, InfoDescribesTheChartInWords) {
    dir.write("four patches ü.it8",
              LabChart(kRows, "KEYWORD \"NUMBER_OF_STRIPS\"\n"
                              "NUMBER_OF_STRIPS 2\nKEYWORD \"NUMBER_OF_COLS\"\n"
                              "NUMBER_OF_COLS 2\nPROCESSCOLOR_ID \"1 Cyan\"\n"
                              "PROCESSCOLOR_ID \"2 Magenta\"\n"));
    ExpectIn(Ok({"info", "four patches ü.it8"}),
             {"4 (NUMBER_OF_SETS 4)", "2 strips of 2 patches", "CMYK, 4 channels"});
}

TEST_F(ToolTest, PatchesTableAndTsvCarryTheValues) {
    dir.write("four.it8", LabChart(kRows));
    // Right-aligned numbers; "Weiß" is four characters (five bytes) wide like "Cyan".
    ExpectIn(Ok({"patches", "four.it8", "--spaces", "cmyk,lab"}),
             {"SAMPLE  NAME     CMYK_C  CMYK_M  CMYK_Y  CMYK_K  LAB_L   LAB_A   LAB_B\n"
              "     1  Weiß       0.00    0.00    0.00    0.00  95.50    0.50   -2.25\n"});
    EXPECT_EQ(Ok({"patches", "four.it8", "--spaces", "lab", "--format", "tsv"}),
              "SAMPLE\tNAME\tLAB_L\tLAB_A\tLAB_B\n1\tWeiß\t95.50\t0.50\t-2.25\n"
              "2\tCyan\t55.00\t-37.00\t-50.00\n3\tMg,100%\t48.00\t74.00\t-3.00\n"
              "4\tGrün\t50.00\t-65.00\t27.00\n");
}

TEST_F(ToolTest, PatchesLeaveValuesAPatchCouldNotDeriveEmpty) {
    // Spectra every 20 nm from 380 to 780 nm: a flat 0.5, one with "nan" at 500 nm
    // and one with a value no float holds. Only the first gives colour: Y = 50
    // (half the white's 100), L* = 116 * 0.5^(1/3) - 16 = 76.07.
    std::string text = "CGATS.17\nNUMBER_OF_FIELDS 23\nBEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME";
    std::string rows[3] = {"1 flat", "2 nan", "3 huge"};
    for (int nm = 380; nm <= 780; nm += 20) {
        text += " SPECTRAL_NM_" + std::to_string(nm);
        rows[0] += " 0.5";
        rows[1] += nm == 500 ? " nan" : " 0.5";
        rows[2] += nm == 500 ? " 1e39" : " 0.5";
    }
    text += "\nEND_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA\n" + rows[0] + "\n" + rows[1] + "\n" +
            rows[2] + "\nEND_DATA\n";
    dir.write("spectra.it8", text);
    const std::string empty13(13, '\t');
    ExpectIn(Tsv("spectra.it8", "rgb,xyz,lab,density"),
             {"\t50.00\t", "\t76.07\t", "\n2\tnan" + empty13 + "\n", "\n3\thuge" + empty13 + "\n"});
    REQUIRE_JQ();
    ExpectJson(Ok({"patches", "spectra.it8", "--spaces", "rgb,lab", "--format", "json"}),
               {"[.patches[] | .lab != null] == [true, false, false]",
                "[.patches[] | .rgb != null] == [true, false, false]"});
}

TEST_F(ToolTest, ValidateSaysWhatIsWrongWithLineNumbers) {
    dir.write("good.it8", LabChart(kRows));
    std::vector<std::string> wide = kRows;
    wide[2] += " 99";
    dir.write("wide row.it8", LabChart(wide));
    const RunResult run = Tool({"validate", "good.it8", "wide row.it8"});
    EXPECT_EQ(run.status, 1);
    EXPECT_EQ(run.out, "good.it8: ok, 4 patches (CMYK, L*a*b*)\n");
    ExpectIn(run.err,
             {"wide row.it8: row 3 (line 11) has 10 values but NUMBER_OF_FIELDS is 9 [code 8]"});
}

} // namespace
} // namespace tool_test
