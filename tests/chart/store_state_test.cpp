// The empty store, its reset, and the chart-level presence flags.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::kNothingSupplied;

TEST(StoreState, NewStoreAnswersAsEmpty) {
    TestStore store;
    EXPECT_EQ(store.GetPatchCount(), 0);
    EXPECT_EQ(store.GetNumberOfCols(), 0);
    EXPECT_EQ(store.GetNumberOfStrips(), 0);
    EXPECT_EQ(store.GetNumberOfPages(), 0);
    EXPECT_EQ(store.GetDevice(), 0);
    EXPECT_EQ(store.GetPatchesPerPage(), 0);
    for (int space = -1; space <= 12; ++space) {
        EXPECT_FALSE(store.IsColorSpacePresent(space)) << space;
    }
    tagCMYK cmyk;
    std::vector<tagXYZ> xyz;
    std::vector<tagLAB> strip;
    std::map<int, int> references;
    int result = -1;
    store.GetPatch(1, result);
    EXPECT_EQ(result, 11);
    EXPECT_EQ(store.GetPatchCMYK(1, cmyk), 11);
    EXPECT_EQ(store.CollectXYZ(xyz), 11);
    EXPECT_EQ(store.CollectStripLAB(1, strip), 12);
    EXPECT_EQ(store.GetReferenceSampleMap(references), 25);
    EXPECT_TRUE(store.GetPatchList().empty());
    EXPECT_TRUE(store.GetSpectralDataList().empty());
    const SpectralRangeStruct range = store.GetSpectralRange();
    EXPECT_EQ(range.startNm, 0);
    EXPECT_EQ(range.stepNm, 0);
    EXPECT_EQ(range.count, 0);
}

TEST(StoreState, BaseAnswersOfTheFileFormatOperations) {
    TestStore store;
    std::vector<std::vector<double>> lists{{1.0}};
    std::vector<std::string> names{"kept"};
    EXPECT_EQ(store.GetDeviceValueLists(lists), 24);
    EXPECT_EQ(lists.size(), 1u);
    EXPECT_EQ(store.GetDeviceColorSpace(), -1);
    EXPECT_EQ(store.GetDeviceChannelCount(), -1);
    EXPECT_EQ(store.WriteDeviceControlSequence("unused.txt"), 23);
    store.SetDataFormatLine("SAMPLE_ID CMYK_C");
    EXPECT_EQ(store.GetDataFormatLine(), "");
    EXPECT_EQ(store.GetProcessColorNames(names), 1);
    EXPECT_EQ(names, std::vector<std::string>{"kept"});
}

TEST(StoreState, ResetEmptiesTheReadSideAndKeepsHostLists) {
    TestStore store;
    store.patches[1] = test_patches::Cmyk(10, 0, 0, 0);
    store.keywordMap["CHART_TYPE"] = "\"IT8.7/4\"";
    store.referenceSampleMap[5] = 1;
    store.filePath = L"chart.txt";
    store.numberOfSets = 1;
    store.numberOfFields = 5;
    store.numberOfStrips = 2;
    store.numberOfCols = 3;
    store.numberOfPages = 4;
    store.patchesPerPage = 6;
    store.borderPatches = 1;
    store.originalNumberOfSets = 7;
    store.uvCutMode = 1;
    store.zebraRulerMode = 1;
    store.device = 9;
    store.UpdatePresenceFlags(0);
    store.hasCMYKO = true;
    store.SetChartNormLight({96.0, 100.0, 82.0});
    store.SetSampleNameList({"A1"});
    store.SetCMYKList({{1, 2, 3, 4}});
    store.SetKeywordList({{"ORIGINATOR", "test"}});

    store.ResetChart();

    EXPECT_TRUE(store.patches.empty());
    EXPECT_TRUE(store.keywordMap.empty());
    EXPECT_TRUE(store.referenceSampleMap.empty());
    EXPECT_TRUE(store.filePath.empty());
    for (int number : {store.numberOfSets, store.numberOfFields, store.numberOfStrips,
                       store.numberOfCols, store.numberOfPages, store.patchesPerPage,
                       store.borderPatches, store.originalNumberOfSets, store.uvCutMode,
                       store.zebraRulerMode, store.device, store.channelCount}) {
        EXPECT_EQ(number, 0);
    }
    EXPECT_EQ(store.missingColorSpaces, 0u);
    for (int space = 0; space <= 11; ++space) {
        EXPECT_FALSE(store.IsColorSpacePresent(space)) << space;
    }
    EXPECT_EQ(store.normLight.x, 0.0);
    EXPECT_EQ(store.normLight.y, 0.0);
    EXPECT_EQ(store.normLight.z, 0.0);
    EXPECT_EQ(store.sampleNameList.size(), 1u);
    EXPECT_EQ(store.cmykList.size(), 1u);
    EXPECT_EQ(store.keywordList.size(), 1u);
}

TEST(PresenceFlags, SpectrumAloneImpliesCmykXyzAndLab) {
    TestStore store;
    store.UpdatePresenceFlags(kNothingSupplied & ~MISSING_SPECTRAL);
    EXPECT_TRUE(store.hasSpectral);
    EXPECT_TRUE(store.hasCMYK);
    EXPECT_TRUE(store.hasXYZ);
    EXPECT_TRUE(store.hasLAB);
    EXPECT_FALSE(store.hasRGB);
    EXPECT_FALSE(store.hasDensity);
    EXPECT_EQ(store.channelCount, 0);
    EXPECT_EQ(store.missingColorSpaces, kNothingSupplied & ~MISSING_SPECTRAL);
}

TEST(PresenceFlags, LabFollowsTheXyzFlagOfTheStepBefore) {
    TestStore xyzOnly; // the patches compute Lab from their XYZ
    xyzOnly.UpdatePresenceFlags(kNothingSupplied & ~MISSING_XYZ);
    EXPECT_TRUE(xyzOnly.hasXYZ);
    EXPECT_TRUE(xyzOnly.hasLAB);
    EXPECT_FALSE(xyzOnly.hasCMYK);
    EXPECT_FALSE(xyzOnly.hasSpectral);

    TestStore nothing; // no source for XYZ or Lab
    nothing.UpdatePresenceFlags(kNothingSupplied);
    for (int space = -1; space <= 12; ++space) {
        EXPECT_FALSE(nothing.IsColorSpacePresent(space)) << space;
    }
    EXPECT_EQ(nothing.channelCount, 0);
}

TEST(PresenceFlags, ChannelCountFollowsTheLastDeviceSpaceSupplied) {
    {
        TestStore store; // CMYK and RGB: the RGB step comes later
        store.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_CMYK | MISSING_RGB));
        EXPECT_TRUE(store.hasCMYK);
        EXPECT_TRUE(store.hasRGB);
        EXPECT_FALSE(store.hasXYZ);
        EXPECT_FALSE(store.hasLAB);
        EXPECT_EQ(store.channelCount, 3);
    }
    {
        TestStore store;
        store.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_CMYK | MISSING_CMYKOG));
        EXPECT_TRUE(store.hasCMYKOG);
        EXPECT_EQ(store.channelCount, 6);
    }
    {
        TestStore store;
        store.UpdatePresenceFlags(kNothingSupplied & ~MISSING_CMYKOGV);
        EXPECT_TRUE(store.hasCMYKOGV);
        EXPECT_FALSE(store.hasCMYK);
        EXPECT_EQ(store.channelCount, 7);
    }
    {
        TestStore store; // Lab supplied implies XYZ (the patches convert it)
        store.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_LAB | MISSING_HTMLCOLOR |
                                                       MISSING_DENSITY | MISSING_CMYKRGB));
        EXPECT_TRUE(store.hasLAB);
        EXPECT_TRUE(store.hasXYZ);
        EXPECT_TRUE(store.hasHTMLCOLOR);
        EXPECT_TRUE(store.hasDensity);
        EXPECT_TRUE(store.hasCMYKRGB);
        EXPECT_EQ(store.channelCount, 7);
    }
}

TEST(PresenceFlags, NColorCountComesFromPatchOne) {
    TestStore store;
    store.patches[1] = test_patches::NColor({10, 0, 0, 0, 0});
    store.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_RGB | MISSING_NCOLOR));
    EXPECT_TRUE(store.hasNColor);
    EXPECT_EQ(store.channelCount, 5);

    TestStore withoutPatchOne;
    withoutPatchOne.patches[2] = test_patches::NColor({10, 0, 0, 0, 0});
    withoutPatchOne.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_RGB | MISSING_NCOLOR));
    EXPECT_TRUE(withoutPatchOne.hasNColor);
    EXPECT_EQ(withoutPatchOne.channelCount, 3);
}

TEST(PresenceFlags, FlagsAccumulateAndFiveColourIsNeverSet) {
    TestStore store;
    store.UpdatePresenceFlags(kNothingSupplied & ~MISSING_RGB);
    store.UpdatePresenceFlags(kNothingSupplied & ~MISSING_CMYK);
    EXPECT_TRUE(store.hasRGB);
    EXPECT_TRUE(store.hasCMYK);
    EXPECT_EQ(store.channelCount, 4);
    EXPECT_EQ(store.missingColorSpaces, kNothingSupplied & ~MISSING_CMYK);

    store.UpdatePresenceFlags(0);
    EXPECT_FALSE(store.hasCMYKO);
    EXPECT_FALSE(store.IsColorSpacePresent(COLORSPACE_CMYKO));
    for (int space = 0; space <= 10; ++space) {
        EXPECT_TRUE(store.IsColorSpacePresent(space)) << space;
    }
}

} // namespace
