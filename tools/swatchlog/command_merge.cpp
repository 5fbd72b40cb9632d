// swatchlog merge: the measurements of one chart put into a target file.
#include "chart_writers.h"
#include "command_support.h"
#include "commands.h"

namespace swatchlog {

const char* const kMergeHelp =
    "Usage: swatchlog merge TARGET MEASURED -o OUT [--append-missing [--exact]]\n\n"
    "Puts the measurements of MEASURED (L*a*b*, XYZ, spectra and the densities\n"
    "computed from the spectra) into TARGET, patch by patch in sample order, and\n"
    "writes the result to OUT: the data block is rebuilt from TARGET's device\n"
    "values and the measurements.\n\n"
    "  --append-missing  keep TARGET's rows and append only the colour spaces it\n"
    "                    lacks\n"
    "  --exact           with --append-missing: the number of measured patches must\n"
    "                    equal TARGET's row count (or MEASURED's\n"
    "                    ORIGINAL_NUMBER_OF_SETS); without it any number between the\n"
    "                    two is taken\n\n"
    "OUT is written whole or not at all and may not be one of the input files.\n";

int RunMerge(const Words& args, std::ostream& /*out*/, std::ostream& /*err*/) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"output", 'o', true}, {"append-missing", '\0', false}, {"exact", '\0', false}});
    RequirePositionals(parsed, 2, 2, "the target and the measured chart files");
    if (parsed.Has("exact") && !parsed.Has("append-missing")) {
        throw UsageError("--exact goes with --append-missing");
    }
    const std::string target = parsed.positionals[0];
    const std::string measuredPath = parsed.positionals[1];
    const std::string output = RequireOutputPath(parsed, {target, measuredPath});

    MergeMeasurements(target, measuredPath, output, parsed.Has("append-missing"),
                      parsed.Has("exact"));
    return kExitSuccess;
}

} // namespace swatchlog
