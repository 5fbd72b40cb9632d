// swatchlog convert: a clean CGATS file written from the chart by the library's
// new-file writer, with everything it changes or drops listed.
#include <algorithm>
#include <fstream>

#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "convert_report.h"
#include "file_paths.h"
#include "keyword_names.h"
#include "result_messages.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kConvertHelp =
    "Usage: swatchlog convert CHART -o OUT [--keep-ids] [--table N]\n\n"
    "Writes a clean CGATS.17 file: the chart's header keywords as the file has\n"
    "them (with KEYWORD declarations for the ones the format does not define),\n"
    "sample names, device values (CMYK, RGB, n-colour channels) and measurements\n"
    "(XYZ, L*a*b*, spectra). XYZ and L*a*b* derived from the spectra are written\n"
    "where the file had none.\n\n"
    "The new-file format writes CMYK, n-colour channels, XYZ and L*a*b* with 2\n"
    "decimals, spectra with 5, RGB as the whole numbers the chart holds, and the\n"
    "row numbers as SAMPLE_ID; it has no columns for densities, HTML colours,\n"
    "orange, green and violet or fields it does not know. Everything that OUT\n"
    "changes or drops is listed on standard error, with counts.\n\n"
    "  --keep-ids  write the file's own SAMPLE_ID values instead of row numbers\n"
    "  --table N   the table of a file that holds several (default: the first\n"
    "              with data rows)\n"
    "OUT is written whole or not at all and may not be CHART itself.\n";

namespace {

// Keywords that describe spectral fields; they go when no spectra are written.
bool AnnouncesSpectra(const std::string& key) {
    return key.rfind("SPECTRAL_", 0) == 0;
}

struct KeywordPlan {
    KeywordList lines;
    std::vector<ConvertChange> changes;
};

// The header lines of the chart as the file has them, values unchanged.
KeywordPlan PlanKeywords(const Chart& chart, bool spectraWritten) {
    KeywordPlan plan;
    const std::string& identification = chart.Identification();
    if (identification.empty()) {
        plan.changes.push_back({"added", "the identification line CGATS.17"});
    } else if (identification != "CGATS.17") {
        plan.changes.push_back({"changed", "the identification " + RepairUtf8(identification) +
                                               " is replaced by CGATS.17; programs that expect " +
                                               RepairUtf8(identification) + " may not read OUT"});
    }
    std::vector<const HeaderLine*> kept;
    std::vector<std::string> declared;
    std::size_t comments = 0;
    std::vector<std::string> droppedKeys;
    std::vector<std::string> spectral;
    bool skippedIdentification = identification.empty();
    for (const auto& line : chart.Loaded().Text().header) {
        const std::string& key = line.key;
        if (!skippedIdentification && key == identification && line.value.empty()) {
            skippedIdentification = true;
        } else if (key[0] == '#') {
            ++comments;
        } else if (key == "KEYWORD") {
            declared.push_back(Unquoted(line.value));
        } else if (key == "NUMBER_OF_FIELDS" || key == "NUMBER_OF_SETS") {
            // The writer puts its own counts.
        } else if (!IsValidKeywordName(key)) {
            droppedKeys.push_back(key);
        } else if (!spectraWritten && AnnouncesSpectra(key)) {
            spectral.push_back(key);
        } else {
            kept.push_back(&line);
        }
    }
    KeywordList keptLines;
    for (const HeaderLine* line : kept) {
        keptLines.emplace_back(line->key, line->value);
    }
    plan.lines = NewFileKeywordLines(std::move(keptLines));
    std::vector<std::string> announced;
    for (const auto& [key, value] : plan.lines) {
        if (key == "KEYWORD") {
            announced.push_back(Unquoted(value));
        }
    }
    const auto list = [](const std::vector<std::string>& items) {
        std::string text;
        for (const auto& item : items) {
            text += (text.empty() ? "" : ", ") + RepairUtf8(item);
        }
        return text;
    };
    if (comments > 0) {
        plan.changes.push_back(
            {"dropped",
             std::to_string(comments) + (comments == 1 ? " comment line" : " comment lines")});
    }
    if (!droppedKeys.empty()) {
        plan.changes.push_back(
            {"dropped", "header lines whose key is not a keyword name: " + list(droppedKeys)});
    }
    if (!spectral.empty()) {
        plan.changes.push_back({"dropped", "keywords that describe spectral fields, which are "
                                           "not written: " +
                                               list(spectral)});
    }
    std::vector<std::string> undeclared;
    for (const auto& name : declared) {
        if (std::find(announced.begin(), announced.end(), name) == announced.end()) {
            undeclared.push_back(name);
        }
    }
    if (!undeclared.empty()) {
        plan.changes.push_back(
            {"dropped", "KEYWORD declarations of names OUT does not use: " + list(undeclared)});
    }
    const auto& sections = chart.Loaded().Text().sections;
    if (!sections.empty()) {
        std::vector<std::string> names;
        for (const std::size_t index : sections) {
            names.push_back(SplitWords(chart.Loaded().Lines().Line(index))[0] + " on line " +
                            std::to_string(chart.Loaded().FileLine(index)));
        }
        plan.changes.push_back({"dropped", "sections: " + list(names)});
    }
    return plan;
}

template <typename Record, typename Get> std::vector<Record> Collect(const Chart& chart, Get get) {
    std::vector<Record> list;
    for (const auto& patch : chart.Patches()) {
        list.push_back(get(patch));
    }
    return list;
}

// A column of the new file has a value on every row, so a space some patches
// lack (a spectrum that gives no colour) cannot be written without making up
// numbers for them: it is left out and the patches are named.
bool Writable(const Chart& chart, Space space, std::vector<ConvertChange>& changes) {
    if (!chart.Has(space)) {
        return false;
    }
    std::vector<std::size_t> lacking;
    const auto& patches = chart.Patches();
    for (std::size_t i = 0; i < patches.size(); ++i) {
        if (!Chart::PatchHas(patches[i], space)) {
            lacking.push_back(i + 1);
        }
    }
    if (lacking.empty()) {
        return true;
    }
    std::string samples;
    for (std::size_t i = 0; i < lacking.size() && i < 10; ++i) {
        samples += (i == 0 ? "" : ", ") + std::to_string(lacking[i]);
    }
    if (lacking.size() > 10) {
        samples += " and " + std::to_string(lacking.size() - 10) + " more";
    }
    changes.push_back({"dropped", std::string(NameOf(space).title) + ": no value for " +
                                      std::to_string(lacking.size()) + " of " +
                                      std::to_string(patches.size()) + " patches (sample " +
                                      samples + "), and the new-file format has no empty cells"});
    return false;
}

void HandListsToStore(const Chart& chart, const KeywordList& keywords,
                      std::vector<ConvertChange>& changes) {
    CSwatchlogBase& store = chart.Store();
    const auto& patches = chart.Patches();
    store.SetKeywordList(keywords);
    const bool named = std::any_of(patches.begin(), patches.end(),
                                   [](const CColorPatch& p) { return !p.GetLabel().empty(); });
    if (named) {
        store.SetSampleNameList(
            Collect<std::string>(chart, [](const CColorPatch& p) { return p.GetLabel(); }));
    }
    if (Writable(chart, Space::Cmyk, changes)) {
        store.SetCMYKList(
            Collect<tagCMYK>(chart, [](const CColorPatch& p) { return p.GetCMYK(); }));
    }
    if (!chart.Derived(Space::Rgb) && Writable(chart, Space::Rgb, changes)) {
        store.SetRGBList(Collect<tagRGB>(chart, [](const CColorPatch& p) { return p.GetRGB(); }));
    }
    if (Writable(chart, Space::NColor, changes)) {
        store.SetNColorList(Collect<std::map<int, tagNCLR>>(
            chart, [](const CColorPatch& p) { return p.GetNColorMap(); }));
    }
    if (Writable(chart, Space::Spectral, changes)) {
        store.SetSpectralDataList(store.GetSpectralDataList(), false);
    }
    if (Writable(chart, Space::Xyz, changes)) {
        store.SetXYZList(Collect<tagXYZ>(chart, [](const CColorPatch& p) { return p.GetXYZ(); }));
    }
    if (Writable(chart, Space::Lab, changes)) {
        store.SetLABList(Collect<tagLAB>(chart, [](const CColorPatch& p) { return p.GetLAB(); }));
    }
}

std::string ReadText(const std::string& utf8Path) {
    std::string text;
    if (!ReadRegularFile(utf8Path, text)) {
        throw ChartError(RepairUtf8(utf8Path) + ": the file cannot be read");
    }
    return text;
}

// The new-file writer numbers the rows; put the file's own SAMPLE_ID back at
// the start of each data row.
void RestoreSampleIds(const Chart& chart, const std::string& utf8Path) {
    const ChartLines lines(ReadText(utf8Path));
    const TableText table = ReadTableText(lines, 0, lines.Count() - 1);
    const auto ids = chart.Loaded().ColumnText("SAMPLE_ID");
    const int column = FieldColumn(chart.Loaded().Text(), "SAMPLE_ID");
    if (ids.size() != table.rowLines.size() || column < 0) {
        throw ChartError(chart.Name() + ": the sample ids cannot be kept: the written file has " +
                         std::to_string(table.rowLines.size()) + " rows");
    }
    std::string text;
    std::size_t position = 0;
    for (std::size_t row = 0; row < table.rowLines.size(); ++row) {
        const std::size_t begin = lines.Begin(table.rowLines[row]);
        const auto first = SplitTokens(lines.Line(table.rowLines[row]));
        const auto source =
            SplitTokens(chart.Loaded().Lines().Line(chart.Loaded().Text().rowLines[row]));
        text += lines.Text().substr(position, begin + first[0].offset - position);
        text += std::string(source[static_cast<std::size_t>(column)].text);
        position = begin + first[0].offset + first[0].text.size();
    }
    text += lines.Text().substr(position);
    std::ofstream out(FileSystemPath(utf8Path), std::ios::binary | std::ios::trunc);
    out << text;
    out.close();
    if (!out) {
        throw ChartError(RepairUtf8(utf8Path) + ": cannot be written");
    }
}

void Report(const std::vector<ConvertChange>& changes, const std::string& output,
            std::ostream& err) {
    if (changes.empty()) {
        return;
    }
    err << "swatchlog convert: " << RepairUtf8(output)
        << " differs from the chart in these ways:\n";
    for (const auto& change : changes) {
        err << "  " << change.kind << ": " << change.text << "\n";
    }
}

} // namespace

int RunConvert(const Words& args, std::ostream& /*out*/, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"output", 'o', true}, {"keep-ids", '\0', false}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input, TableOption(parsed));
    const bool keepIds = parsed.Has("keep-ids") && chart.HasSampleIds();
    if (parsed.Has("keep-ids") && !keepIds) {
        err << "swatchlog convert: note: " << chart.Name()
            << " has no SAMPLE_ID; the row numbers are written\n";
    }
    KeywordPlan plan = PlanKeywords(chart, chart.Has(Space::Spectral));
    std::vector<ConvertChange> changes = plan.changes;
    HandListsToStore(chart, plan.lines, changes);

    LibraryPath(output);
    PendingOutput pending(output);
    int code = 0;
    try {
        code = chart.Store().WriteChartFile(L"", LibraryPath(pending.TemporaryPath()), false);
    } catch (const std::exception& error) {
        throw ChartError(RepairUtf8(output) + ": " + DescribeLibraryException(error));
    }
    if (code != 0) {
        throw DefaultFailureText(output, chart)(code);
    }
    if (keepIds) {
        RestoreSampleIds(chart, pending.TemporaryPath());
    }
    try {
        const Chart written = Chart::Load(pending.TemporaryPath());
        if (written.Patches().size() != chart.Patches().size()) {
            throw ChartError("it holds " + std::to_string(written.Patches().size()) + " patches");
        }
        for (auto& change : CompareConvertedData(chart, written, keepIds)) {
            changes.push_back(std::move(change));
        }
    } catch (const ChartError&) {
        std::string fields;
        for (const auto& field : chart.Loaded().Text().fields) {
            fields += (fields.empty() ? "" : ", ") + RepairUtf8(field);
        }
        throw ChartError(chart.Name() + ": the new-file format carries none of the chart's data (" +
                         fields +
                         "), so the converted file would hold no patches; nothing was "
                         "written");
    }
    const auto& tables = chart.Loaded().Tables();
    if (tables.size() > 1) {
        changes.push_back({"dropped", "the other " + std::to_string(tables.size() - 1) +
                                          (tables.size() == 2 ? " table" : " tables") + " of " +
                                          RepairUtf8(input) +
                                          " (OUT holds one; --table N picks it)"});
    }
    pending.Commit();
    Report(changes, output, err);
    return kExitSuccess;
}

} // namespace swatchlog
