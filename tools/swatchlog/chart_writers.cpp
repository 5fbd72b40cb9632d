#include "chart_writers.h"

#include <algorithm>

#include "chart_model.h"
#include "command_support.h"
#include "device_agreement.h"
#include "number_format.h"
#include "patch_values.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

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
                                 " has no " + NameOf(space).title + "; nothing was written",
                             measured.Path(), 0);
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
                  double tolerance, const Remark& note) {
    const DeviceAgreement agreement = CheckDeviceValues(target, measured, pairing, tolerance);
    if (agreement.space.empty()) {
        note("the device values were not compared: " + RepairUtf8(target.Name()) + " and " +
             RepairUtf8(measured.Name()) + " carry none of the same kind");
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

void MergeMeasurements(const std::string& targetPath, const std::string& measuredPath,
                       const std::string& outputPath, const MergeOptions& options,
                       const Remark& note) {
    const Chart target = Chart::Load(targetPath, options.targetTable);
    const Chart measured = Chart::Load(measuredPath, options.measuredTable);
    if (!measured.Has(Space::Lab) && !measured.Has(Space::Xyz) && !measured.Has(Space::Spectral)) {
        throw ChartError(measured.Name() + ": the chart holds no measurements "
                                           "(no L*a*b*, XYZ or spectra)",
                         measuredPath, 0);
    }
    const Pairing pairing = PairPatches(target, measured, options.by);
    const std::vector<std::size_t> partner =
        PartnerOfEachTarget(target, measured, pairing, options.allowUnpaired);
    CheckDevices(target, measured, pairing, options.deviceTolerance, note);
    HandMeasurementsToStore(target, measured, partner);
    if (!pairing.fallback.empty()) {
        note("paired by " + std::string(PairByText(pairing.by)) + " (" +
             RepairUtf8(pairing.fallback) + ")");
    }
    if (!pairing.unpairedSecond.empty()) {
        note("left out " + std::to_string(pairing.unpairedSecond.size()) + " of " +
             std::to_string(measured.Patches().size()) + " patches of " +
             RepairUtf8(measured.Name()) + " that have no target patch (" +
             SamplesText(pairing.unpairedSecond) + ")");
    }
    if (target.Loaded().Tables().size() > 1) {
        note(RepairUtf8(outputPath) + " holds table " +
             std::to_string(target.Loaded().Table().number) + " of " + RepairUtf8(targetPath) +
             " alone");
    }

    const std::size_t targetCount = target.Patches().size();
    WriteOutputFile(
        outputPath, DefaultFailureText(outputPath, target), [&](const std::wstring& temporary) {
            CSwatchlogBase& store = target.Store();
            const int code =
                options.appendMissing
                    ? store.AppendMissingColumns(target.SourcePath(), temporary, options.exact)
                    : store.WriteMeasurementFile(target.SourcePath(), temporary);
            if (code == 0) {
                RequirePatchCount(temporary, targetCount,
                                  "the merged file would hold a different number "
                                  "of patches than " +
                                      target.Name());
            }
            return code;
        });
}

void WriteCleanTarget(const std::string& inputPath, const std::string& outputPath, int table,
                      bool force, const Remark& warning) {
    const Chart chart = Chart::Load(inputPath, table);
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
        if (!force) {
            throw ChartError(chart.Name() + ": " + text + "; --force writes it anyway", inputPath,
                             0);
        }
        warning(chart.Name() + ": " + text);
    }
    const FailureText standard = DefaultFailureText(outputPath, chart);
    const FailureText failure = [&](int code) {
        if (code == 1) {
            return ChartError(chart.Name() + ": " +
                                  "the chart has no clean and no white patch (no patch prints a "
                                  "single colorant or none) [code 1]",
                              inputPath, code);
        }
        return standard(code);
    };
    std::vector<CColorPatch> selected;
    chart.Store().SelectCleanAndWhitePatches(selected, true);
    WriteOutputFile(outputPath, failure, [&](const std::wstring& temporary) {
        const int code = chart.Store().WriteTargetFile(chart.SourcePath(), temporary);
        if (code == 0) {
            // A chart without CMYK or n-colour values gives a target without rows.
            RequirePatchCount(temporary, selected.size(),
                              chart.Name() + ": the target file of its " +
                                  std::to_string(selected.size()) + " clean and white patches");
        }
        return code;
    });
}

} // namespace swatchlog
