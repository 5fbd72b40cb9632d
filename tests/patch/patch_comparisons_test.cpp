// Device colour of a patch: 8-bit RGB from XYZ and from CMYK, the
// straight-gradient test and the clean and white tests.
#include <climits>
#include <cmath>
#include <vector>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::SuppliedOnly;
using Rgb = std::vector<long>;

Rgb FromXYZ(double x, double y, double z, unsigned int type) {
    CColorPatch p;
    Rgb out(3, -7);
    EXPECT_EQ(ColorPatchProbe::GetRGBfromXYZ(p, x, y, z, &out[0], &out[1], &out[2], type), 0);
    return out;
}

Rgb FromCMYK(double c, double m, double y, double k) {
    CColorPatch p;
    const tagRGB v = ColorPatchProbe::GetRGBFromCMYK(p, tagCMYK{c, m, y, k});
    return {v.r, v.g, v.b};
}

TEST(RgbDerivation, XyzThroughEachConversionType) {
    EXPECT_EQ(FromXYZ(95.047, 100, 108.883, 1), (Rgb{255, 255, 255})); // D65 white, sRGB
    EXPECT_EQ(FromXYZ(96.38, 100, 82.45, 0), (Rgb{255, 255, 255}));    // the norm light
    EXPECT_EQ(FromXYZ(20, 20, 20, 1), (Rgb{135, 121, 118}));
    // (20, 20, 20), type 2: linear 0.217867, 0.197239, 0.167496, companded
    // 0.504112, 0.481414, 0.446096; type 0: companded 0.488684, 0.480983, 0.530027.
    EXPECT_EQ(FromXYZ(20, 20, 20, 2), (Rgb{129, 123, 114}));
    EXPECT_EQ(FromXYZ(20, 20, 20, 0), (Rgb{125, 123, 135}));

    // Clamping. Type 1 on (200, 0, 0): linear 6.48 (far above 1), -1.94 and
    // 0.111 (companded 0.367608; 255 c + 0.5 = 94.24).
    EXPECT_EQ(FromXYZ(200, 0, 0, 1), (Rgb{255, 0, 94}));
    // NaN: clamped before the integer conversion.
    EXPECT_EQ(FromXYZ(std::nan(""), 0, 0, 0), (Rgb{0, 0, 0}));
}

TEST(RgbDerivation, CmykInksAndBlackShareAreInverted) {
    // K 50: C 50 gives 1 - (0.5 * 0.5 + 0.5) = 0.25, 63.75 truncated; M, Y 0 give 127.5.
    EXPECT_EQ(FromCMYK(50, 0, 0, 50), (Rgb{63, 127, 127}));
    // No range is imposed: C 150 gives (1 - 1.5) * 255 = -127.5, truncated to -127.
    // Beyond the int range the ends are kept.
    EXPECT_EQ(FromCMYK(150, 1e300, -1e300, 0), (Rgb{-127, INT_MIN, INT_MAX}));
}

CColorPatch CmykPatch(tagCMYK cmyk) {
    patch_test::PatchInput in;
    in.cmyk = cmyk;
    return in.Read(SuppliedOnly(MISSING_CMYK));
}

// A patch with CMYK and n-colour channels both present.
CColorPatch NColorPatch(std::initializer_list<double> values, tagCMYK cmyk = {}) {
    patch_test::PatchInput in;
    in.cmyk = cmyk;
    in.nColors = patch_test::Channels(values);
    return in.Read(SuppliedOnly(MISSING_CMYK | MISSING_NCOLOR));
}

TEST(PatchComparisons, GradientTestComparesTheLineParameterWithinTolerance) {
    const tagCMYK direction{10, 10, 0, 0};
    EXPECT_TRUE(CmykPatch({50, 50, 0, 0}).IsCMYKOnGradient({}, direction, 1));
    EXPECT_FALSE(CmykPatch({50, 51, 0, 0}).IsCMYKOnGradient({}, direction, 1)); // 5 vs 5.1
    EXPECT_FALSE(CmykPatch({50, 50, 0, 1}).IsCMYKOnGradient({}, direction, 1)); // k off origin
    // A NaN direction component counts as non-zero and fails.
    EXPECT_FALSE(CmykPatch({50, 50, 0, 0}).IsCMYKOnGradient({}, {10, 10, std::nan(""), 0}, 1));
}

TEST(PatchComparisons, CleanAndWhiteAreStrictAndPreferNColorChannels) {
    EXPECT_TRUE(CmykPatch({80, 4, 0, 0}).IsCleanColor(0, 5));
    EXPECT_FALSE(CmykPatch({80, 5, 0, 0}).IsCleanColor(0, 5)); // 5 is not below 5
    EXPECT_FALSE(CmykPatch({80, 4, 0, 0}).IsCleanColor(4, 5));
    EXPECT_FALSE(CmykPatch({80, 0, 5, 0}).IsCleanColor(5));
    EXPECT_TRUE(CmykPatch({0, 0, 0, 0.5}).IsWhite(1));
    EXPECT_FALSE(CmykPatch({0, 0, 0, 1}).IsWhite(1));

    // n-colour channels win over CMYK when both are present.
    CColorPatch both = NColorPatch({0, 70, 0}, tagCMYK{80, 0, 0, 0});
    EXPECT_TRUE(both.IsCleanColor(1, 5));
    EXPECT_TRUE(both.IsCleanColor(5));
    EXPECT_TRUE(NColorPatch({0, 0.5}, tagCMYK{90, 0, 0, 0}).IsWhite(1));
    EXPECT_FALSE(NColorPatch({0, 1}).IsWhite(1));

    patch_test::PatchInput none; // neither flag raised
    none.cmyk = {80, 0, 0, 0};
    EXPECT_FALSE(none.Build().IsWhite(100));
}

} // namespace
