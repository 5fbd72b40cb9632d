// swatchlog info: what a chart is and what it carries.
#include <sstream>

#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "device_space.h"
#include "json_writer.h"
#include "result_messages.h"
#include "text_table.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kInfoHelp =
    "Usage: swatchlog info CHART [--table N] [--format text|json]\n\n"
    "Prints the chart's identification line, its keywords, NUMBER_OF_SETS and the\n"
    "number of patches read, the layout (strips, columns, pages), the colour spaces\n"
    "present and which of them the library derived, the device colour space and\n"
    "channel count, the spectral range and the process colour names.\n\n"
    "A file that holds several tables (each with its own data format and data\n"
    "block) has them listed with their lines, rows and fields; the details are\n"
    "those of one table:\n"
    "  --table N   the table to describe (default: the first with data rows)\n";

namespace {

std::string Trimmed(std::string text) {
    text.erase(text.find_last_not_of(' ') + 1);
    return text;
}

struct InfoFacts {
    int patchCount = 0;
    std::string numberOfSets;
    int strips = 0;
    int columns = 0;
    int pages = 0;
    std::string device;
    int channels = 0;
    SpectralRangeStruct range;
    std::vector<std::string> processColors;
    std::vector<const SpaceName*> spaces;
    std::vector<bool> derived;
};

InfoFacts Gather(const Chart& chart) {
    CSwatchlogBase& store = chart.Store();
    InfoFacts facts;
    facts.patchCount = store.GetPatchCount();
    facts.numberOfSets = Trimmed(store.GetKeywordValue("NUMBER_OF_SETS"));
    facts.strips = store.GetNumberOfStrips();
    facts.columns = store.GetNumberOfCols();
    facts.pages = store.GetNumberOfPages();
    const DeviceSpace device = DescribeDevice(chart);
    facts.device = device.name;
    facts.channels = device.channels;
    try {
        facts.range = store.GetSpectralRange();
    } catch (const std::exception& error) {
        throw ChartError(chart.Name() + ": " + DescribeLibraryException(error));
    }
    if (store.GetProcessColorNames(facts.processColors) != 0) {
        facts.processColors.clear();
    }
    for (const auto& name : AllSpaces()) {
        if (chart.Has(name.space)) {
            facts.spaces.push_back(&name);
            facts.derived.push_back(chart.Derived(name.space));
        }
    }
    return facts;
}

std::string LayoutText(const InfoFacts& facts) {
    if (facts.strips < 1 || facts.columns < 1) {
        return "not given (NUMBER_OF_STRIPS and NUMBER_OF_COLS missing)";
    }
    std::string text =
        std::to_string(facts.strips) + " strips of " + std::to_string(facts.columns) + " patches";
    if (facts.pages > 0) {
        text += ", " + std::to_string(facts.pages) + (facts.pages == 1 ? " page" : " pages");
    }
    return text;
}

std::string FieldList(const std::vector<std::string>& fields) {
    std::string text;
    for (const auto& field : fields) {
        text += (text.empty() ? "" : " ") + field;
    }
    return text.empty() ? "(no data format)" : text;
}

// One line per table of a file of several: number, lines, identification, rows, fields.
void PrintTables(const Chart& chart, std::ostream& out) {
    const auto& tables = chart.Loaded().Tables();
    out << "tables\n";
    TextTable list;
    for (const bool numeric : {true, false, false, true, false}) {
        list.AddColumn("", numeric);
    }
    for (const auto& table : tables) {
        list.AddRow(
            {"  " + std::to_string(table.number),
             "lines " + std::to_string(table.firstLine) + "-" + std::to_string(table.lastLine),
             RepairUtf8(table.identification),
             std::to_string(table.rowCount) + (table.rowCount == 1 ? " row" : " rows"),
             RepairUtf8(FieldList(table.fields))});
    }
    std::ostringstream text;
    list.Print(text, TableFormat::Table);
    const std::string listed = text.str();
    out << listed.substr(listed.find('\n') + 1);
}

void PrintText(const Chart& chart, const InfoFacts& facts, std::ostream& out) {
    TextTable table;
    table.AddColumn("", false);
    table.AddColumn("", false);
    table.AddRow({"file", RepairUtf8(chart.Path())});
    const LoadedTable& loaded = chart.Loaded();
    if (loaded.Tables().size() > 1) {
        table.AddRow({"table", std::to_string(loaded.Table().number) + " of " +
                                   std::to_string(loaded.Tables().size()) + ", lines " +
                                   std::to_string(loaded.Table().firstLine) + "-" +
                                   std::to_string(loaded.Table().lastLine) +
                                   " (--table N shows another)"});
    }
    table.AddRow({"identification",
                  chart.Identification().empty() ? "none" : RepairUtf8(chart.Identification())});
    table.AddRow({"patches", std::to_string(facts.patchCount) + " (NUMBER_OF_SETS " +
                                 RepairUtf8(facts.numberOfSets) + ")"});
    table.AddRow({"layout", LayoutText(facts)});
    table.AddRow({"device", facts.channels > 0
                                ? facts.device + ", " + std::to_string(facts.channels) + " channels"
                                : facts.device});
    std::string spaces;
    for (std::size_t i = 0; i < facts.spaces.size(); ++i) {
        spaces += (i ? ", " : "") + std::string(facts.spaces[i]->title) +
                  (facts.derived[i] ? " (derived)" : "");
    }
    table.AddRow({"colour spaces", spaces.empty() ? "none" : spaces});
    std::string range = "none";
    if (facts.range.count > 0) {
        const int last = facts.range.startNm + facts.range.stepNm * (facts.range.count - 1);
        range = std::to_string(facts.range.startNm) + "-" + std::to_string(last) + " nm in " +
                std::to_string(facts.range.stepNm) + " nm steps, " +
                std::to_string(facts.range.count) + " values";
    }
    table.AddRow({"spectral range", range});
    std::string colors;
    for (const auto& name : facts.processColors) {
        colors += (colors.empty() ? "" : ", ") + RepairUtf8(name);
    }
    table.AddRow({"process colours", colors.empty() ? "none" : colors});
    std::ostringstream body;
    table.Print(body, TableFormat::Table);
    // The first line of the table is its empty header row.
    const std::string text = body.str();
    out << text.substr(text.find('\n') + 1);
    if (chart.Loaded().Tables().size() > 1) {
        PrintTables(chart, out);
    }
    out << "keywords\n";
    TextTable keywords;
    keywords.AddColumn("", false);
    keywords.AddColumn("", false);
    for (const auto& [key, value] : chart.Keywords()) {
        keywords.AddRow({"  " + RepairUtf8(key), RepairUtf8(value)});
    }
    std::ostringstream list;
    keywords.Print(list, TableFormat::Table);
    const std::string listed = list.str();
    out << listed.substr(listed.find('\n') + 1);
}

void PrintJson(const Chart& chart, const InfoFacts& facts, std::ostream& out) {
    JsonWriter json(out);
    json.BeginObject();
    json.Key("file");
    json.String(chart.Path());
    json.Key("identification");
    json.String(chart.Identification());
    json.Key("table");
    json.Integer(chart.Loaded().Table().number);
    json.Key("tables");
    json.BeginArray();
    for (const auto& table : chart.Loaded().Tables()) {
        json.BeginObject();
        json.Key("number");
        json.Integer(table.number);
        json.Key("first_line");
        json.Integer(table.firstLine);
        json.Key("last_line");
        json.Integer(table.lastLine);
        json.Key("identification");
        json.String(table.identification);
        json.Key("rows");
        json.Integer(table.rowCount);
        json.Key("fields");
        json.BeginArray(true);
        for (const auto& field : table.fields) {
            json.String(field);
        }
        json.EndArray();
        json.EndObject();
    }
    json.EndArray();
    json.Key("patch_count");
    json.Integer(facts.patchCount);
    json.Key("number_of_sets");
    if (!facts.numberOfSets.empty() &&
        facts.numberOfSets.find_first_not_of("0123456789") == std::string::npos &&
        facts.numberOfSets.size() < 10) {
        json.Integer(std::stoll(facts.numberOfSets));
    } else {
        json.String(facts.numberOfSets);
    }
    json.Key("layout");
    json.BeginObject();
    json.Key("strips");
    json.Integer(facts.strips);
    json.Key("columns");
    json.Integer(facts.columns);
    json.Key("pages");
    json.Integer(facts.pages);
    json.EndObject();
    json.Key("device_color_space");
    json.String(facts.device);
    json.Key("device_channels");
    json.Integer(facts.channels);
    json.Key("color_spaces");
    json.BeginArray();
    for (std::size_t i = 0; i < facts.spaces.size(); ++i) {
        json.BeginObject();
        json.Key("name");
        json.String(facts.spaces[i]->key);
        json.Key("derived");
        json.Bool(facts.derived[i]);
        json.EndObject();
    }
    json.EndArray();
    json.Key("spectral_range");
    if (facts.range.count > 0) {
        json.BeginObject();
        json.Key("start_nm");
        json.Integer(facts.range.startNm);
        json.Key("step_nm");
        json.Integer(facts.range.stepNm);
        json.Key("count");
        json.Integer(facts.range.count);
        json.EndObject();
    } else {
        json.Null();
    }
    json.Key("process_colors");
    json.BeginArray(true);
    for (const auto& name : facts.processColors) {
        json.String(name);
    }
    json.EndArray();
    json.Key("keywords");
    json.BeginObject();
    for (const auto& [key, value] : chart.Keywords()) {
        json.Key(key);
        json.String(value);
    }
    json.EndObject();
    json.EndObject();
    json.Finish();
}

} // namespace

int RunInfo(const Words& args, std::ostream& out, std::ostream& /*err*/) {
    const ParsedArguments parsed =
        ParseArguments(args, {{"format", '\0', true}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const OutputFormat format = ParseFormat(parsed, {"text", "json"});
    const Chart chart = Chart::Load(parsed.positionals[0], TableOption(parsed));
    const InfoFacts facts = Gather(chart);
    if (format.json) {
        PrintJson(chart, facts, out);
    } else {
        PrintText(chart, facts, out);
    }
    return kExitSuccess;
}

} // namespace swatchlog
