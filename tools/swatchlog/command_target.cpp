// swatchlog target: the target file reduced to its clean and white patches.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "patch_pairing.h"
#include "patch_values.h"
#include "tool_error.h"
#include "utf8_text.h"

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

namespace {

// The tolerance of the library's clean and white patch selection.
constexpr double kCleanTolerance = 1e-5;

struct Selection {
    std::size_t firstWhite = 0; ///< patch index of the first white patch
    bool hasWhite = false;
    std::vector<std::size_t> clean;
    std::vector<std::size_t> cleanAfterWhite;
};

// Walks the patches as the selection does, but to the end.
Selection Select(const Chart& chart) {
    Selection selection;
    for (std::size_t i = 0; i < chart.Patches().size(); ++i) {
        CColorPatch patch = chart.Patches()[i];
        if (patch.IsCleanColor(kCleanTolerance)) {
            selection.clean.push_back(i);
            if (selection.hasWhite) {
                selection.cleanAfterWhite.push_back(i);
            }
        } else if (!selection.hasWhite && patch.IsWhite(kCleanTolerance)) {
            selection.hasWhite = true;
            selection.firstWhite = i;
        }
    }
    return selection;
}

std::string Named(const Chart& chart, std::size_t index) {
    std::string text = "sample " + std::to_string(index + 1);
    const std::string name = DisplayName(chart.Patches()[index]);
    if (!name.empty()) {
        text += " (" + RepairUtf8(name) + ")";
    }
    return text;
}

} // namespace

int RunTarget(const Words& args, std::ostream& /*out*/, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"output", 'o', true}, {"force", '\0', false}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input, TableOption(parsed));
    const Selection selection = Select(chart);
    if (!selection.cleanAfterWhite.empty()) {
        const std::size_t expected = selection.clean.size() + 1;
        const std::size_t kept = expected - selection.cleanAfterWhite.size();
        const std::string text =
            "the target would keep " + std::to_string(kept) + " of the " +
            std::to_string(expected) + " clean and white patches: the target writer stops at " +
            "the first white patch, " + Named(chart, selection.firstWhite) + ", and leaves out " +
            std::to_string(selection.cleanAfterWhite.size()) + " clean patches after it (" +
            SamplesText(selection.cleanAfterWhite) + ")";
        if (!parsed.Has("force")) {
            throw ChartError(chart.Name() + ": " + text + "; --force writes it anyway");
        }
        err << "swatchlog target: warning: " << chart.Name() << ": " << text << "\n";
    }
    const FailureText standard = DefaultFailureText(output, chart.Name());
    const FailureText failure = [&](int code) {
        if (code == 1) {
            return chart.Name() + ": " +
                   "the chart has no clean and no white patch (no patch prints a single "
                   "colorant or none) [code 1]";
        }
        return standard(code);
    };
    std::vector<CColorPatch> selected;
    chart.Store().SelectCleanAndWhitePatches(selected, true);
    WriteOutputFile(output, failure, [&](const std::wstring& temporary) {
        const int code = chart.Store().WriteTargetFile(chart.SourcePath(), temporary);
        if (code == 0) {
            // A chart without CMYK or n-colour values gives a target without rows.
            RequirePatchCount(temporary, selected.size(),
                              chart.Name() + ": the target file of its " +
                                  std::to_string(selected.size()) + " clean and white patches");
        }
        return code;
    });
    return kExitSuccess;
}

} // namespace swatchlog
