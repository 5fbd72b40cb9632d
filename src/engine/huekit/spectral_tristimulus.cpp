// Spectrum to XYZ: D50 and the CIE 1931 2 degree observer on a 5 nm grid.
#include <array>
#include <cmath>
#include <cstddef>

#include "d50_cie1931_table.h"
#include "huekit_engine.h"

namespace huekit {
namespace {

// Tristimulus weights scaled so that the Y weights sum to 100, and the white
// point they give (Y = 1).
struct TristimulusWeights {
    std::array<std::array<double, kTableCount>, 3> weights;
    std::array<double, 3> white;
};

constexpr TristimulusWeights MakeTristimulusWeights() {
    TristimulusWeights result{};
    std::array<double, 3> sums{};
    for (std::size_t j = 0; j < kTableCount; ++j) {
        const IlluminantObserverRow& row = kD50Cie1931[j];
        result.weights[0][j] = row.power * row.xBar;
        result.weights[1][j] = row.power * row.yBar;
        result.weights[2][j] = row.power * row.zBar;
        sums[0] += result.weights[0][j];
        sums[1] += result.weights[1][j];
        sums[2] += result.weights[2][j];
    }
    const double k = 100.0 / sums[1];
    for (std::size_t axis = 0; axis < 3; ++axis) {
        for (std::size_t j = 0; j < kTableCount; ++j) {
            result.weights[axis][j] *= k;
        }
        result.white[axis] = sums[axis] / sums[1];
    }
    return result;
}

constexpr TristimulusWeights kWeights = MakeTristimulusWeights();

// The table rows must be the consecutive 5 nm points from 380 nm.
constexpr bool TableIsOnItsGrid() {
    for (std::size_t j = 0; j < kTableCount; ++j) {
        if (kD50Cie1931[j].nm != kTableStartNm + kTableStepNm * static_cast<int>(j)) {
            return false;
        }
    }
    return true;
}
static_assert(TableIsOnItsGrid(), "illuminant and observer rows out of order");

// Supplied value `index`, the end values standing in beyond both ends.
double SuppliedValue(const float* spectrum, int count, int index) {
    if (index < 0) {
        return spectrum[0];
    }
    if (index >= count) {
        return spectrum[count - 1];
    }
    return spectrum[index];
}

// Reflectance at `nm`: cubic (Catmull-Rom) between supplied points, the end value
// beyond them. A cubic keeps the curvature of 10 nm data that a straight line
// between points would flatten (worth up to about 0.4 dE*ab on saturated colours).
double ReflectanceAt(const float* spectrum, int startNm, int count, int nm) {
    const int offset = nm - startNm;
    if (offset <= 0) {
        return spectrum[0];
    }
    const int index = offset / kSpectrumStepNm;
    if (index >= count - 1) {
        return spectrum[count - 1];
    }
    const double t = static_cast<double>(offset % kSpectrumStepNm) / kSpectrumStepNm;
    const double p0 = SuppliedValue(spectrum, count, index - 1);
    const double p1 = spectrum[index];
    const double p2 = spectrum[index + 1];
    const double p3 = SuppliedValue(spectrum, count, index + 2);
    return p1 + 0.5 * t *
                    ((p2 - p0) +
                     t * ((2.0 * p0 - 5.0 * p1 + 4.0 * p2 - p3) + t * (3.0 * (p1 - p2) + p3 - p0)));
}

} // namespace

void SpectrumToXYZ(const float* spectrum, int startNm, int count, double xyz[3]) {
    double sums[3] = {0.0, 0.0, 0.0};
    for (std::size_t j = 0; j < kTableCount; ++j) {
        const int nm = kTableStartNm + kTableStepNm * static_cast<int>(j);
        const double r = ReflectanceAt(spectrum, startNm, count, nm);
        sums[0] += kWeights.weights[0][j] * r;
        sums[1] += kWeights.weights[1][j] * r;
        sums[2] += kWeights.weights[2][j] * r;
    }
    xyz[0] = sums[0];
    xyz[1] = sums[1];
    xyz[2] = sums[2];
}

void WhitePoint(double white[3]) {
    white[0] = kWeights.white[0];
    white[1] = kWeights.white[1];
    white[2] = kWeights.white[2];
}

bool IsAcceptableSpectrum(const float* spectrum, int startNm, int count) {
    if (spectrum == nullptr || count < 1 || startNm < kLowestNm) {
        return false;
    }
    const long long lastNm =
        static_cast<long long>(startNm) + static_cast<long long>(kSpectrumStepNm) * (count - 1);
    if (lastNm > kHighestNm) {
        return false;
    }
    for (int i = 0; i < count; ++i) {
        if (!std::isfinite(spectrum[i])) {
            return false;
        }
    }
    return true;
}

} // namespace huekit
