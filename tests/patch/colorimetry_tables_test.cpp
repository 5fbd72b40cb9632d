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

} // namespace
