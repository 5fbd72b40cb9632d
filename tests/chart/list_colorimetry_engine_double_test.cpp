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

TEST_F(ListColorimetry, WithoutComputeOnlyTheSpectraChange) {
    store.xyzList = {tagXYZ{1, 2, 3}};
    store.labList = {tagLAB{4, 5, 6}};
    store.densityList = {tagDENSITY{}};
    store.SetSpectralDataList({Spectrum("SPECTRAL_NM_", 380, 730, 10)}, false);
    EXPECT_EQ(store.spectralList.size(), 1u);
    EXPECT_EQ(ComputedSizes(), (std::vector<std::size_t>{1, 1, 1}));

    store.SetSpectralDataList({}, true); // an empty list empties the computed ones
    EXPECT_TRUE(store.spectralList.empty());
    EXPECT_EQ(ComputedSizes(), (std::vector<std::size_t>{0, 0, 0}));
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
        EXPECT_EQ(
            (std::vector<Call>{toXyz.call, toLab.call, toDensity.call}),
            (std::vector<Call>{Call::SpectralToXYZ, Call::XYZToLab, Call::SpectralToDensity}));
        // Start, count and option of the two spectral calls.
        EXPECT_EQ((std::vector<int>{toXyz.startNm, toXyz.count, toDensity.startNm, toDensity.count,
                                    toDensity.option}),
                  (std::vector<int>{380, 36, 380, 36, 0}));
        EXPECT_EQ(toXyz.input, std::vector<float>(36, static_cast<float>(values[s])));
        EXPECT_EQ(toDensity.input, toXyz.input);
        ASSERT_EQ(toLab.input.size(), 3u);
        for (int i = 0; i < 3; ++i) {
            EXPECT_FLOAT_EQ(toLab.input[i], (41.0f + i) / 100); // the engine's XYZ / 100
        }
    }
    ASSERT_EQ(ComputedSizes(), (std::vector<std::size_t>{3, 3, 3}));
    EXPECT_EQ(store.xyzList[2].y, 42.0);
    EXPECT_EQ(store.labList[1].b, 3.5);
    const tagDENSITY& density = store.densityList[0];
    EXPECT_EQ((std::vector<double>{density.red, density.green, density.blue, density.visual,
                                   density.majorFilter}),
              (std::vector<double>{0.5, 0.25, 1.5, 2.0, 0.0}));
}

TEST_F(ListColorimetry, StartWavelengthFromTheFirstName) {
    const struct {
        std::map<std::string, double> first;
        int calls;
        int startNm;
    } cases[] = {
        {Spectrum("SPECTRAL_", 400, 700, 10), 3, 400},
        {Spectrum("nm", 400, 700, 10), 3, 400},
        {Spectrum("NM", 400, 700, 10), 3, 400},
        {{{"SPECTRAL_x", 0.5}, {"SPECTRAL_y", 0.6}}, 3, 0}, // no digit: 0, still computed
        {{{"R380", 0.5}}, 0, 0},                            // no lead-in: nothing computed
        {{}, 0, 0},                                         // empty first spectrum
    };
    for (const auto& c : cases) {
        engine_double::Reset();
        store.SetSpectralDataList({c.first, Spectrum("SPECTRAL_", 380, 730, 10)}, true);
        const auto& calls = engine_double::Calls();
        ASSERT_EQ(calls.size(), static_cast<std::size_t>(2 * c.calls)) << c.calls;
        if (c.calls > 0) {
            EXPECT_EQ(calls[0].startNm, c.startNm);
            EXPECT_EQ(calls[0].count, static_cast<int>(c.first.size()));
        }
        EXPECT_EQ(store.spectralList.size(), 2u);
        EXPECT_EQ(store.xyzList.size(), c.calls == 0 ? 0u : 2u);
    }
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
