// The tool's commands: each reads its words after the command name, prints its
// result on `out` and answers an exit status. Usage mistakes throw UsageError,
// chart and file failures throw ChartError.
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace swatchlog {

using Words = std::vector<std::string>;
using CommandFunction = int (*)(const Words& args, std::ostream& out, std::ostream& err);

struct Command {
    const char* name;
    const char* summary; ///< one line for the tool's help
    const char* help;    ///< the command's --help text
    CommandFunction run;
};

/// Every command in the order the tool's help lists them.
const std::vector<Command>& AllCommands();
/// The tool's own --help text.
std::string ToolHelp();
/// The --version line.
std::string VersionText();
/// Runs the tool on its words after the program name; answers the exit status.
int RunTool(const Words& args, std::ostream& out, std::ostream& err);

int RunInfo(const Words& args, std::ostream& out, std::ostream& err);
int RunPatches(const Words& args, std::ostream& out, std::ostream& err);
int RunConvert(const Words& args, std::ostream& out, std::ostream& err);
int RunMerge(const Words& args, std::ostream& out, std::ostream& err);
int RunTarget(const Words& args, std::ostream& out, std::ostream& err);
int RunKeywords(const Words& args, std::ostream& out, std::ostream& err);
int RunCompare(const Words& args, std::ostream& out, std::ostream& err);
int RunRender(const Words& args, std::ostream& out, std::ostream& err);
int RunValidate(const Words& args, std::ostream& out, std::ostream& err);

extern const char* const kInfoHelp;
extern const char* const kPatchesHelp;
extern const char* const kConvertHelp;
extern const char* const kMergeHelp;
extern const char* const kTargetHelp;
extern const char* const kKeywordsHelp;
extern const char* const kCompareHelp;
extern const char* const kRenderHelp;
extern const char* const kValidateHelp;

} // namespace swatchlog
