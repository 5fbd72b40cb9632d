// The engine's L*a*b* of real-looking reflectance spectra against values from an
// independent D50 / 2 degree computation (provenance in the fixture file).
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iostream>
#include <sstream>
#include <string>
#include <vector>

#include "huekit.h"

namespace {

struct ReferenceSample {
    std::string name;
    double lab[3];
    std::vector<float> spectrum; // 380 .. 730 nm
};

std::vector<ReferenceSample> ReadFixture(const std::string& path) {
    std::vector<ReferenceSample> samples;
    std::ifstream in(path);
    std::string line;
    while (std::getline(in, line)) {
        if (line.empty() || line[0] == '#') {
            continue;
        }
        std::istringstream fields(line);
        ReferenceSample s;
        fields >> s.name >> s.lab[0] >> s.lab[1] >> s.lab[2];
        float value = 0.0f;
        while (fields >> value) {
            s.spectrum.push_back(value);
        }
        samples.push_back(s);
    }
    return samples;
}

TEST(HuekitReference, LabAgreesWithTheIndependentToolWithinHalfADeltaE) {
    const std::vector<ReferenceSample> samples =
        ReadFixture(std::string(REDAVUDEVA_TEST_DATA_DIR) + "/engine/reference_lab_d50_2deg.txt");
    ASSERT_EQ(samples.size(), 8u);
    double largest = 0.0;
    for (const ReferenceSample& s : samples) {
        ASSERT_EQ(s.spectrum.size(), 36u) << s.name;
        float xyz[3] = {};
        ASSERT_EQ(HUEKIT_fromSpectralToCIEXYZ(s.spectrum.data(), 380, 36, xyz), 0) << s.name;
        const float relative[3] = {xyz[0] / 100.0f, xyz[1] / 100.0f, xyz[2] / 100.0f};
        float lab[3] = {};
        ASSERT_EQ(HUEKIT_fromCIEXYZToCIELAB(relative, lab), 0) << s.name;
        const double dE =
            std::sqrt(std::pow(lab[0] - s.lab[0], 2) + std::pow(lab[1] - s.lab[1], 2) +
                      std::pow(lab[2] - s.lab[2], 2));
        EXPECT_LT(dE, 0.5) << s.name << ": " << lab[0] << " " << lab[1] << " " << lab[2];
        largest = std::max(largest, dE);
    }
    RecordProperty("largest_delta_e", std::to_string(largest));
    std::cout << "largest dE*ab against the reference: " << largest << "\n";
}

} // namespace
