// swatchlog compare: colour differences between a reference and a measured chart.
#include <algorithm>
#include <map>

#include "chart_model.h"
#include "color_difference.h"
#include "command_support.h"
#include "commands.h"
#include "json_writer.h"
#include "number_format.h"
#include "patch_values.h"
#include "statistics.h"
#include "text_table.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kCompareHelp =
    "Usage: swatchlog compare REFERENCE MEASURED [--by sample|name] [--format table|json]\n\n"
    "Compares the L*a*b* of the patches of MEASURED with those of REFERENCE (derived\n"
    "from XYZ or spectra where a chart has no L*a*b*). Patches are paired by sample\n"
    "number (default) or by sample name. Prints the mean, the 95th percentile\n"
    "(linear between the closest ranks) and the maximum of dE*ab (CIE 1976) and\n"
    "CIEDE2000, then every pair, the worst CIEDE2000 first.\n";

namespace {

struct Pair {
    int referenceSample = 0;
    int measuredSample = 0;
    std::string name;
    LabColor reference;
    LabColor measured;
    double de76 = 0.0;
    double de2000 = 0.0;
};

struct Comparison {
    std::vector<Pair> pairs;
    std::vector<int> unmatchedReference;
    std::vector<int> unmatchedMeasured;
};

LabColor LabOf(const CColorPatch& patch) {
    const tagLAB lab = patch.GetLAB();
    return {lab.l, lab.a, lab.b};
}

void RequireLab(const Chart& chart) {
    if (!chart.Has(Space::Lab)) {
        throw ChartError(RepairUtf8(chart.Path()) +
                         ": the chart carries no L*a*b* (nor XYZ or spectra to derive it from)");
    }
}

Comparison Pairs(const Chart& reference, const Chart& measured, bool byName) {
    Comparison result;
    const auto& refPatches = reference.Patches();
    const auto& measPatches = measured.Patches();
    std::vector<bool> measuredUsed(measPatches.size(), false);
    std::map<std::string, std::size_t> measuredByName;
    for (std::size_t i = measPatches.size(); i-- > 0;) {
        measuredByName[DisplayName(measPatches[i])] = i; // the first of equal names wins
    }
    for (std::size_t r = 0; r < refPatches.size(); ++r) {
        std::size_t m = r;
        if (byName) {
            const auto found = measuredByName.find(DisplayName(refPatches[r]));
            m = found == measuredByName.end() ? measPatches.size() : found->second;
        }
        if (m >= measPatches.size() || measuredUsed[m] || !refPatches[r].IsLABPresent() ||
            !measPatches[m].IsLABPresent()) {
            result.unmatchedReference.push_back(static_cast<int>(r + 1));
            continue;
        }
        measuredUsed[m] = true;
        Pair pair;
        pair.referenceSample = static_cast<int>(r + 1);
        pair.measuredSample = static_cast<int>(m + 1);
        pair.name = DisplayName(refPatches[r]);
        pair.reference = LabOf(refPatches[r]);
        pair.measured = LabOf(measPatches[m]);
        pair.de76 = DeltaE76(pair.reference, pair.measured);
        pair.de2000 = DeltaE2000(pair.reference, pair.measured);
        result.pairs.push_back(pair);
    }
    for (std::size_t m = 0; m < measPatches.size(); ++m) {
        if (!measuredUsed[m]) {
            result.unmatchedMeasured.push_back(static_cast<int>(m + 1));
        }
    }
    std::stable_sort(result.pairs.begin(), result.pairs.end(),
                     [](const Pair& a, const Pair& b) { return a.de2000 > b.de2000; });
    return result;
}

std::vector<double> Differences(const Comparison& comparison, bool de2000) {
    std::vector<double> values;
    for (const auto& pair : comparison.pairs) {
        values.push_back(de2000 ? pair.de2000 : pair.de76);
    }
    return values;
}

std::string SampleList(const std::vector<int>& samples) {
    std::string text;
    for (const int sample : samples) {
        text += (text.empty() ? "" : ", ") + std::to_string(sample);
    }
    return text;
}

void PrintTable(const Chart& reference, const Chart& measured, const Comparison& comparison,
                bool byName, std::ostream& out) {
    out << "reference  " << RepairUtf8(reference.Path()) << "\n";
    out << "measured   " << RepairUtf8(measured.Path()) << "\n";
    out << "paired     " << comparison.pairs.size() << " patches by "
        << (byName ? "sample name" : "sample number") << "\n";
    if (!comparison.unmatchedReference.empty()) {
        out << "unpaired   reference samples " << SampleList(comparison.unmatchedReference) << "\n";
    }
    if (!comparison.unmatchedMeasured.empty()) {
        out << "unpaired   measured samples " << SampleList(comparison.unmatchedMeasured) << "\n";
    }
    out << "\n";
    TextTable summary;
    summary.AddColumn("", false);
    summary.AddColumn("mean", true);
    summary.AddColumn("p95", true);
    summary.AddColumn("max", true);
    for (const bool de2000 : {false, true}) {
        const Summary s = Summarise(Differences(comparison, de2000));
        summary.AddRow({de2000 ? "CIEDE2000" : "dE*ab", FormatFixed(s.mean, 2),
                        FormatFixed(s.p95, 2), FormatFixed(s.max, 2)});
    }
    summary.Print(out, TableFormat::Table);
    out << "\n";
    TextTable table;
    for (const char* header : {"SAMPLE", "NAME", "REF_L", "REF_A", "REF_B", "MEAS_L", "MEAS_A",
                               "MEAS_B", "DE_AB", "DE2000"}) {
        table.AddColumn(header, std::string(header) != "NAME");
    }
    for (const auto& pair : comparison.pairs) {
        std::string sample = std::to_string(pair.referenceSample);
        if (pair.measuredSample != pair.referenceSample) {
            sample += "/" + std::to_string(pair.measuredSample);
        }
        table.AddRow({sample, RepairUtf8(pair.name), FormatFixed(pair.reference.l, 2),
                      FormatFixed(pair.reference.a, 2), FormatFixed(pair.reference.b, 2),
                      FormatFixed(pair.measured.l, 2), FormatFixed(pair.measured.a, 2),
                      FormatFixed(pair.measured.b, 2), FormatFixed(pair.de76, 2),
                      FormatFixed(pair.de2000, 2)});
    }
    table.Print(out, TableFormat::Table);
}

void JsonSummary(JsonWriter& json, const char* key, const Summary& s) {
    json.Key(key);
    json.BeginObject();
    json.Key("mean");
    json.Number(s.mean, 4);
    json.Key("p95");
    json.Number(s.p95, 4);
    json.Key("max");
    json.Number(s.max, 4);
    json.EndObject();
}

void JsonLab(JsonWriter& json, const char* key, const LabColor& lab) {
    json.Key(key);
    json.BeginArray(true);
    json.Number(lab.l);
    json.Number(lab.a);
    json.Number(lab.b);
    json.EndArray();
}

void PrintJson(const Chart& reference, const Chart& measured, const Comparison& comparison,
               bool byName, std::ostream& out) {
    JsonWriter json(out);
    json.BeginObject();
    json.Key("reference");
    json.String(reference.Path());
    json.Key("measured");
    json.String(measured.Path());
    json.Key("paired_by");
    json.String(byName ? "name" : "sample");
    json.Key("paired");
    json.Integer(static_cast<long long>(comparison.pairs.size()));
    for (const bool ofReference : {true, false}) {
        json.Key(ofReference ? "unpaired_reference" : "unpaired_measured");
        json.BeginArray(true);
        for (const int sample :
             ofReference ? comparison.unmatchedReference : comparison.unmatchedMeasured) {
            json.Integer(sample);
        }
        json.EndArray();
    }
    json.Key("summary");
    json.BeginObject();
    JsonSummary(json, "de76", Summarise(Differences(comparison, false)));
    JsonSummary(json, "de2000", Summarise(Differences(comparison, true)));
    json.EndObject();
    json.Key("patches");
    json.BeginArray();
    for (const auto& pair : comparison.pairs) {
        json.BeginObject();
        json.Key("reference_sample");
        json.Integer(pair.referenceSample);
        json.Key("measured_sample");
        json.Integer(pair.measuredSample);
        json.Key("name");
        json.String(pair.name);
        JsonLab(json, "reference_lab", pair.reference);
        JsonLab(json, "measured_lab", pair.measured);
        json.Key("de76");
        json.Number(pair.de76, 4);
        json.Key("de2000");
        json.Number(pair.de2000, 4);
        json.EndObject();
    }
    json.EndArray();
    json.EndObject();
    json.Finish();
}

} // namespace

int RunCompare(const Words& args, std::ostream& out, std::ostream& /*err*/) {
    const ParsedArguments parsed =
        ParseArguments(args, {{"by", '\0', true}, {"format", '\0', true}});
    RequirePositionals(parsed, 2, 2, "the reference and the measured chart files");
    const bool byName =
        RequireChoice("by", parsed.Value("by", "sample"), {"sample", "name"}) == "name";
    const OutputFormat format = ParseFormat(parsed, {"table", "json"});
    const Chart reference = Chart::Load(parsed.positionals[0]);
    const Chart measured = Chart::Load(parsed.positionals[1]);
    RequireLab(reference);
    RequireLab(measured);
    const Comparison comparison = Pairs(reference, measured, byName);
    if (comparison.pairs.empty()) {
        throw ChartError("no patch of " + RepairUtf8(measured.Path()) + " pairs with one of " +
                         RepairUtf8(reference.Path()) + (byName ? " by name" : ""));
    }
    if (format.json) {
        PrintJson(reference, measured, comparison, byName, out);
    } else {
        PrintTable(reference, measured, comparison, byName, out);
    }
    return kExitSuccess;
}

} // namespace swatchlog
