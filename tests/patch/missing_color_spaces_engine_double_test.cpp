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

TEST_F(MissingColorSpacesEngine, OtherGridsAndRangesReachTheEngineAs10nmValues) {
    struct Case {
        std::map<std::string, double> spectrum; // value i is 0.5 + 0.01 i
        int startNm;
        int count;
        std::size_t measured; // the engine's index of the point measured at 400 nm
        std::size_t index;    // ... and its index in the measured spectrum
    };
    const Case cases[] = {
        {patch_test::Spectrum("SPECTRAL_NM_", 380, 20, 21, 0.5, 0.01), 380, 41, 2, 1},
        {patch_test::Spectrum("SPECTRAL_NM_", 360, 10, 43, 0.5, 0.01), 380, 41, 2, 4},
        {patch_test::Spectrum("SPECTRAL_", 400, 10, 31, 0.5, 0.01), 400, 31, 0, 0},
        {patch_test::Spectrum("SPECTRAL_NM_", 340, 20, 25, 0.5, 0.01), 380, 41, 2, 3}, // to 820
    };
    for (const Case& c : cases) {
        engine_double::Reset();
        patch_test::PatchInput in;
        in.spectral = c.spectrum;
        const CColorPatch p = in.Read(MISSING_XYZ | MISSING_LAB | MISSING_DENSITY);
        const auto& calls = engine_double::Calls();
        ASSERT_EQ(calls.size(), 2u);
        EXPECT_EQ((std::vector<int>{calls[0].startNm, calls[0].count}),
                  (std::vector<int>{c.startNm, c.count}));
        EXPECT_EQ(calls[1].input, calls[0].input); // densities from the same 10 nm values
        EXPECT_EQ(calls[0].input.at(c.measured), static_cast<float>(0.5 + 0.01 * c.index));
        EXPECT_TRUE(p.IsXYZPresent() && p.IsLABPresent() && p.IsDensityAvailable());
    }
}

TEST_F(MissingColorSpacesEngine, UnevenNamesAreResampledThoughTheEndsAndCountLookEven) {
    // 36 names from 380 to 730 nm, but 395 nm in place of 400 nm; the values rise
    // by 0.001 per nm. The curve through the points is exact for a straight line
    // away from the ends, so the engine's 400 nm value is 0.52, not the 0.515
    // measured at 395 nm.
    std::map<std::string, double> spectrum;
    for (int i = 0; i < 36; ++i) {
        const int nm = i == 2 ? 395 : 380 + 10 * i;
        spectrum["SPECTRAL_NM_" + std::to_string(nm)] = 0.5 + 0.001 * (nm - 380);
    }
    patch_test::PatchInput in;
    in.spectral = spectrum;
    in.Read(MISSING_XYZ);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ((std::vector<int>{calls[0].startNm, calls[0].count}), (std::vector<int>{380, 36}));
    EXPECT_EQ(calls[0].input.at(1), 0.51f);
    EXPECT_FLOAT_EQ(calls[0].input.at(2), 0.52f);
}

TEST_F(MissingColorSpacesEngine, SpectraThatCannotGiveColourDeriveNothing) {
    auto withNan = patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 0.5);
    withNan["SPECTRAL_NM_500"] = std::numeric_limits<double>::quiet_NaN();
    auto unreadable = patch_test::Spectrum("", 380, 10, 36, 0.5); // "380" ... "730"
    std::map<std::string, double> trailer;
    for (const auto& [name, value] : unreadable) {
        trailer[name + "NM"] = value; // "380NM" ... "730NM"
    }
    trailer["5XYZ"] = 0.5; // between them, but names no wavelength
    const std::map<std::string, double> cases[] = {
        {{"SPECTRAL_NM_550", 0.5}},                              // one value
        withNan,                                                 // not a number
        patch_test::Spectrum("SPECTRAL_NM_", 300, 10, 8, 0.5),   // 300..370 nm
        patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 1e39), // no float holds it
        trailer,
    };
    for (const auto& spectrum : cases) {
        engine_double::Reset();
        patch_test::PatchInput in;
        in.spectral = spectrum;
        const CColorPatch p = in.Read(patch_test::SuppliedOnly(0));
        EXPECT_TRUE(engine_double::Calls().empty());
        EXPECT_EQ(patch_test::FlagCount(p), 1) << "only the spectrum itself is present";
        EXPECT_EQ(p.GetXYZ().y, 0.0);
    }
}

TEST_F(MissingColorSpacesEngine, OnlySuppliedCmykGivesRgbWhenXyzFails) {
    // CMYK derived from a spectrum holds densities, or off the 380..730 nm / 10 nm
    // grid the marker (-1, 0, 0, 0), which as tone values would read as RGB
    // (257, 255, 255). Neither is a device value. CMYK (50, 0, 0, 0) from the row
    // gives (1 - 0.5) * 255 = 127.5, truncated to 127.
    engine_double::FailAll(Call::SpectralToXYZ);
    struct Case {
        std::map<std::string, double> spectrum;
        double c; // the derived record's first value
    };
    const Case cases[] = {
        {patch_test::Spectrum("SPECTRAL_NM_", 380, 20, 21, 0.5), -1.0},     // the marker
        {patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 0.5), 0.30103}}; // -log10(0.5)
    for (const Case& c : cases) {
        patch_test::PatchInput in;
        in.spectral = c.spectrum;
        const CColorPatch p = in.Read(patch_test::SuppliedOnly(0));
        EXPECT_TRUE(p.IsCMYKPresent());
        EXPECT_NEAR(p.GetCMYK().c, c.c, 1e-5);
        EXPECT_FALSE(p.IsRGBPresent());
    }

    patch_test::PatchInput supplied;
    supplied.cmyk = {50, 0, 0, 0};
    supplied.spectral = patch_test::Spectrum("SPECTRAL_NM_", 380, 20, 21, 0.5);
    const CColorPatch p = supplied.Read(patch_test::SuppliedOnly(MISSING_CMYK));
    ASSERT_TRUE(p.IsRGBPresent());
    EXPECT_EQ((std::vector<int>{p.GetRGB().r, p.GetRGB().g, p.GetRGB().b}),
              (std::vector<int>{127, 255, 255}));
}

} // namespace
