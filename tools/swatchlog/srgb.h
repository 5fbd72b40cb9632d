// Display colours for measured patches: CIE XYZ or L*a*b* (D50) to 8-bit sRGB.
#pragma once

#include <array>

#include "color_difference.h"

namespace swatchlog {

struct XyzColor {
    double x = 0.0; ///< on the scale where the perfect white has y = 1
    double y = 0.0;
    double z = 0.0;
};

struct Rgb8 {
    int r = 0;
    int g = 0;
    int b = 0;
};

using Matrix3 = std::array<std::array<double, 3>, 3>;

/// CIE D50 and D65 white points (y = 1).
constexpr XyzColor kWhiteD50{0.96422, 1.0, 0.82521};
constexpr XyzColor kWhiteD65{0.95047, 1.0, 1.08883};

/// Bradford chromatic adaptation matrix from `source` white to `destination` white.
Matrix3 BradfordAdaptation(const XyzColor& source, const XyzColor& destination);
XyzColor Multiply(const Matrix3& matrix, const XyzColor& xyz);

/// XYZ relative to D50 (as charts are measured) to linear sRGB, adapted to D65 with Bradford.
std::array<double, 3> LinearSrgbFromXyzD50(const XyzColor& xyz);
/// The sRGB transfer curve for one linear component.
double CompandSrgb(double linear);
/// 8-bit sRGB of XYZ relative to D50; out-of-gamut components are clipped.
Rgb8 SrgbFromXyzD50(const XyzColor& xyz);
/// XYZ (D50, y = 1 for white) of an L*a*b* colour.
XyzColor XyzFromLabD50(const LabColor& lab);
/// Naive 8-bit display colour of CMYK tone values in percent (no colour management).
Rgb8 RgbFromCmykPercent(double c, double m, double y, double k);

} // namespace swatchlog
