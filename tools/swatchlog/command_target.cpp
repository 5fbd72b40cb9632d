// swatchlog target: the target file reduced to its clean and white patches.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kTargetHelp =
    "Usage: swatchlog target CHART -o OUT\n\n"
    "Writes CHART reduced to its clean patches (one colorant alone) and its first\n"
    "white patch, with the device values of each, and the layout keywords\n"
    "(NUMBER_OF_SETS, PATCHES_PER_PAGE, NUMBER_OF_STRIPS ...) set to the new patch\n"
    "count. OUT is written whole or not at all and may not be CHART itself.\n";

int RunTarget(const Words& args, std::ostream& /*out*/, std::ostream& /*err*/) {
    const ParsedArguments parsed = ParseArguments(args, {{"output", 'o', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input);
    const FailureText standard = DefaultFailureText(output, input);
    const FailureText failure = [&](int code) {
        if (code == 1) {
            return RepairUtf8(input) + ": " +
                   "the chart has no clean and no white patch (no patch prints a single "
                   "colorant or none) [code 1]";
        }
        return standard(code);
    };
    WriteOutputFile(output, failure, [&](const std::wstring& temporary) {
        return chart.Store().WriteTargetFile(LibraryPath(input), temporary);
    });
    return kExitSuccess;
}

} // namespace swatchlog
