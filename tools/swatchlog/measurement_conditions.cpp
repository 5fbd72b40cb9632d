#include "measurement_conditions.h"

#include "chart_lines.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

std::string Squeezed(const std::string& text) {
    std::string result;
    for (const char c : UpperAscii(Unquoted(text))) {
        if (c != ' ' && c != '\t' && c != '"') {
            result += c;
        }
    }
    return result;
}

// "2", "2 degree", "2_DEGREE", "CIE 1931" give 2°; "10", "CIE 1964" give 10°.
std::string Observer(const std::string& text) {
    const std::string squeezed = Squeezed(text);
    if (squeezed.find("1964") != std::string::npos || squeezed.rfind("10", 0) == 0) {
        return "10°";
    }
    if (squeezed.find("1931") != std::string::npos || squeezed.rfind("2", 0) == 0) {
        return "2°";
    }
    return squeezed;
}

void State(StatedCondition& condition, std::string value, const std::string& source) {
    if (!value.empty()) {
        condition.value = std::move(value);
        condition.source = source;
    }
}

// MEASUREMENT_SOURCE "Illumination=D50 ObserverAngle=2 WhiteBase=Abs Filter=No".
void ReadSourcePairs(const std::string& value, const std::string& source,
                     MeasurementConditions& conditions) {
    std::string text = Unquoted(value);
    for (char& c : text) {
        if (c == ';' || c == ',') {
            c = ' ';
        }
    }
    for (const auto& word : SplitWords(text)) {
        const std::size_t equals = word.find('=');
        if (equals == std::string::npos) {
            continue;
        }
        const std::string key = UpperAscii(word.substr(0, equals));
        const std::string item = word.substr(equals + 1);
        if (key == "ILLUMINATION" || key == "ILLUMINANT") {
            State(conditions.illuminant, Squeezed(item), source);
        } else if (key == "OBSERVERANGLE" || key == "OBSERVER") {
            State(conditions.observer, Observer(item), source);
        } else if (key == "FILTER") {
            State(conditions.filter, Squeezed(item), source);
        }
    }
}

std::string Describe(const StatedCondition& condition, const Chart& chart) {
    return condition.value + " in " + chart.Name() + " (" + condition.source + ")";
}

} // namespace

MeasurementConditions ReadConditions(const Chart& chart) {
    MeasurementConditions conditions;
    const LoadedTable& table = chart.Loaded();
    for (const auto& line : table.Text().header) {
        const std::string source =
            line.key + " on line " + std::to_string(table.FileLine(line.index));
        if (line.key == "ILLUMINANT") {
            State(conditions.illuminant, Squeezed(line.value), source);
        } else if (line.key == "OBSERVER") {
            State(conditions.observer, Observer(line.value), source);
        } else if (line.key == "MEASUREMENT_CONDITION") {
            State(conditions.mode, Squeezed(line.value), source);
        } else if (line.key == "WEIGHTING_FUNCTION") {
            // "ILLUMINANT, D50" or "OBSERVER, 2 degree"
            const std::string value = Unquoted(line.value);
            const std::size_t comma = value.find(',');
            if (comma != std::string::npos) {
                const std::string what = Squeezed(value.substr(0, comma));
                const std::string item = value.substr(comma + 1);
                if (what == "ILLUMINANT") {
                    State(conditions.illuminant, Squeezed(item), source);
                } else if (what == "OBSERVER") {
                    State(conditions.observer, Observer(item), source);
                }
            }
        } else if (line.key == "MEASUREMENT_SOURCE") {
            ReadSourcePairs(line.value, source, conditions);
        }
    }
    return conditions;
}

ConditionCheck CompareConditions(const Chart& first, const Chart& second) {
    const MeasurementConditions a = ReadConditions(first);
    const MeasurementConditions b = ReadConditions(second);
    ConditionCheck check;
    const struct {
        const char* what;
        const StatedCondition& first;
        const StatedCondition& second;
    } items[] = {{"illuminant", a.illuminant, b.illuminant},
                 {"observer", a.observer, b.observer},
                 {"measurement condition", a.mode, b.mode},
                 {"filter", a.filter, b.filter}};
    for (const auto& item : items) {
        if (!item.first.value.empty() && !item.second.value.empty()) {
            if (item.first.value != item.second.value) {
                check.conflicts.push_back(RepairUtf8(std::string("the ") + item.what +
                                                     " differs: " + Describe(item.first, first) +
                                                     " but " + Describe(item.second, second)));
            }
        } else if (!item.first.value.empty() || !item.second.value.empty()) {
            const bool inFirst = !item.first.value.empty();
            const StatedCondition& stated = inFirst ? item.first : item.second;
            check.oneSided.push_back(RepairUtf8(
                std::string("only ") + (inFirst ? first.Name() : second.Name()) +
                (std::string("aeiou").find(item.what[0]) != std::string::npos ? " states an "
                                                                              : " states a ") +
                item.what + ": " + stated.value + " (" + stated.source + ")"));
        }
    }
    return check;
}

} // namespace swatchlog
