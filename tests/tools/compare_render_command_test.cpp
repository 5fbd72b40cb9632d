// compare and render, and the bundled example charts.
#include "tool_runner.h"

namespace tool_test {
namespace {

// Differences worked out by hand: patch one differs by dL* = 3 only, two by (3, 4, 12) in
// (L*, a*, b*), three not at all; four is a grey of L* 50 measured at 60.
const std::vector<std::string> kReference{"1 one 0 0 0 0 50 10 10", "2 two 0 0 0 0 50 10 -5",
                                          "3 three 0 0 0 0 70 -20 30", "4 four 0 0 0 0 50 0 0"};
const std::vector<std::string> kMeasuredInOtherOrder{
    "1 four 0 0 0 0 60 0 0", "2 three 0 0 0 0 70 -20 30", "3 two 0 0 0 0 53 14 7",
    "4 one 0 0 0 0 53 10 10"};

std::size_t Count(const std::string& text, const std::string& part) {
    std::size_t count = 0;
    for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
        ++count;
    }
    return count;
}

TEST_F(ToolTest, ComparePairsByNameWorstFirstWithSummary) {
    REQUIRE_JQ();
    dir.write("ref.it8", LabChart(kReference));
    dir.write("meas.it8", LabChart(kMeasuredInOtherOrder));
    ExpectJson(Ok({"compare", "ref.it8", "meas.it8", "--by=name", "--format=json"}),
               {".paired == 4 and .paired_by == \"name\"",
                // dE*ab: 13 (sqrt(9 + 16 + 144)), 10 (the grey), 3 (lightness), 0.
                "[.patches[] | {(.name): .de76}] | add == "
                "{\"two\": 13, \"four\": 10, \"one\": 3, \"three\": 0}",
                // The grey in CIEDE2000: 10 / (1 + 0.015 * 25 / sqrt(20 + 25)) = 9.4706.
                "(.patches[] | select(.name == \"four\") | .de2000) == 9.4706",
                "[.patches[].de2000] | . == (sort | reverse)",
                "(.patches[] | select(.name == \"one\")) | "
                ".reference_sample == 1 and .measured_sample == 4",
                // Mean of 13, 10, 3, 0 is 6.5; the 95th percentile lies at rank
                // 0.95 * 3 = 2.85 of 0, 3, 10, 13: 10 + 0.85 * 3 = 12.55.
                ".summary.de76 == {\"mean\": 6.5, \"p95\": 12.55, \"max\": 13}"});
}

TEST_F(ToolTest, CompareBySampleNumberInATableWithUnpairedPatches) {
    dir.write("ref.it8", LabChart(kReference));
    dir.write("short.it8", LabChart({"1 x 0 0 0 0 50 10 10", "2 y 0 0 0 0 50 10 -5"}));
    ExpectIn(Ok({"compare", "ref.it8", "short.it8"}),
             {"paired     2 patches by sample number", "unpaired   reference samples 3, 4",
              "dE*ab      0.00  0.00  0.00"});
    dir.write("other names.it8", LabChart({"1 q 0 0 0 0 50 0 0"}));
    const RunResult none = Tool({"compare", "ref.it8", "other names.it8", "--by", "name"});
    EXPECT_EQ(none.status, 1);
    ExpectIn(none.err, {"no patch of other names.it8 pairs"});
}

TEST_F(ToolTest, RenderDrawsEveryPatchInItsColourWithEscapedNames) {
    dir.write("chart.it8", LabChart({"1 white 0 0 0 0 100 0 0", "2 grey<&> 0 0 0 0 50 0 0",
                                     "3 black 0 0 0 100 0 0 0"}));
    Ok({"render", "chart.it8", "-o", "picture ü.svg"});
    const std::string svg = Read("picture ü.svg");
    EXPECT_EQ(svg.rfind("<?xml", 0), 0u);
    // L* 100 is the D50 white. L* 50: Y = (66 / 116)^3 = 0.184187, a grey;
    // 1.055 * 0.184187^(1/2.4) - 0.055 = 0.466327, times 255 = 118.9 = 0x77.
    ExpectIn(svg, {"fill=\"#ffffff\"/><text", "fill=\"#777777\"", "fill=\"#000000\"",
                   "grey&lt;&amp;&gt;", "</svg>"});
    EXPECT_EQ(Count(svg, "grey<&>"), 0u);
    EXPECT_EQ(Count(svg, "<polyline"), 0u); // no spectra in this chart
}

TEST_F(ToolTest, BundledExamplesReadRenderCompareAndMerge) {
    const std::string proof = SWATCHLOG_EXAMPLES_DIR "/press_proof.it8";
    const std::string sheet = SWATCHLOG_EXAMPLES_DIR "/press_sheet.it8";
    const std::string target = SWATCHLOG_EXAMPLES_DIR "/press_target.it8";
    Ok({"validate", proof, sheet, target});
    ExpectIn(Ok({"info", proof}),
             {"4 strips of 12 patches", "380-730 nm in 10 nm steps, 36 values"});
    // 48 patches drawn, and the spectra of the three selected ones plotted.
    Ok({"render", proof, "-o", "proof.svg", "--samples", "1,2,48"});
    EXPECT_EQ(Count(Read("proof.svg"), "<rect x="), 48u);
    EXPECT_EQ(Count(Read("proof.svg"), "<polyline"), 3u);
    EXPECT_EQ(Tool({"render", proof, "-o", "x.svg", "--samples", "49"}).status, 2);
    ExpectIn(Ok({"compare", proof, sheet}), {"paired     48 patches"});
    Ok({"merge", target, sheet, "-o", "merged.it8"});
    Ok({"validate", "merged.it8"});
}

} // namespace
} // namespace tool_test
