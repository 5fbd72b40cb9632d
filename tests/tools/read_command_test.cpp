// The tool as a whole, and the commands that only read: info, patches, validate.
#include "tool_runner.h"

#if !defined(_WIN32)
#include <sys/stat.h>
#endif

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

#if !defined(_WIN32)
TEST_F(ToolTest, DevicesAndPipesAreRefusedWithoutReading) {
    // /dev/zero never ends and opening a pipe without a writer blocks: both must
    // be refused before they are read, by every command that reads a chart.
    ASSERT_EQ(mkfifo(dir.file("pipe.it8").c_str(), 0600), 0);
    for (const std::string input : {"/dev/zero", "pipe.it8"}) {
        for (const std::vector<std::string>& args : {std::vector<std::string>{"info", input},
                                                     {"validate", input},
                                                     {"keywords", input, "-o", "out.it8", "A=1"},
                                                     {"convert", input, "-o", "out.it8"}}) {
            const RunResult run = Tool(args);
            EXPECT_EQ(run.status, 1) << args[0] << " " << input;
            ExpectIn(run.err, {input + ": is a device or a pipe, not a chart file"});
        }
    }
}
#endif

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
    ExpectIn(
        Ok({"patches", "four.it8", "--spaces", "cmyk,lab"}),
        {"SAMPLE  SAMPLE_ID  NAME     CMYK_C  CMYK_M  CMYK_Y  CMYK_K  LAB_L   LAB_A   LAB_B\n"
         "     1  1          Weiß       0.00    0.00    0.00    0.00  95.50    0.50   -2.25\n"});
    // The file's own SAMPLE_ID stands beside the sample number (the row).
    std::vector<std::string> renamed = kRows;
    renamed[1].replace(0, 1, "\"A2\"");
    dir.write("ids.it8", LabChart(renamed));
    EXPECT_EQ(Ok({"patches", "ids.it8", "--spaces", "lab", "--format", "tsv"}),
              "SAMPLE\tSAMPLE_ID\tNAME\tLAB_L\tLAB_A\tLAB_B\n1\t1\tWeiß\t95.50\t0.50\t-2.25\n"
              "2\tA2\tCyan\t55.00\t-37.00\t-50.00\n3\t3\tMg,100%\t48.00\t74.00\t-3.00\n"
              "4\t4\tGrün\t50.00\t-65.00\t27.00\n");
}

// Two tables of one file, as a profiling tool writes them; lines 1-9 and 10-18.
const char* const kTwoTables = "CTI3\nNUMBER_OF_FIELDS 4\nBEGIN_DATA_FORMAT\n"
                               "SAMPLE_ID LAB_L LAB_A LAB_B\nEND_DATA_FORMAT\nNUMBER_OF_SETS 2\n"
                               "BEGIN_DATA\nA1 50 10 -10\nA2 60 -5 5\nEND_DATA\n"
                               "CAL\nNUMBER_OF_FIELDS 4\nBEGIN_DATA_FORMAT\n"
                               "RGB_I RGB_R RGB_G RGB_B\nEND_DATA_FORMAT\nNUMBER_OF_SETS 1\n"
                               "BEGIN_DATA\n1 255 128 0\nEND_DATA\n";

TEST_F(ToolTest, EveryTableOfAFileOfSeveralIsReadable) {
    dir.write("two.ti3", kTwoTables);
    ExpectIn(Ok({"info", "two.ti3"}),
             {"table            1 of 2, lines 1-10", "identification   CTI3",
              "  1  lines 1-10   CTI3  2 rows  SAMPLE_ID LAB_L LAB_A LAB_B\n"
              "  2  lines 11-19  CAL    1 row  RGB_I RGB_R RGB_G RGB_B\n"});
    EXPECT_EQ(Ok({"patches", "two.ti3", "--table", "2", "--spaces", "rgb", "--format", "csv"}),
              "SAMPLE,NAME,RGB_R,RGB_G,RGB_B\n1,,255,128,0\n");
    const struct {
        int status;
        std::string message;
        std::vector<std::string> args;
    } refusals[] = {
        {1, "two.ti3: the file holds 2 tables, not a table 3", {"info", "two.ti3", "--table", "3"}},
        {2, "--table takes a table number from 1, not \"0\"", {"info", "two.ti3", "--table=0"}},
    };
    for (const auto& c : refusals) {
        const RunResult run = Tool(c.args);
        EXPECT_EQ(run.status, c.status);
        ExpectIn(run.err, {c.message});
    }
    // A real file: FograStrip3.ti1's first table names 8 fields against its own
    // NUMBER_OF_FIELDS 9; the other two tables read.
    const RunResult strip = Tool({"validate", "/usr/share/color/argyll/ref/FograStrip3.ti1"});
    if (strip.err.find("cannot be opened") == std::string::npos) {
        EXPECT_EQ(strip.status, 1);
        ExpectIn(strip.err, {"FograStrip3.ti1, table 1: the data format on line 17 names 8 "
                             "different fields but NUMBER_OF_FIELDS on line 16 is 9 [code 5]"});
        ExpectIn(strip.out, {"FograStrip3.ti1, table 2: ok, 8 patches (CMYK, XYZ)",
                             "FograStrip3.ti1, table 3: ok, 9 patches (CMYK, XYZ)"});
    }
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
             {"\t50.00\t", "\t76.07\t", "\n2\t2\tnan" + empty13 + "\n",
              "\n3\t3\thuge" + empty13 + "\n"});
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
    // A name with a blank falls apart into two values.
    std::vector<std::string> quoted = kRows;
    quoted[1] = "2 \"Cyan 100\" 100 0 0 0 55 -37 -50";
    dir.write("quoted.it8", LabChart(quoted));
    ExpectIn(Tool({"validate", "quoted.it8"}).err,
             {"row 2 (line 10) has 10 values but NUMBER_OF_FIELDS is 9: the quoted value "
              "\"Cyan 100\" (line 10, column 3) holds a blank, and values are separated at blanks "
              "even inside double quotes, so it counts as 2 values [code 8]"});
}

TEST_F(ToolTest, ValidateWarnsOfValuesThatDoNotReadAsWritten) {
    // Line 9 on: what each cell of LAB_L (column 13) or LAB_A (column 17) holds.
    dir.write("values.it8",
              LabChart({"1 a 0 0 0 0 n/a 0 0", "2 b 0 0 0 0 75.25.3 0 0", "3 c 0 0 0 0 nan inf 0",
                        "4 d 0 0 0 0 1e308 0 0", "5 e 0 0 0 0 50 -0,5 0"}));
    const RunResult run = Tool({"validate", "values.it8"});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.out, "values.it8: ok, 5 patches (CMYK, L*a*b*), 5 warnings\n");
    // The values the reader takes: text reads as 0; "75.25.3" stops at the second
    // point, then reads again with the first point as a comma, which stops at once: 75.
    EXPECT_EQ(run.err,
              "swatchlog validate: warning: values.it8: line 9, column 13: LAB_L of sample 1 holds "
              "the text \"n/a\"; it reads as 0\n"
              "swatchlog validate: warning: values.it8: line 10, column 13: LAB_L of sample 2 is "
              "\"75.25.3\", not a well-formed number; it reads as 75\n"
              "swatchlog validate: warning: values.it8: line 11, column 13: LAB_L of sample 3 is "
              "\"nan\", not a finite number; it reads as nan\n"
              "swatchlog validate: warning: values.it8: line 11, column 17: LAB_A of sample 3 is "
              "\"inf\", not a finite number; it reads as inf\n"
              "swatchlog validate: warning: values.it8: line 12, column 13: LAB_L of sample 4 is "
              "1e308, outside 0 to 100\n");
    const RunResult strict = Tool({"validate", "--strict", "values.it8"});
    EXPECT_EQ(strict.status, 1);
    EXPECT_EQ(strict.out, "");
    ExpectIn(strict.err, {"values.it8: 5 values fail the strict checks"});
}

} // namespace
} // namespace tool_test
