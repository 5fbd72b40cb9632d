// Construction and copying of CColorPatch.
#include <gtest/gtest.h>

#include "color_patch_probe.h"
#include "patch_test_inputs.h"

namespace {

using patch_test::FlagCount;

TEST(ColorPatchConstruction, DefaultPatchIsAnEmptyPlaceholder) {
    const CColorPatch p;
    EXPECT_EQ(FlagCount(p), 0);
    EXPECT_EQ(p.GetRGB().r, -1);
    EXPECT_EQ(p.GetRGB().b, -1);
    EXPECT_EQ(p.GetCMYKOGV().v, 0.0);
    EXPECT_EQ(ColorPatchProbe::normLight(p).y, 0.0);
    EXPECT_EQ(ColorPatchProbe::normWeighting(p)[0], 0.0);
}

TEST(ColorPatchConstruction, EachConstructorSendsEveryRecordToItsOwnMember) {
    patch_test::PatchInput in;
    in.cmykrgb = {0, 0, 0, 0, 16, 17, 18}; // sixth argument of the reader's constructor
    in.cmykogv = {0, 0, 0, 0, 19, 20, 21}; // seventh
    in.density = {0.1, 0.2, 0.3, 0.4, 0.5};
    in.label = "A1";
    const CColorPatch reader = in.Build();
    EXPECT_EQ(reader.GetCMYKRGB().b, 18.0);
    EXPECT_EQ(reader.GetCMYKOGV().v, 21.0);
    EXPECT_EQ(reader.GetDensity().majorFilter, 0.5);
    EXPECT_EQ(reader.GetLabel(), "A1");
    EXPECT_EQ(FlagCount(reader), 0); // nothing is marked before SetMissingColorSpace

    // The two shorter constructors take CMYKOGV before CMYKRGB.
    const CColorPatch plain({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {}, {}, "P");
    const CColorPatch channels({}, {}, {}, {}, {}, in.cmykogv, in.cmykrgb, {},
                               patch_test::Channels({7}), {}, "N");
    EXPECT_EQ(channels.GetNColorMap().size(), 1u);
    for (const CColorPatch* p : {&reader, &plain, &channels}) {
        EXPECT_EQ(p->GetCMYKRGB().b, 18.0);
        EXPECT_EQ(p->GetCMYKOGV().v, 21.0);
        // The D50 / 2 degree white and the Y column sums of the four weighting sets.
        EXPECT_EQ(ColorPatchProbe::normLight(*p).x, 96.38);
        EXPECT_EQ(ColorPatchProbe::normLight(*p).z, 82.45);
        const double* weighting = ColorPatchProbe::normWeighting(*p);
        EXPECT_EQ(weighting[0], 1050.4686900000002);
        EXPECT_EQ(weighting[1], 1140.0734270000003);
        EXPECT_EQ(weighting[2], 1056.73198);
        EXPECT_EQ(weighting[3], 1161.8872599999997);
    }
}

TEST(ColorPatchConstruction, CopiesAreIndependentAndSelfAssignmentKeepsThePatch) {
    patch_test::PatchInput in;
    in.spectral = patch_test::Spectrum("SPECTRAL_NM_", 380, 10, 36, 0.5);
    in.nColors = patch_test::Channels({1, 2});
    in.label = "orig";
    CColorPatch original = in.Build();
    const CColorPatch copy(original);
    CColorPatch assigned;
    assigned = original;
    original = CColorPatch();
    CColorPatch& alias = assigned;
    assigned = alias;
    for (const CColorPatch* p : {&copy, static_cast<const CColorPatch*>(&assigned)}) {
        EXPECT_EQ(p->GetLabel(), "orig");
        EXPECT_TRUE(p->IsSpectralPresent());
        EXPECT_EQ(p->GetSpectralData().size(), 36u);
        EXPECT_EQ(p->GetSpectralDataStruct().values[35], 0.5);
        EXPECT_EQ(p->GetNColorMap().at(1).value, 2.0);
    }
}

} // namespace
