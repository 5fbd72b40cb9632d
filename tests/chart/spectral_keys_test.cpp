// Spectral ranges from field names, and the chart's spectra.
#include <gtest/gtest.h>

#include <stdexcept>

#include "test_store.h"

namespace {

using test_patches::Spectrum;

void ExpectRange(const SpectralRangeStruct& range, int start, int step, int count) {
    EXPECT_EQ(range.startNm, start);
    EXPECT_EQ(range.stepNm, step);
    EXPECT_EQ(range.count, count);
}

TEST(SpectralKeys, EveryLeadInGivesTheGrid) {
    TestStore store;
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("SPECTRAL_NM_", 380, 730, 10)), 380, 10, 36);
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("SPECTRAL_", 400, 700, 10)), 400, 10, 31);
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("nm", 380, 730, 10)), 380, 10, 36);
    // Field names reach the store upper-cased from the reader.
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("NM", 380, 730, 10)), 380, 10, 36);
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("SPECTRAL_NM_", 400, 700, 20)), 400, 20, 16);
}

TEST(SpectralKeys, UnrecognisedOrDegenerateNames) {
    TestStore store;
    ExpectRange(store.AnalyseSpectralKeys({}), 0, 0, 0);
    ExpectRange(store.AnalyseSpectralKeys(Spectrum("R", 380, 730, 10)), 0, 0, 0);
    // One field: no step can be derived.
    ExpectRange(store.AnalyseSpectralKeys({{"SPECTRAL_500", 0.5}}), 500, 0, 1);
    // The last name (in byte order) without a lead-in: start and count only.
    ExpectRange(store.AnalyseSpectralKeys({{"SPECTRAL_400", 0.5}, {"ZZ", 0.5}}), 400, 0, 2);
    // Byte order, not wavelength order: "SPECTRAL_1000" sorts before "SPECTRAL_380";
    // (730 - 1000) / (37 - 1) = -7.5, truncated to -7.
    auto mixed = Spectrum("SPECTRAL_", 380, 730, 10);
    mixed["SPECTRAL_1000"] = 0.5;
    ExpectRange(store.AnalyseSpectralKeys(mixed), 1000, -7, 37);
    // Extreme wavelengths: (2147483647 - (-2147483648)) / 1 does not fit; clamped.
    ExpectRange(store.AnalyseSpectralKeys({{"nm-2147483648", 0.1}, {"nm2147483647", 0.2}}),
                -2147483647 - 1, 2147483647, 2);
}

TEST(SpectralKeys, NamesWithoutANumberThrow) {
    TestStore store;
    try {
        store.AnalyseSpectralKeys({{"SPECTRAL_x", 0.5}});
        ADD_FAILURE() << "no exception";
    } catch (const std::invalid_argument& e) {
        EXPECT_STREQ(e.what(), "invalid stol argument");
    }
    EXPECT_THROW(store.AnalyseSpectralKeys({{"SPECTRAL_380", 0.5}, {"SPECTRAL_99999999999", 0.5}}),
                 std::out_of_range);
}

TEST(SpectralKeys, ChartRangeAndSpectraNeedTheSpectralFlag) {
    TestStore store;
    test_patches::PatchValues first;
    first.spectral = Spectrum("SPECTRAL_NM_", 400, 700, 10);
    store.patches[2] = test_patches::Build(first);
    test_patches::PatchValues second;
    second.spectral = Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.25);
    store.patches[3] = test_patches::Build(second);

    ExpectRange(store.GetSpectralRange(), 0, 0, 0);
    EXPECT_TRUE(store.GetSpectralDataList().empty());

    store.hasSpectral = true;
    ExpectRange(store.GetSpectralRange(), 400, 10, 31); // the lowest sample number
    const auto spectra = store.GetSpectralDataList();
    ASSERT_EQ(spectra.size(), 2u);
    EXPECT_EQ(spectra[0].size(), 31u);
    EXPECT_EQ(spectra[1].size(), 36u);
    EXPECT_EQ(spectra[1].at("SPECTRAL_NM_730"), 0.25);

    TestStore flagOnly;
    flagOnly.hasSpectral = true;
    ExpectRange(flagOnly.GetSpectralRange(), 0, 0, 0);
}

} // namespace
