#include <gtest/gtest.h>

#include "srgb.h"

namespace swatchlog {
namespace {

TEST(Bradford, AdaptsD50ToD65AsPublished) {
    // The D50 to D65 Bradford matrix as commonly tabulated for the whites
    // (0.96422, 1, 0.82521) and (0.95047, 1, 1.08883), to seven decimals.
    const Matrix3 expected{{{0.9555766, -0.0230393, 0.0631636},
                            {-0.0282895, 1.0099416, 0.0210077},
                            {0.0122982, -0.0204830, 1.3299098}}};
    const Matrix3 m = BradfordAdaptation(kWhiteD50, kWhiteD65);
    for (int i = 0; i < 3; ++i) {
        for (int j = 0; j < 3; ++j) {
            EXPECT_NEAR(m[i][j], expected[i][j], 5e-7) << i << "," << j;
        }
    }
    // The source white lands on the destination white.
    const XyzColor white = Multiply(m, kWhiteD50);
    EXPECT_NEAR(white.x, kWhiteD65.x, 1e-12);
    EXPECT_NEAR(white.y, kWhiteD65.y, 1e-12);
    EXPECT_NEAR(white.z, kWhiteD65.z, 1e-12);
}

TEST(Srgb, WhiteGreyAndBlackOfD50) {
    // D50 white adapts to D65 white, whose linear sRGB is (1, 1, 1) to 1e-7.
    const auto linear = LinearSrgbFromXyzD50(kWhiteD50);
    for (const double v : linear) {
        EXPECT_NEAR(v, 1.0, 1e-6);
    }
    const Rgb8 white = SrgbFromXyzD50(kWhiteD50);
    EXPECT_EQ(white.r, 255);
    EXPECT_EQ(white.g, 255);
    EXPECT_EQ(white.b, 255);
    // A grey of Y = 0.2: linear 0.2 per channel; 1.055 * 0.2^(1/2.4) - 0.055 =
    // 0.4845292, times 255 = 123.555, so 124.
    const Rgb8 grey = SrgbFromXyzD50({0.2 * kWhiteD50.x, 0.2 * kWhiteD50.y, 0.2 * kWhiteD50.z});
    EXPECT_EQ(grey.r, 124);
    EXPECT_EQ(grey.g, 124);
    EXPECT_EQ(grey.b, 124);
    const Rgb8 black = SrgbFromXyzD50({0, 0, 0});
    EXPECT_EQ(black.r + black.g + black.b, 0);
}

TEST(Srgb, CompandingHasItsLinearToe) {
    // Below 0.0031308 the curve is 12.92 v: 0.002 gives 0.02584.
    EXPECT_NEAR(CompandSrgb(0.002), 0.02584, 1e-12);
    EXPECT_NEAR(CompandSrgb(1.0), 1.0, 1e-12);
    // Out-of-gamut colours are clipped, not wrapped: a saturated green of
    // D50 XYZ (0.1, 0.5, 0.05) has a negative linear red and blue.
    const Rgb8 clipped = SrgbFromXyzD50({0.1, 0.5, 0.05});
    EXPECT_EQ(clipped.r, 0);
    EXPECT_EQ(clipped.b, 0);
    EXPECT_GT(clipped.g, 200);
}

TEST(LabToXyz, FollowsTheCieInverse) {
    // L* 50: Y = ((50 + 16) / 116)^3 = 0.1841865; a* = b* = 0 keeps the white's chromaticity.
    const XyzColor grey = XyzFromLabD50({50, 0, 0});
    EXPECT_NEAR(grey.y, 0.1841865, 1e-7);
    EXPECT_NEAR(grey.x, 0.1841865 * kWhiteD50.x, 1e-7);
    EXPECT_NEAR(grey.z, 0.1841865 * kWhiteD50.z, 1e-7);
    // Below L* 8 the linear branch: Y = L* / (24389 / 27) = 5 * 27 / 24389.
    EXPECT_NEAR(XyzFromLabD50({5, 0, 0}).y, 135.0 / 24389.0, 1e-12);
    const XyzColor white = XyzFromLabD50({100, 0, 0});
    EXPECT_NEAR(white.x, kWhiteD50.x, 1e-12);
    EXPECT_NEAR(white.z, kWhiteD50.z, 1e-12);
}

TEST(CmykPreview, InvertsTheInksWithBlackOnTop) {
    const Rgb8 paper = RgbFromCmykPercent(0, 0, 0, 0);
    EXPECT_EQ(paper.r + paper.g + paper.b, 3 * 255);
    // Cyan 50: red 255 * 0.5 = 127.5, rounded to 128.
    const Rgb8 cyan = RgbFromCmykPercent(50, 0, 0, 0);
    EXPECT_EQ(cyan.r, 128);
    EXPECT_EQ(cyan.g, 255);
    // Black 100 is black whatever the other inks; values beyond 100 % clip.
    const Rgb8 black = RgbFromCmykPercent(20, 130, -5, 100);
    EXPECT_EQ(black.r + black.g + black.b, 0);
}

} // namespace
} // namespace swatchlog
