// Built-in colorimetry of a patch: XYZ of a spectrum, both Lab conversions,
// spectral density over a reference and density-based CMYK.
#include <algorithm>
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

CColorPatch WithSpectrum(const SpectralDataStruct& spectrum) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setSpectral(patch, spectrum, true);
    return patch;
}

tagCMYK CmykOf(long filterSet, const SpectralDataStruct& spectrum) {
    CColorPatch patch;
    return ColorPatchProbe::GetCMYKfromSPECTRAL(patch, filterSet, spectrum);
}

bool IsMarker(const tagCMYK& v) {
    return v.c == -1 && v.m == 0 && v.y == 0 && v.k == 0;
}

TEST(ColorimetryXYZ, PerfectWhiteGivesEachSetsWhitePoint) {
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
}

TEST(ColorimetryLab, EachFormKeepsItsOwnThresholdAndFactor) {
    CColorPatch patch = WithXYZ({96.38, 100.0, 82.45});
    const tagLAB white = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(white.l, 100.0, 1e-12);

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
    // A count beyond the 50 values held is not followed past the end (from
    // 430 nm at 1 nm the window would reach index 250).
    s = FlatSpectrum(430, 1, 50, 0.1);
    s.count = 5000;
    EXPECT_NEAR(WithSpectrum(s).CalculateDensity(reference, peak), 1.0, 1e-12);
    EXPECT_EQ(peak, 430);
}

TEST(ColorimetryCMYK, FilterWeightsAndVisualWeightsByHand) {
    // Set 6 with nothing reflected at 620 nm. Red: weights 10^0.1, 10^0.5, 10^0.8,
    // 10^1, 10^0.8, 10^0.5, 10^0.1 at 590..650 nm and 1 at the 29 other points,
    // total W = 60.46155303352896; the 620 nm weight 10 is lost:
    // -log10((W - 10) / W) = 0.07851868592113798. Green and blue weigh 620 nm
    // with 1 of the same total.
    // Visual: V(620) = 0.381 of 10.6853051: 0.015768217964135526.
    SpectralDataStruct s = FlatSpectrum(380, 10, 36, 1.0);
    s.values[24] = 0.0;
    const tagCMYK v = CmykOf(6, s);
    EXPECT_NEAR(v.c, 0.07851868592113798, 1e-12);
    EXPECT_NEAR(v.k, 0.015768217964135526, 1e-12);
}

TEST(ColorimetryCMYK, OffGridSpectraAndUnknownSetsGiveTheMarker) {
    for (const SpectralDataStruct& s :
         {FlatSpectrum(400, 10, 31, 0.5), FlatSpectrum(380, 10, 35, 0.5),
          FlatSpectrum(380, 5, 36, 0.5)}) {
        EXPECT_TRUE(IsMarker(CmykOf(0, s)));
    }
    EXPECT_TRUE(IsMarker(CmykOf(7, FlatSpectrum(380, 10, 36, 0.5))));
    EXPECT_TRUE(IsMarker(CmykOf(-1, FlatSpectrum(380, 10, 36, 0.5))));
}

} // namespace
