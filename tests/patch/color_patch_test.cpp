// CColorPatch as a value: construction, the wavelength grid derived from the
// spectral field names, the presence marking and engine-free derivations of
// SetMissingColorSpace, and the channel lookups that follow the presence flags.
#include <stdexcept>
#include <string>
#include <utility>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::FlagCount;
using patch_test::PatchInput;
using patch_test::Spectrum;
using patch_test::SuppliedOnly;
using SpectralMap = std::map<std::string, double>;

TEST(ColorPatchConstruction, EachConstructorSendsEveryRecordToItsOwnMember) {
    PatchInput in;
    in.cmykrgb = {0, 0, 0, 0, 16, 17, 18}; // sixth argument of the reader's constructor
    in.cmykogv = {0, 0, 0, 0, 19, 20, 21}; // seventh
    const CColorPatch reader = in.Build();
    EXPECT_EQ(FlagCount(reader), 0); // nothing is marked before SetMissingColorSpace

    // The two shorter constructors take CMYKOGV before CMYKRGB.
    const CColorPatch plain({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {}, {}, "P");
    const CColorPatch channels({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {},
                               patch_test::Channels({7}), {}, "N");
    for (const CColorPatch* p : {&reader, &plain, &channels}) {
        EXPECT_EQ(p->GetCMYKRGB().b, 18.0);
        EXPECT_EQ(p->GetCMYKOGV().v, 21.0);
        EXPECT_EQ(ColorPatchProbe::normLight(*p).z, 82.45); // the D50 / 2 degree white
        // The Y column sum of the 10 degree D50 weighting set, as published.
        EXPECT_EQ(ColorPatchProbe::normWeighting(*p)[1], 1140.0734270000003);
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
        EXPECT_TRUE(grid.startNm == 380 && grid.stepNm == 10 && grid.count == 36) << lead;
        EXPECT_DOUBLE_EQ(grid.values[35], 0.36) << lead;
    }
    // 380, 390, 405 nm: (405 - 380) / 2 = 12.5 truncates to 12.
    EXPECT_EQ(GridOf({{"SPECTRAL_380", 1}, {"SPECTRAL_390", 1}, {"SPECTRAL_405", 1}}).stepNm, 12);
}

TEST(SpectralGrid, UnusualSpectraKeepTheGridSafe) {
    // A single value: no step can be derived, so it is 0.
    const SpectralDataStruct single = GridOf({{"SPECTRAL_380", 0.7}});
    EXPECT_TRUE(single.count == 1 && single.stepNm == 0);

    // 60 values from 300 to 890 nm: the grid keeps the first 50 (300 to 790 nm,
    // step (790 - 300) / 49 = 10), the map keeps all 60.
    PatchInput wide;
    wide.spectral = Spectrum("SPECTRAL_NM_", 300, 10, 60, 0.0, 1.0);
    const CColorPatch p = wide.Build();
    const SpectralDataStruct grid = p.GetSpectralDataStruct();
    EXPECT_TRUE(grid.count == 50 && grid.stepNm == 10);
    EXPECT_EQ(p.GetSpectralData().size(), 60u);
}

TEST(SpectralGrid, UnreadableNamesRefuseThePatchWithTheLibraryExceptions) {
    // Mixed forms: the greatest name chooses "SPECTRAL_NM_", the least lacks it.
    EXPECT_EQ(FailureOf<std::out_of_range>({{"SPECTRAL_380", 1}, {"SPECTRAL_NM_390", 1}}),
              "invalid string position");
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
    const CColorPatch all = FullRow().Read(0xFFFF800Fu);
    EXPECT_EQ(FlagCount(all), 11);
    EXPECT_EQ(all.GetLAB().l, 1.0); // nothing is derived
    // A set bit of a device space only keeps its flag down.
    const CColorPatch p = FullRow().Read(MISSING_CMYKOG | MISSING_HTMLCOLOR | MISSING_CMYKRGB |
                                         MISSING_CMYKOGV | MISSING_NCOLOR);
    EXPECT_EQ(FlagCount(p), 6);
}

TEST(MissingColorSpaces, LabAndRgbComeFromXYZThenRgbFromCmyk) {
    PatchInput in = FullRow();
    in.spectral.clear();
    const CColorPatch p = in.Read(SuppliedOnly(MISSING_XYZ));
    EXPECT_EQ(FlagCount(p), 3); // XYZ, Lab and RGB
    // XYZ is half the norm light: f = 0.5^(1/3) = 0.7937005, L* = 116 f - 16;
    // RGB type 0: linear 0.499721, companded 0.735173; 255 c + 0.5 floored.
    EXPECT_NEAR(p.GetLAB().l, 76.06926, 1e-5);
    EXPECT_EQ(p.GetRGB().r, 187);

    EXPECT_EQ(in.Read(MISSING_RGB).GetRGB().r, 187); // XYZ is preferred over CMYK
    const CColorPatch fromCmyk = in.Read(SuppliedOnly(MISSING_CMYK));
    EXPECT_EQ(fromCmyk.GetRGB().r, 127); // (1 - 0.5) * 255 = 127.5, truncated
    EXPECT_EQ(FlagCount(fromCmyk), 2);
}

TEST(MissingColorSpaces, CmykIsDerivedFromTheSpectrumAsDensities) {
    // Without a spectrum nothing is derived.
    EXPECT_NEAR(FullRow().Read(MISSING_CMYK).GetCMYK().k, 0.0, 1e-9); // a perfect white
    PatchInput off = FullRow();
    off.spectral.clear();
    EXPECT_FALSE(off.Read(MISSING_CMYK).IsCMYKPresent());
}

} // namespace
