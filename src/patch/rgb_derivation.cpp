// CColorPatch: 8-bit RGB derived from XYZ or from CMYK.
#include <array>
#include <cmath>
#include <cstddef>
#include <limits>

#include "redavudeva/color_patch.h"

namespace {

using Matrix = std::array<std::array<double, 3>, 3>;

// XYZ (white Y = 1) to linear RGB, by conversion type. Type 1 has the sRGB
// primaries with the D65 white; type 3 maps everything to black.
constexpr std::array<Matrix, 4> kXyzToLinearRgb{{
    {{{1.7552599, -0.4836786, -0.253},
      {-0.5441336, 1.5068789, 0.0215528},
      {0.0063467, -0.0175761, 1.2256959}}},
    {{{3.2404542, -1.5371385, -0.4985314},
      {-0.969266, 1.8760108, 0.041556},
      {0.0556434, -0.2040259, 1.0572252}}},
    {{{1.9099961, -0.5324542, -0.2882091},
      {-0.9846663, 1.999171, -0.0283082},
      {0.0583056, -0.1183781, 0.8975535}}},
    {{{0.0, 0.0, 0.0}, {0.0, 0.0, 0.0}, {0.0, 0.0, 0.0}}},
}};

// The sRGB tone curve: linear near black, a 1/2.4 power above.
double Compand(double linear) {
    if (linear > 0.0031308) {
        return 1.055 * std::pow(linear, 0.4166666666666667) - 0.055;
    }
    return 12.92 * linear;
}

// floor(255 c + 0.5) clamped to 0..255. The clamp is done on the double so
// that out-of-gamut and non-finite values never reach an integer conversion
// they do not fit; NaN counts as 0.
long ToByte(double companded) {
    const double scaled = std::floor(255.0 * companded + 0.5);
    if (!(scaled > 0.0)) {
        return 0;
    }
    if (scaled > 255.0) {
        return 255;
    }
    return static_cast<long>(scaled);
}

// 255 times the share of light left after `colorant` percent ink plus the
// black share, truncated toward zero. No range is imposed (CMYK above 100 gives
// negative components), but values beyond the int range are held at its ends
// and NaN gives 0, so that the conversion is always defined.
int InvertedComponent(double colorant, double blackShare) {
    const double value =
        std::trunc((1.0 - (colorant / 100.0 * (1.0 - blackShare) + blackShare)) * 255.0);
    if (std::isnan(value)) {
        return 0;
    }
    if (value >= static_cast<double>(std::numeric_limits<int>::max())) {
        return std::numeric_limits<int>::max();
    }
    if (value <= static_cast<double>(std::numeric_limits<int>::min())) {
        return std::numeric_limits<int>::min();
    }
    return static_cast<int>(value);
}

} // namespace

// XYZ on the 0-100 scale to 8-bit RGB through conversion type `type` (types
// above 3 act as 0). Always answers 0.
int CColorPatch::GetRGBfromXYZ(double x, double y, double z, long* r, long* g, long* b,
                               unsigned int type) {
    const Matrix& matrix = kXyzToLinearRgb[type > 3 ? 0 : type];
    const std::array<double, 3> xyz{x / 100.0, y / 100.0, z / 100.0};
    std::array<long, 3> rgb{};
    for (std::size_t row = 0; row < 3; ++row) {
        const double linear =
            matrix[row][0] * xyz[0] + matrix[row][1] * xyz[1] + matrix[row][2] * xyz[2];
        rgb[row] = ToByte(Compand(linear));
    }
    *r = rgb[0];
    *g = rgb[1];
    *b = rgb[2];
    return 0;
}

// A naive inversion of the inks: the black share is added to each colorant.
tagRGB CColorPatch::GetRGBFromCMYK(tagCMYK cmyk) {
    const double blackShare = cmyk.k / 100.0;
    return tagRGB{InvertedComponent(cmyk.c, blackShare), InvertedComponent(cmyk.m, blackShare),
                  InvertedComponent(cmyk.y, blackShare)};
}
