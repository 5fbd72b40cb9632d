// Patches for the colour patch tests: the reader constructor's arguments with
// defaults, spectra on regular grids and masks naming the supplied spaces.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <map>
#include <string>

#include "redavudeva/color_patch.h"

namespace patch_test {

constexpr std::uint32_t kAllMissing = 0x7FF0; // every meaningful mask bit

/// A mask in which only the spaces in `supplied` count as supplied by the row.
constexpr std::uint32_t SuppliedOnly(std::uint32_t supplied) {
    return kAllMissing & ~supplied;
}

/// `count` values named lead + wavelength; the value at index i is first + i * increment.
inline std::map<std::string, double> Spectrum(const std::string& lead, int startNm, int stepNm,
                                              int count, double first = 1.0,
                                              double increment = 0.0) {
    std::map<std::string, double> spectrum;
    for (int i = 0; i < count; ++i) {
        spectrum[lead + std::to_string(startNm + i * stepNm)] = first + i * increment;
    }
    return spectrum;
}

/// n-colour channels with the given tone values at positions 0 to n-1.
inline std::map<int, tagNCLR> Channels(std::initializer_list<double> values) {
    std::map<int, tagNCLR> channels;
    for (double value : values) {
        const int position = static_cast<int>(channels.size());
        channels[position] = tagNCLR{6, position, "6CLR_" + std::to_string(position + 1), value};
    }
    return channels;
}

/// Number of raised presence flags.
inline int FlagCount(const CColorPatch& p) {
    return p.IsCMYKPresent() + p.IsLABPresent() + p.IsXYZPresent() + p.IsRGBPresent() +
           p.IsSpectralPresent() + p.IsCMYKOGPresent() + p.IsCMYKRGBPresent() +
           p.IsCMYKOGVPresent() + p.IsHTMLCOLORPresent() + p.IsNColorPresent() +
           p.IsDensityAvailable();
}

struct PatchInput {
    tagCMYK cmyk;
    tagXYZ xyz;
    tagLAB lab;
    tagRGB rgb;
    tagCMYKOG cmykog;
    tagCMYKRGB cmykrgb;
    tagCMYKOGV cmykogv;
    std::map<std::string, double> spectral;
    std::map<int, tagNCLR> nColors;
    tagHTMLCOLOR html;
    tagDENSITY density;
    std::string label;

    CColorPatch Build() const {
        return CColorPatch(cmyk, xyz, lab, rgb, cmykog, cmykrgb, cmykogv, spectral, nColors, html,
                           density, label);
    }
    /// A built patch after SetMissingColorSpace(mask), as the chart reader makes it.
    CColorPatch Read(std::uint32_t mask) const {
        CColorPatch patch = Build();
        patch.SetMissingColorSpace(mask);
        return patch;
    }
};

} // namespace patch_test
