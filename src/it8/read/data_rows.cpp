// The data block: one patch per row, numbered in file order.
#include <cmath>
#include <cstdint>
#include <limits>
#include <map>
#include <string>
#include <string_view>
#include <tuple>
#include <utility>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "it8/read/number_text.h"
#include "it8/read/row_layout.h"
#include "it8/read/tokens.h"
#include "patch/text_number.h"

namespace {

// The values of one row. Numbers are read in place, so a token that two groups
// share (CMYK_C, RGB_R ...) is read the second time in its rewritten form.
class RowValues {
public:
    explicit RowValues(std::vector<it8::LineSpan>& tokens) : tokens_(tokens) {}

    double Number(int column) {
        it8::LineSpan& token = tokens_[static_cast<std::size_t>(column)];
        return it8::ParseNumberInPlace(token.data, token.size);
    }

    std::string_view Text(int column) const {
        return it8::View(tokens_[static_cast<std::size_t>(column)]);
    }

    // RGB components are whole numbers, truncated toward zero; values outside the
    // int range are clamped to it and a NaN gives 0.
    int WholeNumber(int column) {
        const double value = Number(column);
        if (std::isnan(value)) {
            return 0;
        }
        if (value <= static_cast<double>(std::numeric_limits<int>::min())) {
            return std::numeric_limits<int>::min();
        }
        if (value >= static_cast<double>(std::numeric_limits<int>::max())) {
            return std::numeric_limits<int>::max();
        }
        return static_cast<int>(value);
    }

private:
    std::vector<it8::LineSpan>& tokens_;
};

unsigned HexPair(std::string_view pair) {
    unsigned value = 0;
    for (const char c : pair) {
        if (c >= '0' && c <= '9') {
            value = value * 16 + static_cast<unsigned>(c - '0');
        } else if ((c | 0x20) >= 'a' && (c | 0x20) <= 'f') {
            value = value * 16 + static_cast<unsigned>((c | 0x20) - 'a' + 10);
        } else {
            break;
        }
    }
    return value;
}

// "#RRGGBB": seven characters with a '#' among them; the pairs after the first
// character are the red, green and blue bytes.
bool ReadHtmlColor(std::string_view text, tagHTMLCOLOR& html) {
    if (text.size() != 7 || text.find('#') == std::string_view::npos) {
        return false;
    }
    html.r = HexPair(text.substr(1, 2));
    html.g = HexPair(text.substr(3, 2));
    html.b = HexPair(text.substr(5, 2));
    return true;
}

// Everything one row supplies, ready for the patch constructor.
struct RowRecords {
    std::string label;
    tagCMYK cmyk;
    tagCMYKOG cmykog; // six-colour fields are n-colour channels: never read
    tagCMYKRGB cmykrgb;
    tagCMYKOGV cmykogv;
    tagXYZ xyz;
    tagLAB lab;
    tagRGB rgb{0, 0, 0};
    std::map<std::string, double> spectral;
    tagHTMLCOLOR html;
    std::map<int, tagNCLR> nColors;
    tagDENSITY density;
    std::uint32_t mask = 0;
};

using Columns = std::map<std::string, int>;

// True when every column of `columns` lies within a row of `count` values.
bool ColumnsWithin(const Columns& columns, std::size_t count) {
    for (const auto& entry : columns) {
        if (entry.second < 0 || static_cast<std::size_t>(entry.second) >= count) {
            return false;
        }
    }
    return true;
}

// Reads the groups in a fixed order (CMYK, CMYK+RGB, CMYK+OGV, XYZ, Lab, RGB,
// spectrum, HTML colour, n-colour channels, densities): a shared token is read
// the second time in the form the first reading left it. The spectral and
// n-colour fields are taken in name order.
RowRecords ReadRecords(const it8::RowLayout& layout, const Columns& spectralColumns,
                       const Columns& nColorColumns, RowValues& row) {
    RowRecords r;
    if (layout.label >= 0) {
        r.label = std::string(row.Text(layout.label));
    }
    r.mask = layout.formatMask;
    if (layout.hasCMYK) {
        const auto& c = layout.cmyk;
        r.cmyk = {row.Number(c[0]), row.Number(c[1]), row.Number(c[2]), row.Number(c[3])};
    }
    if (layout.hasCMYKRGB) {
        const auto& c = layout.cmykRgb;
        r.cmykrgb = {row.Number(c[0]), row.Number(c[1]), row.Number(c[2]), row.Number(c[3]),
                     row.Number(c[4]), row.Number(c[5]), row.Number(c[6])};
    }
    if (layout.hasCMYKOGV) {
        const auto& c = layout.cmykOgv;
        r.cmykogv = {row.Number(c[0]), row.Number(c[1]), row.Number(c[2]), row.Number(c[3]),
                     row.Number(c[4]), row.Number(c[5]), row.Number(c[6])};
    }
    if (layout.hasXYZ) {
        r.xyz = {row.Number(layout.xyz[0]), row.Number(layout.xyz[1]), row.Number(layout.xyz[2])};
    }
    if (layout.hasLAB) {
        r.lab = {row.Number(layout.lab[0]), row.Number(layout.lab[1]), row.Number(layout.lab[2])};
    }
    if (layout.hasRGB) {
        r.rgb = {row.WholeNumber(layout.rgb[0]), row.WholeNumber(layout.rgb[1]),
                 row.WholeNumber(layout.rgb[2])};
    }
    for (const auto& [name, column] : spectralColumns) {
        r.spectral.emplace_hint(r.spectral.end(), name, row.Number(column));
    }
    if (layout.htmlColor < 0 || !ReadHtmlColor(row.Text(layout.htmlColor), r.html)) {
        r.html = tagHTMLCOLOR{};
        r.mask |= MISSING_HTMLCOLOR;
    }
    int channel = 0;
    for (const auto& [name, column] : nColorColumns) {
        r.nColors.emplace_hint(
            r.nColors.end(), channel,
            tagNCLR{text_number::ParseIntLenient(name), channel, name, row.Number(column)});
        ++channel;
    }
    if (layout.hasDensity) {
        r.density.red = row.Number(layout.density[0]);
        r.density.green = row.Number(layout.density[1]);
        r.density.blue = row.Number(layout.density[2]);
        if (layout.densityVisual >= 0) {
            r.density.visual = row.Number(layout.densityVisual);
        }
        if (layout.densityMajorFilter >= 0) {
            r.density.majorFilter = row.Number(layout.densityMajorFilter);
        }
    }
    return r;
}

} // namespace

int CIT8ReaderWriter::ReadDataRows() {
    int sampleNumber = 1;
    if (chartStream.AtEnd()) {
        return 7;
    }
    const it8::RowLayout layout =
        it8::ResolveRowLayout(fieldColumns, !spectralColumns.empty(), !nColorColumns.empty());
    // Every patch carries its own copy of each spectral and n-colour field name.
    // A row must hold at least one value per such name, so that the copies grow
    // with the rows' length and never with the number of rows times a long
    // format (data formats that map several names onto one column).
    const std::size_t namesPerPatch = spectralColumns.size() + nColorColumns.size();
    bool endSeen = false;
    std::vector<it8::LineSpan> tokens;
    it8::LineSpan line;
    while (!endSeen && chartStream.ReadLine(line)) {
        it8::SplitFields(line, tokens);
        if (tokens.empty()) {
            // An empty or blank line between rows.
        } else if (it8::View(tokens.front()) == "END_DATA") {
            endSeen = true;
        } else if (static_cast<long long>(tokens.size()) != numberOfFields ||
                   static_cast<long long>(layout.highestColumn) >=
                       static_cast<long long>(tokens.size()) ||
                   namesPerPatch > tokens.size() ||
                   !ColumnsWithin(spectralColumns, tokens.size()) ||
                   !ColumnsWithin(nColorColumns, tokens.size())) {
            // A row with another number of values, or a format whose columns lie
            // beyond the row's values or that names more spectral and n-colour
            // fields than the row holds values, cannot be read.
            return 8;
        } else if (sampleNumber == std::numeric_limits<int>::max()) {
            return 8; // more rows than sample numbers
        } else {
            RowValues row(tokens);
            RowRecords records = ReadRecords(layout, spectralColumns, nColorColumns, row);
            // The patch is built in its place in the store; a second data block
            // replaces the patch of the same sample number.
            auto stored = patches.find(sampleNumber);
            if (stored == patches.end()) {
                stored = patches.emplace_hint(
                    patches.end(), std::piecewise_construct, std::forward_as_tuple(sampleNumber),
                    std::forward_as_tuple(records.cmyk, records.xyz, records.lab, records.rgb,
                                          records.cmykog, records.cmykrgb, records.cmykogv,
                                          std::move(records.spectral), std::move(records.nColors),
                                          records.html, records.density, std::move(records.label)));
            } else {
                stored->second =
                    CColorPatch(records.cmyk, records.xyz, records.lab, records.rgb, records.cmykog,
                                records.cmykrgb, records.cmykogv, std::move(records.spectral),
                                std::move(records.nColors), records.html, records.density,
                                std::move(records.label));
            }
            stored->second.SetMissingColorSpace(records.mask);
            if (layout.referenceSample >= 0) {
                const int reference =
                    text_number::ParseIntLenient(std::string(row.Text(layout.referenceSample)));
                referenceSampleMap[reference] = sampleNumber;
            }
            lastRowMask = records.mask;
            ++sampleNumber;
        }
        if (chartStream.AtEnd()) {
            break;
        }
    }
    if (!endSeen) {
        return 7;
    }
    if (static_cast<long long>(patches.size()) != numberOfSets) {
        return 8;
    }
    UpdatePresenceFlags(lastRowMask);
    missingColorSpaces = lastRowMask;
    return 0;
}
