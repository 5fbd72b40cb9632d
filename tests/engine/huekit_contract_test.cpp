// The engine's call contracts: the perfect white there and back, a flat grey's
// density, and what it refuses.
#include <gtest/gtest.h>

#include <limits>
#include <vector>

#include "huekit.h"

namespace {

std::vector<float> Flat(int count, float value) {
    return std::vector<float>(static_cast<std::size_t>(count), value);
}

TEST(HuekitWhite, PerfectWhiteHasY100AndLab100OverAnyRange) {
    struct Range {
        int startNm, count;
    };
    // 380-730 and 380-780 as instruments export them, 400-700, and a start off
    // the 10 nm grid (385-735).
    for (const Range r : {Range{380, 36}, Range{380, 41}, Range{400, 31}, Range{385, 36}}) {
        const std::vector<float> white = Flat(r.count, 1.0f);
        float xyz[3] = {};
        ASSERT_EQ(HUEKIT_fromSpectralToCIEXYZ(white.data(), r.startNm, r.count, xyz), 0);
        EXPECT_NEAR(xyz[1], 100.0f, 1e-4f) << r.startNm << "+" << r.count;
        // D50 / 2 degree white point, (96.42, 100, 82.51) in the 1 nm CIE data;
        // 5 nm data round it slightly differently.
        EXPECT_NEAR(xyz[0], 96.42f, 0.02f);
        EXPECT_NEAR(xyz[2], 82.51f, 0.02f);

        const float relative[3] = {xyz[0] / 100.0f, xyz[1] / 100.0f, xyz[2] / 100.0f};
        float lab[3] = {-1.0f, -1.0f, -1.0f};
        ASSERT_EQ(HUEKIT_fromCIEXYZToCIELAB(relative, lab), 0);
        EXPECT_NEAR(lab[0], 100.0f, 1e-4f) << r.startNm << "+" << r.count;
        EXPECT_NEAR(lab[1], 0.0f, 1e-4f) << r.startNm << "+" << r.count;
        EXPECT_NEAR(lab[2], 0.0f, 1e-4f) << r.startNm << "+" << r.count;
        // And back: Lab to XYZ returns the relative white.
        float back[3] = {};
        ASSERT_EQ(HUEKIT_fromCIELABToCIEXYZ(lab, back), 0);
        EXPECT_NEAR(back[1], 1.0f, 1e-5f) << r.startNm << "+" << r.count;
    }
}

TEST(HuekitDensity, FlatGreyHasDensityOneThroughEveryFilter) {
    float d[4] = {};
    // A flat reflectance of 0.1 has density 1 through every filter.
    for (int count : {36, 41}) {
        const std::vector<float> grey = Flat(count, 0.1f);
        ASSERT_EQ(HUEKIT_fromSpectralToDensity(grey.data(), 380, count, d, 0), 0);
        for (float density : d) {
            EXPECT_NEAR(density, 1.0f, 1e-5f) << count;
        }
    }
}

TEST(HuekitRefusals, BadArgumentsAnswerNonZeroAndWriteNothing) {
    const std::vector<float> white = Flat(41, 1.0f);
    const float nan = std::numeric_limits<float>::quiet_NaN();
    const float inf = std::numeric_limits<float>::infinity();
    std::vector<float> withNan = Flat(36, 0.5f);
    withNan[7] = nan;
    std::vector<float> withInf = Flat(36, 0.5f);
    withInf[35] = -inf;

    struct Case {
        const char* what;
        const float* spectrum;
        int startNm, count;
    };
    const Case cases[] = {
        {"null spectrum", nullptr, 380, 36},           {"count 0", white.data(), 380, 0},
        {"count -1", white.data(), 380, -1},           {"start 370", white.data(), 370, 36},
        {"ends 790", white.data(), 380, 42},           {"ends 790 late", white.data(), 750, 5},
        {"huge count", white.data(), 380, 2147483647}, {"NaN value", withNan.data(), 380, 36},
        {"infinite value", withInf.data(), 380, 36},
    };
    for (const Case& c : cases) {
        float xyz[3] = {-5.0f, -5.0f, -5.0f};
        float d[4] = {-5.0f, -5.0f, -5.0f, -5.0f};
        EXPECT_NE(HUEKIT_fromSpectralToCIEXYZ(c.spectrum, c.startNm, c.count, xyz), 0) << c.what;
        EXPECT_NE(HUEKIT_fromSpectralToDensity(c.spectrum, c.startNm, c.count, d, 0), 0) << c.what;
        EXPECT_EQ(xyz[0], -5.0f) << c.what;
        EXPECT_EQ(d[3], -5.0f) << c.what;
    }
    // The last accepted points: 740..780 and a single value at 780.
    float xyz[3] = {};
    EXPECT_EQ(HUEKIT_fromSpectralToCIEXYZ(white.data(), 740, 5, xyz), 0);
    EXPECT_EQ(HUEKIT_fromSpectralToCIEXYZ(white.data(), 780, 1, xyz), 0);

    EXPECT_NE(HUEKIT_fromSpectralToCIEXYZ(white.data(), 380, 36, nullptr), 0);
    EXPECT_NE(HUEKIT_fromSpectralToDensity(white.data(), 380, 36, nullptr, 0), 0);

    // Densities that do not exist: nothing reflected, or no visual weight at
    // any supplied wavelength (740..780 nm); an unknown density option.
    float d[4] = {-5.0f, -5.0f, -5.0f, -5.0f};
    const std::vector<float> black = Flat(36, 0.0f);
    EXPECT_NE(HUEKIT_fromSpectralToDensity(black.data(), 380, 36, d, 0), 0);
    EXPECT_NE(HUEKIT_fromSpectralToDensity(white.data(), 740, 5, d, 0), 0);
    EXPECT_NE(HUEKIT_fromSpectralToDensity(white.data(), 380, 36, d, 1), 0);
    EXPECT_EQ(d[0], -5.0f);

    const float good[3] = {0.5f, 0.5f, 0.5f};
    const float bad[3] = {0.5f, nan, 0.5f};
    float out[3] = {-5.0f, -5.0f, -5.0f};
    EXPECT_NE(HUEKIT_fromCIEXYZToCIELAB(nullptr, out), 0);
    EXPECT_NE(HUEKIT_fromCIEXYZToCIELAB(good, nullptr), 0);
    EXPECT_NE(HUEKIT_fromCIEXYZToCIELAB(bad, out), 0);
    EXPECT_NE(HUEKIT_fromCIELABToCIEXYZ(nullptr, out), 0);
    EXPECT_NE(HUEKIT_fromCIELABToCIEXYZ(good, nullptr), 0);
    EXPECT_NE(HUEKIT_fromCIELABToCIEXYZ(bad, out), 0);
    // Lab so large that XYZ leaves the float range.
    const float huge[3] = {3.0e38f, 0.0f, 0.0f};
    EXPECT_NE(HUEKIT_fromCIELABToCIEXYZ(huge, out), 0);
    EXPECT_EQ(out[1], -5.0f);
}

} // namespace
