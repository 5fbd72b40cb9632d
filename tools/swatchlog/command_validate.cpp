// swatchlog validate: reads charts and says in plain words what is wrong.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "json_writer.h"
#include "tool_error.h"
#include "utf8_text.h"
#include "value_checks.h"

namespace swatchlog {

const char* const kValidateHelp =
    "Usage: swatchlog validate CHART... [--strict] [--format text|json]\n\n"
    "Reads each chart, every table of a file that holds several, and says in plain\n"
    "words what is wrong with it, with the line number where it is known, e.g.\n"
    "\"row 17 (line 40) has 9 values but NUMBER_OF_FIELDS is 8 [code 8]\". A\n"
    "double-quoted value with blanks in a data row is explained: values are\n"
    "separated at blanks even inside quotes.\n\n"
    "Then every value the library reads as a number is checked, with its line and\n"
    "column: text in a numeric field (it reads as 0), a malformed number (\"75.25.3\"\n"
    "reads as 75), a value that is not finite (NaN, inf) or lies outside its range:\n"
    "tone values (CMYK, n-colour channels, orange, green, violet) 0 to 100, RGB 0 to\n"
    "255, L* 0 to 100, a* and b* -200 to 200, XYZ 0 to 200, densities -1 to 10,\n"
    "spectral values -1 to 200. These are warnings; --strict makes them errors.\n\n"
    "Readable charts are listed on standard output, failures and warnings on\n"
    "standard error (with --format json everything goes to standard output as one\n"
    "document). The exit status is 1 when any chart fails.\n";

namespace {

struct Verdict {
    std::string path;
    int table = 0; ///< 0 for a file of one table
    bool ok = false;
    std::string message; ///< failure reason, or a summary of the chart
    std::vector<ValueFinding> findings;
};

std::string Summary(const Chart& chart) {
    std::string spaces;
    for (const auto& name : AllSpaces()) {
        if (chart.Has(name.space) && !chart.Derived(name.space)) {
            spaces += (spaces.empty() ? "" : ", ") + std::string(name.title);
        }
    }
    return std::to_string(chart.Patches().size()) + " patches" +
           (spaces.empty() ? "" : " (" + spaces + ")");
}

// One verdict per table; a file that cannot be opened gives one.
std::vector<Verdict> Check(const std::string& path, bool strict) {
    std::vector<Verdict> verdicts;
    std::vector<TableExtent> tables;
    try {
        tables = ListTables(path);
    } catch (const ChartError& error) {
        Verdict verdict;
        verdict.path = path;
        verdict.message = error.what();
        return {verdict};
    }
    for (const auto& table : tables) {
        Verdict verdict;
        verdict.path = path;
        verdict.table = tables.size() > 1 ? table.number : 0;
        try {
            const Chart chart = Chart::Load(path, table.number);
            verdict.findings = CheckValues(chart);
            verdict.ok = !strict || verdict.findings.empty();
            verdict.message = Summary(chart);
        } catch (const ChartError& error) {
            verdict.message = error.what();
        }
        verdicts.push_back(verdict);
    }
    return verdicts;
}

std::string Name(const Verdict& verdict) {
    std::string name = RepairUtf8(verdict.path);
    if (verdict.table != 0) {
        name += ", table " + std::to_string(verdict.table);
    }
    return name;
}

// A failure message starts with the file (and table); the verdict names them itself.
std::string Reason(const Verdict& verdict) {
    std::string message = verdict.message;
    const std::string prefix = RepairUtf8(verdict.path);
    if (message.compare(0, prefix.size(), prefix) == 0) {
        message.erase(0, prefix.size());
        if (message.compare(0, 2, ", ") == 0 && verdict.table != 0) {
            message.erase(0, message.find(": "));
        }
        if (message.compare(0, 2, ": ") == 0) {
            message.erase(0, 2);
        }
    }
    return message;
}

void PrintText(const std::vector<Verdict>& verdicts, bool strict, std::ostream& out,
               std::ostream& err) {
    for (const auto& verdict : verdicts) {
        const bool read = verdict.ok || !verdict.findings.empty();
        if (verdict.ok) {
            out << Name(verdict) << ": ok, " << RepairUtf8(verdict.message);
            if (!verdict.findings.empty()) {
                out << ", " << verdict.findings.size()
                    << (verdict.findings.size() == 1 ? " warning" : " warnings");
            }
            out << "\n" << std::flush;
        } else if (read) {
            err << "swatchlog validate: " << Name(verdict) << ": " << verdict.findings.size()
                << (verdict.findings.size() == 1 ? " value fails" : " values fail")
                << " the strict checks\n";
        } else {
            err << "swatchlog validate: " << Name(verdict) << ": " << RepairUtf8(Reason(verdict))
                << "\n";
        }
        for (const auto& finding : verdict.findings) {
            err << "swatchlog validate: " << (strict ? "" : "warning: ") << Name(verdict)
                << ": line " << finding.line << ", column " << finding.column << ": "
                << RepairUtf8(finding.message) << "\n";
        }
    }
}

void PrintJson(const std::vector<Verdict>& verdicts, bool allOk, std::ostream& out) {
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
        json.Key("table");
        if (verdict.table != 0) {
            json.Integer(verdict.table);
        } else {
            json.Null();
        }
        json.Key("ok");
        json.Bool(verdict.ok);
        const bool read = verdict.ok || !verdict.findings.empty();
        json.Key(read ? "summary" : "error");
        json.String(read ? verdict.message : Reason(verdict));
        json.Key("findings");
        json.BeginArray();
        for (const auto& finding : verdict.findings) {
            json.BeginObject();
            json.Key("line");
            json.Integer(finding.line);
            json.Key("column");
            json.Integer(finding.column);
            json.Key("sample");
            json.Integer(finding.sample);
            json.Key("field");
            json.String(finding.field);
            json.Key("text");
            json.String(finding.text);
            json.Key("problem");
            json.String(finding.problem);
            json.Key("message");
            json.String(finding.message);
            json.EndObject();
        }
        json.EndArray();
        json.EndObject();
    }
    json.EndArray();
    json.EndObject();
    json.Finish();
}

} // namespace

int RunValidate(const Words& args, std::ostream& out, std::ostream& err) {
    const ParsedArguments parsed =
        ParseArguments(args, {{"format", '\0', true}, {"strict", '\0', false}});
    RequirePositionals(parsed, 1, static_cast<std::size_t>(-1), "the chart files");
    const OutputFormat format = ParseFormat(parsed, {"text", "json"});
    const bool strict = parsed.Has("strict");
    std::vector<Verdict> verdicts;
    bool allOk = true;
    for (const auto& path : parsed.positionals) {
        for (auto& verdict : Check(path, strict)) {
            allOk = allOk && verdict.ok;
            verdicts.push_back(std::move(verdict));
        }
    }
    if (format.json) {
        PrintJson(verdicts, allOk, out);
    } else {
        PrintText(verdicts, strict, out, err);
    }
    return allOk ? kExitSuccess : kExitChartError;
}

} // namespace swatchlog
