#include "patch_values.h"

#include <array>
#include <cstdio>
#include <limits>
#include <optional>

#include "number_format.h"

namespace swatchlog {

std::vector<std::string> SpaceFields(const Chart& chart, Space space) {
    switch (space) {
    case Space::Cmyk:
        return {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"};
    case Space::Rgb:
        return {"RGB_R", "RGB_G", "RGB_B"};
    case Space::NColor:
        return chart.NColorNames();
    case Space::Html:
        return {"DRGB"};
    case Space::Cmykogv:
        return {"ORANGE", "GREEN", "VIOLET"};
    case Space::Xyz:
        return {"XYZ_X", "XYZ_Y", "XYZ_Z"};
    case Space::Lab:
        return {"LAB_L", "LAB_A", "LAB_B"};
    case Space::Density:
        return {"D_RED", "D_GREEN", "D_BLUE", "D_VIS"};
    case Space::Spectral:
        return chart.SpectralFields();
    }
    return {};
}

int SpaceDecimals(Space space) {
    switch (space) {
    case Space::Rgb:
    case Space::Html:
        return 0;
    case Space::Density:
        return 3;
    case Space::Spectral:
        return 4;
    default:
        return 2;
    }
}

namespace {

// The patch's values of a space it holds, one per field; a field the patch has
// no value for (a spectral field or n-colour channel it lacks) is left empty.
std::vector<std::optional<double>> HeldValues(const CColorPatch& patch, Space space,
                                              std::size_t fieldCount) {
    switch (space) {
    case Space::Cmyk: {
        const tagCMYK v = patch.GetCMYK();
        return {v.c, v.m, v.y, v.k};
    }
    case Space::Rgb: {
        const tagRGB v = patch.GetRGB();
        return {static_cast<double>(v.r), static_cast<double>(v.g), static_cast<double>(v.b)};
    }
    case Space::NColor: {
        std::vector<std::optional<double>> values(fieldCount);
        for (const auto& [position, channel] : patch.GetNColorMap()) {
            if (position >= 0 && static_cast<std::size_t>(position) < fieldCount) {
                values[static_cast<std::size_t>(position)] = channel.value;
            }
        }
        return values;
    }
    case Space::Html:
        return {};
    case Space::Cmykogv: {
        const tagCMYKOGV v = patch.GetCMYKOGV();
        return {v.o, v.g, v.v};
    }
    case Space::Xyz: {
        const tagXYZ v = patch.GetXYZ();
        return {v.x, v.y, v.z};
    }
    case Space::Lab: {
        const tagLAB v = patch.GetLAB();
        return {v.l, v.a, v.b};
    }
    case Space::Density: {
        const tagDENSITY v = patch.GetDensity();
        return {v.red, v.green, v.blue, v.visual};
    }
    case Space::Spectral: {
        std::vector<std::optional<double>> values;
        for (const auto& entry : patch.GetSpectralData()) {
            values.emplace_back(entry.second);
        }
        values.resize(fieldCount);
        return values;
    }
    }
    return {};
}

} // namespace

std::vector<double> SpaceNumbers(const CColorPatch& patch, Space space, std::size_t fieldCount) {
    if (!Chart::PatchHas(patch, space)) {
        return {};
    }
    std::vector<double> numbers;
    for (const auto& value : HeldValues(patch, space, fieldCount)) {
        numbers.push_back(value.value_or(std::numeric_limits<double>::quiet_NaN()));
    }
    return numbers;
}

std::string HtmlText(const CColorPatch& patch) {
    const tagHTMLCOLOR html = patch.GetHTMLCOLOR();
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "#%02X%02X%02X", html.r & 0xFFu, html.g & 0xFFu,
                  html.b & 0xFFu);
    return text.data();
}

std::vector<std::string> SpaceCells(const CColorPatch& patch, Space space, std::size_t fieldCount) {
    if (!Chart::PatchHas(patch, space)) {
        return std::vector<std::string>(fieldCount);
    }
    if (space == Space::Html) {
        return {HtmlText(patch)};
    }
    std::vector<std::string> cells;
    for (const auto& value : HeldValues(patch, space, fieldCount)) {
        cells.push_back(value ? FormatFixed(*value, SpaceDecimals(space)) : std::string());
    }
    return cells;
}

std::string DisplayName(const CColorPatch& patch) {
    std::string name = patch.GetLabel();
    if (name.size() >= 2 && name.front() == '"' && name.back() == '"') {
        name = name.substr(1, name.size() - 2);
    }
    return name;
}

} // namespace swatchlog
