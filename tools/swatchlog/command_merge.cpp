// swatchlog merge: the measurements of one chart put into a target file.
#include <charconv>

#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "device_agreement.h"
#include "file_paths.h"
#include "number_format.h"
#include "patch_pairing.h"
#include "result_messages.h"
#include "tool_error.h"
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

// The measured patch of each target patch, by index; every target patch has one.
std::vector<std::size_t> PartnerOfEachTarget(const Chart& target, const Chart& measured,
                                             const Pairing& pairing, bool allowUnpaired) {
    if (!pairing.unpairedFirst.empty()) {
        throw ChartError(std::to_string(pairing.unpairedFirst.size()) + " of " +
                         std::to_string(target.Patches().size()) + " patches of " + target.Name() +
                         " (" + SamplesText(pairing.unpairedFirst) + ")" +
                         (pairing.unpairedFirst.size() == 1 ? " has" : " have") +
                         " no partner in " + measured.Name() + " by " + PairByText(pairing.by) +
                         (pairing.fallback.empty() ? "" : " (" + pairing.fallback + ")") +
                         "; every target patch needs a measurement, so nothing was written");
    }
    if (!pairing.unpairedSecond.empty() && !allowUnpaired) {
        throw ChartError(std::to_string(pairing.unpairedSecond.size()) + " of " +
                         std::to_string(measured.Patches().size()) + " patches of " +
                         measured.Name() + " (" + SamplesText(pairing.unpairedSecond) + ")" +
                         (pairing.unpairedSecond.size() == 1 ? " has" : " have") +
                         " no partner in " + target.Name() + " by " + PairByText(pairing.by) +
                         "; --allow-unpaired leaves them out of the merged file");
    }
    std::vector<std::size_t> partner(target.Patches().size());
    for (const PatchPair& pair : pairing.pairs) {
        partner[pair.first] = pair.second;
    }
    return partner;
}

template <typename Record, typename Get>
std::vector<Record> Reordered(const Chart& measured, const std::vector<std::size_t>& partner,
                              Space space, Get get) {
    std::vector<Record> list;
    for (const std::size_t index : partner) {
        const CColorPatch& patch = measured.Patches()[index];
        if (!Chart::PatchHas(patch, space)) {
            throw ChartError("sample " + std::to_string(index + 1) + " of " + measured.Name() +
                             " has no " + NameOf(space).title + "; nothing was written");
        }
        list.push_back(get(patch));
    }
    return list;
}

// Hands the measurements, in the target's patch order, to the target's chart
// object, whose merge writers then rebuild the target file.
void HandMeasurementsToStore(const Chart& target, const Chart& measured,
                             const std::vector<std::size_t>& partner) {
    CSwatchlogBase& store = target.Store();
    if (measured.Has(Space::Spectral)) {
        const auto spectra = measured.Store().GetSpectralDataList();
        std::vector<std::map<std::string, double>> list;
        for (const std::size_t index : partner) {
            list.push_back(index < spectra.size() ? spectra[index]
                                                  : std::map<std::string, double>());
        }
        // With computation on, the store also works out XYZ, L*a*b* and densities.
        store.SetSpectralDataList(list, true);
    }
    if (measured.Has(Space::Xyz)) {
        store.SetXYZList(Reordered<tagXYZ>(measured, partner, Space::Xyz,
                                           [](const CColorPatch& p) { return p.GetXYZ(); }));
    }
    if (measured.Has(Space::Lab)) {
        store.SetLABList(Reordered<tagLAB>(measured, partner, Space::Lab,
                                           [](const CColorPatch& p) { return p.GetLAB(); }));
    }
}

void CheckDevices(const Chart& target, const Chart& measured, const Pairing& pairing,
                  double tolerance, std::ostream& err) {
    const DeviceAgreement agreement = CheckDeviceValues(target, measured, pairing, tolerance);
    if (agreement.space.empty()) {
        err << "swatchlog merge: note: the device values were not compared: "
            << RepairUtf8(target.Name()) << " and " << RepairUtf8(measured.Name())
            << " carry none of the same kind\n";
        return;
    }
    if (agreement.disagreements.empty()) {
        return;
    }
    std::string text = std::to_string(agreement.disagreements.size()) + " of " +
                       std::to_string(agreement.checked) + " pairs by " + PairByText(pairing.by) +
                       " differ in their " + agreement.space + " values by more than " +
                       FormatShortest(tolerance) + ": ";
    const std::size_t shown = std::min<std::size_t>(agreement.disagreements.size(), 3);
    for (std::size_t i = 0; i < shown; ++i) {
        text += (i ? "; " : "") + agreement.disagreements[i];
    }
    if (agreement.disagreements.size() > shown) {
        text += "; ...";
    }
    throw ChartError(RepairUtf8(text) + ". The measurements may belong to another chart, or "
                                        "the pairing is wrong (--by, --device-tolerance)");
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

    const Chart target = Chart::Load(targetPath, TableOption(parsed, "target-table"));
    const Chart measured = Chart::Load(measuredPath, TableOption(parsed, "measured-table"));
    if (!measured.Has(Space::Lab) && !measured.Has(Space::Xyz) && !measured.Has(Space::Spectral)) {
        throw ChartError(measured.Name() + ": the chart holds no measurements "
                                           "(no L*a*b*, XYZ or spectra)");
    }
    const Pairing pairing = PairPatches(target, measured, by);
    const std::vector<std::size_t> partner =
        PartnerOfEachTarget(target, measured, pairing, parsed.Has("allow-unpaired"));
    CheckDevices(target, measured, pairing, tolerance, err);
    HandMeasurementsToStore(target, measured, partner);
    if (!pairing.fallback.empty()) {
        err << "swatchlog merge: note: paired by " << PairByText(pairing.by) << " ("
            << RepairUtf8(pairing.fallback) << ")\n";
    }
    if (!pairing.unpairedSecond.empty()) {
        err << "swatchlog merge: note: left out " << pairing.unpairedSecond.size() << " of "
            << measured.Patches().size() << " patches of " << RepairUtf8(measured.Name())
            << " that have no target patch (" << SamplesText(pairing.unpairedSecond) << ")\n";
    }
    if (target.Loaded().Tables().size() > 1) {
        err << "swatchlog merge: note: " << RepairUtf8(output) << " holds table "
            << target.Loaded().Table().number << " of " << RepairUtf8(targetPath) << " alone\n";
    }

    const std::size_t targetCount = target.Patches().size();
    const FailureText failure = DefaultFailureText(output, target.Name());
    const bool appendMissing = parsed.Has("append-missing");
    const bool exact = parsed.Has("exact");
    WriteOutputFile(output, failure, [&](const std::wstring& temporary) {
        CSwatchlogBase& store = target.Store();
        const int code = appendMissing
                             ? store.AppendMissingColumns(target.SourcePath(), temporary, exact)
                             : store.WriteMeasurementFile(target.SourcePath(), temporary);
        if (code == 0) {
            RequirePatchCount(temporary, targetCount,
                              "the merged file would hold a different number of patches than " +
                                  target.Name());
        }
        return code;
    });
    return kExitSuccess;
}

} // namespace swatchlog
