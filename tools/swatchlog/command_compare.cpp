// swatchlog compare: colour differences between a reference and a measured chart.
#include <algorithm>

#include "chart_model.h"
#include "color_difference.h"
#include "command_support.h"
#include "commands.h"
#include "json_writer.h"
#include "measurement_conditions.h"
#include "number_format.h"
#include "patch_pairing.h"
#include "patch_values.h"
#include "statistics.h"
#include "text_table.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kCompareHelp =
    "Usage: swatchlog compare REFERENCE MEASURED [--by auto|id|name|position]\n"
    "                         [--allow-unpaired] [--force]\n"
    "                         [--format table|tsv|csv|json]\n"
    "                         [--reference-table N] [--measured-table N]\n\n"
    "Compares the L*a*b* of the patches of MEASURED with those of REFERENCE (derived\n"
    "from XYZ or spectra where a chart has no L*a*b*). Prints the mean, the 95th\n"
    "percentile (linear between the closest ranks) and the maximum of dE*ab (CIE\n"
    "1976) and CIEDE2000, then every pair, the worst CIEDE2000 first.\n\n"
    "  --by RULE         how patches are paired. auto (default): by SAMPLE_ID when\n"
    "                    both files carry it, else by sample name when both name\n"
    "                    every patch once, else by position, saying which; id, name\n"
    "                    or position (also called sample): by that rule alone\n"
    "  --allow-unpaired  compare the pairs found although patches are left without\n"
    "                    a partner or without L*a*b*; without it that is an error\n"
    "  --force           compare although the headers state different illuminants,\n"
    "                    observers, measurement conditions (M0 to M3) or filters\n"
    "                    (ILLUMINANT, OBSERVER, MEASUREMENT_CONDITION,\n"
    "                    WEIGHTING_FUNCTION, MEASUREMENT_SOURCE)\n"
    "  --format F        table (default); tsv or csv: one line per pair; json\n"
    "  --reference-table N, --measured-table N\n"
    "                    the table of a file that holds several (default: the\n"
    "                    first with data rows)\n";

namespace {

struct Pair {
    std::size_t reference = 0; ///< patch indexes, 0-based
    std::size_t measured = 0;
    std::string referenceId;
    std::string measuredId;
    std::string name;
    LabColor referenceLab;
    LabColor measuredLab;
    double de76 = 0.0;
    double de2000 = 0.0;
};

struct Comparison {
    Pairing pairing;
    std::vector<Pair> pairs; ///< worst CIEDE2000 first
    std::vector<std::size_t> referenceWithoutLab;
    std::vector<std::size_t> measuredWithoutLab;
    bool showIds = false;
};

LabColor LabOf(const CColorPatch& patch) {
    const tagLAB lab = patch.GetLAB();
    return {lab.l, lab.a, lab.b};
}

void RequireLab(const Chart& chart) {
    if (!chart.Has(Space::Lab)) {
        throw ChartError(chart.Name() +
                         ": the chart carries no L*a*b* (nor XYZ or spectra to derive it from)");
    }
}

Comparison Compare(const Chart& reference, const Chart& measured, PairBy by) {
    Comparison result;
    result.pairing = PairPatches(reference, measured, by);
    result.showIds = reference.HasSampleIds() || measured.HasSampleIds();
    const auto& refPatches = reference.Patches();
    const auto& measPatches = measured.Patches();
    for (const PatchPair& match : result.pairing.pairs) {
        const CColorPatch& ref = refPatches[match.first];
        const CColorPatch& meas = measPatches[match.second];
        if (!ref.IsLABPresent() || !meas.IsLABPresent()) {
            if (!ref.IsLABPresent()) {
                result.referenceWithoutLab.push_back(match.first);
            }
            if (!meas.IsLABPresent()) {
                result.measuredWithoutLab.push_back(match.second);
            }
            continue;
        }
        Pair pair;
        pair.reference = match.first;
        pair.measured = match.second;
        pair.referenceId = reference.SampleId(match.first);
        pair.measuredId = measured.SampleId(match.second);
        pair.name = DisplayName(ref);
        pair.referenceLab = LabOf(ref);
        pair.measuredLab = LabOf(meas);
        pair.de76 = DeltaE76(pair.referenceLab, pair.measuredLab);
        pair.de2000 = DeltaE2000(pair.referenceLab, pair.measuredLab);
        result.pairs.push_back(pair);
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

std::string WithoutLabText(const Chart& reference, const Chart& measured,
                           const Comparison& comparison) {
    std::string text;
    if (!comparison.referenceWithoutLab.empty()) {
        text += reference.Name() + " " + SamplesText(comparison.referenceWithoutLab);
    }
    if (!comparison.measuredWithoutLab.empty()) {
        text += std::string(text.empty() ? "" : " and ") + measured.Name() + " " +
                SamplesText(comparison.measuredWithoutLab);
    }
    return text;
}

std::string PairingText(const Comparison& comparison) {
    std::string text = std::to_string(comparison.pairs.size()) + " patches by " +
                       PairByText(comparison.pairing.by);
    if (!comparison.pairing.fallback.empty()) {
        text += " (" + RepairUtf8(comparison.pairing.fallback) + ")";
    }
    return text;
}

std::string SampleCell(const Pair& pair) {
    std::string sample = std::to_string(pair.reference + 1);
    if (pair.measured != pair.reference) {
        sample += "/" + std::to_string(pair.measured + 1);
    }
    return sample;
}

std::string IdCell(const Pair& pair) {
    if (pair.referenceId == pair.measuredId || pair.measuredId.empty()) {
        return RepairUtf8(pair.referenceId);
    }
    return RepairUtf8(pair.referenceId + "/" + pair.measuredId);
}

void PrintTable(const Chart& reference, const Chart& measured, const Comparison& comparison,
                std::ostream& out) {
    out << "reference  " << RepairUtf8(reference.Name()) << "\n";
    out << "measured   " << RepairUtf8(measured.Name()) << "\n";
    out << "paired     " << PairingText(comparison) << "\n";
    const std::string unpaired = UnpairedText(reference, measured, comparison.pairing);
    if (!unpaired.empty()) {
        out << "unpaired   " << RepairUtf8(unpaired) << "\n";
    }
    const std::string withoutLab = WithoutLabText(reference, measured, comparison);
    if (!withoutLab.empty()) {
        out << "no L*a*b*  " << RepairUtf8(withoutLab) << "\n";
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
    table.AddColumn("SAMPLE", true);
    if (comparison.showIds) {
        table.AddColumn("SAMPLE_ID", false);
    }
    for (const char* header :
         {"NAME", "REF_L", "REF_A", "REF_B", "MEAS_L", "MEAS_A", "MEAS_B", "DE_AB", "DE2000"}) {
        table.AddColumn(header, std::string(header) != "NAME");
    }
    for (const auto& pair : comparison.pairs) {
        std::vector<std::string> row{SampleCell(pair)};
        if (comparison.showIds) {
            row.push_back(IdCell(pair));
        }
        for (const std::string& cell :
             {RepairUtf8(pair.name), FormatFixed(pair.referenceLab.l, 2),
              FormatFixed(pair.referenceLab.a, 2), FormatFixed(pair.referenceLab.b, 2),
              FormatFixed(pair.measuredLab.l, 2), FormatFixed(pair.measuredLab.a, 2),
              FormatFixed(pair.measuredLab.b, 2), FormatFixed(pair.de76, 2),
              FormatFixed(pair.de2000, 2)}) {
            row.push_back(cell);
        }
        table.AddRow(std::move(row));
    }
    table.Print(out, TableFormat::Table);
}

// One line per pair with full precision, for spreadsheets and scripts.
void PrintSeparated(const Comparison& comparison, TableFormat format, std::ostream& out) {
    TextTable table;
    for (const char* header :
         {"REF_SAMPLE", "MEAS_SAMPLE", "REF_SAMPLE_ID", "MEAS_SAMPLE_ID", "NAME", "REF_L", "REF_A",
          "REF_B", "MEAS_L", "MEAS_A", "MEAS_B", "DE_AB", "DE2000"}) {
        table.AddColumn(header, false);
    }
    for (const auto& pair : comparison.pairs) {
        table.AddRow({std::to_string(pair.reference + 1), std::to_string(pair.measured + 1),
                      RepairUtf8(pair.referenceId), RepairUtf8(pair.measuredId),
                      RepairUtf8(pair.name), FormatShortest(pair.referenceLab.l),
                      FormatShortest(pair.referenceLab.a), FormatShortest(pair.referenceLab.b),
                      FormatShortest(pair.measuredLab.l), FormatShortest(pair.measuredLab.a),
                      FormatShortest(pair.measuredLab.b), FormatFixed(pair.de76, 4),
                      FormatFixed(pair.de2000, 4)});
    }
    table.Print(out, format);
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

void JsonSamples(JsonWriter& json, const char* key, const std::vector<std::size_t>& indexes) {
    json.Key(key);
    json.BeginArray(true);
    for (const std::size_t index : indexes) {
        json.Integer(static_cast<long long>(index + 1));
    }
    json.EndArray();
}

void JsonId(JsonWriter& json, const char* key, const Chart& chart, const std::string& id) {
    json.Key(key);
    if (chart.HasSampleIds()) {
        json.String(id);
    } else {
        json.Null();
    }
}

void PrintJson(const Chart& reference, const Chart& measured, const Comparison& comparison,
               std::ostream& out) {
    JsonWriter json(out);
    json.BeginObject();
    json.Key("reference");
    json.String(reference.Name());
    json.Key("measured");
    json.String(measured.Name());
    json.Key("paired_by");
    json.String(PairByKey(comparison.pairing.by));
    json.Key("pairing_note");
    json.String(comparison.pairing.fallback);
    json.Key("paired");
    json.Integer(static_cast<long long>(comparison.pairs.size()));
    JsonSamples(json, "unpaired_reference", comparison.pairing.unpairedFirst);
    JsonSamples(json, "unpaired_measured", comparison.pairing.unpairedSecond);
    JsonSamples(json, "reference_without_lab", comparison.referenceWithoutLab);
    JsonSamples(json, "measured_without_lab", comparison.measuredWithoutLab);
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
        json.Integer(static_cast<long long>(pair.reference + 1));
        json.Key("measured_sample");
        json.Integer(static_cast<long long>(pair.measured + 1));
        JsonId(json, "reference_id", reference, pair.referenceId);
        JsonId(json, "measured_id", measured, pair.measuredId);
        json.Key("name");
        json.String(pair.name);
        JsonLab(json, "reference_lab", pair.referenceLab);
        JsonLab(json, "measured_lab", pair.measuredLab);
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

// Differing measurement conditions stop the comparison unless forced; one-sided
// statements are noted.
void CheckConditions(const Chart& reference, const Chart& measured, bool force, std::ostream& err) {
    const ConditionCheck check = CompareConditions(reference, measured);
    if (!check.conflicts.empty() && !force) {
        std::string text;
        for (const auto& conflict : check.conflicts) {
            text += (text.empty() ? "" : "; ") + conflict;
        }
        throw ChartError(text + ". The colour differences would mix the prints' differences "
                                "with those of the conditions; --force compares anyway");
    }
    for (const auto& conflict : check.conflicts) {
        err << "swatchlog compare: warning: " << conflict << "\n";
    }
    for (const auto& note : check.oneSided) {
        err << "swatchlog compare: note: " << note << "\n";
    }
}

} // namespace

int RunCompare(const Words& args, std::ostream& out, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(args, {{"by", '\0', true},
                                                         {"format", '\0', true},
                                                         {"allow-unpaired", '\0', false},
                                                         {"force", '\0', false},
                                                         {"reference-table", '\0', true},
                                                         {"measured-table", '\0', true}});
    RequirePositionals(parsed, 2, 2, "the reference and the measured chart files");
    const PairBy by = ParsePairBy(parsed.Value("by", "auto"));
    const OutputFormat format = ParseFormat(parsed, {"table", "tsv", "csv", "json"});
    const Chart reference =
        Chart::Load(parsed.positionals[0], TableOption(parsed, "reference-table"));
    const Chart measured =
        Chart::Load(parsed.positionals[1], TableOption(parsed, "measured-table"));
    RequireLab(reference);
    RequireLab(measured);
    CheckConditions(reference, measured, parsed.Has("force"), err);
    const Comparison comparison = Compare(reference, measured, by);
    if (comparison.pairs.empty()) {
        throw ChartError("no patch of " + measured.Name() + " pairs with one of " +
                         reference.Name() + " by " + PairByText(comparison.pairing.by));
    }
    const std::string unpaired = UnpairedText(reference, measured, comparison.pairing);
    const std::string withoutLab = WithoutLabText(reference, measured, comparison);
    if ((!unpaired.empty() || !withoutLab.empty()) && !parsed.Has("allow-unpaired")) {
        std::string text;
        if (!unpaired.empty()) {
            text = unpaired +
                   (comparison.pairing.unpairedFirst.size() +
                                comparison.pairing.unpairedSecond.size() ==
                            1
                        ? " has"
                        : " have") +
                   " no partner by " + PairByText(comparison.pairing.by);
            if (!comparison.pairing.fallback.empty()) {
                text += " (" + comparison.pairing.fallback + ")";
            }
        }
        if (!withoutLab.empty()) {
            text += std::string(text.empty() ? "" : "; ") + "no L*a*b* for " + withoutLab;
        }
        throw ChartError(text + "; --allow-unpaired compares the " +
                         std::to_string(comparison.pairs.size()) + " pairs anyway");
    }
    if (format.json) {
        PrintJson(reference, measured, comparison, out);
    } else if (format.table != TableFormat::Table) {
        PrintSeparated(comparison, format.table, out);
    } else {
        PrintTable(reference, measured, comparison, out);
    }
    return kExitSuccess;
}

} // namespace swatchlog
