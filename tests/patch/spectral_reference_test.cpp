// L*a*b* that patches derive from real measured spectra on 5, 10 and 20 nm
// grids and several ranges, against an independent tool's values for the same
// spectra (fixture and provenance in tests/data/spectra/).
#include <gtest/gtest.h>

#include <iostream>

#include "patch_test_inputs.h"
#include "spectral_reference.h"

namespace {

TEST(SpectralReference, EveryGridAndRangeAgreesWithinHalfADeltaEMeanATenth) {
    const auto sets = spectral_reference::Read();
    ASSERT_EQ(sets.size(), 7u); // 5 nm (two ranges), 10 and 20 nm, 360-780, 380-730, 400-700
    for (const auto& set : sets) {
        std::vector<tagLAB> ours;
        for (const auto& sample : set.samples) {
            patch_test::PatchInput in;
            in.spectral = sample.spectrum;
            const CColorPatch patch = in.Read(MISSING_XYZ | MISSING_LAB | MISSING_DENSITY);
            ASSERT_TRUE(patch.IsLABPresent() && patch.IsDensityAvailable())
                << set.name << " " << sample.name;
            ours.push_back(patch.GetLAB());
        }
        ASSERT_EQ(ours.size(), 15u) << set.name;
        const auto agreement = spectral_reference::Compare(set, ours);
        EXPECT_LE(agreement.largest, 0.5) << set.name;
        EXPECT_LE(agreement.mean, 0.1) << set.name;
        std::cout << set.name << ": mean dE*ab " << agreement.mean << ", max " << agreement.largest
                  << "\n";
    }
}

} // namespace
