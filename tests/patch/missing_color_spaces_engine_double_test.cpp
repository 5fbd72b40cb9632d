// The patch's colour-engine steps, watched and failed through the recording engine.
#include <gtest/gtest.h>

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

} // namespace
