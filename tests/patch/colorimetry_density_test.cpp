// Spectral density over a reference and the density-based CMYK of a spectrum.
#include <gtest/gtest.h>

#include <cmath>

#include "color_patch_probe.h"
#include "colorimetry_test_support.h"
#include "redavudeva/color_patch.h"

namespace {

using colorimetry_test::FlatSpectrum;
using colorimetry_test::PatchWithNorms;

// A patch holding `spectrum` with its spectral flag raised.
CColorPatch PatchWithSpectrum(const SpectralDataStruct& spectrum) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setSpectral(patch, spectrum, true);
    return patch;
}

TEST(ColorimetryDensity, NothingToReportLeavesThePeakAlone) {
    SpectralDataStruct reference = FlatSpectrum(380, 10, 36, 1.0);
    int peak = -7;

    CColorPatch noSpectrum = PatchWithNorms();
    ColorPatchProbe::setSpectral(noSpectrum, FlatSpectrum(380, 10, 36, 0.1), false);
    EXPECT_EQ(noSpectrum.CalculateDensity(reference, peak), 0.0);

    CColorPatch same = PatchWithSpectrum(reference);
    EXPECT_EQ(same.CalculateDensity(reference, peak), 0.0);

    // Lighter than the reference everywhere: no density exceeds 0.
    CColorPatch lighter = PatchWithSpectrum(FlatSpectrum(380, 10, 36, 1.0));
    SpectralDataStruct darkReference = FlatSpectrum(380, 10, 36, 0.5);
    EXPECT_EQ(lighter.CalculateDensity(darkReference, peak), 0.0);

    // One value: no step, so no window; answered 0 without dividing by zero.
    CColorPatch single = PatchWithSpectrum(FlatSpectrum(380, 0, 1, 0.01));
    EXPECT_EQ(single.CalculateDensity(reference, peak), 0.0);
    EXPECT_EQ(peak, -7);
}

TEST(ColorimetryDensity, WindowOnTheStandardGridIs430To670) {
    SpectralDataStruct reference = FlatSpectrum(380, 10, 36, 1.0);
    SpectralDataStruct s = FlatSpectrum(380, 10, 36, 1.0);
    s.values[4] = 0.001;  // 420 nm: before the window
    s.values[5] = 0.1;    // 430 nm: density 1
    s.values[29] = 0.05;  // 670 nm: density log10(20) = 1.30103
    s.values[30] = 0.001; // 680 nm: after the window
    CColorPatch patch = PatchWithSpectrum(s);
    int peak = 0;
    EXPECT_NEAR(patch.CalculateDensity(reference, peak), 1.3010299956639813, 1e-12);
    EXPECT_EQ(peak, 670);

    // Equal maxima: the first one wins.
    s.values[29] = 0.1;
    CColorPatch ties = PatchWithSpectrum(s);
    EXPECT_NEAR(ties.CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);

    // Relative to the reference: log10(1/0.1) - log10(1/0.5) = log10(5).
    SpectralDataStruct greyReference = FlatSpectrum(380, 10, 36, 0.5);
    EXPECT_NEAR(ties.CalculateDensity(greyReference, peak), 0.69897000433601886, 1e-12);
}

TEST(ColorimetryDensity, WindowFollowsOtherGrids) {
    // From 400 nm: (430 - 400) / 10 = 3 to 3 + 250 / 10 = 28 (exclusive).
    SpectralDataStruct reference = FlatSpectrum(400, 10, 31, 1.0);
    SpectralDataStruct s = FlatSpectrum(400, 10, 31, 1.0);
    s.values[2] = 0.001;  // 420 nm
    s.values[3] = 0.1;    // 430 nm
    s.values[28] = 0.001; // 680 nm
    CColorPatch patch = PatchWithSpectrum(s);
    int peak = 0;
    EXPECT_NEAR(patch.CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);

    // From 450 nm: indexes 0 to (680 - 450) / 10 = 23 (exclusive).
    SpectralDataStruct late = FlatSpectrum(450, 10, 30, 1.0);
    late.values[22] = 0.1;  // 670 nm
    late.values[23] = 0.01; // 680 nm
    CColorPatch latePatch = PatchWithSpectrum(late);
    EXPECT_NEAR(latePatch.CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 670);
}

TEST(ColorimetryDensity, MalformedGridsStayInsideTheSpectrum) {
    SpectralDataStruct reference = FlatSpectrum(380, 10, 36, 1.0);
    int peak = -7;
    // A descending grid would put the window before the first value.
    CColorPatch descending = PatchWithSpectrum(FlatSpectrum(380, -10, 36, 0.1));
    EXPECT_EQ(descending.CalculateDensity(reference, peak), 0.0);
    EXPECT_EQ(peak, -7);
    // A count beyond the 50 values held is not followed past the end.
    // (From 430 nm at 1 nm the window would reach index 250.)
    SpectralDataStruct tooMany = FlatSpectrum(430, 1, 50, 0.1);
    tooMany.count = 5000;
    CColorPatch patch = PatchWithSpectrum(tooMany);
    EXPECT_NEAR(patch.CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);
}

TEST(ColorimetryCMYK, FlatSpectraGiveEqualDensitiesInEverySet) {
    CColorPatch patch = PatchWithNorms();
    for (long set = 0; set <= 6; ++set) {
        const tagCMYK white =
            ColorPatchProbe::GetCMYKfromSPECTRAL(patch, set, FlatSpectrum(380, 10, 36, 1.0));
        EXPECT_NEAR(white.c, 0.0, 1e-12) << set;
        EXPECT_NEAR(white.m, 0.0, 1e-12) << set;
        EXPECT_NEAR(white.y, 0.0, 1e-12) << set;
        EXPECT_NEAR(white.k, 0.0, 1e-12) << set;
        const tagCMYK grey =
            ColorPatchProbe::GetCMYKfromSPECTRAL(patch, set, FlatSpectrum(380, 10, 36, 0.1));
        EXPECT_NEAR(grey.c, 1.0, 1e-12) << set;
        EXPECT_NEAR(grey.m, 1.0, 1e-12) << set;
        EXPECT_NEAR(grey.y, 1.0, 1e-12) << set;
        EXPECT_NEAR(grey.k, 1.0, 1e-12) << set;
    }
}

TEST(ColorimetryCMYK, FilterWeightsAndVisualWeightsByHand) {
    // Set 6 with nothing reflected at 620 nm. Red: weights 10^0.1, 10^0.5, 10^0.8,
    // 10^1, 10^0.8, 10^0.5, 10^0.1 at 590..650 nm and 1 at the 29 other points,
    // total W = 60.46155303352896; the 620 nm weight 10 is lost:
    // -log10((W - 10) / W) = 0.07851868592113798. Green and blue weigh 620 nm
    // with 1 of the same total: -log10((W - 1) / W) = 0.007243050360778706.
    // Visual: V(620) = 0.381 of 10.6853051: 0.015768217964135526.
    SpectralDataStruct s = FlatSpectrum(380, 10, 36, 1.0);
    s.values[24] = 0.0;
    CColorPatch patch = PatchWithNorms();
    const tagCMYK cmyk = ColorPatchProbe::GetCMYKfromSPECTRAL(patch, 6, s);
    EXPECT_NEAR(cmyk.c, 0.07851868592113798, 1e-12);
    EXPECT_NEAR(cmyk.m, 0.007243050360778706, 1e-12);
    EXPECT_NEAR(cmyk.y, 0.007243050360778706, 1e-12);
    EXPECT_NEAR(cmyk.k, 0.015768217964135526, 1e-12);

    // Nothing reflected at all: the filter densities stay 0, visual is infinite.
    const tagCMYK black =
        ColorPatchProbe::GetCMYKfromSPECTRAL(patch, 0, FlatSpectrum(380, 10, 36, 0.0));
    EXPECT_EQ(black.c, 0.0);
    EXPECT_EQ(black.m, 0.0);
    EXPECT_EQ(black.y, 0.0);
    EXPECT_TRUE(std::isinf(black.k));
}

TEST(ColorimetryCMYK, OffGridSpectraAndUnknownSetsGiveTheMarker) {
    CColorPatch patch = PatchWithNorms();
    const SpectralDataStruct offGrid[] = {FlatSpectrum(400, 10, 31, 0.5),
                                          FlatSpectrum(380, 10, 35, 0.5),
                                          FlatSpectrum(380, 5, 36, 0.5)};
    for (const SpectralDataStruct& s : offGrid) {
        const tagCMYK marker = ColorPatchProbe::GetCMYKfromSPECTRAL(patch, 0, s);
        EXPECT_EQ(marker.c, -1.0);
        EXPECT_EQ(marker.m, 0.0);
        EXPECT_EQ(marker.y, 0.0);
        EXPECT_EQ(marker.k, 0.0);
    }
    for (long set : {-1L, 7L, 1000L}) {
        const tagCMYK marker =
            ColorPatchProbe::GetCMYKfromSPECTRAL(patch, set, FlatSpectrum(380, 10, 36, 0.5));
        EXPECT_EQ(marker.c, -1.0) << set;
        EXPECT_EQ(marker.m, 0.0) << set;
        EXPECT_EQ(marker.y, 0.0) << set;
        EXPECT_EQ(marker.k, 0.0) << set;
    }
}

} // namespace
