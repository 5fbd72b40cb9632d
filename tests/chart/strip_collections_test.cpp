// Records of one strip: strip s holds samples (s - 1) * columns + 1 to s * columns.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

// Ten CMYK patches whose cyan value is their sample number.
TestStore TenPatchChart() {
    TestStore store;
    for (int n = 1; n <= 10; ++n) {
        store.patches[n] = test_patches::Cmyk(n, 0, 0, 0);
    }
    store.hasCMYK = true;
    return store;
}

std::vector<double> Cyans(const std::vector<tagCMYK>& list) {
    std::vector<double> cyans;
    for (const auto& cmyk : list) {
        cyans.push_back(cmyk.c);
    }
    return cyans;
}

TEST(StripCollections, ThreeStripsOfFourOverTenPatches) {
    TestStore store = TenPatchChart();
    ASSERT_EQ(store.SetLayout(3, 4), 0);
    std::vector<tagCMYK> strip;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 0);
    EXPECT_EQ(Cyans(strip), (std::vector<double>{1, 2, 3, 4}));
    EXPECT_EQ(store.CollectStripCMYK(2, strip), 0);
    EXPECT_EQ(Cyans(strip), (std::vector<double>{5, 6, 7, 8}));
    EXPECT_EQ(store.CollectStripCMYK(3, strip), 0);
    EXPECT_EQ(Cyans(strip), (std::vector<double>{9, 10}));
    EXPECT_EQ(store.CollectStripCMYK(4, strip), 17);
    EXPECT_EQ(store.CollectStripCMYK(0, strip), 17);
    EXPECT_EQ(Cyans(strip), (std::vector<double>{9, 10})); // untouched on failure
}

TEST(StripCollections, StripBeyondThePatchesIsEmpty) {
    TestStore store = TenPatchChart();
    ASSERT_EQ(store.SetLayout(5, 4), 0);
    std::vector<tagCMYK> strip{{1, 1, 1, 1}};
    EXPECT_EQ(store.CollectStripCMYK(4, strip), 0);
    EXPECT_TRUE(strip.empty());
}

TEST(StripCollections, UnusableOrMissingLayout) {
    TestStore store = TenPatchChart();
    std::vector<tagCMYK> strip;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 16);
    store.numberOfCols = 5;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 15);
    store.numberOfStrips = 2;
    store.numberOfCols = -1;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 15);
    store.numberOfStrips = -2;
    store.numberOfCols = 5;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 15);
    store.hasCMYK = false;
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 12); // the flag is tested first
}

TEST(StripCollections, EachFamilyTestsItsOwnFlag) {
    TestStore store = TenPatchChart();
    ASSERT_EQ(store.SetLayout(2, 5), 0);
    store.hasCMYKRGB = true;
    std::vector<tagCMYKOGV> cmykogv;
    std::vector<tagCMYKRGB> cmykrgb;
    std::vector<SWL_CMYKO> cmyko;
    std::vector<tagCMYKOG> cmykog;
    std::vector<tagRGB> rgb;
    std::vector<tagLAB> lab;
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(store.CollectStripCMYKOGV(1, cmykogv), 12);
    EXPECT_EQ(store.CollectStripCMYKRGB(2, cmykrgb), 0);
    EXPECT_EQ(cmykrgb.size(), 5u);
    EXPECT_EQ(store.CollectStripCMYKO(1, cmyko), 12);
    EXPECT_EQ(store.CollectStripCMYKOG(1, cmykog), 12);
    EXPECT_EQ(store.CollectStripRGB(1, rgb), 12);
    EXPECT_EQ(store.CollectStripLAB(1, lab), 12);
    EXPECT_EQ(store.CollectStripXYZ(1, xyz), 12);
    store.hasCMYKOGV = true;
    store.hasXYZ = true;
    EXPECT_EQ(store.CollectStripCMYKOGV(2, cmykogv), 0);
    EXPECT_EQ(cmykogv.size(), 5u);
    EXPECT_EQ(store.CollectStripXYZ(1, xyz), 0);
    EXPECT_EQ(xyz.size(), 5u);
}

TEST(StripCollections, HugeLayoutDoesNotOverflow) {
    TestStore store = TenPatchChart();
    ASSERT_EQ(store.SetLayout(2147483647, 2147483647), 0);
    std::vector<tagCMYK> strip{{1, 1, 1, 1}};
    EXPECT_EQ(store.CollectStripCMYK(1, strip), 0);
    EXPECT_EQ(strip.size(), 10u);
    EXPECT_EQ(store.CollectStripCMYK(2147483647, strip), 0);
    EXPECT_TRUE(strip.empty());
}

} // namespace
