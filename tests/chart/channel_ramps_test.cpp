// Channel ramps: reference values and XYZ sorted along a channel and thinned.
#include <gtest/gtest.h>

#include <stdexcept>

#include "test_store.h"

namespace {

using test_patches::Cmyk;

// Adds a CMYK patch whose XYZ x value is its sample number.
void Add(TestStore& store, int n, double c, double m) {
    store.patches[n] = Cmyk(c, m, 0, 0, {double(n), 0, 0});
}

std::vector<double> Channel(const std::vector<std::vector<double>>& references, int c) {
    std::vector<double> values;
    for (const auto& r : references) {
        values.push_back(r.at(static_cast<std::size_t>(c)));
    }
    return values;
}

std::vector<double> Samples(const std::vector<tagXYZ>& xyz) {
    std::vector<double> numbers;
    for (const auto& v : xyz) {
        numbers.push_back(v.x);
    }
    return numbers;
}

TestStore CyanMagentaChart() {
    TestStore store;
    Add(store, 1, 0, 0);
    Add(store, 2, 100, 0);
    Add(store, 3, 50, 0);
    Add(store, 4, 25, 0);
    Add(store, 5, 0, 100);
    Add(store, 6, 0, 60);
    Add(store, 7, 0, 30);
    store.channelCount = 4;
    return store;
}

TEST(ChannelRamps, OneChannelSortedWithWhiteFirst) {
    TestStore store = CyanMagentaChart();
    std::vector<std::vector<double>> references{{1.0}};
    std::vector<tagXYZ> xyz(3);
    EXPECT_EQ(store.GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0, 25, 50, 100}));
    EXPECT_EQ(Samples(xyz), (std::vector<double>{1, 4, 3, 2}));
    EXPECT_EQ(references[1], (std::vector<double>{25, 0, 0, 0}));
}

TEST(ChannelRamps, EveryChannelGivesOneBlockEach) {
    TestStore store = CyanMagentaChart();
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(store.GetChannelRamps(references, xyz, -1), 0);
    // Blocks: cyan (white, 25, 50, 100), magenta (white, 30, 60, 100), yellow
    // (white), black (white).
    EXPECT_EQ(Samples(xyz), (std::vector<double>{1, 4, 3, 2, 1, 7, 6, 5, 1, 1}));
    ASSERT_EQ(references.size(), 10u);
    EXPECT_EQ(references[5], (std::vector<double>{0, 30, 0, 0}));
}

TEST(ChannelRamps, StepsOfAHundredthOrLessAreThinnedFromTheTop) {
    TestStore store;
    Add(store, 1, 50.005, 0);
    Add(store, 2, 50.0, 0);
    store.channelCount = 4;
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(store.GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{50.0}));
    EXPECT_EQ(Samples(xyz), (std::vector<double>{2}));

    TestStore fine; // white 0, then 0.005 and 0.010: each step is 0.005
    Add(fine, 1, 0.010, 0);
    Add(fine, 2, 0.005, 0);
    Add(fine, 3, 0, 0);
    fine.channelCount = 4;
    EXPECT_EQ(fine.GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0}));
    EXPECT_EQ(Samples(xyz), (std::vector<double>{3}));

    // A step of exactly 0.01 (0.01 - 0 is the double 0.01 itself) is thinned;
    // 0.03 - 0.01 = 0.02 is kept.
    TestStore edge;
    Add(edge, 1, 0, 0);
    Add(edge, 2, 0.01, 0);
    Add(edge, 3, 0.03, 0);
    edge.channelCount = 4;
    EXPECT_EQ(edge.GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0, 0.03}));
    EXPECT_EQ(Samples(xyz), (std::vector<double>{1, 3}));
}

TEST(ChannelRamps, EqualValuesComeOutInExchangeOrder) {
    // Collected: white (5) in front, then 1 (50), 2 (25), 3 (50), 4 (25).
    // Exchange sort: [5, 2, 4, 3, 1]; thinning drops 1 (equal to 3) and 4
    // (equal to 2), leaving 5, 2, 3. A stable sort would have kept 1 instead of 3.
    TestStore store;
    Add(store, 1, 50, 0);
    Add(store, 2, 25, 0);
    Add(store, 3, 50, 0);
    Add(store, 4, 25, 0);
    Add(store, 5, 0, 0);
    store.channelCount = 4;
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(store.GetChannelRamps(references, xyz, 0), 0);
    EXPECT_EQ(Channel(references, 0), (std::vector<double>{0, 25, 50}));
    EXPECT_EQ(Samples(xyz), (std::vector<double>{5, 2, 3}));
}

TEST(ChannelRamps, ChannelOutsideTheChartAnswers19) {
    TestStore store = CyanMagentaChart();
    std::vector<std::vector<double>> references{{1.0}};
    std::vector<tagXYZ> xyz(1);
    EXPECT_EQ(store.GetChannelRamps(references, xyz, 4), 19);
    EXPECT_EQ(store.GetChannelRamps(references, xyz, -3), 19);
    EXPECT_EQ(references.size(), 1u);
    EXPECT_EQ(xyz.size(), 1u);
}

TEST(ChannelRamps, TooFewReferenceValuesEndWithOutOfRange) {
    // Five channels, but CMYK patches carry four reference values: the white
    // patch taken for channel 4 cannot be sorted along it.
    TestStore store;
    Add(store, 1, 0, 0);
    Add(store, 2, 100, 0);
    store.channelCount = 5;
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    try {
        store.GetChannelRamps(references, xyz, -1);
        ADD_FAILURE() << "no exception";
    } catch (const std::out_of_range& e) {
        EXPECT_STREQ(e.what(), "invalid vector subscript");
    }
    // Channel 0: white and cyan; channels 1 to 3: white; channel 4: the white.
    EXPECT_EQ(Samples(xyz), (std::vector<double>{1, 2, 1, 1, 1, 1}));
    EXPECT_EQ(references.size(), 6u);
}

} // namespace
