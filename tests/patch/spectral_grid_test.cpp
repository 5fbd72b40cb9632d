// Deriving a patch's wavelength grid from its spectral field names.
#include <climits>
#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::Spectrum;

CColorPatch WithSpectrum(std::map<std::string, double> spectral) {
    patch_test::PatchInput in;
    in.spectral = std::move(spectral);
    return in.Build();
}

SpectralDataStruct GridOf(std::map<std::string, double> spectral) {
    return WithSpectrum(std::move(spectral)).GetSpectralDataStruct();
}

// The message of the exception of type E that construction throws.
template <typename E> std::string FailureOf(std::map<std::string, double> spectral) {
    try {
        WithSpectrum(std::move(spectral));
    } catch (const E& e) {
        return e.what();
    }
    return "no exception";
}

TEST(SpectralGrid, EveryNameFormGivesTheSameGrid) {
    for (const std::string lead : {"SPECTRAL_NM_", "SPECTRAL_"}) {
        const SpectralDataStruct grid = GridOf(Spectrum(lead, 380, 10, 36, 0.01, 0.01));
        EXPECT_EQ(grid.startNm, 380) << lead;
        EXPECT_EQ(grid.stepNm, 10) << lead;
        EXPECT_EQ(grid.count, 36) << lead;
        EXPECT_DOUBLE_EQ(grid.values[35], 0.36) << lead;
    }
    const SpectralDataStruct trailing = GridOf({{"400NM", 0.2}, {"500NM", 0.3}, {"600NM", 0.4}});
    EXPECT_EQ(trailing.startNm, 400);
    EXPECT_EQ(trailing.stepNm, 100);

    EXPECT_TRUE(WithSpectrum(Spectrum("SPECTRAL_", 380, 10, 2)).IsSpectralPresent());
    const CColorPatch none = WithSpectrum({});
    EXPECT_FALSE(none.IsSpectralPresent());
    EXPECT_EQ(none.GetSpectralDataStruct().startNm, 0);
}

TEST(SpectralGrid, UnusualSpectraKeepTheGridSafe) {
    // A single value: no step can be derived, so it is 0.
    const SpectralDataStruct single = GridOf({{"SPECTRAL_380", 0.7}});
    EXPECT_EQ(single.count, 1);
    EXPECT_EQ(single.startNm, 380);
    EXPECT_EQ(single.stepNm, 0);

    // 60 values from 300 to 890 nm: the grid keeps the first 50 (300 to 790 nm),
    // the map keeps all 60.
    const CColorPatch wide = WithSpectrum(Spectrum("SPECTRAL_NM_", 300, 10, 60, 0.0, 1.0));
    const SpectralDataStruct grid = wide.GetSpectralDataStruct();
    EXPECT_EQ(grid.count, 50);
    EXPECT_EQ(grid.startNm, 300);
    EXPECT_EQ(grid.stepNm, 10); // (790 - 300) / 49
    EXPECT_EQ(grid.values[49], 49.0);
    EXPECT_EQ(wide.GetSpectralData().size(), 60u);

    // 380, 390, 405 nm: (405 - 380) / 2 = 12.5 truncates to 12.
    EXPECT_EQ(GridOf({{"SPECTRAL_380", 1}, {"SPECTRAL_390", 1}, {"SPECTRAL_405", 1}}).stepNm, 12);
    // A difference of 4,000,000,000 nm does not fit 32 bits: held at the int maximum.
    EXPECT_EQ(GridOf({{"SPECTRAL_-2000000000", 1}, {"SPECTRAL_2000000000", 1}}).stepNm, INT_MAX);
}

TEST(SpectralGrid, UnreadableNamesRefuseThePatchWithTheLibraryExceptions) {
    const std::string position = "invalid string position";
    // Mixed forms: the greatest name chooses "SPECTRAL_NM_", the least lacks it.
    EXPECT_EQ(FailureOf<std::out_of_range>({{"SPECTRAL_380", 1}, {"SPECTRAL_NM_390", 1}}),
              position);
    EXPECT_EQ(FailureOf<std::invalid_argument>({{"SPECTRAL_NM_abc", 1}}), "invalid stol argument");
    EXPECT_EQ(FailureOf<std::invalid_argument>({{"SPECTRAL_380", 1}, {"SPECTRAL_X", 1}}),
              "invalid stol argument");
    EXPECT_EQ(FailureOf<std::out_of_range>({{"SPECTRAL_99999999999", 1}}),
              "stol argument out of range");
    EXPECT_THROW(CColorPatch({}, {}, {}, {}, {}, {}, {}, {{"SPECTRAL_NM_x", 1}}, {}, ""),
                 std::invalid_argument);
}

} // namespace
