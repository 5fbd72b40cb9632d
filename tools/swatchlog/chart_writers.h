// The writers that start from existing chart files, as the merge and target
// commands (and other front ends) run them: inputs are read and checked first,
// the output appears whole or not at all, and failures are ChartErrors with
// the file they blame and the library's result code.
#pragma once

#include <functional>
#include <string>

#include "patch_pairing.h"

namespace swatchlog {

/// Receives a remark the writer makes on the way (a note or a warning, one
/// sentence without the program's name); the commands print it on standard
/// error.
using Remark = std::function<void(const std::string& text)>;

struct MergeOptions {
    /// Keep the target's rows and append only the colour spaces it lacks;
    /// otherwise the data block is rebuilt from the target's device values.
    bool appendMissing = false;
    /// With appendMissing: work the larger of ORIGINAL_NUMBER_OF_SETS and
    /// NUMBER_OF_SETS rather than the smaller.
    bool exact = false;
    PairBy by = PairBy::Auto;
    /// Leave out measured patches that have no target patch (else an error).
    bool allowUnpaired = false;
    /// Largest difference of a device value between paired patches (percent
    /// or RGB levels).
    double deviceTolerance = 1.0;
    int targetTable = 0; ///< table of the target file, 0: the first with data
    int measuredTable = 0;
};

/// Puts the measurements of the chart `measuredPath` (L*a*b*, XYZ, spectra and
/// the densities computed from the spectra) into the target `targetPath` and
/// writes the result to `outputPath`. Each target patch takes the measurement
/// of its partner (PairPatches); every target patch needs one, and where both
/// charts carry device values every pair must agree within the tolerance.
/// Notes (pairing fallback, patches left out, device values not compared, a
/// table written alone) go to `note`. Paths are UTF-8; the caller keeps
/// `outputPath` apart from the inputs.
void MergeMeasurements(const std::string& targetPath, const std::string& measuredPath,
                       const std::string& outputPath, const MergeOptions& options,
                       const Remark& note);

/// Writes table `table` (0: the first with data) of the chart file `inputPath`
/// reduced to its clean patches and its first white patch to `outputPath`,
/// layout keywords set to the new patch count. The library's writer stops at
/// the first white patch: when clean patches stand after it, ChartError unless
/// `force`, in which case the loss goes to `warning` and the file is written.
void WriteCleanTarget(const std::string& inputPath, const std::string& outputPath, int table,
                      bool force, const Remark& warning);

} // namespace swatchlog
