// A chart store without a file format, for what a read chart cannot reach: the
// file operations do nothing, and tests put patches and masks
// straight into the store.
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
    using CSwatchlogBase::SetKeyword;
    using CSwatchlogBase::UpdatePresenceFlags;

    using CSwatchlogBase::channelCount;
    using CSwatchlogBase::densityList;
    using CSwatchlogBase::keywordList;
    using CSwatchlogBase::labList;
    using CSwatchlogBase::patches;
    using CSwatchlogBase::xyzList;
};

namespace test_patches {

/// Every missing-space bit: a row that supplied nothing.
constexpr std::uint32_t kNothingSupplied =
    MISSING_CMYK | MISSING_XYZ | MISSING_LAB | MISSING_RGB | MISSING_SPECTRAL | MISSING_CMYKOG |
    MISSING_CMYKRGB | MISSING_HTMLCOLOR | MISSING_NCOLOR | MISSING_CMYKOGV | MISSING_DENSITY;

/// A patch made as the chart reader makes one: full constructor, then the mask
/// of the spaces not `supplied`.
inline CColorPatch Build(const tagCMYK& cmyk, const tagCMYKOG& cmykog, const tagCMYKRGB& cmykrgb,
                         const std::map<int, tagNCLR>& nColors, const std::string& label,
                         std::uint32_t supplied) {
    CColorPatch patch(cmyk, tagXYZ{}, tagLAB{}, tagRGB{}, cmykog, cmykrgb, tagCMYKOGV{}, {},
                      nColors, tagHTMLCOLOR{}, tagDENSITY{}, label);
    patch.SetMissingColorSpace(kNothingSupplied & ~supplied);
    return patch;
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
