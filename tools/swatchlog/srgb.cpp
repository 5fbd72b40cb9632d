#include "srgb.h"

#include <algorithm>
#include <cmath>

namespace swatchlog {
namespace {

// Cone response matrix of the Bradford transform.
constexpr Matrix3 kBradford{
    {{0.8951, 0.2664, -0.1614}, {-0.7502, 1.7135, 0.0367}, {0.0389, -0.0685, 1.0296}}};

// Linear sRGB from XYZ (D65 white).
constexpr Matrix3 kSrgbFromXyz{{{3.2404542, -1.5371385, -0.4985314},
                                {-0.9692660, 1.8760108, 0.0415560},
                                {0.0556434, -0.2040259, 1.0572252}}};

Matrix3 Product(const Matrix3& left, const Matrix3& right) {
    Matrix3 out{};
    for (int i = 0; i < 3; ++i) {
        for (int j = 0; j < 3; ++j) {
            for (int k = 0; k < 3; ++k) {
                out[i][j] += left[i][k] * right[k][j];
            }
        }
    }
    return out;
}

Matrix3 Inverse(const Matrix3& m) {
    const double det = m[0][0] * (m[1][1] * m[2][2] - m[1][2] * m[2][1]) -
                       m[0][1] * (m[1][0] * m[2][2] - m[1][2] * m[2][0]) +
                       m[0][2] * (m[1][0] * m[2][1] - m[1][1] * m[2][0]);
    Matrix3 out{};
    out[0][0] = (m[1][1] * m[2][2] - m[1][2] * m[2][1]) / det;
    out[0][1] = (m[0][2] * m[2][1] - m[0][1] * m[2][2]) / det;
    out[0][2] = (m[0][1] * m[1][2] - m[0][2] * m[1][1]) / det;
    out[1][0] = (m[1][2] * m[2][0] - m[1][0] * m[2][2]) / det;
    out[1][1] = (m[0][0] * m[2][2] - m[0][2] * m[2][0]) / det;
    out[1][2] = (m[0][2] * m[1][0] - m[0][0] * m[1][2]) / det;
    out[2][0] = (m[1][0] * m[2][1] - m[1][1] * m[2][0]) / det;
    out[2][1] = (m[0][1] * m[2][0] - m[0][0] * m[2][1]) / det;
    out[2][2] = (m[0][0] * m[1][1] - m[0][1] * m[1][0]) / det;
    return out;
}

int ToByte(double companded) {
    const double clipped = std::clamp(companded, 0.0, 1.0);
    return static_cast<int>(std::lround(clipped * 255.0));
}

} // namespace

XyzColor Multiply(const Matrix3& m, const XyzColor& v) {
    return {m[0][0] * v.x + m[0][1] * v.y + m[0][2] * v.z,
            m[1][0] * v.x + m[1][1] * v.y + m[1][2] * v.z,
            m[2][0] * v.x + m[2][1] * v.y + m[2][2] * v.z};
}

Matrix3 BradfordAdaptation(const XyzColor& source, const XyzColor& destination) {
    const XyzColor coneSource = Multiply(kBradford, source);
    const XyzColor coneDestination = Multiply(kBradford, destination);
    Matrix3 scale{};
    scale[0][0] = coneDestination.x / coneSource.x;
    scale[1][1] = coneDestination.y / coneSource.y;
    scale[2][2] = coneDestination.z / coneSource.z;
    return Product(Inverse(kBradford), Product(scale, kBradford));
}

std::array<double, 3> LinearSrgbFromXyzD50(const XyzColor& xyz) {
    const XyzColor d65 = Multiply(BradfordAdaptation(kWhiteD50, kWhiteD65), xyz);
    const XyzColor rgb = Multiply(kSrgbFromXyz, d65);
    return {rgb.x, rgb.y, rgb.z};
}

double CompandSrgb(double linear) {
    if (linear <= 0.0031308) {
        return 12.92 * linear;
    }
    return 1.055 * std::pow(linear, 1.0 / 2.4) - 0.055;
}

Rgb8 SrgbFromXyzD50(const XyzColor& xyz) {
    const auto linear = LinearSrgbFromXyzD50(xyz);
    return {ToByte(CompandSrgb(linear[0])), ToByte(CompandSrgb(linear[1])),
            ToByte(CompandSrgb(linear[2]))};
}

XyzColor XyzFromLabD50(const LabColor& lab) {
    constexpr double epsilon = 216.0 / 24389.0;
    constexpr double kappa = 24389.0 / 27.0;
    const double fy = (lab.l + 16.0) / 116.0;
    const double fx = fy + lab.a / 500.0;
    const double fz = fy - lab.b / 200.0;
    auto inverse = [&](double f) {
        const double cube = f * f * f;
        return cube > epsilon ? cube : (116.0 * f - 16.0) / kappa;
    };
    const double yr = lab.l > kappa * epsilon ? fy * fy * fy : lab.l / kappa;
    return {inverse(fx) * kWhiteD50.x, yr * kWhiteD50.y, inverse(fz) * kWhiteD50.z};
}

Rgb8 RgbFromCmykPercent(double c, double m, double y, double k) {
    auto channel = [k](double ink) {
        const double covered = std::clamp(ink / 100.0, 0.0, 1.0);
        const double black = std::clamp(k / 100.0, 0.0, 1.0);
        return static_cast<int>(std::lround(255.0 * (1.0 - covered) * (1.0 - black)));
    };
    return {channel(c), channel(m), channel(y)};
}

} // namespace swatchlog
