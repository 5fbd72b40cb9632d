// The columns the rows of one data block are read from, resolved once per block.
#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <string>
#include <vector>

namespace it8 {

/// A spectral or n-colour field with its column.
struct NamedColumn {
    std::string name;
    int column = -1;
    int colorantCount = 0; ///< n-colour fields: the number the name begins with
};

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
    std::array<int, 3> density{};      ///< red, green, blue
    int densityVisual = -1;            ///< optional within the density group
    int densityMajorFilter = -1;       ///< optional within the density group
    std::vector<NamedColumn> spectral; ///< in name order
    std::vector<NamedColumn> nColor;   ///< in name order; the position is the channel
    /// Missing-space bits that follow from the format alone (all but the HTML colour).
    std::uint32_t formatMask = 0;
    /// Highest column a row is read from; -1 when no value is read.
    int highestColumn = -1;
};

RowLayout ResolveRowLayout(const std::map<std::string, int>& fieldColumns,
                           const std::map<std::string, int>& spectralColumns,
                           const std::map<std::string, int>& nColorColumns);

} // namespace it8
