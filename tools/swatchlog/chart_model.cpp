#include "chart_model.h"

#include <algorithm>

namespace swatchlog {
namespace {

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

Chart Chart::Load(const std::string& path, int table) {
    Chart chart(LoadTable(path, table));
    chart.patches_ = chart.Store().GetPatchList();
    chart.sampleIds_ = chart.loaded_.ColumnText("SAMPLE_ID");
    if (chart.sampleIds_.size() != chart.patches_.size()) {
        chart.sampleIds_.clear();
    }
    return chart;
}

std::string Chart::SampleId(std::size_t index) const {
    return index < sampleIds_.size() ? sampleIds_[index] : std::string();
}

bool Chart::FileHasField(const std::string& field) const {
    return FieldColumn(loaded_.Text(), field) >= 0;
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

const char* SupplyingField(Space space) {
    switch (space) {
    case Space::Cmyk:
        return "CMYK_C";
    case Space::Rgb:
        return "RGB_R";
    case Space::Xyz:
        return "XYZ_X";
    case Space::Lab:
        return "LAB_L";
    case Space::Density:
        return "D_RED";
    default:
        return nullptr;
    }
}

bool Chart::Derived(Space space) const {
    const char* field = SupplyingField(space);
    return field != nullptr && Has(space) && !FileHasField(field);
}

KeywordList TableKeywords(const LoadedTable& table) {
    KeywordList keywords;
    const std::string& identification = table.Table().identification;
    for (const auto& [key, value] : table.Chart().GetKeywords()) {
        if (key == identification || key.empty() || key[0] == '#' || key == "KEYWORD" ||
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
