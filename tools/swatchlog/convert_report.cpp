#include "convert_report.h"

#include <algorithm>
#include <cmath>

#include "number_format.h"
#include "patch_values.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// Digits after the point the new-file writer keeps for a space.
int WrittenDecimals(Space space) {
    return space == Space::Spectral ? 5 : 2;
}

// Whether a cell's text has a non-zero digit after its decimal mark, or
// anything else that a whole number does not show.
bool HasFraction(const std::string& cell) {
    const std::size_t mark = cell.find_first_of(".,");
    if (cell.find_first_of("eE") != std::string::npos) {
        return true;
    }
    return mark != std::string::npos && cell.find_first_not_of('0', mark + 1) != std::string::npos;
}

std::string Count(std::size_t count, const char* one, const char* many) {
    return std::to_string(count) + " " + (count == 1 ? one : many);
}

void CompareValues(const Chart& source, const Chart& output, Space space,
                   std::vector<ConvertChange>& changes) {
    const std::string title = NameOf(space).title;
    if (!source.Has(space) || !output.Has(space)) {
        return;
    }
    if (source.Derived(space)) {
        if (output.Derived(space)) {
            return; // not written: derived again on reading
        }
        changes.push_back({"added", title + ", derived by the library (the file had none), " +
                                        std::to_string(WrittenDecimals(space)) + " decimals"});
        return;
    }
    const std::size_t fields = SpaceFields(source, space).size();
    std::size_t values = 0;
    std::size_t changed = 0;
    double largest = 0.0;
    for (std::size_t i = 0; i < source.Patches().size() && i < output.Patches().size(); ++i) {
        const auto before = SpaceNumbers(source.Patches()[i], space, fields);
        const auto after = SpaceNumbers(output.Patches()[i], space, fields);
        for (std::size_t v = 0; v < before.size() && v < after.size(); ++v) {
            ++values;
            const bool same =
                before[v] == after[v] || (std::isnan(before[v]) && std::isnan(after[v]));
            if (!same) {
                ++changed;
                const double change = std::fabs(before[v] - after[v]);
                largest = std::isfinite(change) ? std::max(largest, change) : change;
            }
        }
    }
    if (changed == 0) {
        return;
    }
    if (space == Space::Rgb) {
        changes.push_back({"changed", title + ": " + std::to_string(changed) + " of " +
                                          std::to_string(values) + " values differ"});
        return;
    }
    changes.push_back({"changed", title + ": " + std::to_string(changed) + " of " +
                                      std::to_string(values) + " values rounded to " +
                                      std::to_string(WrittenDecimals(space)) +
                                      " decimals (largest change " +
                                      FormatShortest(RoundToDecimals(largest, 6)) + ")"});
}

// RGB is held as whole numbers from the reading on, so what the file says is
// in its text only.
void RgbFractions(const Chart& source, std::vector<ConvertChange>& changes) {
    if (!source.Has(Space::Rgb) || source.Derived(Space::Rgb)) {
        return;
    }
    std::size_t values = 0;
    std::size_t fractions = 0;
    std::string example;
    for (const char* field : {"RGB_R", "RGB_G", "RGB_B"}) {
        const auto cells = source.Loaded().ColumnText(field);
        for (std::size_t i = 0; i < cells.size(); ++i) {
            ++values;
            if (HasFraction(cells[i])) {
                ++fractions;
                if (example.empty() && i < source.Patches().size()) {
                    const tagRGB rgb = source.Patches()[i].GetRGB();
                    const int whole = field[4] == 'R' ? rgb.r : field[4] == 'G' ? rgb.g : rgb.b;
                    example = cells[i] + " as " + std::to_string(whole);
                }
            }
        }
    }
    if (fractions > 0) {
        changes.push_back(
            {"changed", "RGB: " + std::to_string(fractions) + " of " + std::to_string(values) +
                            " values have decimals and are written as the whole numbers the "
                            "chart holds, cut toward zero (" +
                            RepairUtf8(example) + ")"});
    }
}

} // namespace

std::vector<ConvertChange> CompareConvertedData(const Chart& source, const Chart& output,
                                                bool keptIds) {
    std::vector<ConvertChange> changes;
    const std::size_t rows = source.Patches().size();
    if (source.HasSampleIds() && !keptIds) {
        std::size_t renumbered = 0;
        for (std::size_t i = 0; i < rows; ++i) {
            renumbered += source.SampleId(i) != std::to_string(i + 1) ? 1 : 0;
        }
        if (renumbered > 0) {
            changes.push_back({"changed", "SAMPLE_ID: " + Count(renumbered, "id", "ids") +
                                              " replaced by the row numbers 1 to " +
                                              std::to_string(rows) +
                                              " (--keep-ids keeps the file's own)"});
        }
    }
    const auto& sourceFields = source.Loaded().Text().fields;
    std::vector<std::string> dropped;
    for (const auto& field : sourceFields) {
        if (output.FileHasField(field) ||
            std::find(dropped.begin(), dropped.end(), field) != dropped.end()) {
            continue;
        }
        if (field == "SAMPLE_LOC" && !source.FileHasField("SAMPLE_NAME") &&
            output.FileHasField("SAMPLE_NAME")) {
            changes.push_back({"changed", "SAMPLE_LOC is written as SAMPLE_NAME"});
            continue;
        }
        dropped.push_back(field);
    }
    if (!dropped.empty()) {
        std::string list;
        for (const auto& field : dropped) {
            list += (list.empty() ? "" : ", ") + RepairUtf8(field);
        }
        changes.push_back({"dropped", Count(dropped.size(), "field", "fields") +
                                          " the new-file format has no columns for (" +
                                          Count(rows, "value", "values") +
                                          (dropped.size() == 1 ? "): " : " each): ") + list});
    }
    RgbFractions(source, changes);
    for (const Space space :
         {Space::Cmyk, Space::Rgb, Space::NColor, Space::Spectral, Space::Xyz, Space::Lab}) {
        CompareValues(source, output, space, changes);
    }
    return changes;
}

} // namespace swatchlog
