// Built-in XYZ of a spectrum, both Lab conversions and media-relative XYZ.
#include <gtest/gtest.h>

#include <cmath>

#include "color_patch_probe.h"
#include "colorimetry_test_support.h"
#include "redavudeva/color_patch.h"

namespace {

using colorimetry_test::PatchWithNorms;

TEST(ColorimetryXYZ, PerfectWhiteGivesEachSetsWhitePoint) {
    CColorPatch patch = PatchWithNorms();
    double white[36];
    for (double& v : white) {
        v = 1.0;
    }
    struct Expected {
        int type;
        double x, z;
    };
    const Expected expected[] = {{0, 96.3809, 82.4503},
                                 {1, 95.0143, 108.8280},
                                 {4, 96.7239, 81.4613},
                                 {5, 94.8232, 107.3927}};
    for (const Expected& e : expected) {
        double xyz[3] = {-1.0, -1.0, -1.0};
        ColorPatchProbe::getXYZ(patch, xyz, white, e.type);
        EXPECT_NEAR(xyz[0], e.x, 5e-5) << "type " << e.type;
        EXPECT_NEAR(xyz[1], 100.0, 1e-9) << "type " << e.type;
        EXPECT_NEAR(xyz[2], e.z, 5e-5) << "type " << e.type;
    }
}

TEST(ColorimetryXYZ, UnknownTypesLeaveTheOutputAlone) {
    CColorPatch patch = PatchWithNorms();
    double spectrum[36] = {};
    spectrum[18] = 1.0; // 560 nm only
    for (int type : {2, 3, 6, -1}) {
        double xyz[3] = {7.0, 8.0, 9.0};
        ColorPatchProbe::getXYZ(patch, xyz, spectrum, type);
        EXPECT_EQ(xyz[0], 7.0) << type;
        EXPECT_EQ(xyz[1], 8.0) << type;
        EXPECT_EQ(xyz[2], 9.0) << type;
    }
    // Only 560 nm reflects: D50/2 weights 59.45, 99.5, 0.39 over the Y sum.
    double xyz[3] = {};
    ColorPatchProbe::getXYZ(patch, xyz, spectrum, 0);
    EXPECT_NEAR(xyz[0], 100.0 * 59.45 / 1050.46869, 1e-9);
    EXPECT_NEAR(xyz[1], 100.0 * 99.5 / 1050.46869, 1e-9);
    EXPECT_NEAR(xyz[2], 100.0 * 0.39 / 1050.46869, 1e-9);
}

TEST(ColorimetryXYZ, NormWeightingHoldsTheFourYSums) {
    CColorPatch patch;
    ColorPatchProbe::computeNormWeighting(patch);
    const double* norm = ColorPatchProbe::normWeighting(patch);
    EXPECT_EQ(norm[0], 1050.4686900000002);
    EXPECT_EQ(norm[1], 1140.0734270000003);
    EXPECT_EQ(norm[2], 1056.73198);
    EXPECT_EQ(norm[3], 1161.8872599999997);
}

TEST(ColorimetryLab, PatchLabUsesTheNormLightAndTheExactConstants) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setXYZ(patch, tagXYZ{96.38, 100.0, 82.45});
    tagLAB lab = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(lab.l, 100.0, 1e-12);
    EXPECT_NEAR(lab.a, 0.0, 1e-12);
    EXPECT_NEAR(lab.b, 0.0, 1e-12);

    // Y = 20: L* = 116 * 0.2^(1/3) - 16 = 51.837211526538496.
    ColorPatchProbe::setXYZ(patch, tagXYZ{96.38 * 0.2, 20.0, 82.45 * 0.2});
    lab = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(lab.l, 51.837211526538496, 1e-9);
    EXPECT_NEAR(lab.a, 0.0, 1e-9);
    EXPECT_NEAR(lab.b, 0.0, 1e-9);

    // A ratio of exactly 0.008856 takes the straight line (the test is strictly
    // greater): 903.2962962962963 * 0.008856 = 7.999592, where the cube root
    // would give 7.9995919931.
    patch.SetNormLight(tagXYZ{1.0, 1.0, 1.0});
    ColorPatchProbe::setXYZ(patch, tagXYZ{0.008856, 0.008856, 0.008856});
    lab = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(lab.l, 7.999592, 1e-11);
    // Just above it the cube root applies: 116 * 0.0088564^(1/3) - 16.
    ColorPatchProbe::setXYZ(patch, tagXYZ{0.0088564, 0.0088564, 0.0088564});
    lab = ColorPatchProbe::XYZToLAB(patch);
    EXPECT_NEAR(lab.l, 7.999953318427721, 1e-11);
}

TEST(ColorimetryLab, PublicLabKeepsItsRoundedConstants) {
    CColorPatch patch = PatchWithNorms();
    patch.SetNormLight(tagXYZ{1.0, 1.0, 1.0});
    // 0.0088564 lies below the public threshold 0.00885645: straight line with
    // 903.29629, i.e. 903.29629 * 0.0088564 = 7.999953262756001 (the patch's own
    // form gives 7.999953318427721 here, see above).
    ColorPatchProbe::setXYZ(patch, tagXYZ{0.0088564, 0.0088564, 0.0088564});
    tagLAB lab = patch.XYZToLAB(false, tagXYZ{1.0, 1.0, 1.0}, 0);
    EXPECT_NEAR(lab.l, 7.999953262756001, 1e-11);
    EXPECT_NEAR(lab.a, 0.0, 1e-12);
}

TEST(ColorimetryLab, PublicLabRelativeAndTypeHandling) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setXYZ(patch, tagXYZ{48.19, 50.0, 41.225});
    // Media-relative to a white equal to the patch: the patch becomes the norm
    // light and then the white of Lab.
    tagLAB lab = patch.XYZToLAB(true, tagXYZ{48.19, 50.0, 41.225}, 0);
    EXPECT_NEAR(lab.l, 100.0, 1e-9);
    EXPECT_NEAR(lab.a, 0.0, 1e-9);
    EXPECT_NEAR(lab.b, 0.0, 1e-9);
    // Absolute, type 4: half the norm light -> L* = 116 * 0.5^(1/3) - 16.
    lab = patch.XYZToLAB(false, tagXYZ{}, 4);
    EXPECT_NEAR(lab.l, 116.0 * std::cbrt(0.5) - 16.0, 1e-9);
    EXPECT_NEAR(lab.a, 0.0, 1e-9);

    // Other types take XYZ as relative already (white = 1).
    ColorPatchProbe::setXYZ(patch, tagXYZ{1.0, 1.0, 1.0});
    lab = patch.XYZToLAB(false, tagXYZ{}, 2);
    EXPECT_NEAR(lab.l, 100.0, 1e-9);
    EXPECT_NEAR(lab.a, 0.0, 1e-9);
    EXPECT_NEAR(lab.b, 0.0, 1e-9);
    // Relative with another type: X = 96.38 * 1 / 2 = 48.19 etc., used undivided.
    lab = patch.XYZToLAB(true, tagXYZ{2.0, 2.0, 2.0}, 3);
    EXPECT_NEAR(lab.l, 116.0 * std::cbrt(50.0) - 16.0, 1e-9);
}

TEST(ColorimetryLab, AbsoluteToRelativeMapsTheMediaWhiteOntoTheNormLight) {
    CColorPatch patch = PatchWithNorms();
    ColorPatchProbe::setXYZ(patch, tagXYZ{40.0, 50.0, 30.0});
    const tagXYZ relative = patch.XYZAbsoluteToRelative(tagXYZ{80.0, 90.0, 70.0});
    EXPECT_NEAR(relative.x, 96.38 * 40.0 / 80.0, 1e-12);
    EXPECT_NEAR(relative.y, 100.0 * 50.0 / 90.0, 1e-12);
    EXPECT_NEAR(relative.z, 82.45 * 30.0 / 70.0, 1e-12);
    // The patch itself is not changed.
    EXPECT_EQ(patch.GetXYZ().x, 40.0);
    EXPECT_EQ(patch.GetXYZ().y, 50.0);
    EXPECT_EQ(patch.GetXYZ().z, 30.0);
}

} // namespace
