// XYZ, L*a*b* and densities computed through the colour engine from the spectra
// a host hands in: the calls the store makes and what it keeps of their answers.
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
    std::vector<std::size_t> ComputedSizes() const {
        return {store.xyzList.size(), store.labList.size(), store.densityList.size()};
    }
    TestStore store;
};

TEST_F(ListColorimetry, TwoSpectraGiveTwoEntriesThroughThreeCallsEach) {
    engine_double::SetXYZ(41.0f, 42.0f, 43.0f);
    engine_double::SetLab(71.0f, -2.0f, 3.5f);
    engine_double::SetDensity(0.5f, 0.25f, 1.5f, 2.0f);
    store.SetSpectralDataList(
        {Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.1), Spectrum("SPECTRAL_NM_", 380, 730, 10, 0.2)},
        true);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 6u);
    for (std::size_t s = 0; s < 2; ++s) {
        const auto& toXyz = calls[3 * s];
        const auto& toLab = calls[3 * s + 1];
        const auto& toDensity = calls[3 * s + 2];
        EXPECT_EQ(
            (std::vector<Call>{toXyz.call, toLab.call, toDensity.call}),
            (std::vector<Call>{Call::SpectralToXYZ, Call::XYZToLab, Call::SpectralToDensity}));
        // Start, count and option of the two spectral calls.
        EXPECT_EQ((std::vector<int>{toXyz.startNm, toXyz.count, toDensity.startNm, toDensity.count,
                                    toDensity.option}),
                  (std::vector<int>{380, 36, 380, 36, 0}));
        EXPECT_EQ(toXyz.input, std::vector<float>(36, s == 0 ? 0.1f : 0.2f));
        EXPECT_EQ(toDensity.input, toXyz.input);
        EXPECT_EQ(toLab.input, (std::vector<float>{0.41f, 0.42f, 0.43f})); // the engine's XYZ / 100
    }
    ASSERT_EQ(ComputedSizes(), (std::vector<std::size_t>{2, 2, 2}));
    const tagDENSITY& density = store.densityList[1];
    EXPECT_EQ(
        (std::vector<double>{store.xyzList[1].y, store.labList[1].b, density.red, density.green,
                             density.blue, density.visual, density.majorFilter}),
        (std::vector<double>{42.0, 3.5, 0.5, 0.25, 1.5, 2.0, 0.0}));
}

TEST_F(ListColorimetry, EachSpectrumOnTheWavelengthsOfItsOwnNames) {
    for (const char* leadIn : {"nm", "NM"}) {
        engine_double::Reset();
        store.SetSpectralDataList(
            {Spectrum(leadIn, 400, 700, 10), Spectrum("SPECTRAL_", 380, 730, 10)}, true);
        const auto& calls = engine_double::Calls();
        ASSERT_EQ(calls.size(), 6u);
        EXPECT_EQ(
            (std::vector<int>{calls[0].startNm, calls[0].count, calls[3].startNm, calls[3].count}),
            (std::vector<int>{400, 31, 380, 36}));
    }
    // Names without a wavelength, without a lead-in, or no names at all: those
    // spectra are skipped, the others computed.
    engine_double::Reset();
    store.SetSpectralDataList({{{"SPECTRAL_x", 0.5}, {"SPECTRAL_y", 0.6}},
                               {{"R380", 0.5}, {"R390", 0.5}},
                               {},
                               Spectrum("SPECTRAL_", 380, 730, 10)},
                              true);
    ASSERT_EQ(engine_double::Calls().size(), 3u);
    EXPECT_EQ(ComputedSizes(), (std::vector<std::size_t>{1, 1, 1}));
}

TEST_F(ListColorimetry, AFailingSpectrumLeavesNoEntry) {
    Spectra spectra(3, Spectrum("SPECTRAL_", 380, 730, 10));
    engine_double::FailCall(4); // the second spectrum's XYZ call
    store.SetSpectralDataList(spectra, true);
    EXPECT_EQ(engine_double::Calls().size(), 7u); // 3 + 1 + 3
    EXPECT_EQ(ComputedSizes(), (std::vector<std::size_t>{2, 2, 2}));

    for (Call failing : {Call::XYZToLab, Call::SpectralToDensity}) {
        engine_double::Reset();
        engine_double::FailAll(failing);
        store.SetSpectralDataList(spectra, true);
        EXPECT_EQ(ComputedSizes(), (std::vector<std::size_t>{0, 0, 0}));
    }
}

TEST_F(ListColorimetry, OtherGridsAndRangesAreBroughtOnto10nmSteps) {
    Spectra spectra{Spectrum("SPECTRAL_", 380, 400, 10, 0.25),  // 3 values, as they are
                    Spectrum("SPECTRAL_", 380, 780, 20, 0.5),   // every 20 nm
                    Spectrum("SPECTRAL_", 360, 780, 10, 0.75)}; // from 360 nm
    store.SetSpectralDataList(spectra, true);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 9u);
    EXPECT_EQ(calls[0].input, std::vector<float>(3, 0.25f));
    EXPECT_EQ(
        (std::vector<int>{calls[3].startNm, calls[3].count, calls[6].startNm, calls[6].count}),
        (std::vector<int>{380, 41, 380, 41}));
    // A flat spectrum stays flat between its points.
    EXPECT_EQ(calls[3].input, std::vector<float>(41, 0.5f));
    EXPECT_EQ(calls[8].input, std::vector<float>(41, 0.75f));
}

} // namespace
