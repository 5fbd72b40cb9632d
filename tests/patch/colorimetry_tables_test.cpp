// Transcription checks of the constant colorimetry tables: every column sum of
// the weighting sets against its published sum row, the exact norm weighting
// doubles, the visual weighting sum, and each density filter's wavelength range
// and entry sum (sums of the published entries, added up separately).
#include <gtest/gtest.h>

#include <array>
#include <cstddef>

#include "patch/colorimetry_tables.h"

namespace {

using colorimetry::SpectralRow;

double Sum(const SpectralRow& row) {
    double sum = 0.0;
    for (double v : row) {
        sum += v;
    }
    return sum;
}

// First and last wavelength with a non-zero entry (-1, -1 when none).
std::array<int, 2> NonZeroRange(const SpectralRow& row) {
    std::array<int, 2> range{-1, -1};
    for (std::size_t i = 0; i < row.size(); ++i) {
        if (row[i] != 0.0) {
            const int nm = 380 + 10 * static_cast<int>(i);
            if (range[0] < 0) {
                range[0] = nm;
            }
            range[1] = nm;
        }
    }
    return range;
}

// Sum of (i + 1) * row[i]: unlike the plain sum it changes when two entries
// trade places, so it checks that each entry stands at its own wavelength.
double Moment(const SpectralRow& row) {
    double sum = 0.0;
    for (std::size_t i = 0; i < row.size(); ++i) {
        sum += static_cast<double>(i + 1) * row[i];
    }
    return sum;
}

TEST(ColorimetryTables, WeightingSetColumnsAddUpToTheirPublishedSums) {
    struct Expected {
        const colorimetry::WeightingSet* set;
        double x, y, z;
    };
    const Expected expected[] = {
        {&colorimetry::kD50Observer2, 1012.45111, 1050.46869, 866.11469},
        {&colorimetry::kD65Observer2, 1004.04614, 1056.73198, 1150.02045},
        {&colorimetry::kD50Observer10, 1102.72357, 1140.073427, 928.718424},
        {&colorimetry::kD65Observer10, 1101.7383, 1161.88726, 1247.7819},
    };
    for (const Expected& e : expected) {
        EXPECT_NEAR(Sum((*e.set)[0]), e.x, 1e-9);
        EXPECT_NEAR(Sum((*e.set)[1]), e.y, 1e-9);
        EXPECT_NEAR(Sum((*e.set)[2]), e.z, 1e-9);
    }
}

TEST(ColorimetryTables, VisualWeightsAreTheLuminousEfficiency) {
    EXPECT_NEAR(Sum(colorimetry::kVisualWeights), 10.6853051, 1e-12);
    EXPECT_EQ(colorimetry::kVisualWeights[17], 0.9949501); // 550 nm
}

TEST(ColorimetryTables, DensityFiltersCoverTheirRangesWithTheirEntries) {
    struct Filter {
        int firstNm, lastNm;
        double sum;
    };
    // Per set: red, green, blue.
    const Filter expected[7][3] = {
        {{600, 730, 46.404}, {510, 590, 35.329}, {420, 500, 31.713}},
        {{620, 730, 42.597}, {470, 610, 53.756}, {410, 510, 43.343}},
        {{570, 710, 48.901}, {480, 620, 57.853}, {380, 540, 69.116}},
        {{570, 710, 48.901}, {480, 620, 57.853}, {380, 520, 57.292}},
        {{600, 650, 1.507401491}, {510, 560, 1.6866594758}, {410, 460, 1.737818316}},
        {{560, 710, 2.97352}, {470, 620, 5.20374}, {380, 510, 4.55927}},
        {{590, 650, 3.8}, {500, 560, 3.8}, {400, 460, 3.8}},
    };
    for (std::size_t set = 0; set < 7; ++set) {
        for (std::size_t filter = 0; filter < 3; ++filter) {
            const SpectralRow& row = colorimetry::kDensityFilterSets[set][filter];
            const Filter& e = expected[set][filter];
            const std::array<int, 2> range = NonZeroRange(row);
            EXPECT_EQ(range[0], e.firstNm) << "set " << set << " filter " << filter;
            EXPECT_EQ(range[1], e.lastNm) << "set " << set << " filter " << filter;
            EXPECT_NEAR(Sum(row), e.sum, 1e-9) << "set " << set << " filter " << filter;
        }
    }
    // Sets 2 and 3 share red and green.
    EXPECT_EQ(colorimetry::kDensityFilterSets[2][0], colorimetry::kDensityFilterSets[3][0]);
    EXPECT_EQ(colorimetry::kDensityFilterSets[2][1], colorimetry::kDensityFilterSets[3][1]);
}

// The moments below were computed by a separate script straight from the
// published tables (weighting columns, visual weights, filter entries placed at
// their wavelengths), not from these arrays.
TEST(ColorimetryTables, EveryEntryStandsAtItsWavelength) {
    const colorimetry::WeightingSet* sets[4] = {
        &colorimetry::kD50Observer2, &colorimetry::kD65Observer2, &colorimetry::kD50Observer10,
        &colorimetry::kD65Observer10};
    const double weightingMoments[4][3] = {{20884.52294, 20000.99748, 7592.64138},
                                           {19754.7708, 19736.30428, 9845.47613},
                                           {22382.00352, 21162.46807, 7840.735049},
                                           {21303.02636, 21041.94753, 10289.5971}};
    for (std::size_t set = 0; set < 4; ++set) {
        for (std::size_t axis = 0; axis < 3; ++axis) {
            EXPECT_NEAR(Moment((*sets[set])[axis]), weightingMoments[set][axis], 1e-5)
                << "weighting set " << set << " column " << axis;
        }
    }
    EXPECT_NEAR(Moment(colorimetry::kVisualWeights), 203.2168138, 1e-7);

    const double filterMoments[7][3] = {{1313.895, 617.435, 257.016},
                                        {1273.474, 915.059, 380.368},
                                        {1277.043, 998.317, 608.719},
                                        {1277.043, 998.317, 426.904},
                                        {38.29949022, 27.90457288, 10.62794414},
                                        {71.1364, 83.07865, 27.7064},
                                        {95, 60.8, 22.8}};
    for (std::size_t set = 0; set < 7; ++set) {
        for (std::size_t filter = 0; filter < 3; ++filter) {
            EXPECT_NEAR(Moment(colorimetry::kDensityFilterSets[set][filter]),
                        filterMoments[set][filter], 1e-7)
                << "set " << set << " filter " << filter;
        }
    }
}

} // namespace
