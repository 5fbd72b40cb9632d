// The patch's colour-engine conversions: what the engine receives, how its
// answers land in the patch, and that a failure changes nothing.
#include <gtest/gtest.h>

#include "color_patch_probe.h"
#include "colorimetry_test_support.h"
#include "recording_engine.h"
#include "redavudeva/color_patch.h"

namespace {

using colorimetry_test::FlatSpectrum;
using colorimetry_test::PatchWithNorms;
using engine_double::Call;

class ColorimetryEngine : public ::testing::Test {
protected:
    void SetUp() override { engine_double::Reset(); }

    // A patch holding a 400..700 nm spectrum whose values are 0.25 + i / 100.
    static CColorPatch PatchWithSpectrum() {
        SpectralDataStruct s = FlatSpectrum(400, 10, 31, 0.0);
        for (int i = 0; i < 31; ++i) {
            s.values[i] = 0.25 + i / 100.0;
        }
        CColorPatch patch = PatchWithNorms();
        ColorPatchProbe::setSpectral(patch, s, true);
        ColorPatchProbe::setXYZ(patch, tagXYZ{1.0, 2.0, 3.0});
        return patch;
    }
};

TEST_F(ColorimetryEngine, XYZFromTheSpectrumIsTakenUnscaled) {
    CColorPatch patch = PatchWithSpectrum();
    engine_double::SetXYZ(12.5f, 25.0f, 37.5f);
    EXPECT_TRUE(ColorPatchProbe::calculateXYZ(patch));
    ASSERT_EQ(engine_double::Calls().size(), 1u);
    const engine_double::Record& call = engine_double::Calls()[0];
    EXPECT_EQ(call.call, Call::SpectralToXYZ);
    EXPECT_EQ(call.startNm, 400);
    EXPECT_EQ(call.count, 31);
    ASSERT_EQ(call.input.size(), 31u);
    EXPECT_EQ(call.input[0], 0.25f);
    EXPECT_EQ(call.input[30], static_cast<float>(0.25 + 30 / 100.0));
    EXPECT_EQ(patch.GetXYZ().x, 12.5);
    EXPECT_EQ(patch.GetXYZ().y, 25.0);
    EXPECT_EQ(patch.GetXYZ().z, 37.5);

    engine_double::FailAll(Call::SpectralToXYZ);
    engine_double::SetXYZ(1.0f, 1.0f, 1.0f);
    EXPECT_FALSE(ColorPatchProbe::calculateXYZ(patch));
    EXPECT_EQ(patch.GetXYZ().x, 12.5);
    EXPECT_EQ(patch.GetXYZ().z, 37.5);
}

TEST_F(ColorimetryEngine, DensitiesFromTheSpectrumKeepTheMajorFilter) {
    CColorPatch patch = PatchWithSpectrum();
    engine_double::SetDensity(0.5f, 0.75f, 1.25f, 1.5f);
    EXPECT_TRUE(ColorPatchProbe::calculateDensities(patch));
    ASSERT_EQ(engine_double::Calls().size(), 1u);
    const engine_double::Record& call = engine_double::Calls()[0];
    EXPECT_EQ(call.call, Call::SpectralToDensity);
    EXPECT_EQ(call.startNm, 400);
    EXPECT_EQ(call.count, 31);
    EXPECT_EQ(call.option, 0);
    const tagDENSITY d = patch.GetDensity();
    EXPECT_EQ(d.red, 0.5);
    EXPECT_EQ(d.green, 0.75);
    EXPECT_EQ(d.blue, 1.25);
    EXPECT_EQ(d.visual, 1.5);
    EXPECT_EQ(d.majorFilter, 0.0);

    engine_double::FailCall(2);
    engine_double::SetDensity(2.0f, 2.0f, 2.0f, 2.0f);
    EXPECT_FALSE(ColorPatchProbe::calculateDensities(patch));
    EXPECT_EQ(patch.GetDensity().red, 0.5);
    EXPECT_EQ(patch.GetDensity().visual, 1.5);
}

TEST_F(ColorimetryEngine, LabToXYZNeedsLabAndScalesBy100) {
    CColorPatch patch = PatchWithSpectrum();
    ColorPatchProbe::setLAB(patch, tagLAB{50.0, -20.0, 10.0});
    EXPECT_FALSE(ColorPatchProbe::convertLabToXYZ(patch));
    EXPECT_TRUE(engine_double::Calls().empty());

    ColorPatchProbe::setLABFlag(patch, true);
    engine_double::SetLabToXYZ(0.25f, 0.5f, 0.75f);
    EXPECT_TRUE(ColorPatchProbe::convertLabToXYZ(patch));
    ASSERT_EQ(engine_double::Calls().size(), 1u);
    const engine_double::Record& call = engine_double::Calls()[0];
    EXPECT_EQ(call.call, Call::LabToXYZ);
    ASSERT_EQ(call.input.size(), 3u);
    EXPECT_EQ(call.input[0], 50.0f);
    EXPECT_EQ(call.input[1], -20.0f);
    EXPECT_EQ(call.input[2], 10.0f);
    EXPECT_EQ(patch.GetXYZ().x, 25.0);
    EXPECT_EQ(patch.GetXYZ().y, 50.0);
    EXPECT_EQ(patch.GetXYZ().z, 75.0);

    engine_double::FailAll(Call::LabToXYZ);
    EXPECT_FALSE(ColorPatchProbe::convertLabToXYZ(patch));
    EXPECT_EQ(patch.GetXYZ().y, 50.0);
}

TEST_F(ColorimetryEngine, SpectraThePatchCannotHoldReachNoEngine) {
    CColorPatch patch = PatchWithNorms();
    for (int count : {0, -3, 51}) {
        SpectralDataStruct s = FlatSpectrum(380, 10, 36, 0.5);
        s.count = count;
        ColorPatchProbe::setSpectral(patch, s, true);
        EXPECT_FALSE(ColorPatchProbe::calculateXYZ(patch)) << count;
        EXPECT_FALSE(ColorPatchProbe::calculateDensities(patch)) << count;
    }
    EXPECT_TRUE(engine_double::Calls().empty());
}

} // namespace
