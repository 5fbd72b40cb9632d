// compare and render.
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

TEST_F(ToolTest, ComparePairsByNameWorstFirstWithSummary) {
    REQUIRE_JQ();
    dir.write("ref.it8", LabChart(kReference));
    dir.write("meas.it8", LabChart(kMeasuredInOtherOrder));
    // dE*ab: 13 (sqrt(9 + 16 + 144)), 10 (the grey), 3 (lightness), 0.
    ExpectJson(Ok({"compare", "ref.it8", "meas.it8", "--by=name", "--format=json"}),
               {"[.patches[] | {(.name): .de76}] | add == "
                "{\"two\": 13, \"four\": 10, \"one\": 3, \"three\": 0}",
                // The grey in CIEDE2000: 10 / (1 + 0.015 * 25 / sqrt(20 + 25)) = 9.4706.
                "(.patches[] | select(.name == \"four\") | .de2000) == 9.4706",
                "[.patches[].de2000] | . == (sort | reverse)",
                // Mean of 13, 10, 3, 0 is 6.5; the 95th percentile lies at rank
                // 0.95 * 3 = 2.85 of 0, 3, 10, 13: 10 + 0.85 * 3 = 12.55.
                ".summary.de76 == {\"mean\": 6.5, \"p95\": 12.55, \"max\": 13}"});
}

TEST_F(ToolTest, RenderDrawsEveryPatchInItsColourWithEscapedNames) {
    dir.write("chart.it8", LabChart({"1 white 0 0 0 0 100 0 0", "2 grey<&> 0 0 0 0 50 0 0",
                                     "3 black 0 0 0 100 0 0 0"}));
    Ok({"render", "chart.it8", "-o", "picture ü.svg"});
    const std::string svg = Read("picture ü.svg");
    // L* 100 is the D50 white. L* 50: Y = (66 / 116)^3 = 0.184187, a grey;
    // 1.055 * 0.184187^(1/2.4) - 0.055 = 0.466327, times 255 = 118.9 = 0x77.
    ExpectIn(svg, {"fill=\"#ffffff\"/><text", "fill=\"#777777\"", "fill=\"#000000\"",
                   "grey&lt;&amp;&gt;", "</svg>"});
    EXPECT_EQ(svg.find("grey<&>"), std::string::npos);
}

} // namespace
} // namespace tool_test
