// Checks of the values the library reads as numbers, cell by cell: a cell
// that holds text reads as 0, "75.25.3" reads as 75, NaN and 1e308 read as
// what they say. Each finding names the line, the column, the field and the
// sample, and the value the library took.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"

namespace swatchlog {

struct ValueFinding {
    int line = 0;   ///< line number in the file
    int column = 0; ///< 1-based character column of the cell
    int sample = 0; ///< sample number (row of the data block)
    std::string field;
    std::string text;    ///< the cell as it stands
    std::string problem; ///< "text", "malformed", "not finite", "out of range", "quoted blank"
    std::string message; ///< the finding in words, without the place
};

/// The range a numeric field's values should lie in: tone values in percent
/// 0 to 100, RGB 0 to 255, L* 0 to 100, a* and b* -200 to 200, XYZ 0 to 200,
/// densities -1 to 10, spectral values -1 to 200. False for fields the
/// library does not read as numbers.
bool NumericFieldRange(const std::string& field, double& low, double& high);

/// Every finding of the chart's data rows, in row order.
std::vector<ValueFinding> CheckValues(const Chart& chart);

} // namespace swatchlog
