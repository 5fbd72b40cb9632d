// Building blocks of the SVG picture: escaped text, colours, the chart layout
// and the drawing of patches and spectra.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "srgb.h"

namespace swatchlog {

/// Text safe inside XML elements and attribute values (valid UTF-8, no
/// control characters, markup characters escaped).
std::string XmlText(std::string_view text);
/// "#rrggbb".
std::string HexColor(const Rgb8& color);

struct PicturePatch {
    int sample = 0;
    std::string name;
    Rgb8 color;
    std::string details;          ///< shown on hover, after the name
    std::vector<double> spectrum; ///< reflectance factors; empty when not plotted
    int startNm = 0;
    int stepNm = 0;
};

struct PictureLayout {
    int rows = 0;
    int columns = 0;
    bool fromChart = false; ///< strips and columns of the chart, else a square grid
};

/// Strips of the chart as rows when the layout is known (enough strips and
/// columns for every patch), else the smallest square grid.
PictureLayout ChooseLayout(int patchCount, int strips, int columns);

/// The whole SVG document: the patches in their places, then the spectra of
/// the patches that have one.
std::string DrawChartSvg(const std::string& title, const std::vector<PicturePatch>& patches,
                         const PictureLayout& layout);

} // namespace swatchlog
