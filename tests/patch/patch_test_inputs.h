// Builders shared by the colour patch tests.
#pragma once

#include <algorithm>
#include <cstdint>
#include <initializer_list>
#include <map>
#include <string>

#include "color_patch_probe.h"
#include "redavudeva/color_patch.h"

namespace patch_test {

/// A mask in which only the spaces in `supplied` count as supplied by the row
/// (0x7FF0 holds every meaningful mask bit).
constexpr std::uint32_t SuppliedOnly(std::uint32_t supplied) {
    return 0x7FF0u & ~supplied;
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

/// A spectrum of `count` (at most 50) equal values on the grid startNm + i * stepNm.
inline SpectralDataStruct FlatSpectrum(int startNm, int stepNm, int count, double value) {
    SpectralDataStruct s{{}, startNm, stepNm, count};
    std::fill(s.values, s.values + count, value);
    return s;
}

/// n-colour channels with the given tone values at positions 0 to n-1.
inline std::map<int, tagNCLR> Channels(std::initializer_list<double> values) {
    std::map<int, tagNCLR> channels;
    for (double value : values) {
        const int at = static_cast<int>(channels.size());
        channels[at] = tagNCLR{6, at, "6CLR_" + std::to_string(at + 1), value};
    }
    return channels;
}

inline int FlagCount(const CColorPatch& p) {
    return p.IsCMYKPresent() + p.IsLABPresent() + p.IsXYZPresent() + p.IsRGBPresent() +
           p.IsSpectralPresent() + p.IsCMYKOGPresent() + p.IsCMYKRGBPresent() +
           p.IsCMYKOGVPresent() + p.IsHTMLCOLORPresent() + p.IsNColorPresent() +
           p.IsDensityAvailable();
}

/// A placeholder patch with the norm weighting and the norm light (96.38, 100, 82.45).
inline CColorPatch PatchWithNorms() {
    CColorPatch patch;
    ColorPatchProbe::computeNormWeighting(patch);
    patch.SetNormLight(tagXYZ{96.38, 100.0, 82.45});
    return patch;
}

/// The chart reader's constructor arguments (no HTML colour or label), zero unless set; Read
/// applies SetMissingColorSpace(mask) as the reader does.
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
    tagDENSITY density;

    CColorPatch Build() const {
        return CColorPatch(cmyk, xyz, lab, rgb, cmykog, cmykrgb, cmykogv, spectral, nColors, {},
                           density, "");
    }
    CColorPatch Read(std::uint32_t mask) const {
        CColorPatch patch = Build();
        patch.SetMissingColorSpace(mask);
        return patch;
    }
};

} // namespace patch_test
