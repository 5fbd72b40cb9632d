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
    std::vector<double> values;
    for (const tagXYZ& v : xyz) {
        values.push_back(v.x);
    }
    return values;
}

using HostSelections = HostChart;

TEST_F(HostSelections, GroupsPutTheWhiteFirstAndKeepSampleOrder) {
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
    for (int channel : {4, -2, 100}) {
        EXPECT_EQ(host->GroupCleanColorPatches(groups, channel), 19) << channel;
    }
    EXPECT_EQ(groups.size(), 1u);

    EXPECT_EQ(Labels(host->SelectCleanColorPatches()),
              (Names{"C100", "C50", "C25", "M100", "M60", "M30"}));
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
    EXPECT_EQ(Channel(references, 1), (std::vector<double>{0, 0, 0, 0, 0, 30, 60, 100, 0, 0}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{90, 70, 50, 20, 90, 72, 55, 40, 90, 90}));

    for (int channel : {4, -2}) {
        EXPECT_EQ(host->GetChannelRamps(references, xyz, channel), 19) << channel;
    }
    EXPECT_EQ(references.size(), 10u);
    EXPECT_EQ(xyz.size(), 10u);
}

TEST_F(HostSelections, RampsDropStepsOfAHundredthOrLess) {
    // Sorted: 20, 20.02, 50, 50.005. From the top, 50.005 is only 0.005 above 50
    // and goes; 0.02 is more than a hundredth and stays.
    ASSERT_EQ(Read(kCmykXyzFields, {"1 A 50.005 0 0 0 1 1 1", "2 B 50.000 0 0 0 2 2 2",
                                    "3 C 20 0 0 0 3 3 3", "4 D 20.02 0 0 0 4 4 4"}),
              0);
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(host->GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{20, 20.02, 50}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{3, 4, 2}));

    // 0 (white), 0.005 and 0.010: 0.010 - 0.005 goes first, then 0.005 - 0.
    ASSERT_EQ(Read(kCmykXyzFields,
                   {"1 W 0 0 0 0 9 9 9", "2 A 0.005 0 0 0 1 1 1", "3 B 0.010 0 0 0 2 2 2"}),
              0);
    EXPECT_EQ(host->GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0}));
    EXPECT_EQ(XValues(xyz), (std::vector<double>{9}));
}

TEST_F(HostSelections, OnlyTheFirstOfTwoWhitesIsTaken) {
    ASSERT_EQ(Read(kCmykXyzFields, {"1 C100 100 0 0 0 20 30 60", "2 W2 0 0 0 0 90 95 80",
                                    "3 W3 0 0 0 0 91 96 81", "4 M50 0 50 0 0 50 40 45"}),
              0);
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(host->GroupCleanColorPatches(groups, -1), 0);
    EXPECT_EQ(GroupLabels(groups),
              (Groups{{0, {"W2", "C100"}}, {1, {"W2", "M50"}}, {2, {"W2"}}, {3, {"W2"}}}));
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(host->GetChannelRamps(references, xyz, -1), 0);
    EXPECT_EQ(XValues(xyz), (std::vector<double>{90, 20, 90, 50, 90, 90}));

    // Stopping at the first white keeps the clean patch found before it.
    std::vector<CColorPatch> selected;
    EXPECT_FALSE(host->SelectCleanAndWhitePatches(selected, true));
    EXPECT_EQ(Labels(selected), (Names{"C100", "W2"}));
    EXPECT_FALSE(host->SelectCleanAndWhitePatches(selected, false));
    EXPECT_EQ(Labels(selected), (Names{"C100", "W2", "W3", "M50"}));
}

TEST_F(HostSelections, CleanAndWhiteSelection) {
    // Sample 1 is white and not clean: with stop, the walk ends there.
    ASSERT_EQ(Read(kCmykXyzFields, kCyanMagentaRows), 0);
    std::vector<CColorPatch> selected;
    EXPECT_FALSE(host->SelectCleanAndWhitePatches(selected, true));
    EXPECT_EQ(Labels(selected), (Names{"W"}));

    // Neither clean nor white: true (nothing found) and an emptied list.
    ASSERT_EQ(Read(kCmykXyzFields, {"1 CM 50 50 0 0 1 1 1", "2 CY 10 0 10 0 2 2 2"}), 0);
    EXPECT_TRUE(host->SelectCleanAndWhitePatches(selected, true));
    EXPECT_TRUE(selected.empty());
    EXPECT_TRUE(host->SelectCleanColorPatches().empty());
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(host->GroupCleanColorPatches(groups, -1), 0);
    EXPECT_EQ(GroupLabels(groups), (Groups{{0, {}}, {1, {}}, {2, {}}, {3, {}}}));
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
