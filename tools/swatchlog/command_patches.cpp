// swatchlog patches: one row per patch with the chosen colour spaces.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "json_writer.h"
#include "patch_values.h"
#include "text_table.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kPatchesHelp =
    "Usage: swatchlog patches CHART [--spaces LIST] [--format table|tsv|csv|json]\n"
    "                        [--table N]\n\n"
    "Prints one row per patch: the sample number (its row in the file), the\n"
    "file's SAMPLE_ID when it has one and the name first, then the values\n"
    "of the chosen colour spaces. LIST is a comma-separated choice of\n"
    "  cmyk, rgb, ncolor, html, cmykogv, xyz, lab, density, spectral\n"
    "(default: every space the chart carries except spectral). Values the library\n"
    "derived rather than read from the file are marked: '*' in the table header,\n"
    "\" (derived)\" after the field name in TSV and CSV, and \"derived\": true in JSON.\n"
    "  --table N   the table of a file that holds several (default: the first\n"
    "              with data rows)\n";

namespace {

struct Selection {
    Space space;
    std::vector<std::string> fields;
    bool derived;
};

std::vector<Selection> Select(const Chart& chart, const ParsedArguments& parsed) {
    std::vector<Space> spaces;
    if (parsed.Has("spaces")) {
        for (const auto& key : SplitList(parsed.Value("spaces"))) {
            Space space;
            if (!SpaceFromKey(key, space)) {
                throw UsageError("unknown colour space \"" + RepairUtf8(key) + "\" in --spaces");
            }
            if (!chart.Has(space)) {
                throw ChartError(chart.Name() + ": the chart carries no " + NameOf(space).title);
            }
            spaces.push_back(space);
        }
        if (spaces.empty()) {
            throw UsageError("--spaces names no colour space");
        }
    } else {
        for (const auto& name : AllSpaces()) {
            if (name.space != Space::Spectral && chart.Has(name.space)) {
                spaces.push_back(name.space);
            }
        }
    }
    std::vector<Selection> selection;
    for (const Space space : spaces) {
        selection.push_back({space, SpaceFields(chart, space), chart.Derived(space)});
    }
    return selection;
}

void PrintTable(const Chart& chart, const std::vector<Selection>& selection, TableFormat format,
                std::ostream& out) {
    TextTable table;
    table.AddColumn("SAMPLE", true);
    if (chart.HasSampleIds()) {
        table.AddColumn("SAMPLE_ID", false);
    }
    table.AddColumn("NAME", false);
    std::vector<std::string> derivedTitles;
    for (const auto& selected : selection) {
        const std::string mark = !selected.derived              ? ""
                                 : format == TableFormat::Table ? "*"
                                                                : " (derived)";
        for (const auto& field : selected.fields) {
            table.AddColumn(RepairUtf8(field) + mark, selected.space != Space::Html);
        }
        if (selected.derived) {
            derivedTitles.push_back(NameOf(selected.space).title);
        }
    }
    int sample = 1;
    for (const auto& patch : chart.Patches()) {
        std::vector<std::string> row{std::to_string(sample)};
        if (chart.HasSampleIds()) {
            row.push_back(RepairUtf8(chart.SampleId(static_cast<std::size_t>(sample - 1))));
        }
        row.push_back(RepairUtf8(DisplayName(patch)));
        ++sample;
        for (const auto& selected : selection) {
            for (auto& cell : SpaceCells(patch, selected.space, selected.fields.size())) {
                row.push_back(std::move(cell));
            }
        }
        table.AddRow(std::move(row));
    }
    table.Print(out, format);
    if (format == TableFormat::Table && !derivedTitles.empty()) {
        std::string list;
        for (const auto& title : derivedTitles) {
            list += (list.empty() ? "" : ", ") + title;
        }
        out << "* derived by the library, not read from the file: " << list << "\n";
    }
}

void PrintJson(const Chart& chart, const std::vector<Selection>& selection, std::ostream& out) {
    JsonWriter json(out);
    json.BeginObject();
    json.Key("file");
    json.String(chart.Path());
    json.Key("patch_count");
    json.Integer(static_cast<long long>(chart.Patches().size()));
    json.Key("spaces");
    json.BeginArray();
    for (const auto& selected : selection) {
        json.BeginObject();
        json.Key("name");
        json.String(NameOf(selected.space).key);
        json.Key("fields");
        json.BeginArray(true);
        for (const auto& field : selected.fields) {
            json.String(field);
        }
        json.EndArray();
        json.Key("derived");
        json.Bool(selected.derived);
        json.EndObject();
    }
    json.EndArray();
    json.Key("patches");
    json.BeginArray();
    int sample = 1;
    for (const auto& patch : chart.Patches()) {
        json.BeginObject();
        json.Key("sample");
        json.Integer(sample);
        json.Key("sample_id");
        if (chart.HasSampleIds()) {
            json.String(chart.SampleId(static_cast<std::size_t>(sample - 1)));
        } else {
            json.Null();
        }
        ++sample;
        json.Key("name");
        json.String(DisplayName(patch));
        for (const auto& selected : selection) {
            json.Key(NameOf(selected.space).key);
            if (!Chart::PatchHas(patch, selected.space)) {
                json.Null();
            } else if (selected.space == Space::Html) {
                json.String(HtmlText(patch));
            } else {
                json.BeginArray(true);
                for (const double value :
                     SpaceNumbers(patch, selected.space, selected.fields.size())) {
                    json.Number(value);
                }
                json.EndArray();
            }
        }
        json.EndObject();
    }
    json.EndArray();
    json.EndObject();
    json.Finish();
}

} // namespace

int RunPatches(const Words& args, std::ostream& out, std::ostream& /*err*/) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"spaces", '\0', true}, {"format", '\0', true}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const OutputFormat format = ParseFormat(parsed, {"table", "tsv", "csv", "json"});
    const Chart chart = Chart::Load(parsed.positionals[0], TableOption(parsed));
    const std::vector<Selection> selection = Select(chart, parsed);
    if (format.json) {
        PrintJson(chart, selection, out);
    } else {
        PrintTable(chart, selection, format.table, out);
    }
    return kExitSuccess;
}

} // namespace swatchlog
