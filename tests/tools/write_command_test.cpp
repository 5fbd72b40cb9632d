// convert, merge, target and keywords: files written whole, or not at all.
#include <gtest/gtest.h>

#include <filesystem>

#include "temp_files.h"
#include "tool_runner.h"

namespace tool_test {
namespace {

namespace fs = std::filesystem;
using test_support::ReadBytes;

// Three patches: cyan, white, magenta (device values and L*a*b*).
std::string Target() {
    return "CGATS.17\n"
           "ORIGINATOR \"tool test\"\n"
           "NUMBER_OF_FIELDS 6\n"
           "BEGIN_DATA_FORMAT\n"
           "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K\n"
           "END_DATA_FORMAT\n"
           "NUMBER_OF_SETS 3\n"
           "BEGIN_DATA\n"
           "1 cyan 100 0 0 0\n"
           "2 blue 100 100 0 0\n"
           "3 paper 0 0 0 0\n"
           "END_DATA\n";
}

std::string Measured(int rows) {
    std::string text = "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID LAB_L LAB_A LAB_B\n"
                       "END_DATA_FORMAT\nNUMBER_OF_SETS " +
                       std::to_string(rows) + "\nBEGIN_DATA\n";
    const char* const values[] = {"1 55.25 -37.5 -50", "2 24 20.5 -48", "3 95 0.75 -2", "4 50 0 0"};
    for (int i = 0; i < rows; ++i) {
        text += std::string(values[i]) + "\n";
    }
    return text + "END_DATA\n";
}

// The names of the files in `dir`, to see that nothing was left behind.
std::vector<std::string> Listing(const fs::path& dir) {
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(dir)) {
        names.push_back(entry.path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

TEST(ConvertCommand, WritesACleanChartThatReadsBackWithTheSameValues) {
    test_support::TempDir dir;
    dir.write("in.it8", LabChart({"1 \"A\" 100 0 0 0 55 -37 -50", "2 \"B\" 0 100 0 0 48 74 -3"},
                                 "KEYWORD \"PRESS\"\nPRESS \"sheetfed press\"\n"));
    const RunResult run = RunSwatchlog({"convert", "in.it8", "-o", "out dir ü.it8"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const std::string written = ReadBytes(dir.file("out dir ü.it8"));
    EXPECT_EQ(written.rfind("CGATS.17", 0), 0u);
    EXPECT_NE(written.find("ORIGINATOR\t\"tool test\""), std::string::npos) << written;
    EXPECT_NE(written.find("KEYWORD\t\"PRESS\"\nPRESS\t\"sheetfed press\""), std::string::npos);
    // The written file is a chart of its own with the same names and values.
    const RunResult back = RunSwatchlog(
        {"patches", "out dir ü.it8", "--spaces", "cmyk,lab", "--format", "tsv"}, dir.path());
    ASSERT_EQ(back.status, 0) << back.err;
    EXPECT_EQ(back.out, "SAMPLE\tNAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\n"
                        "1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00\n"
                        "2\tB\t0.00\t100.00\t0.00\t0.00\t48.00\t74.00\t-3.00\n");
    EXPECT_EQ(Listing(dir.path()), (std::vector<std::string>{"in.it8", "out dir ü.it8"}));
}

TEST(ConvertCommand, RefusesToOverwriteItsInputAlsoThroughALink) {
    test_support::TempDir dir;
    const std::string chart = LabChart({"1 A 0 0 0 0 95 0 0"});
    dir.write("in.it8", chart);
    fs::create_symlink(dir.file("in.it8"), dir.file("link.it8"));
    for (const char* out : {"in.it8", "./in.it8", "link.it8"}) {
        const RunResult run = RunSwatchlog({"convert", "in.it8", "-o", out}, dir.path());
        EXPECT_EQ(run.status, 2) << out;
        EXPECT_NE(run.err.find("refusing to overwrite"), std::string::npos);
    }
    EXPECT_EQ(ReadBytes(dir.file("in.it8")), chart);
}

TEST(MergeCommand, PutsTheMeasurementsIntoTheTarget) {
    test_support::TempDir dir;
    dir.write("target.it8", Target());
    dir.write("measured.it8", Measured(3));
    const RunResult run =
        RunSwatchlog({"merge", "target.it8", "measured.it8", "-o", "merged.it8"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const RunResult back = RunSwatchlog(
        {"patches", "merged.it8", "--spaces", "cmyk,lab", "--format", "tsv"}, dir.path());
    ASSERT_EQ(back.status, 0) << back.err;
    EXPECT_NE(back.out.find("\t100.00\t100.00\t0.00\t0.00\t24.00\t20.50\t-48.00\n"),
              std::string::npos)
        << back.out;
    EXPECT_NE(back.out.find("\t0.00\t0.00\t0.00\t0.00\t95.00\t0.75\t-2.00\n"), std::string::npos);
}

TEST(MergeCommand, AppendsOnlyMissingColumns) {
    test_support::TempDir dir;
    dir.write("target.it8", Target());
    dir.write("measured.it8", Measured(3));
    const RunResult run = RunSwatchlog(
        {"merge", "target.it8", "measured.it8", "-o", "merged.it8", "--append-missing", "--exact"},
        dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const std::string written = ReadBytes(dir.file("merged.it8"));
    // The target's rows stay, names included, with XYZ (the library derives it
    // from L*a*b*) and L*a*b* appended.
    EXPECT_NE(written.find("SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tXYZ_X\tXYZ_Y\t"
                           "XYZ_Z\tLAB_L\tLAB_A\tLAB_B\n"),
              std::string::npos)
        << written;
    EXPECT_EQ(written.find("\n1\tcyan\t100\t0\t0\t0\t") + 1, written.find("\n1\t") + 1);
    EXPECT_NE(written.find("\t55.25\t-37.50\t-50.00\n2\tblue\t"), std::string::npos);
    EXPECT_NE(written.find("\t95.00\t0.75\t-2.00\nEND_DATA"), std::string::npos);
}

TEST(MergeCommand, ACountMismatchLeavesNoFileAndAnExistingOutputUntouched) {
    test_support::TempDir dir;
    dir.write("target.it8", Target());
    dir.write("measured.it8", Measured(4));
    const RunResult fresh =
        RunSwatchlog({"merge", "target.it8", "measured.it8", "-o", "merged.it8"}, dir.path());
    EXPECT_EQ(fresh.status, 1);
    EXPECT_NE(fresh.err.find("the target has 3 patches but measured.it8 has 4"), std::string::npos)
        << fresh.err;
    EXPECT_NE(fresh.err.find("[code 24]"), std::string::npos);
    EXPECT_EQ(Listing(dir.path()), (std::vector<std::string>{"measured.it8", "target.it8"}));

    dir.write("merged.it8", "keep me");
    EXPECT_EQ(RunSwatchlog({"merge", "target.it8", "measured.it8", "-o", "merged.it8"}, dir.path())
                  .status,
              1);
    EXPECT_EQ(ReadBytes(dir.file("merged.it8")), "keep me");
    EXPECT_EQ(Listing(dir.path()).size(), 3u);
}

TEST(MergeCommand, RefusesEitherInputAsOutput) {
    test_support::TempDir dir;
    dir.write("target.it8", Target());
    dir.write("measured.it8", Measured(3));
    EXPECT_EQ(
        RunSwatchlog({"merge", "target.it8", "measured.it8", "-o", "measured.it8"}, dir.path())
            .status,
        2);
    EXPECT_EQ(ReadBytes(dir.file("measured.it8")), Measured(3));
}

TEST(TargetCommand, KeepsCleanPatchesAndTheWhite) {
    test_support::TempDir dir;
    dir.write("target.it8", Target());
    const RunResult run = RunSwatchlog({"target", "target.it8", "-o", "clean.it8"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const RunResult back =
        RunSwatchlog({"patches", "clean.it8", "--spaces", "cmyk", "--format", "tsv"}, dir.path());
    ASSERT_EQ(back.status, 0) << back.err;
    // Cyan alone is clean, blue (cyan and magenta) is not, paper is the white.
    EXPECT_EQ(back.out, "SAMPLE\tNAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                        "1\t\t100.00\t0.00\t0.00\t0.00\n"
                        "2\t\t0.00\t0.00\t0.00\t0.00\n");
}

TEST(TargetCommand, NothingCleanIsAChartErrorWithoutOutput) {
    test_support::TempDir dir;
    dir.write("mixed.it8", LabChart({"1 A 50 50 0 0 40 10 -30", "2 B 0 40 40 0 60 30 30"}));
    const RunResult run = RunSwatchlog({"target", "mixed.it8", "-o", "clean.it8"}, dir.path());
    EXPECT_EQ(run.status, 1);
    EXPECT_NE(run.err.find("no clean and no white patch"), std::string::npos) << run.err;
    EXPECT_FALSE(fs::exists(dir.file("clean.it8")));
}

TEST(KeywordsCommand, InsertsLinesAfterTheIdentification) {
    test_support::TempDir dir;
    dir.write("in.it8", Target());
    const RunResult run = RunSwatchlog(
        {"keywords", "in.it8", "-o", "out.it8", "PRINT_CONDITIONS=ISO coated", "PRESS_SPEED=12000"},
        dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const std::string written = ReadBytes(dir.file("out.it8"));
    EXPECT_EQ(written.rfind("CGATS.17\n"
                            "PRINT_CONDITIONS\t\"ISO coated\"\n"
                            "KEYWORD\t\"PRESS_SPEED\"\n"
                            "PRESS_SPEED\t12000\n"
                            "ORIGINATOR",
                            0),
              0u)
        << written;
    EXPECT_EQ(RunSwatchlog({"info", "out.it8"}, dir.path()).status, 0);
}

TEST(KeywordsCommand, RejectsMalformedPairs) {
    test_support::TempDir dir;
    dir.write("in.it8", Target());
    for (const char* pair : {"NOEQUALS", "=5", "TWO WORDS=1", "BEGIN_DATA=1", "NOTE=say \"hi\""}) {
        const RunResult run =
            RunSwatchlog({"keywords", "in.it8", "-o", "out.it8", pair}, dir.path());
        EXPECT_EQ(run.status, 2) << pair;
    }
    EXPECT_EQ(RunSwatchlog({"keywords", "in.it8", "-o", "out.it8"}, dir.path()).status, 2);
    EXPECT_FALSE(fs::exists(dir.file("out.it8")));
}

TEST(WritingCommands, AMissingFolderIsAFileError) {
    test_support::TempDir dir;
    dir.write("in.it8", Target());
    const RunResult run =
        RunSwatchlog({"convert", "in.it8", "-o", "no/such/folder/out.it8"}, dir.path());
    EXPECT_EQ(run.status, 1);
    EXPECT_NE(run.err.find("no/such/folder/out.it8: the output file cannot be written [code 23]"),
              std::string::npos)
        << run.err;
}

} // namespace
} // namespace tool_test
