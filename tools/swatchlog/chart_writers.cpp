#include "chart_writers.h"

#include "chart_model.h"
#include "command_support.h"
#include "file_paths.h"
#include "result_messages.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {
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

void MergeMeasurements(const std::string& targetPath, const std::string& measuredPath,
                       const std::string& outputPath, bool appendMissing, bool exact) {
    const Chart target = Chart::Load(targetPath);
    const Chart measured = Chart::Load(measuredPath);
    if (!measured.Has(Space::Lab) && !measured.Has(Space::Xyz) && !measured.Has(Space::Spectral)) {
        throw ChartError(RepairUtf8(measuredPath) + ": the chart holds no measurements "
                                                    "(no L*a*b*, XYZ or spectra)",
                         measuredPath, 0);
    }
    HandMeasurementsToStore(measured);

    const std::size_t targetCount = target.Patches().size();
    const std::size_t measuredCount = measured.Patches().size();
    const FailureText standard = DefaultFailureText(outputPath, targetPath);
    const FailureText failure = [&](int code) {
        if (code != 24) {
            return standard(code);
        }
        return ChartError(RepairUtf8(targetPath) + ": " +
                              WithCode("the target has " + std::to_string(targetCount) +
                                           " patches but " + RepairUtf8(measuredPath) + " has " +
                                           std::to_string(measuredCount) +
                                           "; the measurements do not fit",
                                       code),
                          targetPath, code);
    };
    WriteOutputFile(outputPath, failure, [&](const std::wstring& temporary) {
        CSwatchlogBase& store = measured.Store();
        return appendMissing ? store.AppendMissingColumns(LibraryPath(targetPath), temporary, exact)
                             : store.WriteMeasurementFile(LibraryPath(targetPath), temporary);
    });
}

void WriteCleanTarget(const std::string& inputPath, const std::string& outputPath) {
    const Chart chart = Chart::Load(inputPath);
    const FailureText standard = DefaultFailureText(outputPath, inputPath);
    const FailureText failure = [&](int code) {
        if (code == 1) {
            return ChartError(RepairUtf8(inputPath) + ": " +
                                  "the chart has no clean and no white patch (no patch prints "
                                  "a single colorant or none) [code 1]",
                              inputPath, code);
        }
        return standard(code);
    };
    WriteOutputFile(outputPath, failure, [&](const std::wstring& temporary) {
        return chart.Store().WriteTargetFile(LibraryPath(inputPath), temporary);
    });
}

} // namespace swatchlog
