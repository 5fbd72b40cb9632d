// Transcription checks of the constant colorimetry tables: per column the plain
// sum (catches a wrong entry) and the sum of (i + 1) * entry[i] (catches an entry
// at the wrong wavelength). Weighting sums are the published sum row; the rest
// were added up by a separate script from the published tables, not these arrays.
#include <cstddef>

#include <gtest/gtest.h>

#include "patch/colorimetry_tables.h"

namespace {

using colorimetry::SpectralRow;

void ExpectSums(const SpectralRow& row, const double (&expected)[2], double tolerance) {
    double plain = 0.0, moment = 0.0;
    for (std::size_t i = 0; i < row.size(); ++i) {
        plain += row[i];
        moment += static_cast<double>(i + 1) * row[i];
    }
    EXPECT_NEAR(plain, expected[0], 1e-9);
    EXPECT_NEAR(moment, expected[1], tolerance);
}

TEST(ColorimetryTables, WeightingSetsAndVisualWeights) {
    const colorimetry::WeightingSet* sets[4] = {
        &colorimetry::kD50Observer2, &colorimetry::kD65Observer2, &colorimetry::kD50Observer10,
        &colorimetry::kD65Observer10};
    // Per set and column X, Y, Z: {sum, weighted sum}.
    const double expected[4][3][2] = {
        {{1012.45111, 20884.52294}, {1050.46869, 20000.99748}, {866.11469, 7592.64138}},
        {{1004.04614, 19754.7708}, {1056.73198, 19736.30428}, {1150.02045, 9845.47613}},
        {{1102.72357, 22382.00352}, {1140.073427, 21162.46807}, {928.718424, 7840.735049}},
        {{1101.7383, 21303.02636}, {1161.88726, 21041.94753}, {1247.7819, 10289.5971}}};
    for (std::size_t set = 0; set < 4; ++set) {
        for (std::size_t axis = 0; axis < 3; ++axis) {
            SCOPED_TRACE(testing::Message() << "set " << set << " column " << axis);
            ExpectSums((*sets[set])[axis], expected[set][axis], 1e-5);
        }
    }
    ExpectSums(colorimetry::kVisualWeights, {10.6853051, 203.2168138}, 1e-7);
}

TEST(ColorimetryTables, DensityFilterSets) {
    // Per set and filter red, green, blue: {sum, weighted sum}.
    const double expected[7][3][2] = {
        {{46.404, 1313.895}, {35.329, 617.435}, {31.713, 257.016}},
        {{42.597, 1273.474}, {53.756, 915.059}, {43.343, 380.368}},
        {{48.901, 1277.043}, {57.853, 998.317}, {69.116, 608.719}},
        {{48.901, 1277.043}, {57.853, 998.317}, {57.292, 426.904}},
        {{1.507401491, 38.29949022}, {1.6866594758, 27.90457288}, {1.737818316, 10.62794414}},
        {{2.97352, 71.1364}, {5.20374, 83.07865}, {4.55927, 27.7064}},
        {{3.8, 95}, {3.8, 60.8}, {3.8, 22.8}}};
    for (std::size_t set = 0; set < 7; ++set) {
        for (std::size_t filter = 0; filter < 3; ++filter) {
            SCOPED_TRACE(testing::Message() << "set " << set << " filter " << filter);
            ExpectSums(colorimetry::kDensityFilterSets[set][filter], expected[set][filter], 1e-7);
        }
    }
}

} // namespace
