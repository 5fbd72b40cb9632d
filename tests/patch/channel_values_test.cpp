// Device channel values of a patch, and the n-colour lookups that fill gaps.
#include <vector>

#include <gtest/gtest.h>

#include "patch_test_inputs.h"

namespace {

using patch_test::SuppliedOnly;
using Values = std::vector<double>;

TEST(ChannelValues, NColorChannelsComeBeforeCmyk) {
    patch_test::PatchInput in;
    in.cmyk = {10, 20, 30, 40};
    CColorPatch cmyk = in.Read(SuppliedOnly(MISSING_CMYK));
    EXPECT_EQ(cmyk.GetChannelValue(3), 40.0);
    EXPECT_EQ(cmyk.GetChannelValue(4), 0.0);
    EXPECT_EQ(cmyk.GetChannelValue(-1), 0.0);

    in.nColors = patch_test::Channels({1, 2, 3, 4, 5, 6});
    CColorPatch both = in.Read(SuppliedOnly(MISSING_CMYK | MISSING_NCOLOR));
    EXPECT_EQ(both.GetChannelValue(4), 5.0); // the fifth channel
    EXPECT_EQ(both.GetChannelValue(6), 0.0);
    EXPECT_EQ(both.GetChannelValue(-1), 0.0);
    EXPECT_EQ(both.GetNColorMap().size(), 6u); // out-of-range reads add nothing
    EXPECT_EQ(in.Read(patch_test::kAllMissing).GetChannelValue(0), 0.0);
}

TEST(ChannelValues, ReferenceValuesTakeTheRichestDeviceSpace) {
    patch_test::PatchInput in;
    in.cmyk = {1, 2, 3, 4};
    in.cmykog = {11, 12, 13, 14, 15, 16};
    in.cmykrgb = {21, 22, 23, 24, 25, 26, 27};
    in.nColors = patch_test::Channels({41, 42});
    const std::uint32_t devices = MISSING_CMYK | MISSING_CMYKOG | MISSING_CMYKRGB | MISSING_CMYKOGV;
    EXPECT_EQ(in.Read(SuppliedOnly(devices | MISSING_NCOLOR)).GetReferenceValues(),
              (Values{41, 42}));
    EXPECT_EQ(in.Read(SuppliedOnly(devices)).GetReferenceValues(),
              (Values{21, 22, 23, 24, 25, 26, 27}));
    EXPECT_EQ(in.Read(SuppliedOnly(MISSING_CMYK | MISSING_CMYKOG)).GetReferenceValues(),
              (Values{11, 12, 13, 14, 15, 16}));
    // CMYKOGV is never a reference space.
    EXPECT_EQ(in.Read(SuppliedOnly(MISSING_CMYK | MISSING_CMYKOGV)).GetReferenceValues(),
              (Values{1, 2, 3, 4}));
    EXPECT_TRUE(in.Read(SuppliedOnly(MISSING_CMYKOGV)).GetReferenceValues().empty());
}

TEST(ChannelValues, MissingPositionsReadAsZeroAndAreAdded) {
    patch_test::PatchInput in;
    in.nColors = {{0, tagNCLR{6, 0, "6CLR_1", 7.0}}, {5, tagNCLR{6, 5, "6CLR_6", 9.0}}};
    CColorPatch p = in.Read(SuppliedOnly(MISSING_NCOLOR));
    // Two entries, so positions 0 and 1 are read; 1 is added as a default channel.
    EXPECT_EQ(p.GetReferenceValues(), (Values{7, 0}));
    ASSERT_EQ(p.GetNColorMap().size(), 3u);
    EXPECT_EQ(p.GetNColorMap().at(1).name, "");
    // Three entries now, so the next scan reads (and adds) position 2 as well.
    EXPECT_EQ(p.GetReferenceValues(), (Values{7, 0, 0}));
    EXPECT_EQ(p.GetNColorMap().size(), 4u);
}

} // namespace
