// Clean-colour and white patches, alone and grouped by channel.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::Cmyk;

// Paper white (sample 1), cyan 100, 50, 25 (samples 2 to 4), magenta 100, 60,
// 30 (samples 5 to 7). The XYZ x value of each patch is its sample number.
TestStore CyanMagentaChart() {
    TestStore store;
    const double tones[7][2] = {{0, 0}, {100, 0}, {50, 0}, {25, 0}, {0, 100}, {0, 60}, {0, 30}};
    for (int n = 1; n <= 7; ++n) {
        store.patches[n] = Cmyk(tones[n - 1][0], tones[n - 1][1], 0, 0, {double(n), 0, 0});
    }
    store.UpdatePresenceFlags(test_patches::kNothingSupplied & ~(MISSING_CMYK | MISSING_XYZ));
    return store;
}

std::vector<double> SampleNumbers(const std::vector<CColorPatch>& patches) {
    std::vector<double> numbers;
    for (const auto& patch : patches) {
        numbers.push_back(patch.GetXYZ().x);
    }
    return numbers;
}

TEST(CleanColourSelection, CleanPatchesInSampleOrder) {
    TestStore store = CyanMagentaChart();
    store.patches[8] = Cmyk(50, 50, 0, 0, {8, 0, 0}); // two colorants: not clean
    EXPECT_EQ(SampleNumbers(store.SelectCleanColorPatches()),
              (std::vector<double>{2, 3, 4, 5, 6, 7}));
    TestStore empty;
    EXPECT_TRUE(empty.SelectCleanColorPatches().empty());
}

TEST(CleanColourSelection, CleanAndWhiteAnswersTrueWhenNothingFound) {
    TestStore store = CyanMagentaChart();
    store.patches[8] = Cmyk(0, 0, 0, 0, {8, 0, 0}); // a second white
    std::vector<CColorPatch> found{CColorPatch()};
    EXPECT_FALSE(store.SelectCleanAndWhitePatches(found, false));
    EXPECT_EQ(SampleNumbers(found), (std::vector<double>{1, 2, 3, 4, 5, 6, 7, 8}));
    EXPECT_FALSE(store.SelectCleanAndWhitePatches(found, true));
    EXPECT_EQ(SampleNumbers(found), (std::vector<double>{1}));

    TestStore muddy;
    muddy.patches[1] = Cmyk(50, 50, 0, 0);
    muddy.patches[2] = Cmyk(0, 20, 20, 20);
    EXPECT_TRUE(muddy.SelectCleanAndWhitePatches(found, false));
    EXPECT_TRUE(found.empty());
}

// The store tests with the tolerance 1e-5: a tone of exactly 1e-5 is neither
// printed (not above) nor unprinted (not below).
TEST(CleanColourSelection, ToleranceOfOneHundredThousandthIsStrictBothWays) {
    TestStore store;
    store.patches[1] = Cmyk(1e-5, 0, 0, 0, {1, 0, 0});   // neither clean nor white
    store.patches[2] = Cmyk(2e-5, 0, 0, 0, {2, 0, 0});   // clean cyan
    store.patches[3] = Cmyk(0.5e-5, 0, 0, 0, {3, 0, 0}); // white
    store.patches[4] = Cmyk(50, 1e-5, 0, 0, {4, 0, 0});  // magenta not below: not clean
    store.channelCount = 4;

    EXPECT_EQ(SampleNumbers(store.SelectCleanColorPatches()), (std::vector<double>{2}));
    std::vector<CColorPatch> found;
    EXPECT_FALSE(store.SelectCleanAndWhitePatches(found, false));
    EXPECT_EQ(SampleNumbers(found), (std::vector<double>{2, 3}));
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(store.GroupCleanColorPatches(groups, 0), 0);
    EXPECT_EQ(SampleNumbers(groups[0]), (std::vector<double>{3, 2}));
}

TEST(CleanColourSelection, GroupsLeadWithTheFirstWhite) {
    TestStore store = CyanMagentaChart();
    store.patches[8] = Cmyk(0, 0, 0, 0, {8, 0, 0}); // a second white is left out
    ASSERT_EQ(store.channelCount, 4);
    std::map<int, std::vector<CColorPatch>> groups{{9, {}}};
    EXPECT_EQ(store.GroupCleanColorPatches(groups, -1), 0);
    ASSERT_EQ(groups.size(), 4u);
    EXPECT_EQ(SampleNumbers(groups[0]), (std::vector<double>{1, 2, 3, 4}));
    EXPECT_EQ(SampleNumbers(groups[1]), (std::vector<double>{1, 5, 6, 7}));
    EXPECT_EQ(SampleNumbers(groups[2]), (std::vector<double>{1}));
    EXPECT_EQ(SampleNumbers(groups[3]), (std::vector<double>{1}));

    EXPECT_EQ(store.GroupCleanColorPatches(groups, 1), 0);
    ASSERT_EQ(groups.size(), 1u);
    EXPECT_EQ(SampleNumbers(groups[1]), (std::vector<double>{1, 5, 6, 7}));
}

TEST(CleanColourSelection, WhiteAfterTheCleanPatchesStillLeads) {
    TestStore store;
    store.patches[1] = Cmyk(40, 0, 0, 0, {1, 0, 0});
    store.patches[2] = Cmyk(0, 0, 0, 0, {2, 0, 0});
    store.channelCount = 4;
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(store.GroupCleanColorPatches(groups, 0), 0);
    EXPECT_EQ(SampleNumbers(groups[0]), (std::vector<double>{2, 1}));
}

TEST(CleanColourSelection, ChannelOutsideTheChartAnswers19) {
    TestStore store = CyanMagentaChart();
    std::map<int, std::vector<CColorPatch>> groups{{9, {}}};
    EXPECT_EQ(store.GroupCleanColorPatches(groups, 4), 19);
    EXPECT_EQ(store.GroupCleanColorPatches(groups, -2), 19);
    EXPECT_EQ(groups.size(), 1u); // untouched

    TestStore noChannels;
    EXPECT_EQ(noChannels.GroupCleanColorPatches(groups, 0), 19);
    EXPECT_EQ(noChannels.GroupCleanColorPatches(groups, -1), 0);
    EXPECT_TRUE(groups.empty());
}

TEST(CleanColourSelection, NColourTestsLeaveTheStoredPatchesAlone) {
    TestStore store;
    // Channels 0 and 5 only: looking at channels 1 to 4 would add positions.
    test_patches::PatchValues v;
    v.nColors[0] = tagNCLR{2, 0, "A", 80.0};
    v.nColors[5] = tagNCLR{2, 5, "B", 0.0};
    v.supplied = MISSING_NCOLOR;
    store.patches[1] = test_patches::Build(v);
    store.patches[2] = test_patches::NColor({0, 0});
    store.channelCount = 2;
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(store.GroupCleanColorPatches(groups, -1), 0);
    store.SelectCleanColorPatches();
    std::vector<CColorPatch> found;
    store.SelectCleanAndWhitePatches(found, false);
    EXPECT_EQ(store.patches[1].GetNColorMap().size(), 2u);
    EXPECT_EQ(store.patches[2].GetNColorMap().size(), 2u);
}

} // namespace
