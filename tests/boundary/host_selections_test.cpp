// Clean-colour and white selections, per-channel groups and channel ramps on
// charts read from files through a factory-made reader-writer.
#include <gtest/gtest.h>

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

#include "chart_files.h"

namespace {

using namespace host_charts;
using Groups = std::map<int, std::vector<std::string>>;
using Names = std::vector<std::string>;

const char* const kCmykXyzFields =
    "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K XYZ_X XYZ_Y XYZ_Z";

// Paper white, three cyan and three magenta patches; the XYZ x value tells them apart.
const std::vector<std::string> kCyanMagentaRows = {
    "1 W 0 0 0 0 90 95 80",    "2 C100 100 0 0 0 20 30 60", "3 C50 50 0 0 0 50 60 75",
    "4 C25 25 0 0 0 70 78 78", "5 M100 0 100 0 0 40 20 30", "6 M60 0 60 0 0 55 45 50",
    "7 M30 0 30 0 0 72 66 68",
};

Groups GroupLabels(const std::map<int, std::vector<CColorPatch>>& groups) {
    Groups labels;
    for (const auto& [channel, patches] : groups) {
        labels[channel] = Labels(patches);
    }
    return labels;
}

std::vector<double> Channel(const std::vector<std::vector<double>>& references, std::size_t c) {
    std::vector<double> values;
    for (const auto& r : references) {
        values.push_back(r.at(c));
    }
    return values;
}

std::vector<double> XValues(const std::vector<tagXYZ>& xyz) {
    return Channel(ValueRows(xyz), 0);
}

using HostSelections = HostChart;

TEST_F(HostSelections, CleanPatchesGroupedWithTheWhiteFirstInSampleOrder) {
    ASSERT_EQ(Read(kCmykXyzFields, kCyanMagentaRows), 0);
    std::map<int, std::vector<CColorPatch>> groups{{9, {}}};
    EXPECT_EQ(host->GroupCleanColorPatches(groups, -1), 0);
    EXPECT_EQ(GroupLabels(groups), (Groups{{0, {"W", "C100", "C50", "C25"}},
                                           {1, {"W", "M100", "M60", "M30"}},
                                           {2, {"W"}},
                                           {3, {"W"}}}));
    EXPECT_EQ(host->GroupCleanColorPatches(groups, 1), 0);
    EXPECT_EQ(GroupLabels(groups), (Groups{{1, {"W", "M100", "M60", "M30"}}}));

    // Channel 4 equals the chart's channel count.
    EXPECT_EQ(host->GroupCleanColorPatches(groups, 4), 19);
    EXPECT_EQ(groups.size(), 1u);

    EXPECT_EQ(Labels(host->SelectCleanColorPatches()),
              (Names{"C100", "C50", "C25", "M100", "M60", "M30"}));
    // Sample 1 is white and not clean: with stop, the walk ends there.
    std::vector<CColorPatch> selected;
    EXPECT_FALSE(host->SelectCleanAndWhitePatches(selected, true));
    EXPECT_EQ(Labels(selected), (Names{"W"}));
}

TEST_F(HostSelections, RampsSortedAlongTheChannelWithMatchingXyz) {
    ASSERT_EQ(Read(kCmykXyzFields, kCyanMagentaRows), 0);
    std::vector<std::vector<double>> references{{1, 2, 3, 4}};
    std::vector<tagXYZ> xyz(2);
    EXPECT_EQ(host->GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(references, (std::vector<std::vector<double>>{
                              {0, 0, 0, 0}, {25, 0, 0, 0}, {50, 0, 0, 0}, {100, 0, 0, 0}}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{90, 70, 50, 20})); // W, C25, C50, C100

    // Every channel: one block each, white first in each.
    EXPECT_EQ(host->GetChannelRamps(references, xyz, -1), 0);
    ASSERT_EQ(references.size(), 10u);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0, 25, 50, 100, 0, 0, 0, 0, 0, 0}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{90, 70, 50, 20, 90, 72, 55, 40, 90, 90}));

    EXPECT_EQ(host->GetChannelRamps(references, xyz, -2), 19);
    EXPECT_EQ(references.size() + xyz.size(), 20u); // left alone
}

TEST_F(HostSelections, RampsSortByExchangeAndDropStepsOfAHundredthOrLess) {
    struct Case {
        std::vector<std::string> rows; // XYZ x is the sample number
        std::vector<double> cyan;
        std::vector<double> samples;
    };
    const Case cases[] = {
        // Sorted 20, 20.02, 50, 50.005: from the top 50.005 is only 0.005 above 50
        // and goes; 0.02 is more than a hundredth and stays.
        {{"1 A 50.005 0 0 0 1 1 1", "2 B 50.000 0 0 0 2 2 2", "3 C 20 0 0 0 3 3 3",
          "4 D 20.02 0 0 0 4 4 4"},
         {20, 20.02, 50},
         {3, 4, 2}},
        // A step of exactly 0.01 (0.01 - 0 is the double 0.01) goes; 0.02 stays.
        {{"1 W 0 0 0 0 1 1 1", "2 A 0.01 0 0 0 2 2 2", "3 B 0.03 0 0 0 3 3 3"}, {0, 0.03}, {1, 3}},
        // Collected as white 5, then 1 (50), 2 (25), 3 (50), 4 (25). The exchange
        // sort gives 5, 2, 4, 3, 1; thinning drops 1 (equal to 3) and 4 (equal to
        // 2). A stable sort would have kept 1 instead of 3.
        {{"1 A 50 0 0 0 1 1 1", "2 B 25 0 0 0 2 2 2", "3 C 50 0 0 0 3 3 3", "4 D 25 0 0 0 4 4 4",
          "5 W 0 0 0 0 5 5 5"},
         {0, 25, 50},
         {5, 2, 3}},
    };
    for (const Case& c : cases) {
        ASSERT_EQ(Read(kCmykXyzFields, c.rows), 0);
        std::vector<std::vector<double>> references;
        std::vector<tagXYZ> xyz;
        EXPECT_EQ(host->GetChannelRamps(references, xyz, 0), 0);
        EXPECT_EQ(Channel(references, 0), c.cyan) << c.rows[0];
        EXPECT_EQ(XValues(xyz), c.samples) << c.rows[0];
    }
}

TEST_F(HostSelections, NeitherCleanNorWhiteFindsNothingAndEmptiesTheList) {
    ASSERT_EQ(Read(kCmykXyzFields, {"1 CM 50 50 0 0 1 1 1", "2 CY 10 0 10 0 2 2 2"}), 0);
    std::vector<CColorPatch> selected{CColorPatch()};
    EXPECT_TRUE(host->SelectCleanAndWhitePatches(selected, true));
    EXPECT_TRUE(selected.empty());
    EXPECT_TRUE(host->SelectCleanColorPatches().empty());
}

TEST_F(HostSelections, ChannelBeyondThePatchReferenceValues) {
    // CMYK with orange, green and violet: seven channels, but the patches' reference
    // values are their four CMYK values, so the white's value on channel 4 is out of
    // range and the ramp ends with the subscript error, keeping what it collected.
    ASSERT_EQ(Read("SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K ORANGE GREEN VIOLET XYZ_X "
                   "XYZ_Y XYZ_Z",
                   {"1 C 100 0 0 0 0 0 0 20 30 60", "2 W 0 0 0 0 0 0 0 90 95 80"}),
              0);
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    try {
        host->GetChannelRamps(references, xyz, 4);
        ADD_FAILURE() << "no exception";
    } catch (const std::out_of_range& error) {
        EXPECT_STREQ(error.what(), "invalid vector subscript");
    }
    EXPECT_EQ(references, (std::vector<std::vector<double>>{{0, 0, 0, 0}}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{90}));
    EXPECT_EQ(host->GetChannelRamps(references, xyz, 7), 19);
}

} // namespace
