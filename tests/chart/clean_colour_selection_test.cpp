// Clean-colour tests on n-colour patches whose channel map has gaps, which a
// file cannot produce: looking at a channel must not add it to the stored patch.
#include <gtest/gtest.h>

#include "test_store.h"

namespace {

TEST(CleanColourSelection, NColourTestsLeaveTheStoredPatchesAlone) {
    TestStore store;
    store.patches[1] = test_patches::Build(
        {}, {}, {}, {{0, tagNCLR{2, 0, "A", 80.0}}, {5, tagNCLR{2, 5, "B", 0.0}}}, "",
        MISSING_NCOLOR);
    store.patches[2] = test_patches::Build(
        {}, {}, {}, {{0, tagNCLR{2, 0, "A", 0.0}}, {1, tagNCLR{2, 1, "B", 0.0}}}, "",
        MISSING_NCOLOR);
    store.UpdatePresenceFlags(test_patches::kNothingSupplied & ~MISSING_NCOLOR);
    std::map<int, std::vector<CColorPatch>> groups;
    EXPECT_EQ(store.GroupCleanColorPatches(groups, -1), 0);
    EXPECT_EQ(groups.size(), 2u);
    store.SelectCleanColorPatches();
    std::vector<CColorPatch> found;
    store.SelectCleanAndWhitePatches(found, false);
    std::vector<std::vector<double>> references;
    std::vector<tagXYZ> xyz;
    store.GetChannelRamps(references, xyz, -1);
    EXPECT_EQ(store.patches[1].GetNColorMap().size(), 2u);
    EXPECT_EQ(store.patches[2].GetNColorMap().size(), 2u);
}

} // namespace
