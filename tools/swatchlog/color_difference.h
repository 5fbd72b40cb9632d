// Colour differences between two CIE L*a*b* colours.
#pragma once

namespace swatchlog {

struct LabColor {
    double l = 0.0;
    double a = 0.0;
    double b = 0.0;
};

/// CIE 1976 colour difference: the Euclidean distance in L*a*b*.
double DeltaE76(const LabColor& first, const LabColor& second);

/// CIEDE2000 colour difference with the parametric factors kL = kC = kH = 1.
double DeltaE2000(const LabColor& first, const LabColor& second);

} // namespace swatchlog
