// What a converted chart lost or changed against its source: fields and
// header lines that were not written, values the new-file writer rounded,
// RGB values the chart keeps as whole numbers, renumbered sample ids. Every
// value compared is the library's, read from the source and from the output.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"

namespace swatchlog {

struct ConvertChange {
    std::string kind; ///< "changed", "dropped" or "added"
    std::string text;
};

/// Differences in the data: fields, values and sample ids. `keptIds` says
/// whether the source's SAMPLE_ID values were written.
std::vector<ConvertChange> CompareConvertedData(const Chart& source, const Chart& output,
                                                bool keptIds);

} // namespace swatchlog
