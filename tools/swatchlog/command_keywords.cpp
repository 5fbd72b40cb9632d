// swatchlog keywords: keyword lines inserted after the identification line.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "keyword_names.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kKeywordsHelp =
    "Usage: swatchlog keywords CHART -o OUT KEY=VALUE...\n\n"
    "Copies CHART to OUT with one keyword line per KEY=VALUE inserted after the\n"
    "identification line. KEY is made of letters, digits and underscores; a KEY\n"
    "the format does not define gets its KEYWORD declaration line as well. A\n"
    "VALUE that is not a number is written in double quotes. OUT is written whole\n"
    "or not at all and may not be CHART itself.\n";

namespace {

KeywordList ParsePairs(const std::vector<std::string>& words) {
    KeywordList pairs;
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
            throw UsageError(key + " describes the data and cannot be inserted as a keyword");
        }
        bool ok = false;
        const std::string value = KeywordValueText(word.substr(equals + 1), ok);
        if (!ok) {
            throw UsageError("the value of " + key +
                             " cannot be written (it holds a line break or a double quote)");
        }
        if (!IsStandardKeyword(key)) {
            pairs.emplace_back("KEYWORD", "\"" + key + "\"");
        }
        pairs.emplace_back(key, value);
    }
    return pairs;
}

} // namespace

int RunKeywords(const Words& args, std::ostream& /*out*/, std::ostream& /*err*/) {
    const ParsedArguments parsed = ParseArguments(args, {{"output", 'o', true}});
    RequirePositionals(parsed, 2, static_cast<std::size_t>(-1),
                       parsed.positionals.empty() ? "the chart file" : "KEY=VALUE");
    const std::string input = parsed.positionals[0];
    const KeywordList pairs = ParsePairs(
        std::vector<std::string>(parsed.positionals.begin() + 1, parsed.positionals.end()));
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input);
    WriteOutputFile(output, DefaultFailureText(output, input), [&](const std::wstring& temporary) {
        return chart.Store().InsertKeywords(LibraryPath(input), temporary, pairs);
    });
    return kExitSuccess;
}

} // namespace swatchlog
