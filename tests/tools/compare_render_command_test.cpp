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

// Three patches; the measured file has them in another row order and patch "two" 3 units
// lighter, so every pair but that one is equal and dE*ab is 3, 0, 0: mean 1.
const std::vector<std::string> kThree{"1 one 0 0 0 0 50 60 40", "2 two 0 0 0 0 60 -50 30",
                                      "3 three 0 0 0 0 40 20 -60.125"};
const std::vector<std::string> kThreeReordered{"3 three 0 0 0 0 40 20 -60.125",
                                               "1 one 0 0 0 0 50 60 40", "2 two 0 0 0 0 63 -50 30"};

TEST_F(ToolTest, ComparePairsBySampleIdWhateverTheRowOrder) {
    REQUIRE_JQ();
    dir.write("ref.it8", LabChart(kThree));
    dir.write("meas.it8", LabChart(kThreeReordered));
    ExpectJson(Ok({"compare", "ref.it8", "meas.it8", "--format", "json"}),
               {".paired_by == \"id\"", ".summary.de76 == {\"mean\": 1, \"p95\": 2.7, \"max\": 3}",
                "[.patches[] | [.reference_id, .measured_sample, .de76]] == "
                "[[\"2\", 3, 3], [\"1\", 2, 0], [\"3\", 1, 0]]"});
    ExpectIn(
        Ok({"compare", "ref.it8", "meas.it8"}),
        {"paired     3 patches by SAMPLE_ID\n",
         "SAMPLE  SAMPLE_ID  NAME   REF_L   REF_A   REF_B  MEAS_L  MEAS_A  MEAS_B  DE_AB  DE2000\n"
         "   2/3  2          two    60.00  -50.00   30.00   63.00  -50.00   30.00   3.00"});
    // One line per pair with the values as read, for scripts.
    ExpectIn(Ok({"compare", "ref.it8", "meas.it8", "--format", "tsv"}),
             {"REF_SAMPLE\tMEAS_SAMPLE\tREF_SAMPLE_ID\tMEAS_SAMPLE_ID\tNAME\tREF_L\tREF_A\tREF_B\t"
              "MEAS_L\tMEAS_A\tMEAS_B\tDE_AB\tDE2000\n",
              "3\t1\t3\t3\tthree\t40\t20\t-60.125\t40\t20\t-60.125\t0.0000\t0.0000\n"});
}

TEST_F(ToolTest, CompareRefusesPairingsThatLeavePatchesOutOrCannotWork) {
    dir.write("ref.it8", LabChart(kThree));
    std::vector<std::string> other = kThreeReordered;
    other[0].replace(0, 1, "4"); // "three" under another id
    dir.write("other.it8", LabChart(other));
    const char* nameless = "CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID LAB_L LAB_A LAB_B\n"
                           "END_DATA_FORMAT\nNUMBER_OF_SETS 2\nBEGIN_DATA\n1 50 0 0\n2 60 0 0\n"
                           "END_DATA\n";
    dir.write("nameless.it8", nameless);
    const struct {
        int status;
        std::string message;
        std::vector<std::string> args;
    } cases[] = {
        {1,
         "1 of 3 patches of ref.it8 (sample 3) and 1 of 3 patches of other.it8 (sample 1) have no "
         "partner by SAMPLE_ID; --allow-unpaired compares the 2 pairs anyway",
         {"compare", "ref.it8", "other.it8"}},
        {1,
         "cannot pair by sample name: sample 1 of nameless.it8 has no name",
         {"compare", "nameless.it8", "nameless.it8", "--by", "name"}},
        {2,
         "--by must be one of auto, id, name, position, sample",
         {"compare", "a", "b", "--by=x"}},
    };
    for (const auto& c : cases) {
        const RunResult run = Tool(c.args);
        EXPECT_EQ(run.status, c.status) << run.err;
        EXPECT_EQ(run.out, "");
        ExpectIn(run.err, {c.message});
    }
    ExpectIn(Ok({"compare", "ref.it8", "other.it8", "--allow-unpaired"}),
             {"paired     2 patches by SAMPLE_ID\nunpaired   1 of 3 patches of ref.it8 (sample 3) "
              "and 1 of 3 patches of other.it8 (sample 1)\n"});
}

TEST_F(ToolTest, CompareRefusesChartsOfDifferentMeasurementConditions) {
    // Line 3 of each file states its conditions.
    dir.write("d50.it8",
              LabChart(kThree, "MEASUREMENT_SOURCE \"Illumination=D50 ObserverAngle=2\"\n"));
    dir.write("d65.it8", LabChart(kThree, "ILLUMINANT D65\nMEASUREMENT_CONDITION \"M1\"\n"));
    const RunResult refused = Tool({"compare", "d50.it8", "d65.it8"});
    EXPECT_EQ(refused.status, 1);
    ExpectIn(refused.err, {"the illuminant differs: D50 in d50.it8 (MEASUREMENT_SOURCE on line 3) "
                           "but D65 in d65.it8 (ILLUMINANT on line 3)",
                           "--force compares anyway"});
    const RunResult forced = Tool({"compare", "d50.it8", "d65.it8", "--force"});
    EXPECT_EQ(forced.status, 0);
    ExpectIn(forced.err,
             {"warning: the illuminant differs",
              "note: only d50.it8 states an observer: 2° (MEASUREMENT_SOURCE on line 3)",
              "note: only d65.it8 states a measurement condition: M1"});
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
