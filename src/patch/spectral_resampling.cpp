// Measured spectra onto the colour engine's 10 nm grid within 380..780 nm.
#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>

#include "patch/engine_spectrum.h"

namespace engine_spectrum {
namespace {

using Samples = std::vector<Sample>;

double Distance(int fromNm, int toNm) {
    return static_cast<double>(toNm) - static_cast<double>(fromNm);
}

double Slope(const Sample& a, const Sample& b) {
    return (b.value - a.value) / Distance(a.nm, b.nm);
}

// Slope of the curve at point k: at an inner point that of the parabola through
// it and its two neighbours; at an end half the slope towards its neighbour, as
// the Catmull-Rom curve has where the end value stands in for the missing point.
double SlopeAt(const Samples& s, std::size_t k) {
    const std::size_t last = s.size() - 1;
    if (k == 0) {
        return Slope(s[0], s[1]) / 2.0;
    }
    if (k == last) {
        return Slope(s[last - 1], s[last]) / 2.0;
    }
    const double left = Distance(s[k - 1].nm, s[k].nm);
    const double right = Distance(s[k].nm, s[k + 1].nm);
    return (right * Slope(s[k - 1], s[k]) + left * Slope(s[k], s[k + 1])) / (left + right);
}

// The cubic Hermite curve through the points at `nm` (within the first and last
// point); exactly the measured value at a measured wavelength.
double CurveAt(const Samples& s, int nm) {
    const auto above =
        std::upper_bound(s.begin(), s.end(), nm, [](int x, const Sample& p) { return x < p.nm; });
    const auto j = static_cast<std::size_t>(above - s.begin()) - 1;
    if (s[j].nm == nm) {
        return s[j].value;
    }
    const double h = Distance(s[j].nm, s[j + 1].nm);
    const double t = Distance(s[j].nm, nm) / h;
    const double u = 1.0 - t;
    return (1.0 + 2.0 * t) * u * u * s[j].value + t * u * u * h * SlopeAt(s, j) +
           t * t * (3.0 - 2.0 * t) * s[j + 1].value - t * t * u * h * SlopeAt(s, j + 1);
}

// Whether neighbouring points within [lo, hi] nm are all closer than one step.
bool CloserThanStep(const Samples& s, int lo, int hi) {
    const Sample* previous = nullptr;
    for (const Sample& point : s) {
        if (point.nm < lo || point.nm > hi) {
            continue;
        }
        if (previous != nullptr && Distance(previous->nm, point.nm) >= kStepNm) {
            return false;
        }
        previous = &point;
    }
    return true;
}

// The Catmull-Rom curve through `count` values 10 nm apart from `lo` nm, at `nm`,
// as weights of the four values it depends on (end values standing in beyond
// both ends, and the last value held past the last one).
struct CurveWeights {
    std::array<std::size_t, 4> index{};
    std::array<double, 4> weight{};
};

CurveWeights CatmullRomAt(int lo, int count, int nm) {
    CurveWeights w;
    const int last = count - 1;
    const int offset = nm - lo;
    const int i = std::min(offset / kStepNm, last);
    if (i == last) {
        w.index.fill(static_cast<std::size_t>(last));
        w.weight = {1.0, 0.0, 0.0, 0.0};
        return w;
    }
    const double t = static_cast<double>(offset - i * kStepNm) / kStepNm;
    w.index = {static_cast<std::size_t>(std::max(i - 1, 0)), static_cast<std::size_t>(i),
               static_cast<std::size_t>(i + 1), static_cast<std::size_t>(std::min(i + 2, last))};
    w.weight = {0.5 * t * (-1.0 + t * (2.0 - t)), 1.0 + 0.5 * t * t * (-5.0 + 3.0 * t),
                0.5 * t * (1.0 + t * (4.0 - 3.0 * t)), 0.5 * t * t * (-1.0 + t)};
    return w;
}

// Least-squares values of `count` knots 10 nm apart from `lo` whose Catmull-Rom
// curve comes closest to the points within [lo, hi]: the normal equations,
// solved by Cholesky factorisation. False when they have no unique solution.
bool FitKnots(const Samples& s, int lo, int hi, int count, std::array<double, kMaxCount>& knots) {
    const auto n = static_cast<std::size_t>(count);
    std::array<double, kMaxCount * kMaxCount> normal{};
    std::array<double, kMaxCount> right{};
    for (const Sample& point : s) {
        if (point.nm < lo || point.nm > hi) {
            continue;
        }
        const CurveWeights w = CatmullRomAt(lo, count, point.nm);
        for (std::size_t a = 0; a < 4; ++a) {
            right[w.index[a]] += w.weight[a] * point.value;
            for (std::size_t b = 0; b < 4; ++b) {
                normal[w.index[a] * n + w.index[b]] += w.weight[a] * w.weight[b];
            }
        }
    }
    // normal = L * L^T, L stored in the lower triangle.
    for (std::size_t j = 0; j < n; ++j) {
        double pivot = normal[j * n + j];
        for (std::size_t k = 0; k < j; ++k) {
            pivot -= normal[j * n + k] * normal[j * n + k];
        }
        if (!(pivot > 1e-9)) {
            return false;
        }
        const double diagonal = std::sqrt(pivot);
        normal[j * n + j] = diagonal;
        for (std::size_t i = j + 1; i < n; ++i) {
            double sum = normal[i * n + j];
            for (std::size_t k = 0; k < j; ++k) {
                sum -= normal[i * n + k] * normal[j * n + k];
            }
            normal[i * n + j] = sum / diagonal;
        }
    }
    for (std::size_t i = 0; i < n; ++i) { // L * y = right
        double sum = right[i];
        for (std::size_t k = 0; k < i; ++k) {
            sum -= normal[i * n + k] * knots[k];
        }
        knots[i] = sum / normal[i * n + i];
    }
    for (std::size_t i = n; i-- > 0;) { // L^T * knots = y
        double sum = knots[i];
        for (std::size_t k = i + 1; k < n; ++k) {
            sum -= normal[k * n + i] * knots[k];
        }
        knots[i] = sum / normal[i * n + i];
    }
    return true;
}

} // namespace

bool Resample(Samples samples, EngineSpectrum& out) {
    if (samples.size() < 2 || std::any_of(samples.begin(), samples.end(), [](const Sample& p) {
            return !IsUsableValue(p.value);
        })) {
        return false;
    }
    const auto byWavelength = [](const Sample& a, const Sample& b) { return a.nm < b.nm; };
    if (!std::is_sorted(samples.begin(), samples.end(), byWavelength)) {
        std::sort(samples.begin(), samples.end(), byWavelength);
    }
    const auto sameWavelength = [](const Sample& a, const Sample& b) { return a.nm == b.nm; };
    if (std::adjacent_find(samples.begin(), samples.end(), sameWavelength) != samples.end() ||
        std::none_of(samples.begin(), samples.end(),
                     [](const Sample& p) { return p.nm >= kLowestNm && p.nm <= kHighestNm; })) {
        return false;
    }

    const int lo = std::max(samples.front().nm, kLowestNm);
    const int hi = std::min(samples.back().nm, kHighestNm);
    const int count = (hi - lo) / kStepNm + 1;
    std::array<double, kMaxCount> knots{};
    if (!(count > 1 && CloserThanStep(samples, lo, hi) &&
          FitKnots(samples, lo, hi, count, knots))) {
        for (int i = 0; i < count; ++i) {
            knots[static_cast<std::size_t>(i)] = CurveAt(samples, lo + kStepNm * i);
        }
    }
    out.startNm = lo;
    out.count = count;
    for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i) {
        out.values[i] = static_cast<float>(knots[i]);
    }
    return true;
}

} // namespace engine_spectrum
