// CColorPatch: distances to device records and the straight-gradient tests.
#include <array>
#include <cmath>
#include <cstddef>

#include "redavudeva/color_patch.h"

namespace {

template <std::size_t N> using Channels = std::array<double, N>;

Channels<4> ChannelsOf(const tagCMYK& v) {
    return {v.c, v.m, v.y, v.k};
}
Channels<6> ChannelsOf(const tagCMYKOG& v) {
    return {v.c, v.m, v.y, v.k, v.o, v.g};
}
Channels<7> ChannelsOf(const tagCMYKOGV& v) {
    return {v.c, v.m, v.y, v.k, v.o, v.g, v.v};
}
Channels<7> ChannelsOf(const tagCMYKRGB& v) {
    return {v.c, v.m, v.y, v.k, v.r, v.g, v.b};
}

template <std::size_t N> double Distance(const Channels<N>& a, const Channels<N>& b) {
    double sum = 0.0;
    for (std::size_t i = 0; i < N; ++i) {
        const double d = a[i] - b[i];
        sum += d * d;
    }
    return std::sqrt(sum);
}

// Whether `point` lies on origin + t * direction: every channel with a non-zero
// direction component must give the same t, and every channel with a zero
// component must sit at the origin, both within tolerance / 10,000,000. A NaN
// component counts as non-zero and then fails the comparison.
template <std::size_t N>
bool LiesOnGradient(const Channels<N>& point, const Channels<N>& origin,
                    const Channels<N>& direction, double tolerance) {
    const double epsilon = tolerance / 10000000.0;
    for (std::size_t i = 0; i < N; ++i) {
        if (direction[i] == 0.0) {
            if (!(std::fabs(point[i] - origin[i]) <= epsilon)) {
                return false;
            }
            continue;
        }
        const double ti = (point[i] - origin[i]) / direction[i];
        for (std::size_t j = 0; j < N; ++j) {
            if (direction[j] == 0.0) {
                continue;
            }
            const double tj = (point[j] - origin[j]) / direction[j];
            if (!(std::fabs(ti - tj) <= epsilon)) {
                return false;
            }
        }
    }
    return true;
}

} // namespace

double CColorPatch::GetCMYKPatchDistanceTo(const tagCMYK& target) {
    return Distance(ChannelsOf(target), ChannelsOf(m_CMYK));
}

double CColorPatch::GetCMYKOGPatchDistanceTo(const tagCMYKOG& target) {
    return Distance(ChannelsOf(target), ChannelsOf(m_CMYKOG));
}

double CColorPatch::GetCMYKOGVPatchDistanceTo(const tagCMYKOGV& target) {
    return Distance(ChannelsOf(target), ChannelsOf(m_CMYKOGV));
}

double CColorPatch::GetCMYKRGBPatchDistanceTo(const tagCMYKRGB& target) {
    return Distance(ChannelsOf(target), ChannelsOf(m_CMYKRGB));
}

bool CColorPatch::IsCMYKOnGradient(const tagCMYK& origin, const tagCMYK& direction,
                                   double tolerance) {
    return LiesOnGradient(ChannelsOf(m_CMYK), ChannelsOf(origin), ChannelsOf(direction), tolerance);
}

bool CColorPatch::IsCMYKOGOnGradient(const tagCMYKOG& origin, const tagCMYKOG& direction,
                                     double tolerance) {
    return LiesOnGradient(ChannelsOf(m_CMYKOG), ChannelsOf(origin), ChannelsOf(direction),
                          tolerance);
}

bool CColorPatch::IsCMYKOGVOnGradient(const tagCMYKOGV& origin, const tagCMYKOGV& direction,
                                      double tolerance) {
    return LiesOnGradient(ChannelsOf(m_CMYKOGV), ChannelsOf(origin), ChannelsOf(direction),
                          tolerance);
}

bool CColorPatch::IsCMYKRGBOnGradient(const tagCMYKRGB& origin, const tagCMYKRGB& direction,
                                      double tolerance) {
    return LiesOnGradient(ChannelsOf(m_CMYKRGB), ChannelsOf(origin), ChannelsOf(direction),
                          tolerance);
}
