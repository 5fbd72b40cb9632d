// Host value lists and the chart's norm light.
#include <gtest/gtest.h>

#include "color_patch_probe.h"
#include "test_store.h"

namespace {

TEST(ValueLists, SettersReplaceWholeListsAndLeavePatchesAlone) {
    TestStore store;
    store.patches[1] = test_patches::Cmyk(10, 0, 0, 0);
    store.SetCMYKList({{1, 2, 3, 4}, {5, 6, 7, 8}});
    store.SetCMYKList({{9, 9, 9, 9}});
    ASSERT_EQ(store.cmykList.size(), 1u);
    EXPECT_EQ(store.cmykList[0].c, 9.0);
    store.SetXYZList({{1, 2, 3}});
    EXPECT_EQ(store.patches[1].GetCMYK().c, 10.0);
    EXPECT_FALSE(store.IsColorSpacePresent(COLORSPACE_CMYK));
    EXPECT_FALSE(store.IsColorSpacePresent(COLORSPACE_XYZ));
}

TEST(ValueLists, ClearListsKeepsSampleNamesAndDensities) {
    TestStore store;
    store.SetSampleNameList({"A1"});
    store.SetCMYKList({{}});
    store.SetCMYKOGList({{}});
    store.SetCMYKRGBList({{}});
    store.SetCMYKOGVList({{}});
    store.SetXYZList({{}});
    store.SetLABList({{}});
    store.SetRGBList({{}});
    store.SetSpectralDataList({{{"SPECTRAL_380", 0.5}}}, false);
    store.SetNColorList({{}});
    store.SetKeywordList({{"K", "V"}});
    store.densityList = {tagDENSITY{}};

    store.ClearLists();

    EXPECT_EQ(store.sampleNameList.size(), 1u);
    EXPECT_EQ(store.densityList.size(), 1u);
    EXPECT_TRUE(store.cmykList.empty());
    EXPECT_TRUE(store.cmykogList.empty());
    EXPECT_TRUE(store.cmykrgbList.empty());
    EXPECT_TRUE(store.cmykogvList.empty());
    EXPECT_TRUE(store.xyzList.empty());
    EXPECT_TRUE(store.labList.empty());
    EXPECT_TRUE(store.rgbList.empty());
    EXPECT_TRUE(store.spectralList.empty());
    EXPECT_TRUE(store.nColorList.empty());
    EXPECT_TRUE(store.keywordList.empty());
}

TEST(ValueLists, NormLightGoesToEveryPatchWithoutRecomputing) {
    TestStore empty;
    empty.SetChartNormLight({95.0, 100.0, 108.0});
    EXPECT_EQ(empty.normLight.z, 108.0);
    EXPECT_EQ(empty.GetPatchCount(), 0);

    TestStore store;
    store.patches[1] = test_patches::Cmyk(10, 0, 0, 0, {40.0, 50.0, 60.0});
    store.patches[2] = test_patches::Cmyk(0, 10, 0, 0, {20.0, 30.0, 40.0});
    const tagLAB labBefore = store.patches[1].GetLAB();
    store.SetChartNormLight({95.0, 100.0, 108.0});
    for (const auto& entry : store.patches) {
        const tagXYZ white = ColorPatchProbe::normLight(entry.second);
        EXPECT_EQ(white.x, 95.0);
        EXPECT_EQ(white.y, 100.0);
        EXPECT_EQ(white.z, 108.0);
    }
    EXPECT_EQ(store.patches[1].GetLAB().l, labBefore.l);
    EXPECT_EQ(store.patches[1].GetLAB().a, labBefore.a);
}

} // namespace
