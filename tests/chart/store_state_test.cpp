// The base answers of the file-format operations, the reset, and the presence
// flags and channel count derived from a row's missing-space mask.
#include <gtest/gtest.h>

#include <set>

#include "test_store.h"

namespace {

using test_patches::kNothingSupplied;
using Spaces = std::set<int>;

Spaces PresentSpaces(TestStore& store) {
    Spaces present;
    for (int space = -1; space <= 12; ++space) {
        if (store.IsColorSpacePresent(space)) {
            present.insert(space);
        }
    }
    return present;
}

TEST(StoreState, BaseAnswersOfTheFileFormatOperations) {
    TestStore store;
    std::vector<std::vector<double>> lists{{1.0}};
    std::vector<std::string> names{"kept"};
    EXPECT_EQ(store.GetDeviceValueLists(lists), 24);
    EXPECT_EQ(store.GetDeviceColorSpace(), -1);
    EXPECT_EQ(store.GetDeviceChannelCount(), -1);
    EXPECT_EQ(store.WriteDeviceControlSequence("unused.txt"), 23);
    store.SetDataFormatLine("SAMPLE_ID CMYK_C");
    EXPECT_EQ(store.GetDataFormatLine(), "");
    EXPECT_EQ(store.GetProcessColorNames(names), 1);
    EXPECT_EQ(lists.size() + names.size(), 2u); // both left alone
}

TEST(StoreState, ResetEmptiesTheReadSideAndKeepsHostLists) {
    TestStore store;
    store.patches[1] = test_patches::Build({10, 0, 0, 0}, {}, {}, {}, "", MISSING_CMYK);
    store.keywordMap["CHART_TYPE"] = "\"IT8.7/4\"";
    store.referenceSampleMap[5] = 1;
    store.filePath = L"chart.txt";
    int* const numbers[] = {&store.numberOfSets,  &store.numberOfFields,      &store.numberOfStrips,
                            &store.numberOfCols,  &store.numberOfPages,       &store.patchesPerPage,
                            &store.borderPatches, &store.uvCutMode,           &store.zebraRulerMode,
                            &store.device,        &store.originalNumberOfSets};
    for (int* number : numbers) {
        *number = 7;
    }
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
    for (int* number : numbers) {
        EXPECT_EQ(*number, 0);
    }
    EXPECT_EQ(store.channelCount, 0);
    EXPECT_EQ(store.missingColorSpaces, 0u);
    EXPECT_TRUE(PresentSpaces(store).empty());
    EXPECT_EQ(store.normLight.x + store.normLight.y + store.normLight.z, 0.0);
    EXPECT_EQ(store.sampleNameList.size() + store.cmykList.size() + store.keywordList.size(), 3u);
}

TEST(PresenceFlags, SpacesAndChannelCountPerSuppliedSpaces) {
    struct Case {
        std::uint32_t supplied; // missing-space bits cleared in the mask
        Spaces present;
        int channels;
    };
    const Case cases[] = {
        // The patches derive CMYK, XYZ and Lab from a spectrum; no device channels.
        {MISSING_SPECTRAL,
         {COLORSPACE_SPECTRAL, COLORSPACE_CMYK, COLORSPACE_XYZ, COLORSPACE_LAB},
         0},
        {MISSING_CMYK, {COLORSPACE_CMYK}, 4},
        {MISSING_XYZ, {COLORSPACE_XYZ, COLORSPACE_LAB}, 0},
        {MISSING_LAB, {COLORSPACE_LAB, COLORSPACE_XYZ}, 0},
        {MISSING_RGB, {COLORSPACE_RGB}, 3},
        {MISSING_HTMLCOLOR, {COLORSPACE_HTMLCOLOR}, 0},
        {MISSING_CMYKOG, {COLORSPACE_CMYKOG}, 6},
        {MISSING_CMYKRGB, {COLORSPACE_CMYKRGB}, 7},
        {MISSING_CMYKOGV, {COLORSPACE_CMYKOGV}, 7},
        {MISSING_NCOLOR, {COLORSPACE_NCOLOR}, 0}, // no patch 1 to count channels on
        {MISSING_DENSITY, {COLORSPACE_DENSITY}, 0},
        {0, {}, 0},
        // A later step overwrites the channel count of an earlier one.
        {MISSING_CMYK | MISSING_RGB, {COLORSPACE_CMYK, COLORSPACE_RGB}, 3},
        {MISSING_CMYK | MISSING_CMYKOG, {COLORSPACE_CMYK, COLORSPACE_CMYKOG}, 6},
        // Everything supplied: every space but the five-colour one, which no bit sets.
        {kNothingSupplied, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10}, 7},
    };
    for (const Case& c : cases) {
        TestStore store;
        store.UpdatePresenceFlags(kNothingSupplied & ~c.supplied);
        EXPECT_EQ(PresentSpaces(store), c.present) << "supplied " << c.supplied;
        EXPECT_EQ(store.channelCount, c.channels) << "supplied " << c.supplied;
        EXPECT_EQ(store.missingColorSpaces, kNothingSupplied & ~c.supplied);
    }
}

TEST(PresenceFlags, NColourCountFromPatchOneAndFlagsAccumulate) {
    std::map<int, tagNCLR> channels;
    for (int c = 0; c < 5; ++c) {
        channels[c] = tagNCLR{5, c, "", 10.0};
    }
    TestStore store;
    store.patches[1] = test_patches::Build({}, {}, {}, channels, "", MISSING_NCOLOR);
    store.UpdatePresenceFlags(kNothingSupplied & ~(MISSING_RGB | MISSING_NCOLOR));
    EXPECT_EQ(store.channelCount, 5);

    // A second block adds its flags to the first block's.
    store.UpdatePresenceFlags(kNothingSupplied & ~MISSING_CMYK);
    EXPECT_EQ(PresentSpaces(store), (Spaces{COLORSPACE_CMYK, COLORSPACE_RGB, COLORSPACE_NCOLOR}));
    EXPECT_EQ(store.channelCount, 4);
    EXPECT_EQ(store.missingColorSpaces, kNothingSupplied & ~MISSING_CMYK);
}

} // namespace
