// Presence marking and the derivations of SetMissingColorSpace that need no
// colour engine (the engine-backed steps are in the engine double tests).
#include <gtest/gtest.h>

#include "color_patch_probe.h"
#include "patch_test_inputs.h"

namespace {

using patch_test::FlagCount;
using patch_test::PatchInput;
using patch_test::SuppliedOnly;

PatchInput FullRow() {
    PatchInput in;
    in.cmyk = {50, 0, 0, 0};
    in.xyz = {48.19, 50.0, 41.225};
    in.lab = {1, 2, 3};
    in.rgb = {4, 5, 6};
    in.spectral = patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 1.0);
    return in;
}

TEST(MissingColorSpaces, SuppliedSpacesAreMarkedAndKeptAsGiven) {
    // Bits 0x1 to 0x8 and above 0x4000 mean nothing.
    for (const std::uint32_t mask : {0u, 0xFFFF800Fu}) {
        const CColorPatch p = FullRow().Read(mask);
        EXPECT_EQ(ColorPatchProbe::missingMask(p), mask);
        EXPECT_EQ(FlagCount(p), 11);
        EXPECT_EQ(p.GetLAB().l, 1.0); // nothing is derived
        EXPECT_EQ(p.GetRGB().b, 6);
    }
    PatchInput noSpectrum = FullRow();
    noSpectrum.spectral.clear();
    EXPECT_FALSE(noSpectrum.Read(0).IsSpectralPresent());

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
    // XYZ is half the norm light: f = 0.5^(1/3) = 0.7937005, L* = 116 f - 16.
    ASSERT_TRUE(p.IsLABPresent());
    EXPECT_NEAR(p.GetLAB().l, 76.06926, 1e-5);
    EXPECT_NEAR(p.GetLAB().a, 0.0, 1e-9);
    // RGB type 0: linear 0.499721, 0.500107, 0.499564, companded 0.735173,
    // 0.735427, 0.735069; 255 c + 0.5 floored.
    ASSERT_TRUE(p.IsRGBPresent());
    EXPECT_EQ(p.GetRGB().r, 187);
    EXPECT_EQ(p.GetRGB().g, 188);
    EXPECT_EQ(FlagCount(p), 3);

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
    // A perfect white has zero density through every filter.
    const CColorPatch white = FullRow().Read(MISSING_CMYK);
    EXPECT_TRUE(white.IsCMYKPresent());
    EXPECT_NEAR(white.GetCMYK().c, 0.0, 1e-9);
    EXPECT_NEAR(white.GetCMYK().k, 0.0, 1e-9);

    // Off the 380 nm / 10 nm / 36-value grid: the marker record, still present.
    PatchInput off = FullRow();
    off.spectral = patch_test::Spectrum("SPECTRAL_NM_", 400, 10, 31, 0.5);
    const CColorPatch marker = off.Read(MISSING_CMYK);
    EXPECT_TRUE(marker.IsCMYKPresent());
    EXPECT_EQ(marker.GetCMYK().c, -1.0);
    EXPECT_EQ(marker.GetCMYK().m, 0.0);

    off.spectral.clear();
    EXPECT_FALSE(off.Read(MISSING_CMYK).IsCMYKPresent());
}

} // namespace
