#include "statistics.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace swatchlog {

double Percentile(std::vector<double> values, double p) {
    if (values.empty()) {
        return 0.0;
    }
    std::sort(values.begin(), values.end());
    const double rank = std::clamp(p, 0.0, 100.0) / 100.0 * static_cast<double>(values.size() - 1);
    const auto below = static_cast<std::size_t>(std::floor(rank));
    const std::size_t above = std::min(below + 1, values.size() - 1);
    const double fraction = rank - static_cast<double>(below);
    return values[below] + fraction * (values[above] - values[below]);
}

Summary Summarise(std::vector<double> values) {
    Summary summary;
    if (values.empty()) {
        return summary;
    }
    summary.mean =
        std::accumulate(values.begin(), values.end(), 0.0) / static_cast<double>(values.size());
    summary.max = *std::max_element(values.begin(), values.end());
    summary.p95 = Percentile(std::move(values), 95.0);
    return summary;
}

} // namespace swatchlog
