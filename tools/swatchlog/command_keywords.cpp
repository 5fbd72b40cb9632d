// swatchlog keywords: header keywords set in a chart file, the rest kept byte for byte.
#include <fstream>

#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "keyword_edit.h"
#include "keyword_names.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kKeywordsHelp =
    "Usage: swatchlog keywords CHART -o OUT KEY=VALUE... [--table N]\n\n"
    "Copies CHART to OUT with each KEY set to VALUE in the header. A KEY the\n"
    "header already has keeps its line, with the new value (where it stands on\n"
    "several lines, the last one, which is the one readers take); a new KEY gets\n"
    "a line after the identification line (CGATS.17, CTI3 ...), which stays first,\n"
    "and a KEYWORD declaration when the format does not define it. KEY is made of\n"
    "letters, digits and underscores. A VALUE that is not a number is written in\n"
    "double quotes. Every other byte of CHART is kept.\n"
    "  --table N   the table whose header is set, in a file that holds several\n"
    "              (default: the first with data rows)\n"
    "OUT is written whole or not at all and may not be CHART itself.\n";

namespace {

std::vector<KeywordEdit> ParsePairs(const std::vector<std::string>& words) {
    std::vector<KeywordEdit> pairs;
    for (const auto& word : words) {
        const std::size_t equals = word.find('=');
        if (equals == std::string::npos) {
            throw UsageError("\"" + RepairUtf8(word) + "\" is not of the form KEY=VALUE");
        }
        const std::string key = word.substr(0, equals);
        if (!IsValidKeywordName(key)) {
            throw UsageError("\"" + RepairUtf8(key) +
                             "\" is not a keyword name (letters, digits and underscores, "
                             "beginning with a letter)");
        }
        if (IsStructuralKeyword(key)) {
            throw UsageError(key + " describes the data and cannot be set as a keyword");
        }
        for (const auto& earlier : pairs) {
            if (earlier.key == key) {
                throw UsageError(key + " is given twice");
            }
        }
        bool ok = false;
        const std::string value = KeywordValueText(word.substr(equals + 1), ok);
        if (!ok) {
            throw UsageError("the value of " + key +
                             " cannot be written (it holds a line break or a double quote)");
        }
        pairs.push_back({key, value});
    }
    return pairs;
}

std::string ReadText(const std::string& utf8Path) {
    std::string text;
    if (!ReadRegularFile(utf8Path, text)) {
        throw ChartError(RepairUtf8(utf8Path) + ": the file cannot be read");
    }
    return text;
}

} // namespace

int RunKeywords(const Words& args, std::ostream& /*out*/, std::ostream& /*err*/) {
    const ParsedArguments parsed =
        ParseArguments(args, {{"output", 'o', true}, {"table", '\0', true}});
    RequirePositionals(parsed, 2, static_cast<std::size_t>(-1),
                       parsed.positionals.empty() ? "the chart file" : "KEY=VALUE");
    const std::string input = parsed.positionals[0];
    const std::vector<KeywordEdit> pairs = ParsePairs(
        std::vector<std::string>(parsed.positionals.begin() + 1, parsed.positionals.end()));
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input, TableOption(parsed));
    const ChartLines file(ReadText(input));
    const TableExtent& table = chart.Loaded().Table();
    const EditedText edited = SetKeywords(file, table, chart.Loaded().Text().header, pairs);

    LibraryPath(output);
    PendingOutput pending(output);
    {
        std::ofstream out(FileSystemPath(pending.TemporaryPath()), std::ios::binary);
        out << edited.text;
        out.close();
        if (!out) {
            throw ChartError(RepairUtf8(output) + ": the output file cannot be written");
        }
    }
    // The edited table must read as the original did.
    const Chart written = Chart::Load(pending.TemporaryPath(), table.number);
    if (written.Patches().size() != chart.Patches().size() ||
        written.Loaded().Tables().size() != chart.Loaded().Tables().size()) {
        throw ChartError(chart.Name() + ": the file with the keywords set does not read as the "
                                        "chart did; nothing was written");
    }
    pending.Commit();
    return kExitSuccess;
}

} // namespace swatchlog
