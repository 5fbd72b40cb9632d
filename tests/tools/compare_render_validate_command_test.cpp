// compare, render and validate, and the bundled example charts.
#include <gtest/gtest.h>

#include <filesystem>

#include "temp_files.h"
#include "tool_runner.h"

namespace tool_test {
namespace {

namespace fs = std::filesystem;
using test_support::ReadBytes;

// Reference and measured charts whose differences are worked out by hand:
// patch 1 differs by dL* = 3 only, patch 2 by (3, 4, 12) in (L*, a*, b*),
// patch 3 not at all; patch 4 of the reference is a grey of L* 50 measured at 60.
std::string Reference() {
    return LabChart({"1 one 0 0 0 0 50 10 10", "2 two 0 0 0 0 50 10 -5",
                     "3 three 0 0 0 0 70 -20 30", "4 four 0 0 0 0 50 0 0"});
}
std::string MeasuredInOtherOrder() {
    return LabChart({"1 four 0 0 0 0 60 0 0", "2 three 0 0 0 0 70 -20 30", "3 two 0 0 0 0 53 14 7",
                     "4 one 0 0 0 0 53 10 10"});
}

TEST(CompareCommand, PairsByNameAndListsTheWorstFirst) {
    if (!HaveJq()) {
        GTEST_SKIP() << "jq is not installed";
    }
    test_support::TempDir dir;
    dir.write("ref.it8", Reference());
    dir.write("meas.it8", MeasuredInOtherOrder());
    const RunResult run = RunSwatchlog(
        {"compare", "ref.it8", "meas.it8", "--by", "name", "--format", "json"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_TRUE(JqTrue(run.out, ".paired == 4 and .paired_by == \"name\""));
    // dE*ab: 13 (3-4-12), 10 (grey), 3 (lightness), 0.
    EXPECT_TRUE(JqTrue(run.out, "[.patches[] | {(.name): .de76}] | add == "
                                "{\"two\": 13, \"four\": 10, \"one\": 3, \"three\": 0}"));
    // The grey pair in CIEDE2000: 10 / (1 + 0.015 * 25 / sqrt(45)) = 9.4706.
    EXPECT_TRUE(JqTrue(run.out, "(.patches[] | select(.name == \"four\") | .de2000) == 9.4706"));
    EXPECT_TRUE(JqTrue(run.out, ".patches[0].de2000 >= .patches[1].de2000 and "
                                ".patches[1].de2000 >= .patches[2].de2000 and "
                                ".patches[2].de2000 >= .patches[3].de2000"));
    EXPECT_TRUE(JqTrue(run.out, "(.patches[] | select(.name == \"one\")) | "
                                ".reference_sample == 1 and .measured_sample == 4"));
    // Mean of 13, 10, 3, 0 is 6.5; the 95th percentile lies at rank 2.85 of
    // 0, 3, 10, 13: 10 + 0.85 * 3 = 12.55.
    EXPECT_TRUE(JqTrue(run.out, ".summary.de76 == {\"mean\": 6.5, \"p95\": 12.55, \"max\": 13}"));
}

TEST(CompareCommand, BySampleNumberInATableAndUnpairedPatches) {
    test_support::TempDir dir;
    dir.write("ref.it8", Reference());
    dir.write("short.it8", LabChart({"1 x 0 0 0 0 50 10 10", "2 y 0 0 0 0 50 10 -5"}));
    const RunResult run = RunSwatchlog({"compare", "ref.it8", "short.it8"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    EXPECT_NE(run.out.find("paired     2 patches by sample number"), std::string::npos) << run.out;
    EXPECT_NE(run.out.find("unpaired   reference samples 3, 4"), std::string::npos);
    EXPECT_NE(run.out.find("dE*ab      0.00  0.00  0.00"), std::string::npos);

    dir.write("other names.it8", LabChart({"1 q 0 0 0 0 50 0 0"}));
    const RunResult none =
        RunSwatchlog({"compare", "ref.it8", "other names.it8", "--by", "name"}, dir.path());
    EXPECT_EQ(none.status, 1);
    EXPECT_NE(none.err.find("no patch of other names.it8 pairs"), std::string::npos);
}

TEST(RenderCommand, DrawsEveryPatchInItsColourAndPlotsSpectra) {
    test_support::TempDir dir;
    dir.write("chart.it8", LabChart({"1 white 0 0 0 0 100 0 0", "2 grey<&> 0 0 0 0 50 0 0",
                                     "3 black 0 0 0 100 0 0 0"}));
    const RunResult run = RunSwatchlog({"render", "chart.it8", "-o", "picture ü.svg"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const std::string svg = ReadBytes(dir.file("picture ü.svg"));
    EXPECT_EQ(svg.rfind("<?xml", 0), 0u);
    EXPECT_NE(svg.find("</svg>"), std::string::npos);
    // L* 100 is the D50 white: #ffffff. L* 50: Y = (66 / 116)^3 = 0.184187, a
    // grey; 1.055 * 0.184187^(1/2.4) - 0.055 = 0.466327, times 255 = 118.9: #777777.
    EXPECT_NE(svg.find("fill=\"#ffffff\"/><text"), std::string::npos);
    EXPECT_NE(svg.find("fill=\"#777777\""), std::string::npos);
    EXPECT_NE(svg.find("fill=\"#000000\""), std::string::npos);
    EXPECT_NE(svg.find("grey&lt;&amp;&gt;"), std::string::npos); // names are escaped
    EXPECT_EQ(svg.find("grey<&>"), std::string::npos);
    EXPECT_EQ(svg.find("<polyline"), std::string::npos); // no spectra in this chart
}

TEST(RenderCommand, ExampleChartHasItsLayoutAndSelectedSpectra) {
    test_support::TempDir dir;
    const std::string example = std::string(SWATCHLOG_EXAMPLES_DIR) + "/press_proof.it8";
    const RunResult run =
        RunSwatchlog({"render", example, "-o", "proof.svg", "--samples", "1,2,48"}, dir.path());
    ASSERT_EQ(run.status, 0) << run.err;
    const std::string svg = ReadBytes(dir.file("proof.svg"));
    std::size_t patches = 0;
    for (std::size_t at = svg.find("<rect x="); at != std::string::npos;
         at = svg.find("<rect x=", at + 1)) {
        ++patches;
    }
    EXPECT_EQ(patches, 48u);
    std::size_t curves = 0;
    for (std::size_t at = svg.find("<polyline"); at != std::string::npos;
         at = svg.find("<polyline", at + 1)) {
        ++curves;
    }
    EXPECT_EQ(curves, 3u);
    EXPECT_EQ(
        RunSwatchlog({"render", example, "-o", "x.svg", "--samples", "49"}, dir.path()).status, 2);
}

TEST(ValidateCommand, SaysWhatIsWrongWithLineNumbers) {
    test_support::TempDir dir;
    dir.write("good.it8", Reference());
    std::string wide = Reference();
    wide.replace(wide.find("3 three 0 0 0 0 70 -20 30"), 25, "3 three 0 0 0 0 70 -20 30 99");
    dir.write("wide row.it8", wide);
    std::string open = Reference();
    open.erase(open.find("END_DATA\n"));
    dir.write("open.it8", open);
    const RunResult run = RunSwatchlog(
        {"validate", "good.it8", "wide row.it8", "open.it8", "missing.it8"}, dir.path());
    EXPECT_EQ(run.status, 1);
    EXPECT_EQ(run.out, "good.it8: ok, 4 patches (CMYK, L*a*b*)\n");
    EXPECT_NE(run.err.find("wide row.it8: row 3 (line 11) has 10 values but NUMBER_OF_FIELDS is 9 "
                           "[code 8]"),
              std::string::npos)
        << run.err;
    EXPECT_NE(run.err.find("open.it8: the data block that begins on line 8 ends before END_DATA"),
              std::string::npos);
    EXPECT_NE(run.err.find("missing.it8: the file cannot be opened for reading [code 3]"),
              std::string::npos);
    EXPECT_EQ(RunSwatchlog({"validate", "good.it8"}, dir.path()).status, 0);
}

TEST(ValidateCommand, JsonListsEveryFile) {
    if (!HaveJq()) {
        GTEST_SKIP() << "jq is not installed";
    }
    test_support::TempDir dir;
    dir.write("good.it8", Reference());
    dir.write("bad.it8", "CGATS.17\nNUMBER_OF_SETS 0\n");
    const RunResult run =
        RunSwatchlog({"validate", "good.it8", "bad.it8", "--format", "json"}, dir.path());
    EXPECT_EQ(run.status, 1);
    EXPECT_TRUE(run.err.empty());
    EXPECT_TRUE(JqTrue(run.out, ".valid == false and (.files | length) == 2"));
    EXPECT_TRUE(JqTrue(run.out, ".files[0].ok and (.files[1].ok | not)"));
    EXPECT_EQ(JqRaw(run.out, ".files[1].error"), "NUMBER_OF_SETS on line 2 is below 1 [code 6]");
}

TEST(BundledExamples, ReadAndWorkTogether) {
    test_support::TempDir dir;
    const std::string examples = SWATCHLOG_EXAMPLES_DIR;
    const RunResult valid =
        RunSwatchlog({"validate", examples + "/press_proof.it8", examples + "/press_sheet.it8",
                      examples + "/press_target.it8"},
                     dir.path());
    EXPECT_EQ(valid.status, 0) << valid.err;
    const RunResult info = RunSwatchlog({"info", examples + "/press_proof.it8"}, dir.path());
    EXPECT_EQ(info.status, 0);
    EXPECT_NE(info.out.find("4 strips of 12 patches"), std::string::npos);
    EXPECT_NE(info.out.find("380-730 nm in 10 nm steps, 36 values"), std::string::npos);
    const RunResult compare = RunSwatchlog(
        {"compare", examples + "/press_proof.it8", examples + "/press_sheet.it8"}, dir.path());
    EXPECT_EQ(compare.status, 0);
    EXPECT_NE(compare.out.find("paired     48 patches"), std::string::npos);
    const RunResult merge = RunSwatchlog({"merge", examples + "/press_target.it8",
                                          examples + "/press_sheet.it8", "-o", "merged.it8"},
                                         dir.path());
    EXPECT_EQ(merge.status, 0) << merge.err;
    EXPECT_EQ(RunSwatchlog({"validate", "merged.it8"}, dir.path()).status, 0);
}

} // namespace
} // namespace tool_test
