// Patches and colour records by sample number and for the whole chart.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::Build;
using test_patches::Cmyk;
using test_patches::PatchValues;

TEST(PatchQueries, GetPatchCopiesOrAnswersTenAndEleven) {
    TestStore store;
    store.patches[1] = Cmyk(10, 20, 30, 40);
    store.patches[2] = Cmyk(50, 0, 0, 0);
    int result = -1;
    const CColorPatch second = store.GetPatch(2, result);
    EXPECT_EQ(result, 0);
    EXPECT_EQ(second.GetCMYK().c, 50.0);
    EXPECT_EQ(store.GetPatchCount(), 2);

    const CColorPatch absent = store.GetPatch(3, result);
    EXPECT_EQ(result, 10);
    EXPECT_FALSE(absent.IsCMYKPresent());
    EXPECT_EQ(absent.GetRGB().r, -1);    // a default patch
    EXPECT_EQ(store.patches.size(), 2u); // the failed look-up added nothing

    const std::vector<CColorPatch> list = store.GetPatchList();
    ASSERT_EQ(list.size(), 2u);
    EXPECT_EQ(list[0].GetCMYK().m, 20.0);
    EXPECT_EQ(list[1].GetCMYK().c, 50.0);
}

TEST(PatchQueries, RecordGettersTestPatchesThenFlagThenNumber) {
    TestStore store;
    tagXYZ xyz{1.0, 2.0, 3.0};
    EXPECT_EQ(store.GetPatchXYZ(1, xyz), 11); // no patches wins over the missing flag

    store.patches[1] = Cmyk(10, 20, 30, 40, {41.0, 42.0, 43.0});
    EXPECT_EQ(store.GetPatchXYZ(1, xyz), 12);
    store.hasXYZ = true;
    EXPECT_EQ(store.GetPatchXYZ(7, xyz), 10);
    EXPECT_EQ(xyz.x, 1.0); // untouched on failure
    EXPECT_EQ(store.GetPatchXYZ(1, xyz), 0);
    EXPECT_EQ(xyz.x, 41.0);
    EXPECT_EQ(xyz.z, 43.0);

    tagCMYK cmyk;
    EXPECT_EQ(store.GetPatchCMYK(1, cmyk), 12);
    store.hasCMYK = true;
    EXPECT_EQ(store.GetPatchCMYK(1, cmyk), 0);
    EXPECT_EQ(cmyk.k, 40.0);

    tagRGB rgb;
    tagLAB lab;
    tagCMYKOG cmykog;
    tagCMYKRGB cmykrgb;
    tagDENSITY density;
    EXPECT_EQ(store.GetPatchRGB(1, rgb), 12);
    EXPECT_EQ(store.GetPatchLAB(1, lab), 12);
    EXPECT_EQ(store.GetPatchCMYKOG(1, cmykog), 12);
    EXPECT_EQ(store.GetPatchCMYKRGB(1, cmykrgb), 12);
    EXPECT_EQ(store.GetPatchDensity(1, density), 12);
}

TEST(PatchQueries, CollectionsVisitPatchesInSampleOrder) {
    TestStore store;
    std::vector<tagCMYK> cmyk{{9, 9, 9, 9}};
    EXPECT_EQ(store.CollectCMYK(cmyk), 11);
    store.patches[3] = Cmyk(30, 0, 0, 0);
    store.patches[1] = Cmyk(10, 0, 0, 0);
    store.patches[2] = Cmyk(20, 0, 0, 0);
    EXPECT_EQ(store.CollectCMYK(cmyk), 12);
    ASSERT_EQ(cmyk.size(), 1u); // untouched
    store.hasCMYK = true;
    EXPECT_EQ(store.CollectCMYK(cmyk), 0);
    ASSERT_EQ(cmyk.size(), 3u); // the earlier entry is gone
    EXPECT_EQ(cmyk[0].c, 10.0);
    EXPECT_EQ(cmyk[1].c, 20.0);
    EXPECT_EQ(cmyk[2].c, 30.0);

    // The flag is chart-level: patches that lack the space still contribute.
    store.hasRGB = true;
    std::vector<tagRGB> rgb;
    EXPECT_EQ(store.CollectRGB(rgb), 0);
    EXPECT_EQ(rgb.size(), 3u);
}

TEST(PatchQueries, FiveColourQueriesAnswerTwelveUnlessMarked) {
    TestStore store;
    store.patches[1] = Cmyk(10, 0, 0, 0);
    store.UpdatePresenceFlags(0);
    std::vector<SWL_CMYKO> cmyko;
    EXPECT_EQ(store.CollectCMYKO(cmyko), 12);
    store.hasCMYKO = true;
    EXPECT_EQ(store.CollectCMYKO(cmyko), 0);
    EXPECT_EQ(cmyko.size(), 1u);
}

TEST(PatchQueries, CollectDensitiesReturnsEveryPatchsDensities) {
    TestStore store;
    std::vector<tagDENSITY> densities(2);
    EXPECT_EQ(store.CollectDensities(densities), 11);
    for (int n : {2, 1}) {
        PatchValues v;
        v.density = {0.1 * n, 0.2 * n, 0.3 * n, 0.4 * n, 0.5 * n};
        v.supplied = MISSING_DENSITY;
        store.patches[n] = Build(v);
    }
    EXPECT_EQ(store.CollectDensities(densities), 12);
    EXPECT_EQ(densities.size(), 2u);
    store.hasDensity = true;
    EXPECT_EQ(store.CollectDensities(densities), 0);
    ASSERT_EQ(densities.size(), 2u);
    EXPECT_DOUBLE_EQ(densities[0].red, 0.1);
    EXPECT_DOUBLE_EQ(densities[0].majorFilter, 0.5);
    EXPECT_DOUBLE_EQ(densities[1].visual, 0.8);
}

TEST(PatchQueries, NColorMapsNeedOnlyTheFlag) {
    TestStore store;
    std::vector<std::map<int, tagNCLR>> maps(1);
    EXPECT_EQ(store.CollectNColorMaps(maps), 12);
    EXPECT_EQ(maps.size(), 1u);
    store.hasNColor = true;
    EXPECT_EQ(store.CollectNColorMaps(maps), 0); // no patches: an empty list
    EXPECT_TRUE(maps.empty());
    store.patches[1] = test_patches::NColor({5, 6, 7});
    EXPECT_EQ(store.CollectNColorMaps(maps), 0);
    ASSERT_EQ(maps.size(), 1u);
    ASSERT_EQ(maps[0].size(), 3u);
    EXPECT_EQ(maps[0].at(2).value, 7.0);
}

TEST(PatchQueries, EachColourSpaceIndexReadsItsOwnFlag) {
    const std::vector<bool TestStore::*> flags = {
        &TestStore::hasCMYK,    &TestStore::hasXYZ,       &TestStore::hasLAB,
        &TestStore::hasRGB,     &TestStore::hasSpectral,  &TestStore::hasCMYKOG,
        &TestStore::hasCMYKRGB, &TestStore::hasHTMLCOLOR, &TestStore::hasNColor,
        &TestStore::hasDensity, &TestStore::hasCMYKOGV,   &TestStore::hasCMYKO};
    for (std::size_t raised = 0; raised < flags.size(); ++raised) {
        TestStore store;
        store.*flags[raised] = true;
        for (int space = -1; space <= 12; ++space) {
            EXPECT_EQ(store.IsColorSpacePresent(space), space == static_cast<int>(raised))
                << "flag " << raised << " space " << space;
        }
    }
}

TEST(PatchQueries, ReferenceSampleMapIsCopiedOrAnswers25) {
    TestStore store;
    std::map<int, int> map{{99, 99}};
    EXPECT_EQ(store.GetReferenceSampleMap(map), 25);
    EXPECT_EQ(map.size(), 1u);
    store.referenceSampleMap = {{101, 1}, {205, 2}};
    EXPECT_EQ(store.GetReferenceSampleMap(map), 0);
    EXPECT_EQ(map, (std::map<int, int>{{101, 1}, {205, 2}}));
}

} // namespace
