#include "color_difference.h"

#include <cmath>

namespace swatchlog {
namespace {

constexpr double kPi = 3.14159265358979323846;

double Radians(double degrees) {
    return degrees * kPi / 180.0;
}
double Degrees(double radians) {
    return radians * 180.0 / kPi;
}

// Hue angle in degrees within [0, 360); 0 for a neutral colour.
double HueDegrees(double b, double aPrime) {
    if (b == 0.0 && aPrime == 0.0) {
        return 0.0;
    }
    double h = Degrees(std::atan2(b, aPrime));
    return h < 0.0 ? h + 360.0 : h;
}

// sqrt(C^7 / (C^7 + 25^7)), the chroma weight shared by G and R_C.
double ChromaWeight(double chroma) {
    const double c7 = std::pow(chroma, 7.0);
    return std::sqrt(c7 / (c7 + std::pow(25.0, 7.0)));
}

} // namespace

double DeltaE76(const LabColor& first, const LabColor& second) {
    const double dl = first.l - second.l;
    const double da = first.a - second.a;
    const double db = first.b - second.b;
    return std::sqrt(dl * dl + da * da + db * db);
}

double DeltaE2000(const LabColor& first, const LabColor& second) {
    const double c1 = std::hypot(first.a, first.b);
    const double c2 = std::hypot(second.a, second.b);
    const double g = 0.5 * (1.0 - ChromaWeight((c1 + c2) / 2.0));

    const double a1 = (1.0 + g) * first.a;
    const double a2 = (1.0 + g) * second.a;
    const double cp1 = std::hypot(a1, first.b);
    const double cp2 = std::hypot(a2, second.b);
    const double hp1 = HueDegrees(first.b, a1);
    const double hp2 = HueDegrees(second.b, a2);

    const double deltaL = second.l - first.l;
    const double deltaC = cp2 - cp1;
    double deltaH = 0.0;
    if (cp1 * cp2 != 0.0) {
        deltaH = hp2 - hp1;
        if (deltaH > 180.0) {
            deltaH -= 360.0;
        } else if (deltaH < -180.0) {
            deltaH += 360.0;
        }
    }
    const double deltaBigH = 2.0 * std::sqrt(cp1 * cp2) * std::sin(Radians(deltaH / 2.0));

    const double meanL = (first.l + second.l) / 2.0;
    const double meanC = (cp1 + cp2) / 2.0;
    double meanH = hp1 + hp2;
    if (cp1 * cp2 != 0.0) {
        if (std::fabs(hp1 - hp2) <= 180.0) {
            meanH = (hp1 + hp2) / 2.0;
        } else if (hp1 + hp2 < 360.0) {
            meanH = (hp1 + hp2 + 360.0) / 2.0;
        } else {
            meanH = (hp1 + hp2 - 360.0) / 2.0;
        }
    }

    const double t =
        1.0 - 0.17 * std::cos(Radians(meanH - 30.0)) + 0.24 * std::cos(Radians(2.0 * meanH)) +
        0.32 * std::cos(Radians(3.0 * meanH + 6.0)) - 0.20 * std::cos(Radians(4.0 * meanH - 63.0));
    const double deltaTheta = 30.0 * std::exp(-std::pow((meanH - 275.0) / 25.0, 2.0));
    const double rc = 2.0 * ChromaWeight(meanC);
    const double lOffset = (meanL - 50.0) * (meanL - 50.0);
    const double sl = 1.0 + 0.015 * lOffset / std::sqrt(20.0 + lOffset);
    const double sc = 1.0 + 0.045 * meanC;
    const double sh = 1.0 + 0.015 * meanC * t;
    const double rt = -std::sin(Radians(2.0 * deltaTheta)) * rc;

    const double termL = deltaL / sl;
    const double termC = deltaC / sc;
    const double termH = deltaBigH / sh;
    return std::sqrt(termL * termL + termC * termC + termH * termH + rt * termC * termH);
}

} // namespace swatchlog
