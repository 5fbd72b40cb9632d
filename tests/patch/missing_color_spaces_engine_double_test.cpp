// The patch's colour-engine steps, watched and failed through the recording engine.
#include <gtest/gtest.h>

#include <limits>
#include <map>
#include <string>
#include <vector>

#include "patch_test_inputs.h"
#include "recording_engine.h"

namespace {

using engine_double::Call;
using patch_test::FlagCount;

class MissingColorSpacesEngine : public ::testing::Test {
protected:
    void SetUp() override { engine_double::Reset(); }

    static patch_test::PatchInput SpectralRow() {
        patch_test::PatchInput in;
        in.xyz = {1, 2, 3};
        in.lab = {50, 10, -20};
        in.spectral = patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 0.5, 0.01);
        return in;
    }
};

TEST_F(MissingColorSpacesEngine, XyzAndDensitiesComeFromTheSpectrum) {
    const CColorPatch p =
        SpectralRow().Read(MISSING_XYZ | MISSING_LAB | MISSING_RGB | MISSING_DENSITY);

    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ(calls[0].call, Call::SpectralToXYZ);
    EXPECT_EQ(calls[1].call, Call::SpectralToDensity);
    EXPECT_EQ(calls[0].input, calls[1].input);
    EXPECT_EQ(calls[0].input.back(), static_cast<float>(0.5 + 35 * 0.01));
    // XYZ unscaled from the engine (50, 60, 70); Lab from it against the norm
    // light, L* = 116 * 0.6^(1/3) - 16; RGB type 0 from it: linear 0.410323,
    // 0.647147, 0.850615, companded 0.672872, 0.825043, 0.931222.
    EXPECT_EQ(FlagCount(p), 11); // every space supplied or derived
    EXPECT_EQ(p.GetXYZ().y, 60.0);
    EXPECT_NEAR(p.GetLAB().l, 81.83819, 1e-5);
    EXPECT_TRUE(p.GetRGB().r == 172 && p.GetRGB().b == 237);
    // Densities from the engine (0.1 ... 0.4).
    EXPECT_NEAR(p.GetDensity().visual, 0.4, 1e-7);
}

TEST_F(MissingColorSpacesEngine, EngineFailuresLeaveTheirSpaceMissingAndUnchanged) {
    engine_double::FailAll(Call::SpectralToXYZ);
    const CColorPatch noXyz = SpectralRow().Read(MISSING_XYZ | MISSING_LAB | MISSING_DENSITY);
    EXPECT_FALSE(noXyz.IsXYZPresent() || noXyz.IsLABPresent());
    EXPECT_EQ(noXyz.GetXYZ().y, 2.0);        // unchanged
    EXPECT_TRUE(noXyz.IsDensityAvailable()); // the later steps still run

    // With Lab supplied, a failed spectral XYZ falls back to the engine's Lab-to-XYZ.
    engine_double::Reset();
    engine_double::FailAll(Call::SpectralToXYZ);
    const CColorPatch fromLab = SpectralRow().Read(MISSING_XYZ);
    ASSERT_EQ(engine_double::Calls().size(), 2u);
    EXPECT_EQ(engine_double::Calls()[1].input, (std::vector<float>{50.0f, 10.0f, -20.0f}));
    EXPECT_NEAR(fromLab.GetXYZ().x, 40.0, 1e-4); // the double's 0.4 scaled by 100

    engine_double::Reset();
    engine_double::FailAll(Call::LabToXYZ);
    patch_test::PatchInput labOnly = SpectralRow();
    labOnly.spectral.clear();
    const CColorPatch noLabXyz = labOnly.Read(MISSING_XYZ);
    EXPECT_FALSE(noLabXyz.IsXYZPresent());
}

TEST_F(MissingColorSpacesEngine, UnevenNamesAreResampledThoughTheEndsAndCountLookEven) {
    // 36 names from 380 to 730 nm, but 395 nm in place of 400 nm; the values rise
    // by 0.001 per nm. The curve through the points is exact for a straight line
    // away from the ends, so the engine's 400 nm value is 0.52, not the 0.515
    // measured at 395 nm.
    patch_test::PatchInput in;
    for (int i = 0; i < 36; ++i) {
        const int nm = i == 2 ? 395 : 380 + 10 * i;
        in.spectral["SPECTRAL_NM_" + std::to_string(nm)] = 0.5 + 0.001 * (nm - 380);
    }
    in.Read(MISSING_XYZ | MISSING_DENSITY);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ((std::vector<int>{calls[0].startNm, calls[0].count}), (std::vector<int>{380, 36}));
    EXPECT_EQ(calls[0].input.at(1), 0.51f);
    EXPECT_FLOAT_EQ(calls[0].input.at(2), 0.52f);
    EXPECT_EQ(calls[1].input, calls[0].input); // densities from the same values
}

TEST_F(MissingColorSpacesEngine, SpectraThatCannotGiveColourDeriveNothing) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const std::map<std::string, double> cases[] = {
        {{"SPECTRAL_NM_550", 0.5}},                            // one value
        {{"SPECTRAL_NM_380", 0.5}, {"SPECTRAL_NM_390", nan}},  // not a number
        {{"SPECTRAL_NM_380", 0.5}, {"SPECTRAL_NM_390", 1e39}}, // beyond a float
        {{"SPECTRAL_NM_300", 0.5}, {"SPECTRAL_NM_370", 0.5}},  // all below 380 nm
        {{"SPECTRAL_NM_370", 0.5}, {"SPECTRAL_NM_790", 0.5}},  // none in 380..780
        {{"SPECTRAL_NM_0500", 0.5}, {"SPECTRAL_NM_500", 0.5}}, // 500 nm twice
        {{"380NM", 0.5}, {"5XYZ", 0.5}, {"730NM", 0.5}},       // a name without nm
    };
    for (const auto& spectrum : cases) {
        engine_double::Reset();
        patch_test::PatchInput in;
        in.spectral = spectrum;
        const CColorPatch p = in.Read(patch_test::SuppliedOnly(0));
        EXPECT_TRUE(engine_double::Calls().empty());
        EXPECT_EQ(patch_test::FlagCount(p), 1) << "only the spectrum itself is present";
    }
}

TEST_F(MissingColorSpacesEngine, OnlySuppliedCmykGivesRgbWhenXyzFails) {
    // CMYK derived from a spectrum holds densities, or off the 380..730 nm / 10 nm
    // grid the marker (-1, 0, 0, 0), which as tone values would read as RGB
    // (257, 255, 255): no RGB from either. CMYK (50, 0, 0, 0) from the row gives
    // (1 - 0.5) * 255 = 127.5, truncated to 127.
    engine_double::FailAll(Call::SpectralToXYZ);
    patch_test::PatchInput in;
    for (const int step : {20, 10}) {
        in.spectral = patch_test::Spectrum("SPECTRAL_NM_", 380, step, 36 * 10 / step, 0.5);
        const CColorPatch derived = in.Read(patch_test::SuppliedOnly(0));
        EXPECT_TRUE(derived.IsCMYKPresent() && !derived.IsRGBPresent());
        EXPECT_NEAR(derived.GetCMYK().c, step == 20 ? -1.0 : 0.30103, 1e-5); // -log10(0.5)
    }
    in.cmyk = {50, 0, 0, 0};
    const tagRGB rgb = in.Read(patch_test::SuppliedOnly(MISSING_CMYK)).GetRGB();
    EXPECT_EQ((std::vector<int>{rgb.r, rgb.g, rgb.b}), (std::vector<int>{127, 255, 255}));
}

} // namespace
