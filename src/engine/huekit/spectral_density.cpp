// Spectrum to red, green, blue and visual density through the library's density
// filter set 0 and the photopic luminous efficiency.
#include <array>
#include <cmath>
#include <cstddef>

#include "huekit_engine.h"
#include "patch/colorimetry_tables.h"

namespace huekit {
namespace {

// 380..780 nm in 10 nm steps: the filter tables' wavelengths and beyond.
constexpr int kDensityGridCount = (kHighestNm - kLowestNm) / kSpectrumStepNm + 1;

// Linear weights per 10 nm point: red, green, blue filter, visual.
using DensityWeights = std::array<std::array<double, kDensityGridCount>, 4>;

DensityWeights MakeDensityWeights() {
    const colorimetry::FilterSet& filters = colorimetry::kDensityFilterSets[0];
    DensityWeights weights{};
    for (std::size_t i = 0; i < kDensityGridCount; ++i) {
        const bool inTables = i < static_cast<std::size_t>(colorimetry::kGridCount);
        for (std::size_t filter = 0; filter < 3; ++filter) {
            // Outside the tables the entry is 0, i.e. the weight 1.
            weights[filter][i] = std::pow(10.0, inTables ? filters[filter][i] : 0.0);
        }
        weights[3][i] = inTables ? colorimetry::kVisualWeights[i] : 0.0;
    }
    return weights;
}

const DensityWeights& Weights() {
    // Immutable once built; the initialisation of a local static is thread-safe.
    static const DensityWeights weights = MakeDensityWeights();
    return weights;
}

// Weight of row `row` at `nm` (within 380..780), interpolated between 10 nm points.
double WeightAt(const DensityWeights& weights, std::size_t row, int nm) {
    const int offset = nm - kLowestNm;
    const auto index = static_cast<std::size_t>(offset / kSpectrumStepNm);
    const int remainder = offset % kSpectrumStepNm;
    if (remainder == 0) {
        return weights[row][index];
    }
    const double fraction = static_cast<double>(remainder) / kSpectrumStepNm;
    return weights[row][index] + fraction * (weights[row][index + 1] - weights[row][index]);
}

} // namespace

bool SpectrumToDensity(const float* spectrum, int startNm, int count, double density[4]) {
    const DensityWeights& weights = Weights();
    double weighted[4] = {0.0, 0.0, 0.0, 0.0};
    double totals[4] = {0.0, 0.0, 0.0, 0.0};
    for (int i = 0; i < count; ++i) {
        const int nm = startNm + kSpectrumStepNm * i;
        for (std::size_t row = 0; row < 4; ++row) {
            const double w = WeightAt(weights, row, nm);
            weighted[row] += w * spectrum[i];
            totals[row] += w;
        }
    }
    double result[4] = {0.0, 0.0, 0.0, 0.0};
    for (std::size_t row = 0; row < 4; ++row) {
        if (!(totals[row] > 0.0)) {
            return false; // no visual weight at any supplied wavelength
        }
        const double mean = weighted[row] / totals[row];
        if (!(mean > 0.0)) {
            return false; // no light reflected: the density does not exist
        }
        result[row] = -std::log10(mean);
    }
    for (std::size_t row = 0; row < 4; ++row) {
        density[row] = result[row];
    }
    return true;
}

} // namespace huekit
