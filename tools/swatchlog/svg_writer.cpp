#include "svg_writer.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <locale>
#include <sstream>

#include "number_format.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

constexpr int kCell = 44;
constexpr int kGap = 4;
constexpr int kMargin = 40;
constexpr int kPlotWidth = 640;
constexpr int kPlotHeight = 300;

std::string Num(double value) {
    return FormatFixed(value, 1);
}

// Black or white, whichever reads better on the patch.
const char* LabelColor(const Rgb8& color) {
    const double luma = 0.299 * color.r + 0.587 * color.g + 0.114 * color.b;
    return luma > 140.0 ? "#000" : "#fff";
}

void DrawPatches(std::ostringstream& svg, const std::vector<PicturePatch>& patches,
                 const PictureLayout& layout, int top) {
    svg << "<g class=\"patches\">\n";
    for (std::size_t i = 0; i < patches.size(); ++i) {
        const auto& patch = patches[i];
        const int row = static_cast<int>(i) / layout.columns;
        const int column = static_cast<int>(i) % layout.columns;
        const int x = kMargin + column * (kCell + kGap);
        const int y = top + row * (kCell + kGap);
        svg << "<g><title>" << patch.sample << " " << XmlText(patch.name) << "\n"
            << XmlText(patch.details) << "</title>";
        svg << "<rect x=\"" << x << "\" y=\"" << y << "\" width=\"" << kCell << "\" height=\""
            << kCell << "\" fill=\"" << HexColor(patch.color) << "\"/>";
        svg << "<text x=\"" << x + 3 << "\" y=\"" << y + 11 << "\" fill=\""
            << LabelColor(patch.color) << "\">" << patch.sample << "</text></g>\n";
    }
    svg << "</g>\n";
    if (layout.fromChart) {
        for (int row = 0; row < layout.rows; ++row) {
            svg << "<text class=\"axis\" x=\"" << kMargin - 6 << "\" y=\""
                << top + row * (kCell + kGap) + kCell / 2 + 4 << "\" text-anchor=\"end\">"
                << row + 1 << "</text>\n";
        }
    }
}

void DrawSpectra(std::ostringstream& svg, const std::vector<PicturePatch>& patches, int top) {
    double lowNm = 1e9;
    double highNm = -1e9;
    double highValue = 1.0;
    for (const auto& patch : patches) {
        if (patch.spectrum.size() < 2) {
            continue;
        }
        lowNm = std::min(lowNm, static_cast<double>(patch.startNm));
        highNm =
            std::max(highNm, static_cast<double>(patch.startNm) +
                                 patch.stepNm * static_cast<double>(patch.spectrum.size() - 1));
        for (const double v : patch.spectrum) {
            if (std::isfinite(v)) {
                highValue = std::max(highValue, v);
            }
        }
    }
    if (highNm <= lowNm) {
        return;
    }
    const int left = kMargin + 10;
    auto xOf = [&](double nm) { return left + (nm - lowNm) / (highNm - lowNm) * kPlotWidth; };
    auto yOf = [&](double v) { return top + kPlotHeight - v / highValue * kPlotHeight; };
    svg << "<text class=\"heading\" x=\"" << kMargin << "\" y=\"" << top - 12
        << "\">Spectra (reflectance factor over wavelength)</text>\n";
    svg << "<rect class=\"plot\" x=\"" << left << "\" y=\"" << top << "\" width=\"" << kPlotWidth
        << "\" height=\"" << kPlotHeight << "\"/>\n";
    for (double v = 0.0; v <= highValue + 1e-9; v += 0.2) {
        svg << "<line class=\"grid\" x1=\"" << left << "\" x2=\"" << left + kPlotWidth << "\" y1=\""
            << Num(yOf(v)) << "\" y2=\"" << Num(yOf(v)) << "\"/>"
            << "<text class=\"axis\" x=\"" << left - 4 << "\" y=\"" << Num(yOf(v) + 4)
            << "\" text-anchor=\"end\">" << FormatFixed(v, 1) << "</text>\n";
    }
    for (int nm = static_cast<int>(std::ceil(lowNm / 50.0)) * 50; nm <= highNm; nm += 50) {
        svg << "<line class=\"grid\" x1=\"" << Num(xOf(nm)) << "\" x2=\"" << Num(xOf(nm))
            << "\" y1=\"" << top << "\" y2=\"" << top + kPlotHeight << "\"/>"
            << "<text class=\"axis\" x=\"" << Num(xOf(nm)) << "\" y=\"" << top + kPlotHeight + 16
            << "\" text-anchor=\"middle\">" << nm << " nm</text>\n";
    }
    svg << "<g class=\"spectra\">\n";
    for (const auto& patch : patches) {
        if (patch.spectrum.size() < 2) {
            continue;
        }
        svg << "<polyline stroke=\"" << HexColor(patch.color) << "\" points=\"";
        for (std::size_t i = 0; i < patch.spectrum.size(); ++i) {
            const double v = std::isfinite(patch.spectrum[i]) ? patch.spectrum[i] : 0.0;
            svg << (i ? " " : "") << Num(xOf(patch.startNm + patch.stepNm * static_cast<double>(i)))
                << "," << Num(yOf(v));
        }
        svg << "\"><title>" << patch.sample << " " << XmlText(patch.name)
            << "</title></polyline>\n";
    }
    svg << "</g>\n";
}

} // namespace

std::string XmlText(std::string_view text) {
    std::string out;
    for (const char c : RepairUtf8(text)) {
        switch (c) {
        case '&':
            out += "&amp;";
            break;
        case '<':
            out += "&lt;";
            break;
        case '>':
            out += "&gt;";
            break;
        case '"':
            out += "&quot;";
            break;
        case '\'':
            out += "&apos;";
            break;
        default:
            if (static_cast<unsigned char>(c) >= 0x20 || c == '\n' || c == '\t') {
                out += c;
            }
        }
    }
    return out;
}

std::string HexColor(const Rgb8& color) {
    std::array<char, 8> text{};
    auto byte = [](int v) { return static_cast<unsigned>(std::clamp(v, 0, 255)); };
    std::snprintf(text.data(), text.size(), "#%02x%02x%02x", byte(color.r), byte(color.g),
                  byte(color.b));
    return text.data();
}

PictureLayout ChooseLayout(int patchCount, int strips, int columns) {
    PictureLayout layout;
    if (strips >= 1 && columns >= 1 && static_cast<long long>(strips) * columns >= patchCount &&
        columns <= 1000) {
        layout.rows = strips;
        layout.columns = columns;
        layout.fromChart = true;
        return layout;
    }
    const int side = std::max(1, static_cast<int>(std::ceil(std::sqrt(std::max(patchCount, 1)))));
    layout.columns = side;
    layout.rows = (std::max(patchCount, 1) + side - 1) / side;
    return layout;
}

std::string DrawChartSvg(const std::string& title, const std::vector<PicturePatch>& patches,
                         const PictureLayout& layout) {
    const bool anySpectrum = std::any_of(patches.begin(), patches.end(), [](const PicturePatch& p) {
        return p.spectrum.size() >= 2;
    });
    const int gridTop = kMargin + 20;
    const int gridHeight = layout.rows * (kCell + kGap);
    const int plotTop = gridTop + gridHeight + 60;
    const int width = std::max(2 * kMargin + layout.columns * (kCell + kGap),
                               anySpectrum ? 2 * kMargin + kPlotWidth + 20 : 0);
    const int height = anySpectrum ? plotTop + kPlotHeight + 40 : gridTop + gridHeight + kMargin;
    std::ostringstream svg;
    svg.imbue(std::locale::classic());
    svg << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
        << "<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" << width << "\" height=\"" << height
        << "\" viewBox=\"0 0 " << width << " " << height << "\">\n"
        << "<style>\n"
        << "text{font-family:sans-serif;font-size:9px}\n"
        << ".heading{font-size:14px;fill:#222}\n"
        << ".axis{font-size:10px;fill:#444}\n"
        << ".patches rect{stroke:#888;stroke-width:0.5}\n"
        << ".patches g:hover rect{stroke:#000;stroke-width:2}\n"
        << ".plot{fill:#a0a0a0}\n"
        << ".grid{stroke:#c8c8c8;stroke-width:0.5}\n"
        << ".spectra polyline{fill:none;stroke-width:1.5;opacity:0.9}\n"
        << ".spectra polyline:hover{stroke-width:4;opacity:1}\n"
        << "</style>\n"
        << "<rect width=\"100%\" height=\"100%\" fill=\"#fff\"/>\n"
        << "<text class=\"heading\" x=\"" << kMargin << "\" y=\"" << kMargin - 8 << "\">"
        << XmlText(title) << "</text>\n";
    DrawPatches(svg, patches, layout, gridTop);
    if (anySpectrum) {
        DrawSpectra(svg, patches, plotTop);
    }
    svg << "</svg>\n";
    return svg.str();
}

} // namespace swatchlog
