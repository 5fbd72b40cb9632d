// Summary statistics of a list of colour differences.
#pragma once

#include <vector>

namespace swatchlog {

struct Summary {
    double mean = 0.0;
    double p95 = 0.0; ///< 95th percentile, linear between the closest ranks
    double max = 0.0;
};

/// Mean, 95th percentile and maximum; all 0 for an empty list. The percentile
/// interpolates linearly at rank 0.95 (n - 1) of the sorted values.
Summary Summarise(std::vector<double> values);
/// The p-th percentile (0 <= p <= 100) of `values`, same method; 0 when empty.
double Percentile(std::vector<double> values, double p);

} // namespace swatchlog
