// Patches on a straight tone gradient origin + t * direction. The six-colour
// record cannot come from a file, so these run on the store directly.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

using Labels = std::vector<std::string>;

Labels LabelsOf(const std::vector<CColorPatch>& patches) {
    Labels labels;
    for (const auto& patch : patches) {
        labels.push_back(patch.GetLabel());
    }
    return labels;
}

TEST(GradientSelection, PatchesOnTheLineInSampleOrder) {
    TestStore store;
    EXPECT_TRUE(store.SelectCMYKGradient({0, 0, 0, 0}, {10, 10, 0, 0}, 1.0).empty());
    // P1 (50, 50) and P3 (20, 20) lie on the line; P2 (50, 51) does not, with line
    // parameters 5 and 5.1 and the tolerance 1 (1e-7 after scaling). The six- and
    // seven-colour records differ in orange and blue; no space is supplied, since
    // the selections test no flag.
    const double cm[3][2] = {{50, 50}, {50, 51}, {20, 20}};
    for (int n = 1; n <= 3; ++n) {
        const tagCMYKOG cmykog{0, 0, 0, 0, 10.0 * n, n == 2 ? 5.0 : 0.0};
        const tagCMYKRGB cmykrgb{0, 0, 0, 0, 0, 0, n == 3 ? 1.0 : 20.0 * n};
        store.patches[n] = test_patches::Build({cm[n - 1][0], cm[n - 1][1], 0, 0}, cmykog, cmykrgb,
                                               {}, "P" + std::to_string(n), 0);
    }
    EXPECT_EQ(LabelsOf(store.SelectCMYKGradient({0, 0, 0, 0}, {10, 10, 0, 0}, 1.0)),
              (Labels{"P1", "P3"}));
    EXPECT_EQ(LabelsOf(store.SelectCMYKOGGradient({0, 0, 0, 0, 0, 0}, {0, 0, 0, 0, 1, 0}, 1.0)),
              (Labels{"P1", "P3"}));
    EXPECT_EQ(
        LabelsOf(store.SelectCMYKRGBGradient({0, 0, 0, 0, 0, 0, 0}, {0, 0, 0, 0, 0, 0, 2}, 1.0)),
        (Labels{"P1", "P2", "P3"}));
    EXPECT_EQ(
        LabelsOf(store.SelectCMYKRGBGradient({0, 0, 0, 0, 0, 0, 20}, {0, 0, 0, 0, 0, 0, 0}, 1.0)),
        (Labels{"P1"}));
}

} // namespace
