// swatchlog validate: reads charts and says in plain words what is wrong.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "json_writer.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kValidateHelp =
    "Usage: swatchlog validate CHART... [--format text|json]\n\n"
    "Reads each chart and says in plain words what is wrong with it, with the line\n"
    "number where it is known, e.g. \"row 17 (line 40) has 9 values but\n"
    "NUMBER_OF_FIELDS is 8 [code 8]\". Readable charts are listed on standard output,\n"
    "failures on standard error (with --format json everything goes to standard\n"
    "output as one document). The exit status is 1 when any chart fails.\n";

namespace {

struct Verdict {
    std::string path;
    bool ok = false;
    std::string message; ///< failure reason, or a summary of the chart
};

Verdict Check(const std::string& path) {
    Verdict verdict;
    verdict.path = path;
    try {
        const Chart chart = Chart::Load(path);
        verdict.ok = true;
        std::string spaces;
        for (const auto& name : AllSpaces()) {
            if (chart.Has(name.space) && !chart.Derived(name.space)) {
                spaces += (spaces.empty() ? "" : ", ") + std::string(name.title);
            }
        }
        verdict.message = std::to_string(chart.Patches().size()) + " patches" +
                          (spaces.empty() ? "" : " (" + spaces + ")");
    } catch (const ChartError& error) {
        // The message starts with the file name; the verdict names the file itself.
        std::string message = error.what();
        const std::string prefix = RepairUtf8(path) + ": ";
        if (message.compare(0, prefix.size(), prefix) == 0) {
            message.erase(0, prefix.size());
        }
        verdict.message = message;
    }
    return verdict;
}

} // namespace

int RunValidate(const Words& args, std::ostream& out, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(args, {{"format", '\0', true}});
    RequirePositionals(parsed, 1, static_cast<std::size_t>(-1), "the chart files");
    const OutputFormat format = ParseFormat(parsed, {"text", "json"});
    std::vector<Verdict> verdicts;
    bool allOk = true;
    for (const auto& path : parsed.positionals) {
        verdicts.push_back(Check(path));
        allOk = allOk && verdicts.back().ok;
    }
    if (format.json) {
        JsonWriter json(out);
        json.BeginObject();
        json.Key("valid");
        json.Bool(allOk);
        json.Key("files");
        json.BeginArray();
        for (const auto& verdict : verdicts) {
            json.BeginObject();
            json.Key("file");
            json.String(verdict.path);
            json.Key("ok");
            json.Bool(verdict.ok);
            json.Key(verdict.ok ? "summary" : "error");
            json.String(verdict.message);
            json.EndObject();
        }
        json.EndArray();
        json.EndObject();
        json.Finish();
    } else {
        for (const auto& verdict : verdicts) {
            if (verdict.ok) {
                out << RepairUtf8(verdict.path) << ": ok, " << verdict.message << "\n";
            } else {
                err << "swatchlog validate: " << RepairUtf8(verdict.path) << ": " << verdict.message
                    << "\n";
            }
        }
    }
    return allOk ? kExitSuccess : kExitChartError;
}

} // namespace swatchlog
