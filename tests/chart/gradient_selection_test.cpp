// Patches on a straight tone gradient origin + t * direction.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using test_patches::Build;
using test_patches::PatchValues;

std::vector<std::string> Labels(const std::vector<CColorPatch>& patches) {
    std::vector<std::string> labels;
    for (const auto& patch : patches) {
        labels.push_back(patch.GetLabel());
    }
    return labels;
}

TEST(GradientSelection, CmykPatchesOnTheLineInSampleOrder) {
    TestStore store;
    const double tones[4][2] = {{50, 50}, {50, 51}, {20, 20}, {0, 0}};
    for (int n = 1; n <= 4; ++n) {
        PatchValues v;
        v.cmyk = {tones[n - 1][0], tones[n - 1][1], 0, 0};
        v.label = "P" + std::to_string(n);
        v.supplied = MISSING_CMYK;
        store.patches[n] = Build(v);
    }
    // Origin 0, direction (10, 10, 0, 0), tolerance 1 (1e-7 after scaling):
    // (50, 51) gives line parameters 5 and 5.1.
    const auto selected = store.SelectCMYKGradient({0, 0, 0, 0}, {10, 10, 0, 0}, 1.0);
    EXPECT_EQ(Labels(selected), (std::vector<std::string>{"P1", "P3", "P4"}));
    TestStore empty;
    EXPECT_TRUE(empty.SelectCMYKGradient({0, 0, 0, 0}, {10, 10, 0, 0}, 1.0).empty());
}

TEST(GradientSelection, SixAndSevenColourGradients) {
    TestStore store;
    for (int n = 1; n <= 3; ++n) {
        PatchValues v;
        v.cmykog = {0, 0, 0, 0, 10.0 * n, n == 2 ? 5.0 : 0.0};
        v.cmykrgb = {0, 0, 0, 0, 0, 0, n == 3 ? 1.0 : 20.0 * n};
        v.label = "P" + std::to_string(n);
        store.patches[n] = Build(v); // no space supplied: the test ignores flags
    }
    EXPECT_EQ(Labels(store.SelectCMYKOGGradient({0, 0, 0, 0, 0, 0}, {0, 0, 0, 0, 1, 0}, 1.0)),
              (std::vector<std::string>{"P1", "P3"}));
    EXPECT_EQ(
        Labels(store.SelectCMYKRGBGradient({0, 0, 0, 0, 0, 0, 0}, {0, 0, 0, 0, 0, 0, 2}, 1.0)),
        (std::vector<std::string>{"P1", "P2", "P3"}));
    EXPECT_EQ(
        Labels(store.SelectCMYKRGBGradient({0, 0, 0, 0, 0, 0, 20}, {0, 0, 0, 0, 0, 0, 0}, 1.0)),
        (std::vector<std::string>{"P1"}));
}

} // namespace
