// Colour differences and the display colours of measured patches.
#include <gtest/gtest.h>

#include <iterator>
#include <vector>

#include "color_difference.h"
#include "srgb.h"

namespace swatchlog {
namespace {

// The 34 pairs of the CIEDE2000 test data published by Sharma, Wu and Dalal (2005), with
// their differences to four decimals. Pairs 9 to 15 put the two hues about 180 degrees apart,
// where the mean hue and the hue difference change branch.
// Each line: L*, a*, b* of both colours and their difference.
const double kSharmaPairs[][7] = {
    {50, 2.6772, -79.7751, 50, 0, -82.7485, 2.0425},
    {50, 3.1571, -77.2803, 50, 0, -82.7485, 2.8615},
    {50, 2.8361, -74.0200, 50, 0, -82.7485, 3.4412},
    {50, -1.3802, -84.2814, 50, 0, -82.7485, 1.0000},
    {50, -1.1848, -84.8006, 50, 0, -82.7485, 1.0000},
    {50, -0.9009, -85.5211, 50, 0, -82.7485, 1.0000},
    {50, 0, 0, 50, -1, 2, 2.3669},
    {50, -1, 2, 50, 0, 0, 2.3669},
    {50, 2.4900, -0.0010, 50, -2.4900, 0.0009, 7.1792},
    {50, 2.4900, -0.0010, 50, -2.4900, 0.0010, 7.1792},
    {50, 2.4900, -0.0010, 50, -2.4900, 0.0011, 7.2195},
    {50, 2.4900, -0.0010, 50, -2.4900, 0.0012, 7.2195},
    {50, -0.0010, 2.4900, 50, 0.0009, -2.4900, 4.8045},
    {50, -0.0010, 2.4900, 50, 0.0010, -2.4900, 4.8045},
    {50, -0.0010, 2.4900, 50, 0.0011, -2.4900, 4.7461},
    {50, 2.5, 0, 50, 0, -2.5, 4.3065},
    {50, 2.5, 0, 73, 25, -18, 27.1492},
    {50, 2.5, 0, 61, -5, 29, 22.8977},
    {50, 2.5, 0, 56, -27, -3, 31.9030},
    {50, 2.5, 0, 58, 24, 15, 19.4535},
    {50, 2.5, 0, 50, 3.1736, 0.5854, 1.0000},
    {50, 2.5, 0, 50, 3.2972, 0, 1.0000},
    {50, 2.5, 0, 50, 1.8634, 0.5757, 1.0000},
    {50, 2.5, 0, 50, 3.2592, 0.3350, 1.0000},
    {60.2574, -34.0099, 36.2677, 60.4626, -34.1751, 39.4387, 1.2644},
    {63.0109, -31.0961, -5.8663, 62.8187, -29.7946, -4.0864, 1.2630},
    {61.2901, 3.7196, -5.3901, 61.4292, 2.2480, -4.9620, 1.8731},
    {35.0831, -44.1164, 3.7933, 35.0232, -40.0716, 1.5901, 1.8645},
    {22.7233, 20.0904, -46.6940, 23.0331, 14.9730, -42.5619, 2.0373},
    {36.4612, 47.8580, 18.3852, 36.2715, 50.5065, 21.2231, 1.4146},
    {90.8027, -2.0831, 1.4410, 91.1528, -1.6435, 0.0447, 1.4441},
    {90.9257, -0.5406, -0.9208, 88.6381, -0.8985, -0.7239, 1.5381},
    {6.7747, -0.2908, -2.4247, 5.8714, -0.0985, -2.2286, 0.6377},
    {2.0776, 0.0795, -1.1350, 0.9033, -0.0636, -0.5514, 0.9082},
};
static_assert(std::size(kSharmaPairs) == 34, "all published pairs");

TEST(DeltaE2000, MatchesThePublishedTestDataBothWays) {
    for (std::size_t i = 0; i < std::size(kSharmaPairs); ++i) {
        const double* p = kSharmaPairs[i];
        // Four published decimals: the true value lies within 5e-5.
        EXPECT_NEAR(DeltaE2000({p[0], p[1], p[2]}, {p[3], p[4], p[5]}), p[6], 5e-5) << i + 1;
        EXPECT_NEAR(DeltaE2000({p[3], p[4], p[5]}, {p[0], p[1], p[2]}), p[6], 5e-5) << i + 1;
    }
}

std::vector<int> Channels(const Rgb8& c) {
    return {c.r, c.g, c.b};
}

TEST(Srgb, DisplayColoursOfXyzAdaptedAndClipped) {
    // A grey of Y = 0.2 (D50 white adapts to D65 white): 1.055 * 0.2^(1/2.4) - 0.055 =
    // 0.4845292, times 255 = 123.555.
    const XyzColor grey{0.2 * kWhiteD50.x, 0.2, 0.2 * kWhiteD50.z};
    EXPECT_EQ(Channels(SrgbFromXyzD50(grey)), (std::vector<int>{124, 124, 124}));
    // A saturated green has negative linear red and blue: clipped to 0, not wrapped.
    const Rgb8 green = SrgbFromXyzD50({0.1, 0.5, 0.05});
    EXPECT_EQ(green.r + green.b, 0);
    EXPECT_GT(green.g, 200);
}

} // namespace
} // namespace swatchlog
