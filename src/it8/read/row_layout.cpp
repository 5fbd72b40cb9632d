#include "it8/read/row_layout.h"

#include <algorithm>
#include <cstddef>

#include "redavudeva/records.h"

namespace it8 {
namespace {

using Columns = std::map<std::string, int>;

int ColumnOf(const Columns& fields, const char* name) {
    const auto found = fields.find(name);
    return found == fields.end() ? -1 : found->second;
}

// Fills `columns` and answers true when every one of `names` is a field; a group
// is then supplied only if its deciding field (the first name) is there as well.
template <std::size_t N>
bool ResolveGroup(const Columns& fields, const char* const (&names)[N],
                  std::array<int, N>& columns) {
    for (std::size_t i = 0; i < N; ++i) {
        columns[i] = ColumnOf(fields, names[i]);
        if (columns[i] < 0) {
            return false;
        }
    }
    return true;
}

template <std::size_t N> void RaiseTo(int& highest, bool used, const std::array<int, N>& columns) {
    if (used) {
        highest = std::max(highest, *std::max_element(columns.begin(), columns.end()));
    }
}

} // namespace

RowLayout ResolveRowLayout(const Columns& fieldColumns, bool hasSpectral, bool hasNColor) {
    static const char* const cmykNames[] = {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"};
    static const char* const cmykRgbNames[] = {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K",
                                               "RGB_R",  "RGB_G",  "RGB_B"};
    static const char* const cmykOgvNames[] = {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K",
                                               "ORANGE", "GREEN",  "VIOLET"};
    static const char* const xyzNames[] = {"XYZ_X", "XYZ_Y", "XYZ_Z"};
    static const char* const labNames[] = {"LAB_L", "LAB_A", "LAB_B"};
    static const char* const rgbNames[] = {"RGB_R", "RGB_G", "RGB_B"};
    static const char* const densityNames[] = {"D_RED", "D_GREEN", "D_BLUE"};

    RowLayout layout;
    layout.label = ColumnOf(fieldColumns, "SAMPLE_NAME");
    if (layout.label < 0) {
        layout.label = ColumnOf(fieldColumns, "SAMPLE_LOC");
    }
    layout.referenceSample = ColumnOf(fieldColumns, "REFERENCE_SAMPLE_ID");
    layout.htmlColor = ColumnOf(fieldColumns, "DRGB");
    layout.hasCMYK = ResolveGroup(fieldColumns, cmykNames, layout.cmyk);
    layout.hasCMYKRGB = ResolveGroup(fieldColumns, cmykRgbNames, layout.cmykRgb);
    layout.hasCMYKOGV = ResolveGroup(fieldColumns, cmykOgvNames, layout.cmykOgv);
    layout.hasXYZ = ResolveGroup(fieldColumns, xyzNames, layout.xyz);
    layout.hasLAB = ResolveGroup(fieldColumns, labNames, layout.lab);
    layout.hasRGB = ResolveGroup(fieldColumns, rgbNames, layout.rgb);
    layout.hasDensity = ResolveGroup(fieldColumns, densityNames, layout.density);
    if (layout.hasDensity) {
        layout.densityVisual = ColumnOf(fieldColumns, "D_VIS");
        layout.densityMajorFilter = ColumnOf(fieldColumns, "D_MAJOR_FILTER");
    }

    // Six-colour values are never read from named fields: names with "CLR" are
    // n-colour channels.
    std::uint32_t mask = MISSING_CMYKOG;
    mask |= layout.hasCMYK ? 0 : MISSING_CMYK;
    mask |= layout.hasCMYKRGB ? 0 : MISSING_CMYKRGB;
    mask |= layout.hasCMYKOGV ? 0 : MISSING_CMYKOGV;
    mask |= layout.hasXYZ ? 0 : MISSING_XYZ;
    mask |= layout.hasLAB ? 0 : MISSING_LAB;
    mask |= layout.hasRGB ? 0 : MISSING_RGB;
    mask |= layout.hasDensity ? 0 : MISSING_DENSITY;
    mask |= hasSpectral ? 0 : MISSING_SPECTRAL;
    mask |= hasNColor ? 0 : MISSING_NCOLOR;
    layout.formatMask = mask;

    int highest = std::max({layout.label, layout.referenceSample, layout.htmlColor,
                            layout.densityVisual, layout.densityMajorFilter});
    RaiseTo(highest, layout.hasCMYK, layout.cmyk);
    RaiseTo(highest, layout.hasCMYKRGB, layout.cmykRgb);
    RaiseTo(highest, layout.hasCMYKOGV, layout.cmykOgv);
    RaiseTo(highest, layout.hasXYZ, layout.xyz);
    RaiseTo(highest, layout.hasLAB, layout.lab);
    RaiseTo(highest, layout.hasRGB, layout.rgb);
    RaiseTo(highest, layout.hasDensity, layout.density);
    layout.highestColumn = highest;
    return layout;
}

} // namespace it8
