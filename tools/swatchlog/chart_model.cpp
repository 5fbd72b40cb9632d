#include "chart_model.h"

#include <algorithm>
#include <exception>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <system_error>

#include "chart_scan.h"
#include "file_paths.h"
#include "result_messages.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

std::vector<std::string> SplitWords(const std::string& text) {
    std::istringstream in(text);
    std::vector<std::string> words;
    std::string word;
    while (in >> word) {
        words.push_back(word);
    }
    return words;
}

std::string FirstWordOfFile(const std::string& path) {
    std::ifstream in(FileSystemPath(path), std::ios::binary);
    std::string line;
    while (std::getline(in, line)) {
        const auto words = SplitWords(line);
        if (!words.empty()) {
            return words[0];
        }
    }
    return "";
}

std::string TrimRight(std::string text) {
    text.erase(text.find_last_not_of(" \t\r\n") + 1);
    return text;
}

} // namespace

const std::vector<SpaceName>& AllSpaces() {
    static const std::vector<SpaceName> spaces{
        {Space::Cmyk, "cmyk", "CMYK"},
        {Space::Rgb, "rgb", "RGB"},
        {Space::NColor, "ncolor", "n-colour channels"},
        {Space::Html, "html", "HTML colour"},
        {Space::Cmykogv, "cmykogv", "CMYK with orange, green, violet"},
        {Space::Xyz, "xyz", "XYZ"},
        {Space::Lab, "lab", "L*a*b*"},
        {Space::Density, "density", "densities"},
        {Space::Spectral, "spectral", "spectra"}};
    return spaces;
}

const SpaceName& NameOf(Space space) {
    const auto& spaces = AllSpaces();
    return *std::find_if(spaces.begin(), spaces.end(),
                         [space](const SpaceName& name) { return name.space == space; });
}

bool SpaceFromKey(const std::string& key, Space& space) {
    for (const auto& name : AllSpaces()) {
        if (key == name.key) {
            space = name.space;
            return true;
        }
    }
    return false;
}

std::string DescribeLibraryException(const std::exception& error) {
    const std::string what = error.what();
    if (what == "invalid stol argument" || what == "stol argument out of range") {
        return "a layout keyword (NUMBER_OF_STRIPS, NUMBER_OF_COLS) or a spectral field name "
               "does not hold a usable whole number (" +
               what + ")";
    }
    if (what == "invalid string position") {
        return "the spectral field names do not follow one naming scheme (" + what + ")";
    }
    return "the library stopped with an error: " + what;
}

Chart Chart::Load(const std::string& path) {
    Chart chart;
    chart.path_ = path;
    const std::wstring libraryPath = LibraryPath(path);
    std::error_code ec;
    if (std::filesystem::is_directory(FileSystemPath(path), ec)) {
        throw ChartError(RepairUtf8(path) + ": is a folder, not a chart file", path, 0);
    }
    chart.store_.reset(CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    if (!chart.store_) {
        throw ChartError("the library offers no chart reader");
    }
    int code = 0;
    try {
        code = chart.store_->ReadChartFile(libraryPath);
    } catch (const std::exception& error) {
        // The library's own exception stays attached, for callers that tell its kind apart.
        std::throw_with_nested(
            ChartError(RepairUtf8(path) + ": " + DescribeLibraryException(error), path, 0));
    }
    if (code != 0) {
        throw ChartError(RepairUtf8(path) + ": " +
                             WithCode(ExplainReadFailure(code, ScanChartFile(path)), code),
                         path, code);
    }
    chart.fields_ = SplitWords(chart.store_->GetDataFormatLine());
    chart.patches_ = chart.store_->GetPatchList();
    chart.identification_ = FirstWordOfFile(path);
    return chart;
}

bool Chart::FileHasField(const std::string& field) const {
    return std::find(fields_.begin(), fields_.end(), field) != fields_.end();
}

bool Chart::PatchHas(const CColorPatch& patch, Space space) {
    switch (space) {
    case Space::Cmyk:
        return patch.IsCMYKPresent();
    case Space::Rgb:
        return patch.IsRGBPresent();
    case Space::NColor:
        return patch.IsNColorPresent();
    case Space::Html:
        return patch.IsHTMLCOLORPresent();
    case Space::Cmykogv:
        return patch.IsCMYKOGVPresent();
    case Space::Xyz:
        return patch.IsXYZPresent();
    case Space::Lab:
        return patch.IsLABPresent();
    case Space::Density:
        return patch.IsDensityAvailable();
    case Space::Spectral:
        return patch.IsSpectralPresent();
    }
    return false;
}

bool Chart::Has(Space space) const {
    // A patch derives CMYK from its spectrum as densities; that is not device CMYK.
    if (space == Space::Cmyk && !FileHasField("CMYK_C")) {
        return false;
    }
    return std::any_of(patches_.begin(), patches_.end(),
                       [space](const CColorPatch& patch) { return PatchHas(patch, space); });
}

bool Chart::Derived(Space space) const {
    if (!Has(space)) {
        return false;
    }
    switch (space) {
    case Space::Rgb:
        return !FileHasField("RGB_R");
    case Space::Xyz:
        return !FileHasField("XYZ_X");
    case Space::Lab:
        return !FileHasField("LAB_L");
    case Space::Density:
        return !FileHasField("D_RED");
    default:
        return false;
    }
}

KeywordList Chart::Keywords() const {
    KeywordList keywords;
    for (const auto& [key, value] : store_->GetKeywords()) {
        if (key == identification_ || key.empty() || key[0] == '#' || key == "KEYWORD" ||
            key == "PROCESSCOLOR_ID") {
            continue;
        }
        keywords.emplace_back(key, TrimRight(value));
    }
    return keywords;
}

std::vector<std::string> Chart::SpectralFields() const {
    for (const auto& patch : patches_) {
        if (patch.IsSpectralPresent()) {
            std::vector<std::string> names;
            for (const auto& entry : patch.GetSpectralData()) {
                names.push_back(entry.first);
            }
            return names;
        }
    }
    return {};
}

std::vector<std::string> Chart::NColorNames() const {
    for (const auto& patch : patches_) {
        if (patch.IsNColorPresent()) {
            std::vector<std::string> names;
            for (const auto& entry : patch.GetNColorMap()) {
                names.push_back(entry.second.name);
            }
            return names;
        }
    }
    return {};
}

} // namespace swatchlog
