// Store state without a file: the presence flags and channel count derived from
// a row's missing-space mask, the keyword list to be written, and spectral
// ranges from spectral field names. Keyword look-up and the range of a read
// chart are tested through read charts.
#include <gtest/gtest.h>

#include <set>
#include <stdexcept>

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
        {MISSING_CMYKOG, {COLORSPACE_CMYKOG}, 6},
        {MISSING_CMYKRGB, {COLORSPACE_CMYKRGB}, 7},
        // A later step overwrites the channel count of an earlier one.
        {MISSING_CMYK | MISSING_RGB, {COLORSPACE_CMYK, COLORSPACE_RGB}, 3},
        // Everything supplied: every space but the five-colour one, which no bit sets.
        {kNothingSupplied, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10}, 7},
    };
    for (const Case& c : cases) {
        TestStore store;
        store.UpdatePresenceFlags(kNothingSupplied & ~c.supplied);
        EXPECT_EQ(PresentSpaces(store), c.present) << "supplied " << c.supplied;
        EXPECT_EQ(store.channelCount, c.channels) << "supplied " << c.supplied;
    }
}

using Pairs = std::vector<std::pair<std::string, std::string>>;

TEST(Keywords, SetChartTypeEditsTheListToBeWritten) {
    TestStore store;
    store.SetChartType("A");
    store.SetChartType("B");
    EXPECT_EQ(store.keywordList, (Pairs{{"CHART_TYPE", "B"}}));

    // AddKeyword appends even a keyword already there; SetChartType changes both.
    store.AddKeyword({"ORIGINATOR", "x"});
    store.AddKeyword({"CHART_TYPE", "C"});
    store.SetChartType("D");
    EXPECT_EQ(store.keywordList,
              (Pairs{{"CHART_TYPE", "D"}, {"ORIGINATOR", "x"}, {"CHART_TYPE", "D"}}));
    store.SetKeyword({"CHART_TYP", "E"}); // a prefix is another keyword
    EXPECT_EQ(store.keywordList.back(), (std::pair<std::string, std::string>{"CHART_TYP", "E"}));
}

using test_patches::Spectrum;

TEST(SpectralKeys, RangesFromTheFirstAndLastNames) {
    auto mixed = Spectrum("SPECTRAL_", 380, 730, 10);
    mixed["SPECTRAL_1000"] = 0.5;
    const struct {
        std::map<std::string, double> names;
        std::vector<int> range; // start, step, count
    } cases[] = {
        {Spectrum("SPECTRAL_NM_", 380, 730, 10), {380, 10, 36}},
        {Spectrum("nm", 380, 730, 10), {380, 10, 36}},
        {Spectrum("NM", 380, 730, 10), {380, 10, 36}}, // as the reader upper-cases them
        {Spectrum("SPECTRAL_", 400, 700, 20), {400, 20, 16}},
        {{}, {0, 0, 0}},
        {{{"SPECTRAL_500", 0.5}}, {500, 0, 1}}, // one name: no step
        // Byte order: "SPECTRAL_1000" comes first; (730 - 1000) / 36 = -7.5 -> -7.
        {mixed, {1000, -7, 37}},
        // 2147483647 - (-2147483648) does not fit in 32 bits: the step is clamped.
        {{{"nm-2147483648", 0.1}, {"nm2147483647", 0.2}}, {-2147483647 - 1, 2147483647, 2}},
    };
    TestStore store;
    for (const auto& c : cases) {
        const SpectralRangeStruct range = store.AnalyseSpectralKeys(c.names);
        EXPECT_EQ((std::vector<int>{range.startNm, range.stepNm, range.count}), c.range)
            << (c.names.empty() ? std::string() : c.names.begin()->first);
    }
    EXPECT_THROW(store.AnalyseSpectralKeys({{"SPECTRAL_x", 0.5}}), std::invalid_argument);
    EXPECT_THROW(store.AnalyseSpectralKeys({{"SPECTRAL_380", 0.5}, {"SPECTRAL_99999999999", 0.5}}),
                 std::out_of_range);
}

} // namespace
