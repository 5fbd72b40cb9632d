// XYZ, L*a*b* and densities of host spectra through the real colour engine:
// which spectra end up in the computed lists, and with whose values.
#include <cmath>
#include <limits>

#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::Spectrum;

// A flat reflectance r over 380-730 nm: the engine normalises a perfect white to
// Y = 100 and takes Lab against that white, so Y = 100 r, L* = 116 r^(1/3) - 16,
// a* = b* = 0, and every filter's weighted mean is r, so each density is
// -log10(r).
TEST(ListColorimetry, ARejectedSpectrumLeavesTheOthersInOrder) {
    auto rejected = Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.5);
    rejected["SPECTRAL_NM_550"] = std::numeric_limits<double>::quiet_NaN();

    TestStore store;
    store.SetSpectralDataList({Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.2), rejected,
                               Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.8)},
                              true);

    EXPECT_EQ(store.spectralList.size(), 3u);
    ASSERT_EQ(store.xyzList.size(), 2u);
    ASSERT_EQ(store.labList.size(), 2u);
    ASSERT_EQ(store.densityList.size(), 2u);

    // Entry 0 is the first spectrum (0.2), entry 1 the third (0.8).
    EXPECT_NEAR(store.xyzList[0].y, 20.0, 1e-3);
    EXPECT_NEAR(store.xyzList[1].y, 80.0, 1e-3);
    EXPECT_NEAR(store.labList[0].l, 51.8372, 1e-3); // 116 * 0.5848035 - 16
    EXPECT_NEAR(store.labList[1].l, 91.6849, 1e-3); // 116 * 0.9283178 - 16
    EXPECT_NEAR(store.labList[0].a, 0.0, 1e-2);
    EXPECT_NEAR(store.labList[1].b, 0.0, 1e-2);
    EXPECT_NEAR(store.densityList[0].red, 0.69897, 1e-5); // -log10(0.2)
    EXPECT_NEAR(store.densityList[0].visual, 0.69897, 1e-5);
    EXPECT_NEAR(store.densityList[1].blue, 0.09691, 1e-5); // -log10(0.8)
    EXPECT_EQ(store.densityList[1].majorFilter, 0.0);
}

} // namespace
