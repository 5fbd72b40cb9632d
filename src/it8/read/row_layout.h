// The columns the rows of one data block are read from, resolved once per block.
#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <string>

namespace it8 {

/// Column of every value a data row supplies; -1 for a field the format lacks. A
/// colour group counts as supplied only when every field it reads is in the
/// format; a group with a missing field stays zero and keeps its missing bit.
struct RowLayout {
    int label = -1; ///< SAMPLE_NAME, else SAMPLE_LOC
    int referenceSample = -1;
    int htmlColor = -1;
    bool hasCMYK = false;
    std::array<int, 4> cmyk{};
    bool hasCMYKRGB = false;
    std::array<int, 7> cmykRgb{};
    bool hasCMYKOGV = false;
    std::array<int, 7> cmykOgv{};
    bool hasXYZ = false;
    std::array<int, 3> xyz{};
    bool hasLAB = false;
    std::array<int, 3> lab{};
    bool hasRGB = false;
    std::array<int, 3> rgb{};
    bool hasDensity = false;
    std::array<int, 3> density{}; ///< red, green, blue
    int densityVisual = -1;       ///< optional within the density group
    int densityMajorFilter = -1;  ///< optional within the density group
    /// Missing-space bits that follow from the format alone (all but the HTML colour).
    std::uint32_t formatMask = 0;
    /// Highest column a general field is read from; -1 when none is read.
    int highestColumn = -1;
};

/// The general fields' columns. Spectral and n-colour fields are read straight
/// from their maps; only whether there are any enters the missing-space bits.
/// Costs a fixed number of look-ups, whatever the number of fields.
RowLayout ResolveRowLayout(const std::map<std::string, int>& fieldColumns, bool hasSpectral,
                           bool hasNColor);

} // namespace it8
