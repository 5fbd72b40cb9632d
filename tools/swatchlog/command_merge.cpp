// swatchlog merge: the measurements of one chart put into a target file.
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "result_messages.h"
#include "tool_error.h"
#include "utf8_text.h"

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

namespace {

void HandMeasurementsToStore(const Chart& measured) {
    CSwatchlogBase& store = measured.Store();
    const auto& patches = measured.Patches();
    if (measured.Has(Space::Spectral)) {
        // With computation on, the store also works out XYZ, L*a*b* and densities.
        store.SetSpectralDataList(store.GetSpectralDataList(), true);
    }
    if (measured.Has(Space::Xyz)) {
        std::vector<tagXYZ> xyz;
        for (const auto& patch : patches) {
            xyz.push_back(patch.GetXYZ());
        }
        store.SetXYZList(xyz);
    }
    if (measured.Has(Space::Lab)) {
        std::vector<tagLAB> lab;
        for (const auto& patch : patches) {
            lab.push_back(patch.GetLAB());
        }
        store.SetLABList(lab);
    }
}

} // namespace

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

    const Chart targetChart = Chart::Load(target);
    const Chart measured = Chart::Load(measuredPath);
    if (!measured.Has(Space::Lab) && !measured.Has(Space::Xyz) && !measured.Has(Space::Spectral)) {
        throw ChartError(RepairUtf8(measuredPath) + ": the chart holds no measurements "
                                                    "(no L*a*b*, XYZ or spectra)");
    }
    HandMeasurementsToStore(measured);

    const std::size_t targetCount = targetChart.Patches().size();
    const std::size_t measuredCount = measured.Patches().size();
    const FailureText standard = DefaultFailureText(output, target);
    const FailureText failure = [&](int code) {
        if (code != 24) {
            return standard(code);
        }
        return RepairUtf8(target) + ": " +
               WithCode("the target has " + std::to_string(targetCount) + " patches but " +
                            RepairUtf8(measuredPath) + " has " + std::to_string(measuredCount) +
                            "; the measurements do not fit",
                        code);
    };
    const bool appendMissing = parsed.Has("append-missing");
    const bool exact = parsed.Has("exact");
    WriteOutputFile(output, failure, [&](const std::wstring& temporary) {
        CSwatchlogBase& store = measured.Store();
        return appendMissing ? store.AppendMissingColumns(LibraryPath(target), temporary, exact)
                             : store.WriteMeasurementFile(LibraryPath(target), temporary);
    });
    return kExitSuccess;
}

} // namespace swatchlog
