// Which patch of one chart goes with which patch of another: by SAMPLE_ID
// when both files carry it, else by sample name, else by position, each
// fallback stated; or by one rule on request.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"

namespace swatchlog {

enum class PairBy { Auto, Id, Name, Position };

/// The rule of a --by value: auto, id, name, position (or sample, its old name).
PairBy ParsePairBy(const std::string& value);
/// "SAMPLE_ID", "sample name" or "position".
const char* PairByText(PairBy by);
/// "id", "name" or "position", for machine-readable output.
const char* PairByKey(PairBy by);

struct PatchPair {
    std::size_t first = 0;  ///< patch index (0-based) in the first chart
    std::size_t second = 0; ///< in the second chart
};

struct Pairing {
    PairBy by = PairBy::Position; ///< the rule used, never Auto
    std::string fallback;         ///< why Auto did not pair by SAMPLE_ID; empty otherwise
    std::vector<PatchPair> pairs; ///< in the order of the first chart
    std::vector<std::size_t> unpairedFirst;
    std::vector<std::size_t> unpairedSecond;
};

/// Pairs the patches of `first` with those of `second`. ChartError when the
/// rule cannot work: a file lacks SAMPLE_ID or names, or one id or name stands
/// on two patches of a file.
Pairing PairPatches(const Chart& first, const Chart& second, PairBy by);

/// Patch indexes as 1-based sample numbers in ranges: "3, 7-9".
std::string SampleRanges(const std::vector<std::size_t>& indexes);
/// "sample 3" or "samples 3, 7-9".
std::string SamplesText(const std::vector<std::size_t>& indexes);

/// "3 of 48 patches of ref.it8 (samples 46-48)" parts for unpaired patches,
/// joined with " and "; empty when every patch is paired.
std::string UnpairedText(const Chart& first, const Chart& second, const Pairing& pairing);

} // namespace swatchlog
