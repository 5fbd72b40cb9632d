// 8-bit RGB from XYZ through the three conversion matrices, and from CMYK.
#include <climits>
#include <cmath>
#include <vector>

#include <gtest/gtest.h>

#include "color_patch_probe.h"

namespace {

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
    EXPECT_EQ(FromXYZ(41.24, 21.26, 1.93, 1), (Rgb{255, 0, 0}));       // sRGB red primary
    EXPECT_EQ(FromXYZ(20, 20, 20, 1), (Rgb{135, 121, 118}));
    // (20, 20, 20), type 2: linear 0.217867, 0.197239, 0.167496, companded
    // 0.504112, 0.481414, 0.446096; type 0: companded 0.488684, 0.480983, 0.530027.
    EXPECT_EQ(FromXYZ(20, 20, 20, 2), (Rgb{129, 123, 114}));
    EXPECT_EQ(FromXYZ(20, 20, 20, 0), (Rgb{125, 123, 135}));
    EXPECT_EQ(FromXYZ(20, 20, 20, 7), (Rgb{125, 123, 135})); // above 3 acts as 0
    EXPECT_EQ(FromXYZ(96.38, 100, 82.45, 3), (Rgb{0, 0, 0}));
    EXPECT_EQ(FromXYZ(0, 0, 0, 2), (Rgb{0, 0, 0}));

    // Clamping. Type 1 on (200, 0, 0): linear 6.48 (far above 1), -1.94 and
    // 0.111 (companded 0.367608; 255 c + 0.5 = 94.24).
    EXPECT_EQ(FromXYZ(200, 0, 0, 1), (Rgb{255, 0, 94}));
    // Beyond any integer, and NaN: clamped before the integer conversion.
    EXPECT_EQ(FromXYZ(1e308, 0, 0, 1), (Rgb{255, 0, 255}));
    EXPECT_EQ(FromXYZ(std::nan(""), 0, 0, 0), (Rgb{0, 0, 0}));
}

TEST(RgbDerivation, CmykInksAndBlackShareAreInverted) {
    EXPECT_EQ(FromCMYK(0, 0, 0, 0), (Rgb{255, 255, 255}));
    EXPECT_EQ(FromCMYK(50, 0, 0, 0), (Rgb{127, 255, 255}));
    EXPECT_EQ(FromCMYK(0, 0, 0, 100), (Rgb{0, 0, 0}));
    // K 50: C 50 gives 1 - (0.5 * 0.5 + 0.5) = 0.25, 63.75 truncated; M, Y 0 give 127.5.
    EXPECT_EQ(FromCMYK(50, 0, 0, 50), (Rgb{63, 127, 127}));
    // No range is imposed: C 150 gives (1 - 1.5) * 255 = -127.5, truncated to -127.
    // Beyond the int range the ends are kept; NaN reads as 0.
    EXPECT_EQ(FromCMYK(150, 1e300, -1e300, 0), (Rgb{-127, INT_MIN, INT_MAX}));
    EXPECT_EQ(FromCMYK(std::nan(""), 0, 0, 0)[0], 0);
}

} // namespace
