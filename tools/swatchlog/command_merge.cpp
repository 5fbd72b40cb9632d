// swatchlog merge: the measurements of one chart put into a target file.
#include <charconv>

#include "chart_writers.h"
#include "command_support.h"
#include "commands.h"
#include "patch_pairing.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kMergeHelp =
    "Usage: swatchlog merge TARGET MEASURED -o OUT [--append-missing [--exact]]\n"
    "                       [--by auto|id|name|position] [--allow-unpaired]\n"
    "                       [--device-tolerance T] [--target-table N]\n"
    "                       [--measured-table N]\n\n"
    "Puts the measurements of MEASURED (L*a*b*, XYZ, spectra and the densities\n"
    "computed from the spectra) into TARGET and writes the result to OUT: the data\n"
    "block is rebuilt from TARGET's device values and the measurements.\n\n"
    "Each target patch takes the measurement of its partner in MEASURED: by\n"
    "SAMPLE_ID when both files carry it, else by sample name, else by position\n"
    "(--by chooses one rule; see 'swatchlog compare --help'). Every target patch\n"
    "needs a partner. Where both files carry device values (CMYK, RGB or n-colour\n"
    "channels), every pair must agree within the tolerance, so that measurements\n"
    "of another chart are not merged.\n\n"
    "  --append-missing    keep TARGET's rows and append only the colour spaces it\n"
    "                      lacks\n"
    "  --exact             with --append-missing: work the larger of TARGET's\n"
    "                      ORIGINAL_NUMBER_OF_SETS and NUMBER_OF_SETS rather than\n"
    "                      the smaller (it matters only where they differ)\n"
    "  --allow-unpaired    leave out measured patches that have no target patch\n"
    "                      (otherwise an error)\n"
    "  --device-tolerance T  largest difference of a device value between paired\n"
    "                      patches, in percent or RGB levels (default 1)\n"
    "  --target-table N, --measured-table N\n"
    "                      the table of a file that holds several (default: the\n"
    "                      first with data rows); OUT holds TARGET's table alone\n\n"
    "OUT is written whole or not at all and may not be one of the input files.\n";

namespace {

double ToleranceOption(const ParsedArguments& parsed) {
    const std::string text = parsed.Value("device-tolerance", "1");
    double value = -1.0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error != std::errc() || end != text.data() + text.size() || !(value >= 0.0) ||
        value > 1e6) {
        throw UsageError("--device-tolerance takes a number from 0, not \"" + RepairUtf8(text) +
                         "\"");
    }
    return value;
}

} // namespace

int RunMerge(const Words& args, std::ostream& /*out*/, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(args, {{"output", 'o', true},
                                                         {"append-missing", '\0', false},
                                                         {"exact", '\0', false},
                                                         {"by", '\0', true},
                                                         {"allow-unpaired", '\0', false},
                                                         {"device-tolerance", '\0', true},
                                                         {"target-table", '\0', true},
                                                         {"measured-table", '\0', true}});
    RequirePositionals(parsed, 2, 2, "the target and the measured chart files");
    if (parsed.Has("exact") && !parsed.Has("append-missing")) {
        throw UsageError("--exact goes with --append-missing");
    }
    const PairBy by = ParsePairBy(parsed.Value("by", "auto"));
    const double tolerance = ToleranceOption(parsed);
    const std::string targetPath = parsed.positionals[0];
    const std::string measuredPath = parsed.positionals[1];
    const std::string output = RequireOutputPath(parsed, {targetPath, measuredPath});

    MergeOptions options;
    options.appendMissing = parsed.Has("append-missing");
    options.exact = parsed.Has("exact");
    options.by = by;
    options.allowUnpaired = parsed.Has("allow-unpaired");
    options.deviceTolerance = tolerance;
    options.targetTable = TableOption(parsed, "target-table");
    options.measuredTable = TableOption(parsed, "measured-table");
    MergeMeasurements(targetPath, measuredPath, output, options, [&err](const std::string& text) {
        err << "swatchlog merge: note: " << text << "\n";
    });
    return kExitSuccess;
}

} // namespace swatchlog
