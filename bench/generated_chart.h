// The benchmark chart: a deterministic table of patches with SAMPLE_ID,
// SAMPLE_NAME, CMYK, 36 spectral values from 380 nm to 730 nm and L*a*b*,
// held in memory and as tab-separated chart text.
#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "redavudeva/records.h"

namespace bench {

struct ChartTable {
    std::vector<std::string> names;
    std::vector<tagCMYK> cmyk;
    std::vector<std::map<std::string, double>> spectra;
    std::vector<tagLAB> lab;
};

/// The field names in file order: SAMPLE_ID, SAMPLE_NAME, CMYK_C ... CMYK_K,
/// SPECTRAL_NM_380 ... SPECTRAL_NM_730, LAB_L, LAB_A, LAB_B (45 fields).
std::vector<std::string> FieldNames();

/// The same `patches` patches for the same count on every run: values come
/// from a fixed-seed integer generator and carry the decimals they are
/// printed with (2 for CMYK and Lab, 5 for spectra), so text and table agree.
ChartTable GenerateTable(int patches);

/// The table as CGATS.17 chart text, tab-separated.
std::string ChartText(const ChartTable& table);

/// Writes the chart of `patches` patches into `folder` (once per count and
/// process) and answers its path.
std::filesystem::path ChartFile(const std::filesystem::path& folder, int patches);

/// A scratch folder of this process, removed at exit.
const std::filesystem::path& ScratchFolder();

} // namespace bench
