// CColorPatch: spectral densities from the built-in tables.
#include <algorithm>
#include <cmath>
#include <cstddef>

#include "patch/colorimetry_tables.h"
#include "redavudeva/color_patch.h"

namespace {

// The largest spectrum a patch holds (SpectralDataStruct::values).
constexpr long long kMaxSpectralValues = 50;

// The window of CalculateDensity: from 430 nm, 250 nm wide, ending before 680 nm.
constexpr long long kWindowFirstNm = 430;
constexpr long long kWindowWidthNm = 250;
constexpr long long kWindowEndNm = 680;

double SpectralDensity(double reflectance) {
    return std::log10(1.0 / reflectance);
}

// Weighted mean reflectance of `values` through one row of linear weights.
double WeightedReflectance(const colorimetry::SpectralRow& weights, double total,
                           const double* values) {
    double x = 0.0;
    for (std::size_t i = 0; i < colorimetry::kGridCount; ++i) {
        x += weights[i] * values[i] / total;
    }
    return x;
}

} // namespace

double CColorPatch::CalculateDensity(SpectralDataStruct& reference, int& peakNm) {
    if (!m_bSpectral) {
        return 0.0;
    }
    const long long count = std::clamp<long long>(m_spectral.count, 0, kMaxSpectralValues);
    const long long start = m_spectral.startNm;
    const long long step = m_spectral.stepNm;
    if (step == 0) {
        return 0.0; // a one-value spectrum has no grid to place the window on
    }
    long long first = 0;
    long long last = 0;
    if (start <= kWindowFirstNm) {
        first = (kWindowFirstNm - start) / step;
        last = first + kWindowWidthNm / step;
    } else {
        last = (kWindowEndNm - start) / step;
    }
    // A descending grid (negative step) can put the window before index 0.
    first = std::max(first, 0LL);
    const long long end = std::min(count, last);

    double best = 0.0;
    for (long long i = first; i < end; ++i) {
        const auto at = static_cast<std::size_t>(i);
        const double density =
            SpectralDensity(m_spectral.values[at]) - SpectralDensity(reference.values[at]);
        if (density > best) {
            best = density;
            peakNm = static_cast<int>(step * i + start);
        }
    }
    return best;
}

tagCMYK CColorPatch::GetCMYKfromSPECTRAL(long filterSet, SpectralDataStruct spectrum) {
    tagCMYK result;
    const colorimetry::FilterWeights* filters = colorimetry::DensityFilterWeights(filterSet);
    if (spectrum.stepNm != colorimetry::kGridStepNm || spectrum.count != colorimetry::kGridCount ||
        spectrum.startNm != colorimetry::kGridStartNm || filters == nullptr) {
        result.c = -1.0; // off the 380 nm / 10 nm / 36-value grid, or no such filter set
        return result;
    }

    double densities[3] = {0.0, 0.0, 0.0};
    for (std::size_t filter = 0; filter < 3; ++filter) {
        const double x =
            WeightedReflectance(filters->weights[filter], filters->totals[filter], spectrum.values);
        if (x > 0.0) {
            densities[filter] = -std::log10(x);
        }
    }

    double visualTotal = 0.0;
    double visualSum = 0.0;
    for (std::size_t i = 0; i < colorimetry::kGridCount; ++i) {
        visualTotal += colorimetry::kVisualWeights[i];
        visualSum += colorimetry::kVisualWeights[i] * spectrum.values[i];
    }

    result.c = densities[0];
    result.m = densities[1];
    result.y = densities[2];
    result.k = -std::log(visualSum / visualTotal) / std::log(10.0);
    return result;
}
