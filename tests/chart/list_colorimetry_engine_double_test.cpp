// XYZ, L*a*b* and densities computed through the colour engine from the spectra
// a host hands in.
#include <gtest/gtest.h>

#include "recording_engine.h"
#include "test_store.h"

namespace {

using engine_double::Call;
using test_patches::Spectrum;
using Spectra = std::vector<std::map<std::string, double>>;

class ListColorimetry : public ::testing::Test {
protected:
    void SetUp() override { engine_double::Reset(); }
    TestStore store;
};

TEST_F(ListColorimetry, WithoutComputeOnlyTheSpectraChange) {
    store.xyzList = {tagXYZ{1, 2, 3}};
    store.labList = {tagLAB{4, 5, 6}};
    store.densityList = {tagDENSITY{}};
    store.SetSpectralDataList({Spectrum("SPECTRAL_NM_", 380, 730, 10)}, false);
    EXPECT_EQ(store.spectralList.size(), 1u);
    EXPECT_EQ(store.xyzList.size(), 1u);
    EXPECT_EQ(store.labList.size(), 1u);
    EXPECT_EQ(store.densityList.size(), 1u);
    EXPECT_TRUE(engine_double::Calls().empty());

    store.SetSpectralDataList({}, true);
    EXPECT_TRUE(store.spectralList.empty());
    EXPECT_TRUE(store.xyzList.empty());
    EXPECT_TRUE(store.labList.empty());
    EXPECT_TRUE(store.densityList.empty());
    EXPECT_TRUE(engine_double::Calls().empty());
}

TEST_F(ListColorimetry, ThreeSpectraGiveThreeEntriesThroughThreeCallsEach) {
    engine_double::SetXYZ(41.0f, 42.0f, 43.0f);
    engine_double::SetLab(71.0f, -2.0f, 3.5f);
    engine_double::SetDensity(0.5f, 0.25f, 1.5f, 2.0f);
    const double values[3] = {0.1, 0.2, 0.3};
    Spectra spectra;
    for (double value : values) {
        spectra.push_back(Spectrum("SPECTRAL_NM_", 380, 730, 10, value));
    }
    store.SetSpectralDataList(spectra, true);

    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 9u);
    for (std::size_t s = 0; s < 3; ++s) {
        const auto& toXyz = calls[3 * s];
        const auto& toLab = calls[3 * s + 1];
        const auto& toDensity = calls[3 * s + 2];
        EXPECT_EQ(toXyz.call, Call::SpectralToXYZ);
        EXPECT_EQ(toXyz.startNm, 380);
        EXPECT_EQ(toXyz.count, 36);
        ASSERT_EQ(toXyz.input.size(), 36u);
        EXPECT_EQ(toXyz.input[35], static_cast<float>(values[s]));
        EXPECT_EQ(toLab.call, Call::XYZToLab);
        ASSERT_EQ(toLab.input.size(), 3u);
        EXPECT_FLOAT_EQ(toLab.input[0], 0.41f); // 41 / 100
        EXPECT_FLOAT_EQ(toLab.input[2], 0.43f);
        EXPECT_EQ(toDensity.call, Call::SpectralToDensity);
        EXPECT_EQ(toDensity.startNm, 380);
        EXPECT_EQ(toDensity.count, 36);
        EXPECT_EQ(toDensity.option, 0);
        EXPECT_EQ(toDensity.input, toXyz.input);
    }
    ASSERT_EQ(store.xyzList.size(), 3u);
    ASSERT_EQ(store.labList.size(), 3u);
    ASSERT_EQ(store.densityList.size(), 3u);
    EXPECT_EQ(store.xyzList[2].y, 42.0);
    EXPECT_EQ(store.labList[1].b, 3.5);
    EXPECT_EQ(store.densityList[0].red, 0.5);
    EXPECT_EQ(store.densityList[0].green, 0.25);
    EXPECT_EQ(store.densityList[0].blue, 1.5);
    EXPECT_EQ(store.densityList[0].visual, 2.0);
    for (const auto& density : store.densityList) {
        EXPECT_EQ(density.majorFilter, 0.0);
    }
}

TEST_F(ListColorimetry, StartWavelengthFromEveryLeadIn) {
    for (const char* leadIn : {"SPECTRAL_", "nm", "NM"}) {
        engine_double::Reset();
        store.SetSpectralDataList({Spectrum(leadIn, 400, 700, 10)}, true);
        ASSERT_FALSE(engine_double::Calls().empty()) << leadIn;
        EXPECT_EQ(engine_double::Calls()[0].startNm, 400) << leadIn;
        EXPECT_EQ(engine_double::Calls()[0].count, 31) << leadIn;
        EXPECT_EQ(store.xyzList.size(), 1u) << leadIn;
    }
    // No digit after the lead-in reads as 0 and is still handed to the engine.
    engine_double::Reset();
    store.SetSpectralDataList({{{"SPECTRAL_x", 0.5}, {"SPECTRAL_y", 0.6}}}, true);
    ASSERT_EQ(engine_double::Calls().size(), 3u);
    EXPECT_EQ(engine_double::Calls()[0].startNm, 0);
    // No lead-in at all: nothing is computed.
    engine_double::Reset();
    store.SetSpectralDataList({{{"R380", 0.5}}}, true);
    EXPECT_TRUE(engine_double::Calls().empty());
    EXPECT_TRUE(store.xyzList.empty());
    // An empty first spectrum: nothing is computed either.
    store.SetSpectralDataList({{}, Spectrum("SPECTRAL_", 380, 730, 10)}, true);
    EXPECT_TRUE(engine_double::Calls().empty());
    EXPECT_EQ(store.spectralList.size(), 2u);
}

TEST_F(ListColorimetry, AFailingSpectrumLeavesNoEntry) {
    Spectra spectra(3, Spectrum("SPECTRAL_", 380, 730, 10));
    engine_double::FailCall(4); // the second spectrum's XYZ call
    store.SetSpectralDataList(spectra, true);
    EXPECT_EQ(engine_double::Calls().size(), 7u); // 3 + 1 + 3
    EXPECT_EQ(store.xyzList.size(), 2u);
    EXPECT_EQ(store.labList.size(), 2u);
    EXPECT_EQ(store.densityList.size(), 2u);

    for (Call failing : {Call::XYZToLab, Call::SpectralToDensity}) {
        engine_double::Reset();
        engine_double::FailAll(failing);
        store.SetSpectralDataList(spectra, true);
        EXPECT_TRUE(store.xyzList.empty());
        EXPECT_TRUE(store.labList.empty());
        EXPECT_TRUE(store.densityList.empty());
    }
}

TEST_F(ListColorimetry, SpectraOfOtherLengthsUseTheFirstOnesCount) {
    Spectra spectra{Spectrum("SPECTRAL_", 380, 430, 10, 0.5),   // 6 values
                    Spectrum("SPECTRAL_", 380, 400, 10, 0.25),  // 3 values
                    Spectrum("SPECTRAL_", 380, 730, 10, 0.75)}; // 36 values
    store.SetSpectralDataList(spectra, true);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 9u);
    EXPECT_EQ(calls[3].count, 6);
    EXPECT_EQ(calls[3].input, (std::vector<float>{0.25f, 0.25f, 0.25f, 0.0f, 0.0f, 0.0f}));
    EXPECT_EQ(calls[6].count, 6);
    EXPECT_EQ(calls[6].input, std::vector<float>(6, 0.75f));
    EXPECT_EQ(store.xyzList.size(), 3u);
}

} // namespace
