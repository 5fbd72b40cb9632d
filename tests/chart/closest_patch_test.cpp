// Closest patch to a device colour, by Euclidean distance of the device values.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::Build;
using test_patches::Cmyk;
using test_patches::PatchValues;

const tagCMYK kPaper{0, 0, 0, 0};

TEST(ClosestPatch, MaximumDistanceIsInclusiveAndCeilingIs400) {
    TestStore store;
    EXPECT_EQ(store.FindClosestPatch(kPaper, 5.0), -1);
    EXPECT_EQ(store.FindClosestPatch(kPaper), -1);

    store.patches[1] = Cmyk(6, 0, 0, 0); // distance 6
    EXPECT_EQ(store.FindClosestPatch(kPaper, 5.0), -1);
    EXPECT_EQ(store.FindClosestPatch(kPaper, 6.0), 1);

    TestStore far;
    far.patches[1] = Cmyk(450, 0, 0, 0);
    EXPECT_EQ(far.FindClosestPatch(kPaper, 1000.0), -1);
    EXPECT_EQ(far.FindClosestPatch(kPaper), 1);
    far.patches[1] = Cmyk(400, 0, 0, 0);
    EXPECT_EQ(far.FindClosestPatch(kPaper, 1000.0), -1);
    far.patches[1] = Cmyk(10000, 0, 0, 0);
    EXPECT_EQ(far.FindClosestPatch(kPaper), -1);
    far.patches[1] = Cmyk(0, 0, 6000, 7999); // sqrt(6000^2 + 7999^2) = 9999.2
    EXPECT_EQ(far.FindClosestPatch(kPaper), 1);
}

TEST(ClosestPatch, TiesGoToTheLowestSampleNumber) {
    TestStore store;
    store.patches[7] = Cmyk(0, 2, 0, 0); // distance 2
    store.patches[3] = Cmyk(2, 0, 0, 0); // distance 2
    store.patches[5] = Cmyk(0, 0, 3, 4); // distance 5
    EXPECT_EQ(store.FindClosestPatch(kPaper, 10.0), 3);
    EXPECT_EQ(store.FindClosestPatch(kPaper), 3);
    // Target (0, 0, 3, 3.5): patch 5 at 0.5, patch 3 at sqrt(4 + 9 + 12.25) = 5.02.
    EXPECT_EQ(store.FindClosestPatch(tagCMYK{0, 0, 3, 3.5}), 5);
}

TEST(ClosestPatch, SixAndSevenColourTargetsUseTheirOwnRecords) {
    TestStore store;
    for (int n = 1; n <= 3; ++n) {
        PatchValues v;
        v.cmykog = {0, 0, 0, 0, 10.0 * n, 0};
        v.cmykrgb = {0, 0, 0, 0, 0, 0, 10.0 * (4 - n)};
        v.supplied = MISSING_CMYKOG | MISSING_CMYKRGB;
        store.patches[n] = Build(v);
    }
    // Orange 19 is 1 from patch 2 (20) and 9 from patch 1 (10).
    EXPECT_EQ(store.FindClosestPatch(tagCMYKOG{0, 0, 0, 0, 19, 0}, 2.0), 2);
    EXPECT_EQ(store.FindClosestPatch(tagCMYKOG{0, 0, 0, 0, 19, 0}, 0.5), -1);
    EXPECT_EQ(store.FindClosestPatch(tagCMYKOG{0, 0, 0, 0, 100, 0}), 3);
    // Blue 31 is 1 from patch 1 (30).
    EXPECT_EQ(store.FindClosestPatch(tagCMYKRGB{0, 0, 0, 0, 0, 0, 31}, 2.0), 1);
    EXPECT_EQ(store.FindClosestPatch(tagCMYKRGB{0, 0, 0, 0, 0, 0, 0}), 3);
}

} // namespace
