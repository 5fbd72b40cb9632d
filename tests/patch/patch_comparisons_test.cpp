// Distances, straight-gradient tests and the clean and white tests of a patch.
#include <cmath>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::SuppliedOnly;

CColorPatch CmykPatch(tagCMYK cmyk) {
    patch_test::PatchInput in;
    in.cmyk = cmyk;
    return in.Read(SuppliedOnly(MISSING_CMYK));
}

CColorPatch NColorPatch(std::initializer_list<double> values, tagCMYK cmyk = {}) {
    patch_test::PatchInput in;
    in.cmyk = cmyk;
    in.nColors = patch_test::Channels(values);
    return in.Read(SuppliedOnly(MISSING_CMYK | MISSING_NCOLOR));
}

TEST(PatchComparisons, DistancesAndGradientsUseEveryChannelOfTheirRecord) {
    patch_test::PatchInput in; // presence flags are not consulted
    in.cmyk = {10, 20, 30, 40};
    in.cmykog = {20, 0, 0, 0, 40, 0};
    in.cmykogv = {20, 0, 0, 0, 0, 0, 40};
    in.cmykrgb = {20, 0, 0, 0, 0, 0, 41};
    CColorPatch p = in.Build();
    EXPECT_EQ(p.GetCMYKPatchDistanceTo(in.cmyk), 0.0);
    EXPECT_DOUBLE_EQ(p.GetCMYKPatchDistanceTo({13, 24, 30, 40}), 5.0);           // 3, 4
    EXPECT_DOUBLE_EQ(p.GetCMYKOGPatchDistanceTo({20, 0, 0, 0, 37, 4}), 5.0);     // o 3, g 4
    EXPECT_DOUBLE_EQ(p.GetCMYKOGVPatchDistanceTo({20, 0, 0, 0, 0, 0, 33}), 7.0); // v alone
    EXPECT_DOUBLE_EQ(p.GetCMYKRGBPatchDistanceTo({18, 0, 0, 0, 3, 6, 41}), 7.0); // 4+9+36

    EXPECT_TRUE(p.IsCMYKOGOnGradient({}, {10, 0, 0, 0, 20, 0}, 1));
    EXPECT_FALSE(p.IsCMYKOGOnGradient({}, {10, 0, 0, 0, 20, 1}, 1));
    EXPECT_TRUE(p.IsCMYKOGVOnGradient({}, {10, 0, 0, 0, 0, 0, 20}, 1));
    EXPECT_FALSE(p.IsCMYKRGBOnGradient({}, {10, 0, 0, 0, 0, 0, 20}, 1)); // t 2 against 2.05
}

TEST(PatchComparisons, GradientTestComparesTheLineParameterWithinTolerance) {
    const tagCMYK direction{10, 10, 0, 0};
    EXPECT_TRUE(CmykPatch({50, 50, 0, 0}).IsCMYKOnGradient({}, direction, 1));
    EXPECT_FALSE(CmykPatch({50, 51, 0, 0}).IsCMYKOnGradient({}, direction, 1)); // 5 vs 5.1
    EXPECT_FALSE(CmykPatch({50, 50, 0, 1}).IsCMYKOnGradient({}, direction, 1)); // k off origin
    // Tolerance 1e7 allows a difference of 1 in t and off the origin.
    EXPECT_TRUE(CmykPatch({50, 60, 0, 1}).IsCMYKOnGradient({}, direction, 1e7));
    EXPECT_FALSE(CmykPatch({50, 65, 0, 0}).IsCMYKOnGradient({}, direction, 1e7)); // 5 vs 6.5
    EXPECT_FALSE(CmykPatch({50, 50, 0, 1.5}).IsCMYKOnGradient({}, direction, 1e7));
    // A zero direction: on the gradient only at the origin.
    EXPECT_TRUE(CmykPatch({5, 6, 7, 8}).IsCMYKOnGradient({5, 6, 7, 8}, {}, 1));
    EXPECT_FALSE(CmykPatch({5, 6, 7, 8.001}).IsCMYKOnGradient({5, 6, 7, 8}, {}, 1));
    // A NaN direction component counts as non-zero and fails.
    EXPECT_FALSE(CmykPatch({50, 50, 0, 0}).IsCMYKOnGradient({}, {10, 10, std::nan(""), 0}, 1));
}

TEST(PatchComparisons, CleanNeedsOneChannelAboveAndTheOthersStrictlyBelow) {
    EXPECT_TRUE(CmykPatch({80, 4, 0, 0}).IsCleanColor(0, 5));
    EXPECT_FALSE(CmykPatch({80, 5, 0, 0}).IsCleanColor(0, 5)); // 5 is not below 5
    EXPECT_FALSE(CmykPatch({80, 4, 0, 0}).IsCleanColor(1, 5));
    EXPECT_FALSE(CmykPatch({80, 4, 0, 0}).IsCleanColor(4, 5));
    EXPECT_TRUE(CmykPatch({0, 0, 0, 90}).IsCleanColor(5));
    EXPECT_FALSE(CmykPatch({0, 0, 0, 0}).IsCleanColor(5));
    EXPECT_FALSE(CmykPatch({80, 0, 5, 0}).IsCleanColor(5));

    // n-colour channels win over CMYK when both are present.
    CColorPatch both = NColorPatch({0, 70, 0}, tagCMYK{80, 0, 0, 0});
    EXPECT_TRUE(both.IsCleanColor(1, 5));
    EXPECT_FALSE(both.IsCleanColor(0, 5));
    EXPECT_FALSE(both.IsCleanColor(3, 5));
    EXPECT_FALSE(both.IsCleanColor(-1, 5));
    EXPECT_TRUE(both.IsCleanColor(5));
    EXPECT_FALSE(NColorPatch({0, 70, 70}).IsCleanColor(5));
    EXPECT_FALSE(NColorPatch({}).IsCleanColor(5));

    patch_test::PatchInput none;
    none.cmyk = {80, 0, 0, 0};
    EXPECT_FALSE(none.Build().IsCleanColor(5));
    EXPECT_FALSE(none.Build().IsCleanColor(0, 5));
    EXPECT_FALSE(none.Build().IsWhite(100));
}

TEST(PatchComparisons, WhiteNeedsEveryChannelStrictlyBelow) {
    EXPECT_TRUE(CmykPatch({0, 0, 0, 0.5}).IsWhite(1));
    EXPECT_FALSE(CmykPatch({0, 0, 0, 1}).IsWhite(1));
    EXPECT_TRUE(NColorPatch({0, 0.5}, tagCMYK{90, 0, 0, 0}).IsWhite(1));
    EXPECT_FALSE(NColorPatch({0, 1}).IsWhite(1));
    EXPECT_TRUE(NColorPatch({}).IsWhite(1));
}

} // namespace
