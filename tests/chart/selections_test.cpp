// Selections run on the store directly, with patches a file cannot produce:
// patches on a straight tone gradient origin + t * direction with six- and
// seven-colour records, and n-colour patches whose channel map has gaps, where
// looking at a channel must not add it to the stored patch. A clean-colour test
// counts a tone above 1e-5 as printed and one below it as unprinted.
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
}

TEST(CleanColourSelection, ToleranceAndStoredPatchesLeftAlone) {
    TestStore store;
    // Channels 0 and 5 of two: tone values 80 and 0 at positions 0 and 1.
    store.patches[1] =
        test_patches::Build({}, {}, {}, {{0, tagNCLR{2, 0, "", 80.0}}, {5, tagNCLR{2, 5, "", 0.0}}},
                            "N", MISSING_NCOLOR);
    const double cyan[] = {0.00001, 0.00002, 0.000005}; // neither, clean, white
    for (int n = 0; n < 3; ++n) {
        store.patches[n + 2] =
            test_patches::Build({cyan[n], 0, 0, 0}, {}, {}, {}, std::to_string(n), MISSING_CMYK);
    }
    store.UpdatePresenceFlags(test_patches::kNothingSupplied & ~MISSING_NCOLOR);
    std::vector<CColorPatch> found;
    EXPECT_FALSE(store.SelectCleanAndWhitePatches(found, false));
    EXPECT_EQ(LabelsOf(found), (Labels{"N", "1", "2"}));
    EXPECT_EQ(LabelsOf(store.SelectCleanColorPatches()), (Labels{"N", "1"}));
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(store.GroupCleanColorPatches(groups, -1), 0);
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    store.GetChannelRamps(references, xyz, -1);
    EXPECT_EQ(store.patches[1].GetNColorMap().size(), 2u);
}

} // namespace
