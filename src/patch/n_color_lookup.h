// Reading n-colour channels by position.
//
// A position without an entry reads as 0.0 and is added to the map with a
// default channel record, so that every later reader sees the same channel
// list. Maps built from a chart hold exactly the positions 0 to n-1, so
// nothing is added for them.
#pragma once

#include <map>
#include <vector>

#include "redavudeva/records.h"

namespace n_color_lookup {

/// Tone value at `position`; adds a default channel when the position is absent.
inline double ValueAt(std::map<int, tagNCLR>& channels, int position) {
    return channels[position].value;
}

/// Tone values at positions 0 to n-1, n being the number of entries on entry.
inline std::vector<double> ValuesInOrder(std::map<int, tagNCLR>& channels) {
    const int count = static_cast<int>(channels.size());
    std::vector<double> values;
    values.reserve(channels.size());
    for (int position = 0; position < count; ++position) {
        values.push_back(ValueAt(channels, position));
    }
    return values;
}

} // namespace n_color_lookup
