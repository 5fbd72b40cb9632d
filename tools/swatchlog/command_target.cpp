// swatchlog target: the target file reduced to its clean and white patches.
#include "chart_writers.h"
#include "command_support.h"
#include "commands.h"

namespace swatchlog {

const char* const kTargetHelp =
    "Usage: swatchlog target CHART -o OUT [--force] [--table N]\n\n"
    "Writes CHART reduced to its clean patches (one colorant alone) and its first\n"
    "white patch, with the device values of each, and the layout keywords\n"
    "(NUMBER_OF_SETS, PATCHES_PER_PAGE, NUMBER_OF_STRIPS ...) set to the new patch\n"
    "count. The target writer stops at the first white patch, so clean patches\n"
    "that stand after it are left out; when that happens (a chart whose paper\n"
    "white comes first, say) nothing is written unless --force is given.\n"
    "  --table N   the table of a file that holds several (default: the first\n"
    "              with data rows); OUT holds that table alone\n"
    "OUT is written whole or not at all and may not be CHART itself.\n";

int RunTarget(const Words& args, std::ostream& /*out*/, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"output", 'o', true}, {"force", '\0', false}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    WriteCleanTarget(
        input, output, TableOption(parsed), parsed.Has("force"),
        [&err](const std::string& text) { err << "swatchlog target: warning: " << text << "\n"; });
    return kExitSuccess;
}

} // namespace swatchlog
