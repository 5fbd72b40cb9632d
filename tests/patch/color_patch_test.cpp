// CColorPatch as a value: construction, the wavelength grid derived from the
// spectral field names, the presence marking and engine-free derivations of
// SetMissingColorSpace, and the channel lookups that follow the presence flags.
#include <climits>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::FlagCount;
using patch_test::PatchInput;
using patch_test::Spectrum;
using patch_test::SuppliedOnly;
using SpectralMap = std::map<std::string, double>;
using Values = std::vector<double>;

TEST(ColorPatchConstruction, DefaultPatchIsAnEmptyPlaceholder) {
    const CColorPatch p;
    EXPECT_EQ(FlagCount(p), 0);
    EXPECT_EQ(p.GetRGB().r, -1);
    EXPECT_EQ(p.GetRGB().b, -1);
}

TEST(ColorPatchConstruction, EachConstructorSendsEveryRecordToItsOwnMember) {
    PatchInput in;
    in.cmykrgb = {0, 0, 0, 0, 16, 17, 18}; // sixth argument of the reader's constructor
    in.cmykogv = {0, 0, 0, 0, 19, 20, 21}; // seventh
    in.density = {0.1, 0.2, 0.3, 0.4, 0.5};
    const CColorPatch reader = in.Build();
    EXPECT_EQ(reader.GetDensity().majorFilter, 0.5);
    EXPECT_EQ(FlagCount(reader), 0); // nothing is marked before SetMissingColorSpace

    // The two shorter constructors take CMYKOGV before CMYKRGB.
    const CColorPatch plain({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {}, {}, "P");
    const CColorPatch channels({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {},
                               patch_test::Channels({7}), {}, "N");
    EXPECT_EQ(channels.GetNColorMap().size(), 1u);
    // The Y column sums of the four weighting sets, as published.
    const std::vector<double> ySums{1050.4686900000002, 1140.0734270000003, 1056.73198,
                                    1161.8872599999997};
    for (const CColorPatch* p : {&reader, &plain, &channels}) {
        EXPECT_EQ(p->GetCMYKRGB().b, 18.0);
        EXPECT_EQ(p->GetCMYKOGV().v, 21.0);
        EXPECT_EQ(ColorPatchProbe::normLight(*p).z, 82.45); // the D50 / 2 degree white
        const double* weighting = ColorPatchProbe::normWeighting(*p);
        EXPECT_EQ(std::vector<double>(weighting, weighting + 4), ySums);
    }
}

SpectralDataStruct GridOf(SpectralMap spectral) {
    PatchInput in;
    in.spectral = std::move(spectral);
    return in.Build().GetSpectralDataStruct();
}

// The message of the exception of type E that construction throws.
template <typename E> std::string FailureOf(SpectralMap spectral) {
    try {
        GridOf(std::move(spectral));
    } catch (const E& e) {
        return e.what();
    }
    return "no exception";
}

TEST(SpectralGrid, GridComesFromTheLeastAndGreatestNames) {
    for (const std::string lead : {"SPECTRAL_NM_", "SPECTRAL_"}) {
        const SpectralDataStruct grid = GridOf(Spectrum(lead, 380, 10, 36, 0.01, 0.01));
        EXPECT_EQ(grid.startNm, 380) << lead;
        EXPECT_EQ(grid.stepNm, 10) << lead;
        EXPECT_EQ(grid.count, 36) << lead;
        EXPECT_DOUBLE_EQ(grid.values[35], 0.36) << lead;
    }
    const SpectralDataStruct trailing = GridOf({{"400NM", 0.2}, {"500NM", 0.3}, {"600NM", 0.4}});
    EXPECT_EQ(trailing.startNm, 400);
    EXPECT_EQ(trailing.stepNm, 100);
    // 380, 390, 405 nm: (405 - 380) / 2 = 12.5 truncates to 12.
    EXPECT_EQ(GridOf({{"SPECTRAL_380", 1}, {"SPECTRAL_390", 1}, {"SPECTRAL_405", 1}}).stepNm, 12);
    EXPECT_FALSE(PatchInput().Build().IsSpectralPresent());
}

TEST(SpectralGrid, UnusualSpectraKeepTheGridSafe) {
    // A single value: no step can be derived, so it is 0.
    const SpectralDataStruct single = GridOf({{"SPECTRAL_380", 0.7}});
    EXPECT_EQ(single.count, 1);
    EXPECT_EQ(single.stepNm, 0);

    // 60 values from 300 to 890 nm: the grid keeps the first 50 (300 to 790 nm,
    // step (790 - 300) / 49 = 10), the map keeps all 60.
    PatchInput wide;
    wide.spectral = Spectrum("SPECTRAL_NM_", 300, 10, 60, 0.0, 1.0);
    const CColorPatch p = wide.Build();
    const SpectralDataStruct grid = p.GetSpectralDataStruct();
    EXPECT_EQ(grid.count, 50);
    EXPECT_EQ(grid.stepNm, 10);
    EXPECT_EQ(grid.values[49], 49.0);
    EXPECT_EQ(p.GetSpectralData().size(), 60u);

    // A difference of 4,000,000,000 nm does not fit 32 bits: held at the int maximum.
    EXPECT_EQ(GridOf({{"SPECTRAL_-2000000000", 1}, {"SPECTRAL_2000000000", 1}}).stepNm, INT_MAX);
}

TEST(SpectralGrid, UnreadableNamesRefuseThePatchWithTheLibraryExceptions) {
    // Mixed forms: the greatest name chooses "SPECTRAL_NM_", the least lacks it.
    EXPECT_EQ(FailureOf<std::out_of_range>({{"SPECTRAL_380", 1}, {"SPECTRAL_NM_390", 1}}),
              "invalid string position");
    EXPECT_EQ(FailureOf<std::invalid_argument>({{"SPECTRAL_NM_abc", 1}}), "invalid stol argument");
    EXPECT_EQ(FailureOf<std::invalid_argument>({{"SPECTRAL_380", 1}, {"SPECTRAL_X", 1}}),
              "invalid stol argument");
    EXPECT_EQ(FailureOf<std::out_of_range>({{"SPECTRAL_99999999999", 1}}),
              "stol argument out of range");
}

PatchInput FullRow() {
    PatchInput in;
    in.cmyk = {50, 0, 0, 0};
    in.xyz = {48.19, 50.0, 41.225}; // half the norm light
    in.lab = {1, 2, 3};
    in.rgb = {4, 5, 6};
    in.spectral = Spectrum("SPECTRAL_NM_", 380, 10, 36, 1.0);
    return in;
}

TEST(MissingColorSpaces, SuppliedSpacesAreMarkedAndKeptAsGiven) {
    // Bits 0x1 to 0x8 and above 0x4000 mean nothing.
    for (const std::uint32_t mask : {0u, 0xFFFF800Fu}) {
        const CColorPatch p = FullRow().Read(mask);
        EXPECT_EQ(ColorPatchProbe::missingMask(p), mask);
        EXPECT_EQ(FlagCount(p), 11);
        EXPECT_EQ(p.GetLAB().l, 1.0); // nothing is derived
    }
    // A set bit of a device space only keeps its flag down.
    const CColorPatch p = FullRow().Read(MISSING_CMYKOG | MISSING_HTMLCOLOR | MISSING_CMYKRGB |
                                         MISSING_CMYKOGV | MISSING_NCOLOR);
    EXPECT_EQ(FlagCount(p), 6);
    EXPECT_FALSE(p.IsCMYKOGPresent() || p.IsHTMLCOLORPresent() || p.IsCMYKRGBPresent() ||
                 p.IsCMYKOGVPresent() || p.IsNColorPresent());
}

TEST(MissingColorSpaces, LabAndRgbComeFromXYZThenRgbFromCmyk) {
    PatchInput in = FullRow();
    in.spectral.clear();
    const CColorPatch p = in.Read(SuppliedOnly(MISSING_XYZ));
    EXPECT_EQ(FlagCount(p), 3); // XYZ, Lab and RGB
    // XYZ is half the norm light: f = 0.5^(1/3) = 0.7937005, L* = 116 f - 16.
    EXPECT_NEAR(p.GetLAB().l, 76.06926, 1e-5);
    // RGB type 0: linear 0.499721, 0.500107, 0.499564, companded 0.735173,
    // 0.735427, 0.735069; 255 c + 0.5 floored.
    EXPECT_EQ(p.GetRGB().r, 187);
    EXPECT_EQ(p.GetRGB().g, 188);

    EXPECT_EQ(in.Read(MISSING_RGB).GetRGB().r, 187); // XYZ is preferred over CMYK
    const CColorPatch fromCmyk = in.Read(SuppliedOnly(MISSING_CMYK));
    EXPECT_EQ(fromCmyk.GetRGB().r, 127); // (1 - 0.5) * 255 = 127.5, truncated
    EXPECT_EQ(fromCmyk.GetRGB().g, 255);
    EXPECT_EQ(FlagCount(fromCmyk), 2);

    const CColorPatch nothing = in.Read(patch_test::kAllMissing);
    EXPECT_EQ(FlagCount(nothing), 0);
    EXPECT_EQ(nothing.GetRGB().r, 4);
}

TEST(MissingColorSpaces, CmykIsDerivedFromTheSpectrumAsDensities) {
    // Off the 380 nm / 10 nm / 36-value grid the marker record is stored, still
    // as present; without a spectrum nothing is derived.
    EXPECT_NEAR(FullRow().Read(MISSING_CMYK).GetCMYK().k, 0.0, 1e-9); // a perfect white
    PatchInput off = FullRow();
    off.spectral = Spectrum("SPECTRAL_NM_", 400, 10, 31, 0.5);
    const CColorPatch marker = off.Read(MISSING_CMYK);
    EXPECT_TRUE(marker.IsCMYKPresent());
    EXPECT_EQ(marker.GetCMYK().c, -1.0);
    off.spectral.clear();
    EXPECT_FALSE(off.Read(MISSING_CMYK).IsCMYKPresent());
}

TEST(ChannelValues, NColorChannelsComeBeforeDeviceRecords) {
    PatchInput in;
    in.cmyk = {1, 2, 3, 4};
    in.cmykog = {11, 12, 13, 14, 15, 16};
    in.cmykrgb = {21, 22, 23, 24, 25, 26, 27};
    in.nColors = patch_test::Channels({41, 42, 43, 44, 45, 46});
    CColorPatch cmyk = in.Read(SuppliedOnly(MISSING_CMYK));
    EXPECT_EQ(cmyk.GetChannelValue(3), 4.0);
    EXPECT_EQ(cmyk.GetChannelValue(4), 0.0);
    CColorPatch both = in.Read(SuppliedOnly(MISSING_CMYK | MISSING_NCOLOR));
    EXPECT_EQ(both.GetChannelValue(4), 45.0); // the fifth channel
    EXPECT_EQ(both.GetChannelValue(6), 0.0);
    EXPECT_EQ(both.GetChannelValue(-1), 0.0);
    EXPECT_EQ(both.GetNColorMap().size(), 6u); // out-of-range reads add nothing

    const std::uint32_t devices = MISSING_CMYK | MISSING_CMYKOG | MISSING_CMYKRGB | MISSING_CMYKOGV;
    const std::pair<std::uint32_t, Values> reference[] = {
        {devices | MISSING_NCOLOR, {41, 42, 43, 44, 45, 46}},
        {devices, {21, 22, 23, 24, 25, 26, 27}},
        {MISSING_CMYK | MISSING_CMYKOG, {11, 12, 13, 14, 15, 16}},
        {MISSING_CMYK | MISSING_CMYKOGV, {1, 2, 3, 4}}, // CMYKOGV is never a reference space
        {MISSING_CMYKOGV, {}}};
    for (const auto& r : reference) {
        EXPECT_EQ(in.Read(SuppliedOnly(r.first)).GetReferenceValues(), r.second) << r.first;
    }
}

TEST(ChannelValues, MissingPositionsReadAsZeroAndAreAdded) {
    PatchInput in;
    in.nColors = {{0, tagNCLR{6, 0, "6CLR_1", 7.0}}, {5, tagNCLR{6, 5, "6CLR_6", 9.0}}};
    CColorPatch p = in.Read(SuppliedOnly(MISSING_NCOLOR));
    // Two entries, so positions 0 and 1 are read and 1 is added; three entries
    // now, so the next scan reads (and adds) position 2 as well.
    EXPECT_EQ(p.GetReferenceValues(), (Values{7, 0}));
    EXPECT_EQ(p.GetReferenceValues(), (Values{7, 0, 0}));
    EXPECT_EQ(p.GetNColorMap().size(), 4u);
}

} // namespace
