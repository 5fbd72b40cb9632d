// convert, merge, target and keywords: files written whole, or not at all.
#include <cstring>

#include "tool_runner.h"

namespace tool_test {
namespace {

// Three patches with device values only: cyan, blue (cyan and magenta), paper.
const char* const kTarget = "CGATS.17\nORIGINATOR \"tool test\"\nNUMBER_OF_FIELDS 6\n"
                            "BEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K\n"
                            "END_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA\n1 cyan 100 0 0 0\n"
                            "2 blue 100 100 0 0\n3 paper 0 0 0 0\nEND_DATA\n";
// L*a*b* measurements of those three patches.
const char* const kMeasured = "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID LAB_L LAB_A LAB_B\n"
                              "END_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA\n1 55.25 -37.5 -50\n"
                              "2 24 20.5 -48\n3 95 0.75 -2\nEND_DATA\n";

TEST_F(ToolTest, ConvertWritesACleanChartThatReadsBackWithTheSameValues) {
    dir.write("in.it8", LabChart({"1 \"A\" 100 0 0 0 55 -37 -50", "2 \"B\" 0 100 0 0 48 74 -3"},
                                 "KEYWORD \"PRESS\"\nPRESS \"sheetfed press\"\n"));
    Ok({"convert", "in.it8", "-o", "out dir ü.it8"});
    EXPECT_EQ(FileCount(), 2u); // nothing left behind
    ExpectIn(Read("out dir ü.it8"), {"KEYWORD\t\"PRESS\"\nPRESS\t\"sheetfed press\""});
    EXPECT_EQ(Tsv("out dir ü.it8", "cmyk,lab"),
              "SAMPLE\tSAMPLE_ID\tNAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\n"
              "1\t1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00\n"
              "2\t2\tB\t0.00\t100.00\t0.00\t0.00\t48.00\t74.00\t-3.00\n");
}

TEST_F(ToolTest, MergePairsBySampleIdAndRefusesMeasurementsOfAnotherChart) {
    dir.write("target.it8", kTarget);
    // The measurements in another row order, with their device values; and one
    // patch the target does not have.
    dir.write("reordered.it8",
              "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A "
              "LAB_B\nEND_DATA_FORMAT\nNUMBER_OF_SETS 4\nBEGIN_DATA\n3 0 0 0 0 95 0.75 -2\n"
              "1 100 0 0 0 55.25 -37.5 -50\n4 0 0 0 100 10 0 0\n2 100 100 0 0 24 20.5 -48\n"
              "END_DATA\n");
    std::string rows;
    for (int i = 1; i <= 48; ++i) {
        rows += std::to_string(i) + " p" + std::to_string(i) + " " + std::to_string(i) + " 0 0 0\n";
    }
    dir.write("target48.it8", "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M "
                              "CMYK_Y CMYK_K\nEND_DATA_FORMAT\nNUMBER_OF_SETS 48\nBEGIN_DATA\n" +
                                  rows + "END_DATA\n");
    dir.write("measured.it8", kMeasured);
    const struct {
        std::string message;
        std::vector<std::string> args;
    } refusals[] = {
        {"1 of 4 patches of reordered.it8 (sample 3) has no partner in target.it8 by SAMPLE_ID; "
         "--allow-unpaired leaves them out",
         {"merge", "target.it8", "reordered.it8"}},
        // By row position the device values show that the pairs are wrong.
        {"3 of 3 pairs by position differ in their CMYK values by more than 1: sample 1 "
         "(SAMPLE_ID 1) of target.it8 has CMYK 100 0 0 0, sample 1 (SAMPLE_ID 3) of "
         "reordered.it8 has CMYK 0 0 0 0",
         {"merge", "target.it8", "reordered.it8", "--by", "position", "--allow-unpaired"}},
        // Three measurements do not make a 48-patch target a 3-patch one.
        {"45 of 48 patches of target48.it8 (samples 4-48) have no partner in measured.it8 by "
         "SAMPLE_ID; every target patch needs a measurement, so nothing was written",
         {"merge", "target48.it8", "measured.it8", "--append-missing"}},
    };
    for (const auto& c : refusals) {
        auto args = c.args;
        args.insert(args.end(), {"-o", "out.it8"});
        const RunResult run = Tool(args);
        EXPECT_EQ(run.status, 1) << run.err;
        ExpectIn(run.err, {c.message});
        EXPECT_FALSE(std::filesystem::exists(dir.file("out.it8")));
    }
    // Options also come as --name=VALUE.
    const RunResult run =
        Tool({"merge", "target.it8", "reordered.it8", "--allow-unpaired", "--output=merged.it8"});
    EXPECT_EQ(run.status, 0) << run.err;
    ExpectIn(run.err, {"left out 1 of 4 patches of reordered.it8 that have no target patch "
                       "(sample 3)"});
    ExpectIn(Tsv("merged.it8", "cmyk,lab"),
             {"1\t1\t\t100.00\t0.00\t0.00\t0.00\t55.25\t-37.50\t-50.00\n"
              "2\t2\t\t100.00\t100.00\t0.00\t0.00\t24.00\t20.50\t-48.00\n"
              "3\t3\t\t0.00\t0.00\t0.00\t0.00\t95.00\t0.75\t-2.00\n"});
}

TEST_F(ToolTest, TargetKeepsCleanPatchesAndTheWhite) {
    dir.write("target.it8", kTarget);
    Ok({"target", "target.it8", "-o", "clean.it8"});
    // Cyan alone is clean, blue (cyan and magenta) is not, paper is the white.
    EXPECT_EQ(Tsv("clean.it8", "cmyk"), "SAMPLE\tSAMPLE_ID\tNAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                                        "1\t1\t\t100.00\t0.00\t0.00\t0.00\n"
                                        "2\t2\t\t0.00\t0.00\t0.00\t0.00\n");
}

TEST_F(ToolTest, TargetRefusesToLoseTheCleanPatchesAfterAWhiteOne) {
    dir.write("white first.it8", LabChart({"1 paper 0 0 0 0 95 0 -2", "2 cyan 100 0 0 0 55 -37 -50",
                                           "3 magenta 0 100 0 0 48 74 -3"}));
    const std::string why = "the target would keep 1 of the 3 clean and white patches: the target "
                            "writer stops at the first white patch, sample 1 (paper), and leaves "
                            "out 2 clean patches after it (samples 2-3)";
    const RunResult refused = Tool({"target", "white first.it8", "-o", "out.it8"});
    EXPECT_EQ(refused.status, 1);
    ExpectIn(refused.err, {why + "; --force writes it anyway"});
    EXPECT_FALSE(std::filesystem::exists(dir.file("out.it8")));
    const RunResult forced = Tool({"target", "white first.it8", "-o", "out.it8", "--force"});
    EXPECT_EQ(forced.status, 0);
    ExpectIn(forced.err, {"warning: white first.it8: " + why});
    EXPECT_EQ(Tsv("out.it8", "cmyk"), "SAMPLE\tSAMPLE_ID\tNAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                                      "1\t1\t\t0.00\t0.00\t0.00\t0.00\n");
}

TEST_F(ToolTest, ConvertListsWhatItChangesAndDrops) {
    // RGB 99.2353 is kept as 99 from the reading on; XYZ_X 12.3456 is written
    // as 12.35 (a change of 0.0044); R380 ... are no field the format knows.
    dir.write("in.ti3", "CTI3\nORIGINATOR \"tool test\"\n# measured twice\n"
                        "KEYWORD \"SPECTRAL_BANDS\"\nSPECTRAL_BANDS \"3\"\n"
                        "KEYWORD \"WEIGHTING_FUNCTION\"\nWEIGHTING_FUNCTION \"ILLUMINANT, D50\"\n"
                        "WEIGHTING_FUNCTION \"OBSERVER, 2 degree\"\nBEGIN_DATA_FORMAT\n"
                        "SAMPLE_ID SAMPLE_LOC RGB_R RGB_G RGB_B XYZ_X XYZ_Y XYZ_Z R380 R390 R400\n"
                        "END_DATA_FORMAT\nNUMBER_OF_SETS 2\nBEGIN_DATA\n"
                        "A1 \"x1\" 99.2353 50 0 12.3456 20 30 0.1 0.2 0.3\n"
                        "A2 \"x2\" 10 20 30 40 50 60 0.4 0.5 0.6\nEND_DATA\n");
    const RunResult run = Tool({"convert", "in.ti3", "-o", "out.it8"});
    EXPECT_EQ(run.status, 0) << run.err;
    ExpectIn(run.err,
             {"changed: the identification CTI3 is replaced by CGATS.17",
              "dropped: 1 comment line\n",
              "dropped: keywords that describe spectral fields, which are not written: "
              "SPECTRAL_BANDS\n",
              "changed: SAMPLE_ID: 2 ids replaced by the row numbers 1 to 2 (--keep-ids keeps the "
              "file's own)\n",
              "changed: SAMPLE_LOC is written as SAMPLE_NAME\n",
              "dropped: 3 fields the new-file format has no columns for (2 values each): R380, "
              "R390, R400\n",
              "changed: RGB: 1 of 6 values have decimals and are written as the whole numbers the "
              "chart holds, cut toward zero (99.2353 as 99)\n",
              "changed: XYZ: 1 of 6 values rounded to 2 decimals (largest change 0.0044)\n",
              "added: L*a*b*, derived by the library"});
    // Repeated keywords stay, as the file has them.
    ExpectIn(Read("out.it8"), {"KEYWORD\t\"WEIGHTING_FUNCTION\"\nWEIGHTING_FUNCTION\t\"ILLUMINANT, "
                               "D50\"\nWEIGHTING_FUNCTION\t\"OBSERVER, 2 degree\"\n"});
    EXPECT_EQ(Read("out.it8").find("SPECTRAL_BANDS"), std::string::npos);
    Ok({"convert", "in.ti3", "-o", "ids.it8", "--keep-ids"});
    ExpectIn(Tsv("ids.it8", "xyz"), {"1\tA1\tx1\t12.35\t20.00\t30.00\n2\tA2\tx2\t"});
}

TEST_F(ToolTest, ConvertAndMergeWriteNoValueAPatchDoesNotHave) {
    // Two spectra every 20 nm; the second holds "nan" and so gives no colour.
    std::string text = "CGATS.17\nNUMBER_OF_FIELDS 22\nBEGIN_DATA_FORMAT\nSAMPLE_ID";
    std::string rows[2] = {"1", "2"};
    for (int nm = 380; nm <= 780; nm += 20) {
        text += " SPECTRAL_NM_" + std::to_string(nm);
        rows[0] += " 0.5";
        rows[1] += nm == 500 ? " nan" : " 0.5";
    }
    dir.write("spectra.it8", text + "\nEND_DATA_FORMAT\nNUMBER_OF_SETS 2\nBEGIN_DATA\n" + rows[0] +
                                 "\n" + rows[1] + "\nEND_DATA\n");
    const RunResult run = Tool({"convert", "spectra.it8", "-o", "out.it8"});
    EXPECT_EQ(run.status, 0) << run.err;
    ExpectIn(run.err, {"dropped: XYZ: no value for 1 of 2 patches (sample 2)",
                       "dropped: L*a*b*: no value for 1 of 2 patches (sample 2)"});
    EXPECT_EQ(Read("out.it8").find("XYZ_X"), std::string::npos);

    dir.write("target.it8", "CGATS.17\nNUMBER_OF_FIELDS 2\nBEGIN_DATA_FORMAT\nSAMPLE_ID "
                            "CMYK_C\nEND_DATA_FORMAT\nNUMBER_OF_SETS 2\nBEGIN_DATA\n1 0\n2 "
                            "50\nEND_DATA\n");
    const RunResult merge = Tool({"merge", "target.it8", "spectra.it8", "-o", "merged.it8"});
    EXPECT_EQ(merge.status, 1);
    ExpectIn(merge.err, {"sample 2 of spectra.it8 has no XYZ; nothing was written"});
    EXPECT_FALSE(std::filesystem::exists(dir.file("merged.it8")));
}

TEST_F(ToolTest, KeywordsKeepTheIdentificationAndReplaceValuesInPlace) {
    for (const std::string end : {"\n", "\r\n"}) {
        const std::vector<std::string> lines{"CTI3",
                                             "DESCRIPTOR \"old\"",
                                             "NUMBER_OF_FIELDS 2",
                                             "BEGIN_DATA_FORMAT",
                                             "SAMPLE_ID LAB_L",
                                             "END_DATA_FORMAT",
                                             "NUMBER_OF_SETS 1",
                                             "BEGIN_DATA",
                                             "1 50",
                                             "END_DATA"};
        std::string in;
        for (const auto& line : lines) {
            in += line + end;
        }
        dir.write("in.ti3", in);
        Ok({"keywords", "in.ti3", "-o", "out.ti3", "DESCRIPTOR=new one", "NOTE=x"});
        std::string expected = in;
        expected.replace(expected.find("\"old\""), 5, "\"new one\"");
        expected.insert(4 + end.size(), "KEYWORD\t\"NOTE\"" + end + "NOTE\t\"x\"" + end);
        EXPECT_EQ(Read("out.ti3"), expected);
    }
}

TEST_F(ToolTest, KeywordsGoRightAfterTheIdentification) {
    dir.write("in.it8", kTarget);
    Ok({"keywords", "in.it8", "-o", "out.it8", "PRINT_CONDITIONS=ISO coated", "PRESS_SPEED=12000"});
    // A standard keyword as it is, another announced with KEYWORD; texts quoted, numbers not.
    EXPECT_EQ(Read("out.it8").rfind("CGATS.17\nPRINT_CONDITIONS\t\"ISO coated\"\n"
                                    "KEYWORD\t\"PRESS_SPEED\"\nPRESS_SPEED\t12000\nORIGINATOR",
                                    0),
              0u)
        << Read("out.it8");
}

TEST_F(ToolTest, WritersRefuseToOverwriteAnInputAlsoThroughALink) {
    dir.write("in.it8", kTarget);
    dir.write("measured.it8", kMeasured);
    std::filesystem::create_symlink(dir.file("in.it8"), dir.file("link.it8"));
    const std::vector<std::string> cases[] = {
        {"convert", "in.it8", "-o", "in.it8"},
        {"convert", "in.it8", "-o", "link.it8"},
        {"merge", "in.it8", "measured.it8", "-o", "measured.it8"},
    };
    for (const auto& args : cases) {
        const RunResult run = Tool(args);
        EXPECT_EQ(run.status, 2) << args[0] << " " << args.back();
        ExpectIn(run.err, {"refusing to overwrite"});
    }
    EXPECT_EQ(Read("in.it8"), kTarget);
    EXPECT_EQ(Read("measured.it8"), kMeasured);
}

TEST_F(ToolTest, AFailedWriteLeavesNoOutputAndAnExistingOneUntouched) {
    dir.write("target.it8", kTarget);
    dir.write("mixed.it8", LabChart({"1 A 50 50 0 0 40 10 -30", "2 B 0 40 40 0 60 30 30"}));
    const struct {
        int status;
        std::string message;
        std::vector<std::string> args;
    } cases[] = {
        {1,
         "1 of 3 patches of target.it8 (sample 3) has no partner in mixed.it8 by SAMPLE_ID",
         {"merge", "target.it8", "mixed.it8"}},
        {1, "no clean and no white patch", {"target", "mixed.it8"}},
        {2, "", {"keywords", "target.it8", "TWO WORDS=1"}},
    };
    for (const bool outExists : {false, true}) {
        if (outExists) {
            dir.write("out", "keep me");
        }
        const std::size_t files = FileCount();
        for (const auto& c : cases) {
            auto args = c.args;
            args.insert(args.end(), {"-o", "out"});
            const RunResult run = Tool(args);
            EXPECT_EQ(run.status, c.status) << c.args.back() << ": " << run.err;
            ExpectIn(run.err, {c.message});
            EXPECT_EQ(FileCount(), files) << c.args.back();
            EXPECT_EQ(Read("out"), outExists ? "keep me" : "") << c.args.back();
        }
    }
    const RunResult run = Tool({"convert", "target.it8", "-o", "no/such/folder/out.it8"});
    EXPECT_EQ(run.status, 1);
    ExpectIn(run.err, {"no/such/folder/out.it8: the output file cannot be written (" +
                       std::string(std::strerror(ENOENT)) + ")"});
}

} // namespace
} // namespace tool_test
