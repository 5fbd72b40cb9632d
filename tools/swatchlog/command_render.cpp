// swatchlog render: an SVG picture of the chart's patches and spectra.
#include <fstream>
#include <set>

#include "arguments.h"
#include "chart_model.h"
#include "command_support.h"
#include "commands.h"
#include "file_paths.h"
#include "number_format.h"
#include "patch_values.h"
#include "srgb.h"
#include "svg_writer.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

const char* const kRenderHelp =
    "Usage: swatchlog render CHART -o OUT.svg [--samples LIST] [--table N]\n\n"
    "Draws every patch in its colour: sRGB from XYZ or L*a*b* (D50, adapted to D65\n"
    "with the Bradford transform), from the device values only where the chart has\n"
    "no colorimetry. Patches stand in their strips and columns when the chart gives\n"
    "NUMBER_OF_STRIPS and NUMBER_OF_COLS, else in a square grid; hovering shows the\n"
    "sample name and values. Below, the spectra are plotted: of all patches, or of\n"
    "the samples in LIST (comma-separated sample numbers). The picture needs no\n"
    "more than a web browser. OUT is written whole or not at all. --table N\n"
    "picks the table of a file that holds several (default: the first with data).\n";

namespace {

// The display colour and how it was found: the file's own L*a*b* first (no
// round trip through a derived XYZ), then XYZ, then a derived L*a*b*.
Rgb8 DisplayColor(const Chart& chart, const CColorPatch& patch, std::string& source) {
    const bool fileLab = chart.FileHasField("LAB_L") && patch.IsLABPresent();
    if (!fileLab && patch.IsXYZPresent()) {
        const tagXYZ xyz = patch.GetXYZ();
        source = "sRGB from XYZ";
        return SrgbFromXyzD50({xyz.x / 100.0, xyz.y / 100.0, xyz.z / 100.0});
    }
    if (patch.IsLABPresent()) {
        const tagLAB lab = patch.GetLAB();
        source = "sRGB from L*a*b*";
        return SrgbFromXyzD50(XyzFromLabD50({lab.l, lab.a, lab.b}));
    }
    if (patch.IsRGBPresent() && chart.FileHasField("RGB_R")) {
        const tagRGB rgb = patch.GetRGB();
        source = "device RGB";
        return {rgb.r, rgb.g, rgb.b};
    }
    if (patch.IsHTMLCOLORPresent()) {
        const tagHTMLCOLOR html = patch.GetHTMLCOLOR();
        source = "HTML colour";
        return {static_cast<int>(html.r & 0xFF), static_cast<int>(html.g & 0xFF),
                static_cast<int>(html.b & 0xFF)};
    }
    if (patch.IsCMYKPresent() && chart.FileHasField("CMYK_C")) {
        const tagCMYK c = patch.GetCMYK();
        source = "device CMYK, not colour-managed";
        return RgbFromCmykPercent(c.c, c.m, c.y, c.k);
    }
    source = "no colour data";
    return {128, 128, 128};
}

std::string Details(const Chart& chart, const CColorPatch& patch, const std::string& source) {
    std::string text;
    for (const Space space : {Space::Cmyk, Space::NColor, Space::Lab}) {
        if (!chart.Has(space) || !Chart::PatchHas(patch, space)) {
            continue;
        }
        const auto fields = SpaceFields(chart, space);
        const auto cells = SpaceCells(patch, space, fields.size());
        text += std::string(NameOf(space).title) + " ";
        for (std::size_t i = 0; i < cells.size(); ++i) {
            text += (i ? " " : "") + cells[i];
        }
        text += "\n";
    }
    return text + "shown as " + source;
}

std::set<int> SelectedSamples(const ParsedArguments& parsed, int patchCount) {
    std::set<int> samples;
    if (!parsed.Has("samples")) {
        for (int i = 1; i <= patchCount; ++i) {
            samples.insert(i);
        }
        return samples;
    }
    for (const auto& item : SplitList(parsed.Value("samples"))) {
        if (item.find_first_not_of("0123456789") != std::string::npos || item.size() > 9) {
            throw UsageError("--samples takes sample numbers, not \"" + RepairUtf8(item) + "\"");
        }
        const int sample = std::stoi(item);
        if (sample < 1 || sample > patchCount) {
            throw UsageError("--samples: the chart has no sample " + item);
        }
        samples.insert(sample);
    }
    if (samples.empty()) {
        throw UsageError("--samples names no sample");
    }
    return samples;
}

} // namespace

int RunRender(const Words& args, std::ostream& /*out*/, std::ostream& /*err*/) {
    const ParsedArguments parsed = ParseArguments(
        args, {{"output", 'o', true}, {"samples", '\0', true}, {"table", '\0', true}});
    RequirePositionals(parsed, 1, 1, "the chart file");
    const std::string input = parsed.positionals[0];
    const std::string output = RequireOutputPath(parsed, {input});
    const Chart chart = Chart::Load(input, TableOption(parsed));
    const int count = static_cast<int>(chart.Patches().size());
    const std::set<int> plotted = SelectedSamples(parsed, count);

    std::vector<PicturePatch> pictures;
    int sample = 1;
    for (const auto& patch : chart.Patches()) {
        PicturePatch picture;
        picture.sample = sample;
        picture.name = DisplayName(patch);
        std::string source;
        picture.color = DisplayColor(chart, patch, source);
        picture.details = Details(chart, patch, source);
        if (patch.IsSpectralPresent() && plotted.count(sample) != 0) {
            const SpectralDataStruct grid = patch.GetSpectralDataStruct();
            picture.startNm = grid.startNm;
            picture.stepNm = grid.stepNm;
            for (const auto& entry : patch.GetSpectralData()) {
                picture.spectrum.push_back(entry.second);
            }
            if (grid.stepNm <= 0) {
                picture.spectrum.clear();
            }
        }
        pictures.push_back(std::move(picture));
        ++sample;
    }
    const PictureLayout layout =
        ChooseLayout(count, chart.Store().GetNumberOfStrips(), chart.Store().GetNumberOfCols());
    std::string title = RepairUtf8(FileSystemPath(input).filename().u8string());
    if (chart.Loaded().Tables().size() > 1) {
        title += ", table " + std::to_string(chart.Loaded().Table().number);
    }
    const std::string svg =
        DrawChartSvg(title + " - " + std::to_string(count) + " patches", pictures, layout);

    PendingOutput pending(output);
    {
        std::ofstream file(FileSystemPath(pending.TemporaryPath()), std::ios::binary);
        file << svg;
        file.close();
        if (!file) {
            throw ChartError(RepairUtf8(output) + ": cannot be written");
        }
    }
    pending.Commit();
    return kExitSuccess;
}

} // namespace swatchlog
