// L*a*b* of a host's list of real measured spectra on 5, 10 and 20 nm grids and
// several ranges, against an independent tool's values for the same spectra
// (fixture and provenance in tests/data/spectra/).
#include <gtest/gtest.h>

#include <iostream>

#include "spectral_reference.h"
#include "test_store.h"

namespace {

TEST(ListColorimetryReference, EveryGridAndRangeAgreesWithinHalfADeltaEMeanATenth) {
    const auto sets = spectral_reference::Read();
    ASSERT_EQ(sets.size(), 7u);
    for (const auto& set : sets) {
        std::vector<std::map<std::string, double>> spectra;
        for (const auto& sample : set.samples) {
            spectra.push_back(sample.spectrum);
        }
        TestStore store;
        store.SetSpectralDataList(spectra, true);
        ASSERT_EQ(store.labList.size(), 15u) << set.name;
        ASSERT_EQ(store.densityList.size(), 15u) << set.name;
        const auto agreement = spectral_reference::Compare(set, store.labList);
        EXPECT_LE(agreement.largest, 0.5) << set.name;
        EXPECT_LE(agreement.mean, 0.1) << set.name;
        std::cout << set.name << ": mean dE*ab " << agreement.mean << ", max " << agreement.largest
                  << "\n";
    }
}

} // namespace
