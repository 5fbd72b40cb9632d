// CColorPatch: CIE 1976 L*a*b* of the patch's XYZ and media-relative XYZ.
#include <cmath>

#include "redavudeva/color_patch.h"

namespace {

// The cube-root compression of CIE L*a*b* with its linear part near black. The
// patch's own Lab uses the exact constants; the public, optionally
// media-relative form keeps the rounded ones that callers' values were made with.
struct LabCompression {
    double threshold;
    double kappa;

    double operator()(double t) const {
        if (t > threshold) {
            return std::pow(t, 1.0 / 3.0);
        }
        return (kappa * t + 16.0) / 116.0;
    }
};

constexpr LabCompression kExactCompression{0.008856, 903.2962962962963}; // kappa = 24389 / 27
constexpr LabCompression kRoundedCompression{0.00885645, 903.29629};

tagLAB LabFromRatios(double xr, double yr, double zr, const LabCompression& f) {
    const double fx = f(xr);
    const double fy = f(yr);
    const double fz = f(zr);
    tagLAB lab;
    lab.l = 116.0 * fy - 16.0;
    lab.a = 500.0 * (fx - fy);
    lab.b = 200.0 * (fy - fz);
    return lab;
}

} // namespace

tagLAB CColorPatch::XYZToLAB() {
    return LabFromRatios(m_XYZ.x / m_normLight.x, m_XYZ.y / m_normLight.y, m_XYZ.z / m_normLight.z,
                         kExactCompression);
}

tagLAB CColorPatch::XYZToLAB(bool relative, tagXYZ white, int type) {
    tagXYZ xyz = relative ? XYZAbsoluteToRelative(white) : m_XYZ;
    if (type == 0 || type == 1 || type == 4 || type == 5) {
        xyz.x /= m_normLight.x;
        xyz.y /= m_normLight.y;
        xyz.z /= m_normLight.z;
    }
    return LabFromRatios(xyz.x, xyz.y, xyz.z, kRoundedCompression);
}

tagXYZ CColorPatch::XYZAbsoluteToRelative(tagXYZ white) {
    tagXYZ relative;
    relative.x = m_normLight.x * m_XYZ.x / white.x;
    relative.y = m_normLight.y * m_XYZ.y / white.y;
    relative.z = m_normLight.z * m_XYZ.z / white.z;
    return relative;
}
