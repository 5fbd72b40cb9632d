// A chart store without a file format, for testing the store on its own: the
// file operations do nothing, and tests put patches, keywords and layout
// numbers straight into the store.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "redavudeva/swatchlog_base.h"

class TestStore : public CSwatchlogBase {
public:
    int ReadChartFile(std::wstring) override { return 0; }
    int AppendColumnsWithWhitePoint(std::wstring, std::wstring, CColorPatch, CColorPatch) override {
        return 0;
    }
    int WriteChartFile(std::wstring, std::wstring, bool) override { return 0; }
    int WriteMeasurementFile(std::wstring, std::wstring) override { return 0; }
    int AppendMissingColumns(std::wstring, std::wstring, bool) override { return 0; }
    int InsertKeywords(std::wstring, std::wstring,
                       const std::vector<std::pair<std::string, std::string>>&) override {
        return 0;
    }
    int CanReadFile(std::wstring) override { return 1; }
    int WriteTargetFile(std::wstring, std::wstring) override { return 0; }

    using CSwatchlogBase::AnalyseSpectralKeys;
    using CSwatchlogBase::ReadLayoutKeywords;
    using CSwatchlogBase::ResetChart;
    using CSwatchlogBase::SetKeyword;
    using CSwatchlogBase::UpdatePresenceFlags;

    using CSwatchlogBase::borderPatches;
    using CSwatchlogBase::channelCount;
    using CSwatchlogBase::cmykList;
    using CSwatchlogBase::cmykogList;
    using CSwatchlogBase::cmykogvList;
    using CSwatchlogBase::cmykrgbList;
    using CSwatchlogBase::densityList;
    using CSwatchlogBase::device;
    using CSwatchlogBase::filePath;
    using CSwatchlogBase::hasCMYK;
    using CSwatchlogBase::hasCMYKO;
    using CSwatchlogBase::hasCMYKOG;
    using CSwatchlogBase::hasCMYKOGV;
    using CSwatchlogBase::hasCMYKRGB;
    using CSwatchlogBase::hasDensity;
    using CSwatchlogBase::hasHTMLCOLOR;
    using CSwatchlogBase::hasLAB;
    using CSwatchlogBase::hasNColor;
    using CSwatchlogBase::hasRGB;
    using CSwatchlogBase::hasSpectral;
    using CSwatchlogBase::hasXYZ;
    using CSwatchlogBase::keywordList;
    using CSwatchlogBase::keywordMap;
    using CSwatchlogBase::labList;
    using CSwatchlogBase::missingColorSpaces;
    using CSwatchlogBase::nColorList;
    using CSwatchlogBase::normLight;
    using CSwatchlogBase::numberOfCols;
    using CSwatchlogBase::numberOfFields;
    using CSwatchlogBase::numberOfPages;
    using CSwatchlogBase::numberOfSets;
    using CSwatchlogBase::numberOfStrips;
    using CSwatchlogBase::originalNumberOfSets;
    using CSwatchlogBase::patches;
    using CSwatchlogBase::patchesPerPage;
    using CSwatchlogBase::referenceSampleMap;
    using CSwatchlogBase::rgbList;
    using CSwatchlogBase::sampleNameList;
    using CSwatchlogBase::spectralList;
    using CSwatchlogBase::uvCutMode;
    using CSwatchlogBase::xyzList;
    using CSwatchlogBase::zebraRulerMode;
};

namespace test_patches {

/// Every missing-space bit: a row that supplied nothing.
constexpr std::uint32_t kNothingSupplied =
    MISSING_CMYK | MISSING_XYZ | MISSING_LAB | MISSING_RGB | MISSING_SPECTRAL | MISSING_CMYKOG |
    MISSING_CMYKRGB | MISSING_HTMLCOLOR | MISSING_NCOLOR | MISSING_CMYKOGV | MISSING_DENSITY;

/// What a data row supplies; `supplied` holds the missing-space bits of the
/// colour spaces given (everything else counts as missing).
struct PatchValues {
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
    std::uint32_t supplied = 0;
};

/// A patch made as the chart reader makes one: full constructor, then the
/// row's missing-space mask.
inline CColorPatch Build(const PatchValues& v) {
    CColorPatch patch(v.cmyk, v.xyz, v.lab, v.rgb, v.cmykog, v.cmykrgb, v.cmykogv, v.spectral,
                      v.nColors, v.html, v.density, v.label);
    patch.SetMissingColorSpace(kNothingSupplied & ~v.supplied);
    return patch;
}

/// A patch that supplies CMYK and XYZ only (Lab and RGB are derived without the
/// colour engine).
inline CColorPatch Cmyk(double c, double m, double y, double k, tagXYZ xyz = {}) {
    PatchValues v;
    v.cmyk = {c, m, y, k};
    v.xyz = xyz;
    v.supplied = MISSING_CMYK | MISSING_XYZ;
    return Build(v);
}

/// A patch that supplies n-colour channels 0 to values.size() - 1 only.
inline CColorPatch NColor(const std::vector<double>& values) {
    PatchValues v;
    for (std::size_t i = 0; i < values.size(); ++i) {
        tagNCLR channel;
        channel.channel = static_cast<int>(i);
        channel.value = values[i];
        v.nColors[static_cast<int>(i)] = channel;
    }
    v.supplied = MISSING_NCOLOR;
    return Build(v);
}

/// Spectral field names "<leadIn><wavelength>" from `first` to `last` in steps
/// of `step`, each with the value `value`.
inline std::map<std::string, double> Spectrum(const std::string& leadIn, int first, int last,
                                              int step, double value = 0.5) {
    std::map<std::string, double> spectrum;
    for (int nm = first; nm <= last; nm += step) {
        spectrum[leadIn + std::to_string(nm)] = value;
    }
    return spectrum;
}

} // namespace test_patches
