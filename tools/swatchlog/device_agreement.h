// Whether paired patches of two charts were printed from the same device
// values: the check that a measurement file belongs to its target.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"
#include "patch_pairing.h"

namespace swatchlog {

struct DeviceAgreement {
    /// The device space both charts carry from their files ("CMYK", "RGB",
    /// "n-colour channels"), or empty when they share none.
    std::string space;
    std::size_t checked = 0; ///< pairs compared
    /// One sentence per pair whose values differ by more than the tolerance.
    std::vector<std::string> disagreements;
};

/// Compares the device values of every pair in the first device space both
/// charts carry in their files (CMYK, then RGB, then n-colour channels of the
/// same count). Values agree when no channel differs by more than `tolerance`
/// (percent, or RGB levels).
DeviceAgreement CheckDeviceValues(const Chart& first, const Chart& second, const Pairing& pairing,
                                  double tolerance);

} // namespace swatchlog
