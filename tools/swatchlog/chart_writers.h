// The writers that start from existing chart files, as the merge and target
// commands (and other front ends) run them: inputs are read first, the output
// appears whole or not at all, and failures are ChartErrors with the file they
// blame and the library's result code.
#pragma once

#include <string>

namespace swatchlog {

/// Puts the measurements of the chart `measuredPath` (L*a*b*, XYZ, spectra and
/// the densities computed from them) into the target file `targetPath` and
/// writes the result to `outputPath`: the data block rebuilt from the target's
/// device values, or with `appendMissing` the target's rows with the colour
/// spaces it lacks appended (`exact`: the patch counts must agree exactly).
/// Paths are UTF-8; the caller keeps `outputPath` apart from the inputs.
void MergeMeasurements(const std::string& targetPath, const std::string& measuredPath,
                       const std::string& outputPath, bool appendMissing, bool exact);

/// Writes the chart file `inputPath` reduced to its clean patches and its first
/// white patch to `outputPath`, layout keywords set to the new patch count.
void WriteCleanTarget(const std::string& inputPath, const std::string& outputPath);

} // namespace swatchlog
