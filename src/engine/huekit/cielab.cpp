// CIE 1976 L*a*b* and back, against the engine's D50 white point.
#include <cmath>

#include "huekit_engine.h"

namespace huekit {
namespace {

constexpr double kEpsilon = 216.0 / 24389.0;
constexpr double kKappa = 24389.0 / 27.0;

double Compress(double t) {
    return t > kEpsilon ? std::cbrt(t) : (kKappa * t + 16.0) / 116.0;
}

double ExpandChroma(double f) {
    const double cube = f * f * f;
    return cube > kEpsilon ? cube : (116.0 * f - 16.0) / kKappa;
}

} // namespace

void XYZToLab(const double xyz[3], double lab[3]) {
    double white[3];
    WhitePoint(white);
    const double fx = Compress(xyz[0] / white[0]);
    const double fy = Compress(xyz[1] / white[1]);
    const double fz = Compress(xyz[2] / white[2]);
    lab[0] = 116.0 * fy - 16.0;
    lab[1] = 500.0 * (fx - fy);
    lab[2] = 200.0 * (fy - fz);
}

void LabToXYZ(const double lab[3], double xyz[3]) {
    double white[3];
    WhitePoint(white);
    const double fy = (lab[0] + 16.0) / 116.0;
    const double fx = fy + lab[1] / 500.0;
    const double fz = fy - lab[2] / 200.0;
    const double yr = lab[0] > kKappa * kEpsilon ? fy * fy * fy : lab[0] / kKappa;
    xyz[0] = ExpandChroma(fx) * white[0];
    xyz[1] = yr * white[1];
    xyz[2] = ExpandChroma(fz) * white[2];
}

} // namespace huekit
