// swatchlog convert: a clean CGATS file written from the chart by the library's
// new-file writer.
#include <algorithm>

#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "keyword_names.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kConvertHelp =
    "Usage: swatchlog convert CHART -o OUT\n\n"
    "Writes a clean CGATS.17 file: the chart's keywords (with KEYWORD declarations\n"
    "for the ones the format does not define), sample names, device values (CMYK,\n"
    "RGB, n-colour channels) and measurements (XYZ, L*a*b*, spectra). XYZ and\n"
    "L*a*b* derived from the spectra are written where the file had none. OUT is\n"
    "written whole or not at all and may not be CHART itself.\n";

namespace {

void HandListsToStore(const Chart& chart, std::ostream& err) {
    CSwatchlogBase& store = chart.Store();
    const auto& patches = chart.Patches();
    // The file may name several process colours; the chart keeps their names.
    std::vector<std::string> processColors;
    if (store.GetProcessColorNames(processColors) != 0) {
        processColors.clear();
    }
    store.SetKeywordList(OutputKeywords(chart.Keywords(), processColors));

    const bool named = std::any_of(patches.begin(), patches.end(),
                                   [](const CColorPatch& p) { return !p.GetLabel().empty(); });
    if (named) {
        std::vector<std::string> names;
        for (const auto& patch : patches) {
            names.push_back(patch.GetLabel());
        }
        store.SetSampleNameList(names);
    }
    if (chart.Has(Space::Cmyk)) {
        std::vector<tagCMYK> cmyk;
        for (const auto& patch : patches) {
            cmyk.push_back(patch.GetCMYK());
        }
        store.SetCMYKList(cmyk);
    }
    if (chart.Has(Space::Rgb) && !chart.Derived(Space::Rgb)) {
        std::vector<tagRGB> rgb;
        for (const auto& patch : patches) {
            rgb.push_back(patch.GetRGB());
        }
        store.SetRGBList(rgb);
    }
    if (chart.Has(Space::NColor)) {
        std::vector<std::map<int, tagNCLR>> channels;
        for (const auto& patch : patches) {
            channels.push_back(patch.GetNColorMap());
        }
        store.SetNColorList(channels);
    }
    if (chart.Has(Space::Spectral)) {
        store.SetSpectralDataList(store.GetSpectralDataList(), false);
    }
    if (chart.Has(Space::Xyz)) {
        std::vector<tagXYZ> xyz;
        for (const auto& patch : patches) {
            xyz.push_back(patch.GetXYZ());
        }
        store.SetXYZList(xyz);
    }
    if (chart.Has(Space::Lab)) {
        std::vector<tagLAB> lab;
        for (const auto& patch : patches) {
            lab.push_back(patch.GetLAB());
        }
        store.SetLABList(lab);
    }
    for (const Space dropped : {Space::Html, Space::Cmykogv, Space::Density}) {
        if (chart.Has(dropped) && !chart.Derived(dropped)) {
            err << "swatchlog convert: note: the values of " << NameOf(dropped).title
                << " are not written; the new-file format has no columns for them\n";
        }
    }
}

} // namespace

int RunConvert(const Words& args, std::ostream& /*out*/, std::ostream& err) {
    const ParsedArguments parsed = ParseArguments(args, {{"output", 'o', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input);
    HandListsToStore(chart, err);
    WriteOutputFile(output, DefaultFailureText(output, input), [&](const std::wstring& temporary) {
        return chart.Store().WriteChartFile(L"", temporary, false);
    });
    return kExitSuccess;
}

} // namespace swatchlog
