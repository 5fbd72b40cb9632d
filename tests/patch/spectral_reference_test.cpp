// L*a*b* that patches derive from real measured spectra on 5, 10 and 20 nm
// grids and several ranges, against an independent tool's values for the same
// spectra (fixture, provenance and the script that makes it in tests/data/spectra/).
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iostream>
#include <sstream>
#include <tuple>
#include <vector>

#include "patch_test_inputs.h"

namespace {

TEST(SpectralReference, EveryGridAndRangeAgreesWithinHalfADeltaEMeanATenth) {
    // Per set: name, mean and largest dE*ab, samples.
    std::vector<std::tuple<std::string, double, double, int>> sets;
    std::ifstream in(std::string(REDAVUDEVA_TEST_DATA_DIR) + "/spectra/reference_lab_tcs.txt");
    int first = 0, last = 0, step = 0;
    for (std::string line, word; std::getline(in, line);) {
        std::istringstream words(line);
        if (line.empty() || line[0] == '#' || !(words >> word)) {
            continue;
        }
        if (word == "set") {
            sets.emplace_back("", 0.0, 0.0, 0);
            words >> std::get<0>(sets.back()) >> first >> last >> step;
            continue;
        }
        double reference[3];
        words >> reference[0] >> reference[1] >> reference[2];
        patch_test::PatchInput patch;
        double value = 0.0;
        for (int nm = first; words >> value; nm += step) {
            patch.spectral["SPECTRAL_NM_" + std::to_string(nm)] = value;
        }
        const tagLAB lab = patch.Read(MISSING_XYZ | MISSING_LAB | MISSING_DENSITY).GetLAB();
        const double dE =
            std::hypot(lab.l - reference[0], lab.a - reference[1], lab.b - reference[2]);
        auto& [name, sum, largest, samples] = sets.back();
        sum += dE;
        largest = std::max(largest, dE);
        ++samples;
    }
    ASSERT_EQ(sets.size(), 7u); // 5 nm (two ranges), 10 and 20 nm; 360-780, 380-730, 400-700 nm
    for (const auto& [name, sum, largest, samples] : sets) {
        ASSERT_EQ(samples, 15) << name;
        EXPECT_LE(largest, 0.5) << name;
        EXPECT_LE(sum / samples, 0.1) << name;
        std::cout << name << ": mean dE*ab " << sum / samples << ", max " << largest << "\n";
    }
}

} // namespace
