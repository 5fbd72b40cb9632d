// Linear weights of the density filter sets, computed once from their
// logarithmic entries.
#include "patch/colorimetry_tables.h"

#include <cmath>

namespace colorimetry {
namespace {

std::array<FilterWeights, kFilterSetCount> ComputeAllFilterWeights() {
    std::array<FilterWeights, kFilterSetCount> all{};
    for (std::size_t set = 0; set < all.size(); ++set) {
        for (std::size_t filter = 0; filter < 3; ++filter) {
            double total = 0.0;
            for (std::size_t i = 0; i < kGridCount; ++i) {
                const double weight = std::pow(10.0, kDensityFilterSets[set][filter][i]);
                all[set].weights[filter][i] = weight;
                total += weight;
            }
            all[set].totals[filter] = total;
        }
    }
    return all;
}

} // namespace

const FilterWeights* DensityFilterWeights(long filterSet) {
    if (filterSet < 0 || filterSet >= kFilterSetCount) {
        return nullptr;
    }
    // Immutable once built; the initialisation of a local static is thread-safe.
    static const std::array<FilterWeights, kFilterSetCount> all = ComputeAllFilterWeights();
    return &all[static_cast<std::size_t>(filterSet)];
}

} // namespace colorimetry
