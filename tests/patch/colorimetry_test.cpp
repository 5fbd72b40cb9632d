// Built-in colorimetry of a patch: XYZ of a spectrum, both Lab conversions,
// media-relative XYZ, spectral density over a reference and density-based CMYK.
#include <algorithm>
#include <cmath>
#include <iterator>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::FlatSpectrum;
using patch_test::PatchWithNorms;

CColorPatch WithXYZ(tagXYZ xyz, tagXYZ normLight = {96.38, 100.0, 82.45}) {
    CColorPatch patch = PatchWithNorms();
    patch.SetNormLight(normLight);
    ColorPatchProbe::setXYZ(patch, xyz);
    return patch;
}

CColorPatch WithSpectrum(const SpectralDataStruct& spectrum, bool present = true) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setSpectral(patch, spectrum, present);
    return patch;
}

tagCMYK CmykOf(long filterSet, const SpectralDataStruct& spectrum) {
    CColorPatch patch;
    return ColorPatchProbe::GetCMYKfromSPECTRAL(patch, filterSet, spectrum);
}

void ExpectCmyk(const tagCMYK& v, double c, double m, double y, double k, double tolerance) {
    EXPECT_NEAR(v.c, c, tolerance);
    EXPECT_NEAR(v.m, m, tolerance);
    EXPECT_NEAR(v.y, y, tolerance);
    EXPECT_NEAR(v.k, k, tolerance);
}

TEST(ColorimetryXYZ, PerfectWhiteGivesEachSetsWhitePointAndOtherTypesNothing) {
    CColorPatch patch = PatchWithNorms();
    double white[36];
    std::fill(std::begin(white), std::end(white), 1.0);
    const double expected[][3] = {{0, 96.3809, 82.4503},
                                  {1, 95.0143, 108.8280},
                                  {4, 96.7239, 81.4613},
                                  {5, 94.8232, 107.3927}};
    for (const auto& e : expected) {
        double xyz[3] = {-1.0, -1.0, -1.0};
        ColorPatchProbe::getXYZ(patch, xyz, white, static_cast<int>(e[0]));
        EXPECT_NEAR(xyz[0], e[1], 5e-5) << "type " << e[0];
        EXPECT_NEAR(xyz[1], 100.0, 1e-9) << "type " << e[0];
        EXPECT_NEAR(xyz[2], e[2], 5e-5) << "type " << e[0];
    }
    for (int type : {2, 3, 6, -1}) {
        double xyz[3] = {7.0, 8.0, 9.0};
        ColorPatchProbe::getXYZ(patch, xyz, white, type);
        EXPECT_TRUE(xyz[0] == 7.0 && xyz[1] == 8.0 && xyz[2] == 9.0) << type;
    }
}

TEST(ColorimetryLab, EachFormKeepsItsOwnThresholdAndFactor) {
    CColorPatch patch = WithXYZ({96.38, 100.0, 82.45});
    const tagLAB white = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(white.l, 100.0, 1e-12);
    EXPECT_NEAR(white.a, 0.0, 1e-12);
    EXPECT_NEAR(white.b, 0.0, 1e-12);

    // Private form, threshold 0.008856 (strictly greater takes the cube root):
    // exactly at it the straight line gives 903.2962962962963 * 0.008856 =
    // 7.999592 (the cube root would give 7.9995919931); just above it,
    // 116 * 0.0088564^(1/3) - 16 = 7.999953318427721.
    patch = WithXYZ({0.008856, 0.008856, 0.008856}, {1.0, 1.0, 1.0});
    EXPECT_NEAR(ColorPatchProbe::XYZToLAB(patch).l, 7.999592, 1e-11);
    patch = WithXYZ({0.0088564, 0.0088564, 0.0088564}, {1.0, 1.0, 1.0});
    EXPECT_NEAR(ColorPatchProbe::XYZToLAB(patch).l, 7.999953318427721, 1e-11);
    // The public form's threshold is 0.00885645, so 0.0088564 still takes its
    // straight line with 903.29629: 903.29629 * 0.0088564 = 7.999953262756001.
    EXPECT_NEAR(patch.XYZToLAB(false, tagXYZ{1.0, 1.0, 1.0}, 0).l, 7.999953262756001, 1e-11);
}

TEST(ColorimetryLab, PublicLabRelativeAndTypeHandling) {
    // Media-relative to a white equal to the patch: the patch becomes the norm
    // light and so the white of Lab. Absolute with type 4: half the norm light
    // gives L* = 116 * 0.5^(1/3) - 16.
    CColorPatch patch = WithXYZ({48.19, 50.0, 41.225});
    const tagLAB lab = patch.XYZToLAB(true, tagXYZ{48.19, 50.0, 41.225}, 0);
    EXPECT_NEAR(lab.l, 100.0, 1e-9);
    EXPECT_NEAR(lab.a, 0.0, 1e-9);
    EXPECT_NEAR(lab.b, 0.0, 1e-9);
    EXPECT_NEAR(patch.XYZToLAB(false, tagXYZ{}, 4).l, 116.0 * std::cbrt(0.5) - 16.0, 1e-9);
    // Other types take XYZ as relative already (white = 1), also when relative:
    // X = 96.38 * 1 / 2 = 48.19 etc. are used undivided.
    patch = WithXYZ({1.0, 1.0, 1.0});
    EXPECT_NEAR(patch.XYZToLAB(false, tagXYZ{}, 2).l, 100.0, 1e-9);
    EXPECT_NEAR(patch.XYZToLAB(true, tagXYZ{2.0, 2.0, 2.0}, 3).l, 116.0 * std::cbrt(50.0) - 16.0,
                1e-9);

    // Absolute to relative maps the media white onto the norm light.
    patch = WithXYZ({40.0, 50.0, 30.0});
    const tagXYZ relative = patch.XYZAbsoluteToRelative(tagXYZ{80.0, 90.0, 70.0});
    EXPECT_NEAR(relative.x, 96.38 * 40.0 / 80.0, 1e-12);
    EXPECT_NEAR(relative.z, 82.45 * 30.0 / 70.0, 1e-12);
    EXPECT_EQ(patch.GetXYZ().x, 40.0); // the patch itself is not changed
}

TEST(ColorimetryDensity, NothingToReportLeavesThePeakAlone) {
    SpectralDataStruct reference = FlatSpectrum(380, 10, 36, 1.0);
    int peak = -7;
    EXPECT_EQ(WithSpectrum(FlatSpectrum(380, 10, 36, 0.1), false).CalculateDensity(reference, peak),
              0.0);
    // Equal to the reference; lighter everywhere; one value (no step, so no
    // window, and no division by zero); a descending grid (the window would
    // lie before the first value).
    for (const SpectralDataStruct& s :
         {reference, FlatSpectrum(380, 10, 36, 2.0), FlatSpectrum(380, 0, 1, 0.01),
          FlatSpectrum(380, -10, 36, 0.1)}) {
        EXPECT_EQ(WithSpectrum(s).CalculateDensity(reference, peak), 0.0);
    }
    EXPECT_EQ(peak, -7);
}

TEST(ColorimetryDensity, WindowRunsFrom430To670OnEveryGrid) {
    SpectralDataStruct reference = FlatSpectrum(380, 10, 36, 1.0);
    SpectralDataStruct s = reference;
    s.values[4] = 0.001;  // 420 nm: before the window
    s.values[5] = 0.1;    // 430 nm: density 1
    s.values[29] = 0.05;  // 670 nm: density log10(20) = 1.30103
    s.values[30] = 0.001; // 680 nm: after the window
    int peak = 0;
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(reference, peak), 1.3010299956639813, 1e-12);
    EXPECT_EQ(peak, 670);
    // Equal maxima: the first one wins. Relative to a grey reference of 0.5:
    // log10(1/0.1) - log10(1/0.5) = log10(5).
    s.values[29] = 0.1;
    SpectralDataStruct grey = FlatSpectrum(380, 10, 36, 0.5);
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(grey, peak), 0.69897000433601886, 1e-12);
    EXPECT_EQ(peak, 430);

    // From 400 nm: (430 - 400) / 10 = 3 to 3 + 250 / 10 = 28 (exclusive).
    s = FlatSpectrum(400, 10, 31, 1.0);
    s.values[3] = 0.1; // 430 nm
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);
    // From 450 nm: indexes 0 to (680 - 450) / 10 = 23 (exclusive).
    s = FlatSpectrum(450, 10, 30, 1.0);
    s.values[22] = 0.1;  // 670 nm
    s.values[23] = 0.01; // 680 nm
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 670);
    // A count beyond the 50 values held is not followed past the end (from
    // 430 nm at 1 nm the window would reach index 250).
    s = FlatSpectrum(430, 1, 50, 0.1);
    s.count = 5000;
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);
}

TEST(ColorimetryCMYK, WhiteAndBlackInEverySet) {
    for (long set = 0; set <= 6; ++set) {
        SCOPED_TRACE(set);
        ExpectCmyk(CmykOf(set, FlatSpectrum(380, 10, 36, 1.0)), 0, 0, 0, 0, 1e-12);
        // Nothing reflected: the filter densities stay 0, visual is infinite.
        const tagCMYK black = CmykOf(set, FlatSpectrum(380, 10, 36, 0.0));
        EXPECT_EQ(black.c + black.m + black.y, 0.0);
        EXPECT_TRUE(std::isinf(black.k));
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
    ExpectCmyk(CmykOf(6, s), 0.07851868592113798, 0.007243050360778706, 0.007243050360778706,
               0.015768217964135526, 1e-12);
}

TEST(ColorimetryCMYK, OffGridSpectraAndUnknownSetsGiveTheMarker) {
    for (const SpectralDataStruct& s :
         {FlatSpectrum(400, 10, 31, 0.5), FlatSpectrum(380, 10, 35, 0.5),
          FlatSpectrum(380, 5, 36, 0.5)}) {
        ExpectCmyk(CmykOf(0, s), -1, 0, 0, 0, 0);
    }
    for (long set : {-1L, 7L, 1000L}) {
        ExpectCmyk(CmykOf(set, FlatSpectrum(380, 10, 36, 0.5)), -1, 0, 0, 0, 0);
    }
}

} // namespace
