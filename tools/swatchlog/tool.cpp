#include <algorithm>
#include <exception>

#include "arguments.h"
#include "commands.h"
#include "tool_error.h"
#include "utf8_text.h"

#ifndef SWATCHLOG_VERSION
#define SWATCHLOG_VERSION "0.0.0"
#endif

namespace swatchlog {
namespace {

bool AsksForHelp(const Words& args) {
    for (const auto& word : args) {
        if (word == "--") {
            return false;
        }
        if (word == "--help" || word == "-h") {
            return true;
        }
    }
    return false;
}

} // namespace

const std::vector<Command>& AllCommands() {
    static const std::vector<Command> commands{
        {"info", "identification, keywords, layout and colour spaces of a chart", kInfoHelp,
         RunInfo},
        {"patches", "one row per patch with the chosen colour spaces", kPatchesHelp, RunPatches},
        {"convert", "write a clean CGATS file from a chart", kConvertHelp, RunConvert},
        {"merge", "put the measurements of one chart into a target file", kMergeHelp, RunMerge},
        {"target", "the target file reduced to its clean and white patches", kTargetHelp,
         RunTarget},
        {"keywords", "insert keyword lines after the identification line", kKeywordsHelp,
         RunKeywords},
        {"compare", "colour differences between a reference and a measured chart", kCompareHelp,
         RunCompare},
        {"render", "an SVG picture of the chart and its spectra", kRenderHelp, RunRender},
        {"validate", "read charts and say in plain words what is wrong", kValidateHelp,
         RunValidate}};
    return commands;
}

std::string VersionText() {
    return std::string("swatchlog ") + SWATCHLOG_VERSION + "\n";
}

std::string ToolHelp() {
    std::string text = "Usage: swatchlog COMMAND [ARGUMENTS]\n"
                       "       swatchlog --help | --version\n\n"
                       "Looks inside IT8.7 / CGATS.17 colour charts, checks, converts, merges and\n"
                       "compares them.\n\nCommands:\n";
    for (const auto& command : AllCommands()) {
        std::string name = command.name;
        name.resize(10, ' ');
        text += "  " + name + command.summary + "\n";
    }
    text += "\n'swatchlog COMMAND --help' describes a command.\n"
            "Exit status: 0 success, 1 chart or file error, 2 usage error.\n";
    return text;
}

int RunTool(const Words& args, std::ostream& out, std::ostream& err) {
    if (args.empty()) {
        err << ToolHelp();
        return kExitUsageError;
    }
    const std::string& name = args[0];
    if (name == "--help" || name == "-h" || name == "help") {
        out << ToolHelp();
        return kExitSuccess;
    }
    if (name == "--version" || name == "-V") {
        out << VersionText();
        return kExitSuccess;
    }
    const auto& commands = AllCommands();
    const auto command = std::find_if(commands.begin(), commands.end(),
                                      [&](const Command& c) { return name == c.name; });
    if (command == commands.end()) {
        err << "swatchlog: unknown command \"" << RepairUtf8(name)
            << "\"\nTry 'swatchlog --help'.\n";
        return kExitUsageError;
    }
    const Words rest(args.begin() + 1, args.end());
    if (AsksForHelp(rest)) {
        out << command->help;
        return kExitSuccess;
    }
    try {
        return command->run(rest, out, err);
    } catch (const UsageError& error) {
        err << "swatchlog " << command->name << ": " << RepairUtf8(error.what())
            << "\nTry 'swatchlog " << command->name << " --help'.\n";
        return kExitUsageError;
    } catch (const ChartError& error) {
        err << "swatchlog " << command->name << ": " << RepairUtf8(error.what()) << "\n";
        return kExitChartError;
    } catch (const std::exception& error) {
        err << "swatchlog " << command->name << ": " << RepairUtf8(error.what()) << "\n";
        return kExitChartError;
    }
}

} // namespace swatchlog
