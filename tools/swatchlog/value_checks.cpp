#include "value_checks.h"

#include <cmath>
#include <optional>

#include "number_format.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

// The length of the longest beginning of `text` that is a number as the
// reader takes it: sign, digits with one decimal point or comma, exponent.
std::size_t NumberPrefix(std::string_view text) {
    std::size_t i = 0;
    if (i < text.size() && (text[i] == '+' || text[i] == '-')) {
        ++i;
    }
    const std::size_t start = i;
    while (i < text.size() && IsDigit(text[i])) {
        ++i;
    }
    bool digits = i > start;
    if (i < text.size() && (text[i] == '.' || text[i] == ',')) {
        const std::size_t after = ++i;
        while (i < text.size() && IsDigit(text[i])) {
            ++i;
        }
        digits = digits || i > after;
    }
    if (!digits) {
        return 0;
    }
    if (i < text.size() && (text[i] == 'e' || text[i] == 'E')) {
        std::size_t j = i + 1;
        if (j < text.size() && (text[j] == '+' || text[j] == '-')) {
            ++j;
        }
        const std::size_t exponent = j;
        while (j < text.size() && IsDigit(text[j])) {
            ++j;
        }
        if (j > exponent) {
            i = j;
        }
    }
    return i;
}

bool IsNonFiniteWord(std::string_view text) {
    if (!text.empty() && (text[0] == '+' || text[0] == '-')) {
        text.remove_prefix(1);
    }
    const std::string upper = UpperAscii(text);
    return upper == "NAN" || upper == "INF" || upper == "INFINITY" ||
           (upper.rfind("NAN(", 0) == 0 && upper.back() == ')');
}

bool IsGeneralField(const std::string& field) {
    return field.find("SPECTRAL") == std::string::npos && field.find("NM") == std::string::npos &&
           field.find("CLR") == std::string::npos && field.find("PC") == std::string::npos;
}

bool IsSpectralField(const std::string& field) {
    return field.find("SPECTRAL") != std::string::npos || field.find("NM") != std::string::npos;
}

// The value the library holds for the patch's cell of `field`, where it keeps one.
std::optional<double> LibraryValue(const Chart& chart, const CColorPatch& patch,
                                   const std::string& field) {
    const auto pick = [&field](const char* const(&names)[4], const double(&values)[4],
                               int count) -> std::optional<double> {
        for (int i = 0; i < count; ++i) {
            if (field == names[i]) {
                return values[i];
            }
        }
        return std::nullopt;
    };
    if (IsSpectralField(field)) {
        if (!patch.IsSpectralPresent()) {
            return std::nullopt;
        }
        const auto spectrum = patch.GetSpectralData();
        const auto found = spectrum.find(field);
        return found == spectrum.end() ? std::nullopt : std::optional<double>(found->second);
    }
    if (!IsGeneralField(field)) {
        for (const auto& [position, channel] : patch.GetNColorMap()) {
            if (UpperAscii(channel.name) == field) {
                return channel.value;
            }
        }
        return std::nullopt;
    }
    if (field.rfind("CMYK_", 0) == 0 && chart.FileHasField("CMYK_C") && patch.IsCMYKPresent()) {
        const tagCMYK v = patch.GetCMYK();
        return pick({"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"}, {v.c, v.m, v.y, v.k}, 4);
    }
    if (field.rfind("RGB_", 0) == 0 && chart.FileHasField("RGB_R") && patch.IsRGBPresent()) {
        const tagRGB v = patch.GetRGB();
        return pick(
            {"RGB_R", "RGB_G", "RGB_B", ""},
            {static_cast<double>(v.r), static_cast<double>(v.g), static_cast<double>(v.b), 0.0}, 3);
    }
    if (field.rfind("XYZ_", 0) == 0 && chart.FileHasField("XYZ_X") && patch.IsXYZPresent()) {
        const tagXYZ v = patch.GetXYZ();
        return pick({"XYZ_X", "XYZ_Y", "XYZ_Z", ""}, {v.x, v.y, v.z, 0.0}, 3);
    }
    if (field.rfind("LAB_", 0) == 0 && chart.FileHasField("LAB_L") && patch.IsLABPresent()) {
        const tagLAB v = patch.GetLAB();
        return pick({"LAB_L", "LAB_A", "LAB_B", ""}, {v.l, v.a, v.b, 0.0}, 3);
    }
    if (field.rfind("D_", 0) == 0 && chart.FileHasField("D_RED") && patch.IsDensityAvailable()) {
        const tagDENSITY v = patch.GetDensity();
        return pick({"D_RED", "D_GREEN", "D_BLUE", "D_VIS"}, {v.red, v.green, v.blue, v.visual}, 4);
    }
    if (patch.IsCMYKOGVPresent()) {
        const tagCMYKOGV v = patch.GetCMYKOGV();
        return pick({"ORANGE", "GREEN", "VIOLET", ""}, {v.o, v.g, v.v, 0.0}, 3);
    }
    return std::nullopt;
}

std::string Reads(const std::optional<double>& value) {
    return value ? "; it reads as " + FormatShortest(*value) : "";
}

std::string Quoted(std::string_view text) {
    return "\"" + RepairUtf8(text) + "\"";
}

} // namespace

bool NumericFieldRange(const std::string& field, double& low, double& high) {
    struct Range {
        const char* field;
        double low;
        double high;
    };
    static const Range general[] = {
        {"CMYK_C", 0, 100},        {"CMYK_M", 0, 100},  {"CMYK_Y", 0, 100}, {"CMYK_K", 0, 100},
        {"ORANGE", 0, 100},        {"GREEN", 0, 100},   {"VIOLET", 0, 100}, {"RGB_R", 0, 255},
        {"RGB_G", 0, 255},         {"RGB_B", 0, 255},   {"LAB_L", 0, 100},  {"LAB_A", -200, 200},
        {"LAB_B", -200, 200},      {"XYZ_X", 0, 200},   {"XYZ_Y", 0, 200},  {"XYZ_Z", 0, 200},
        {"D_RED", -1, 10},         {"D_GREEN", -1, 10}, {"D_BLUE", -1, 10}, {"D_VIS", -1, 10},
        {"D_MAJOR_FILTER", -1, 10}};
    if (IsSpectralField(field)) {
        low = -1;
        high = 200;
        return true;
    }
    if (!IsGeneralField(field)) {
        low = 0;
        high = 100;
        return true;
    }
    for (const auto& range : general) {
        if (field == range.field) {
            low = range.low;
            high = range.high;
            return true;
        }
    }
    return false;
}

std::vector<ValueFinding> CheckValues(const Chart& chart) {
    std::vector<ValueFinding> findings;
    const LoadedTable& table = chart.Loaded();
    const TableText& text = table.Text();
    const std::size_t columnCount = text.fields.size();
    for (std::size_t row = 0; row < text.rowLines.size() && row < chart.Patches().size(); ++row) {
        const std::string_view line = table.Lines().Line(text.rowLines[row]);
        const auto tokens = SplitTokens(line);
        const CColorPatch& patch = chart.Patches()[row];
        const auto place = [&](std::size_t column, const std::string& field,
                               std::string_view cell) {
            ValueFinding finding;
            finding.line = table.FileLine(text.rowLines[row]);
            finding.column =
                static_cast<int>(DisplayWidth(line.substr(0, tokens[column].offset))) + 1;
            finding.sample = static_cast<int>(row) + 1;
            finding.field = field;
            finding.text = std::string(cell);
            return finding;
        };
        for (std::size_t column = 0; column < tokens.size() && column < columnCount; ++column) {
            const std::string& field = text.fields[column];
            const std::string_view cell = tokens[column].text;
            if (cell.size() > 1 && cell.front() == '"' && cell.back() != '"') {
                ValueFinding finding = place(column, field, cell);
                finding.problem = "quoted blank";
                finding.message = field + " of sample " + std::to_string(finding.sample) +
                                  " begins a double-quoted value that holds a blank; values are "
                                  "separated at blanks even inside double quotes, so the values "
                                  "after it stand in the wrong fields";
                findings.push_back(finding);
                break;
            }
            const std::string who = field + " of sample " + std::to_string(row + 1);
            if (field == "REFERENCE_SAMPLE_ID") {
                const std::size_t digits = cell.find_first_not_of("+-0123456789");
                if (digits != std::string_view::npos || NumberPrefix(cell) == 0) {
                    ValueFinding finding = place(column, field, cell);
                    finding.problem = NumberPrefix(cell) == 0 ? "text" : "malformed";
                    finding.message = who + " is " + Quoted(cell) +
                                      ", not a whole number; it reads as the digits it begins with";
                    findings.push_back(finding);
                }
                continue;
            }
            double low = 0;
            double high = 0;
            if (!NumericFieldRange(field, low, high)) {
                continue;
            }
            const std::optional<double> value = LibraryValue(chart, patch, field);
            ValueFinding finding = place(column, field, cell);
            if (IsNonFiniteWord(cell) || (value && !std::isfinite(*value))) {
                finding.problem = "not finite";
                finding.message =
                    who + " is " + Quoted(cell) + ", not a finite number" + Reads(value);
            } else if (const std::size_t prefix = NumberPrefix(cell); prefix == 0) {
                finding.problem = "text";
                finding.message = who + " holds the text " + Quoted(cell) + Reads(value);
            } else if (prefix < cell.size()) {
                finding.problem = "malformed";
                finding.message =
                    who + " is " + Quoted(cell) + ", not a well-formed number" + Reads(value);
            } else if (value && (*value < low || *value > high)) {
                finding.problem = "out of range";
                finding.message = who + " is " + RepairUtf8(cell) + ", outside " +
                                  FormatShortest(low) + " to " + FormatShortest(high);
            } else {
                continue;
            }
            findings.push_back(finding);
        }
    }
    return findings;
}

} // namespace swatchlog
