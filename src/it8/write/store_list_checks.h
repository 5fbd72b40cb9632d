// Whether the store's value lists can fill a given number of rows.
//
// A writer indexes its lists by row, so a list that is too short, or spectra
// and n-colour maps whose names differ from the first entry's (their columns
// are named after the first entry), would give rows with missing or misplaced
// values. The writers refuse such lists before writing anything.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <vector>

#include "redavudeva/records.h"

namespace it8 {

/// True for an empty list (it is not written) or one of at least `rows` entries.
template <typename Entry> bool ListCovers(const std::vector<Entry>& list, std::size_t rows) {
    return list.empty() || list.size() >= rows;
}

/// ListCovers, and the first `rows` spectra carry exactly the first one's names.
bool SpectralListCovers(const std::vector<std::map<std::string, double>>& list, std::size_t rows);

/// ListCovers, and the first `rows` maps carry exactly the first one's channels.
bool NColorListCovers(const std::vector<std::map<int, tagNCLR>>& list, std::size_t rows);

} // namespace it8
