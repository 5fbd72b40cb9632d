// Constant colorimetry tables of the library's built-in routines: the four
// spectral weighting sets, their normalising sums, the visual weighting and the
// seven density filter sets. Everything is constexpr, so the colour engine can
// use the same density filters and visual weights without linking the library.
//
// All rows cover 36 wavelengths, 380 nm to 730 nm in 10 nm steps; index i is
// 380 + 10 i nm.
#pragma once

#include <array>
#include <cstddef>

namespace colorimetry {

inline constexpr int kGridStartNm = 380;
inline constexpr int kGridStepNm = 10;
inline constexpr int kGridCount = 36;

/// One value per grid wavelength.
using SpectralRow = std::array<double, kGridCount>;

/// Three weight rows of one illuminant and observer: X, Y and Z.
using WeightingSet = std::array<SpectralRow, 3>;

// Illuminant relative spectral power (100 at 560 nm) times colour-matching
// function, per grid wavelength.
/// D50 with the CIE 1931 2 degree observer (type 0).
inline constexpr WeightingSet kD50Observer2 = {{
    // X
    {{0.0343,   0.12516,  0.70499,  2.45775,  8.064,     16.40942, 26.05284, 29.31664, 26.34648,
      17.85956, 9.10112,  2.944,    0.46893,  0.89838,   6.14643,  16.89755, 29.27232, 44.33682,
      59.45,    74.45717, 90.62207, 95.95905, 103.77694, 99.55818, 84.5856,  61.47768, 44.25252,
      27.13095, 16.19318, 9.0022,   4.63788,  1.98398,   1.04424,  0.53882,  0.22272,  0.12124}},
    // Y
    {{0,       0.00298,  0.01972, 0.0678,  0.24,    0.67048, 1.7204,  3.3136,  5.436,
      8.3174,  13.22328, 19.136,  30.9111, 48.5898, 68.941,  88.0102, 96.1632, 101.7885,
      99.5,    93.0104,  86.043,  70.7795, 61.6487, 49.9479, 37.719,  25.3605, 17.29,
      10.2399, 5.9902,   3.296,   1.6847,  0.71668, 0.37556, 0.19509, 0.0768,  0.0433}},
    // Z
    {{0.15925,   0.59898, 3.34747, 11.7181, 38.736,   80.08768, 130.68308, 154.52712, 151.22952,
      117.68664, 77.3976, 42.7984, 26.0304, 15.28212, 7.59322,  4.30862,   2.04624,   0.90024,
      0.39,      0.20517, 0.15824, 0.10285, 0.07816,  0.02979,  0.0198,    0,         0,
      0,         0,       0,       0,       0,        0,        0,         0,         0}},
}};
/// D65 with the CIE 1931 2 degree observer (type 1).
inline constexpr WeightingSet kD65Observer2 = {{
    // X
    {{0.07,     0.22932,  1.18404,  3.98025,  12.55296, 24.61413, 36.53667, 39.3354,  34.25624,
      22.45146, 11.08004, 3.4816,   0.53606,  1.00254,  6.63384,  17.82435, 30.31776, 45.0736,
      59.45,    73.39023, 87.78154, 91.03281, 95.598,   89.83296, 74.93088, 53.51192, 37.48923,
      22.68,    13.22498, 7.19302,  3.66444,  1.58219,  0.81624,  0.43094,  0.17864,  0.09786}},
    // Y
    {{0,       0.00546, 0.03312, 0.1098,  0.3736,  1.00572, 2.4127,  4.446,   7.068,
      10.4559, 16.1101, 22.6304, 35.3362, 54.2234, 74.408,  92.8374, 99.5976, 103.48,
      99.5,    91.6776, 83.346,  67.1459, 56.79,   45.0688, 33.4137, 22.0745, 14.6475,
      8.56,    4.8922,  2.6336,  1.3311,  0.57154, 0.29356, 0.15603, 0.0616,  0.03495}},
    // Z
    {{0.325,     1.09746, 5.62212,  18.9771, 60.29904, 120.13152, 183.27079, 207.3357, 196.63176,
      147.94524, 94.2267, 50.61376, 29.7568, 17.05396, 8.19536,   4.54494,   2.11932,  0.9048,
      0.39,      0.20223, 0.16286,  0.09757, 0.072,    0.02688,   0.01754,   0,        0,
      0,         0,       0,        0,       0,        0,         0,         0,        0}},
}};
/// D50 with the CIE 1964 10 degree observer (type 4).
inline constexpr WeightingSet kD50Observer10 = {{
    // X
    {{0.004898,  0.071688,  0.941821,  4.786397,  12.276135,  18.195954, 28.708434, 32.343575,
      27.391403, 17.871972, 7.656355,  1.489752,  0.363736,   3.622875,  11.432201, 24.14665,
      37.9626,   54.209136, 70.52,     85.884138, 100.324664, 104.57975, 109.80356, 102.297735,
      84.807952, 61.9787,   42.667976, 25.668261, 14.983794,  8.3739,    4.056462,  1.738862,
      0.87936,   0.427294,  0.16907,   0.08651}},
    // Y
    {{0,         0.008961,   0.09862,   0.497288,  1.284642,  2.237634,  4.646322,  7.808875,
      11.616202, 16.921724,  24.119896, 31.183636, 44.107776, 58.613287, 73.993634, 89.35792,
      96.9215,   101.480976, 99.73,     93.400344, 85.951588, 72.6869,   64.309327, 52.41456,
      39.427824, 27.13662,   17.775028, 10.294092, 5.920857,  3.2754,    1.576962,  0.672826,
      0.33892,   0.167202,   0.06148,   0.034604}},
    // Z
    {{0.017143,   0.313635,   4.24066,   22.004994, 58.379175, 89.82337, 147.193386, 174.0463,
      158.150694, 120.389112, 73.434431, 38.190988, 20.91482,  10.82032, 5.895791,   3.11405,
      1.380275,   0.40928,    0,         0,         0,         0,        0,          0,
      0,          0,          0,         0,         0,         0,        0,          0,
      0,          0,          0,         0}},
}};
/// D65 with the CIE 1964 10 degree observer (type 5).
inline constexpr WeightingSet kD65Observer10 = {{
    // X
    {{0.01,     0.13104,  1.58148,  7.75005,  19.1003, 27.28449, 40.25013, 43.3719,  35.61094,
      22.47444, 9.32995,  1.76256,  0.41572,  4.0425,  12.33496, 25.47105, 39.33792, 55.0992,
      70.52,    84.61881, 97.16036, 99.21095, 101.16,  92.3328,  75.09751, 53.93675, 36.12492,
      21.464,   12.23852, 6.69099,  3.20247,  1.38703, 0.68736,  0.34178,  0.13552,  0.0699}},
    // Y
    {{0,        0.01638,  0.1656,   0.8052,   1.99876,  3.35529,  6.51429,  10.4715,  15.10196,
      21.27948, 29.39224, 36.89408, 50.41152, 65.40226, 79.83664, 94.25904, 100.4328, 103.1472,
      99.73,    92.02428, 83.24062, 68.95538, 59.247,   47.3088,  34.91337, 23.61555, 15.04926,
      8.608,    4.83606,  2.61714,  1.24497,  0.53669,  0.26492,  0.13374,  0.04928,  0.02796}},
    // Z
    {{0.035,     0.5733,   7.1208,   35.6301, 90.8315, 134.68845, 206.36977, 233.3916, 205.60812,
      151.39224, 89.48639, 45.18464, 23.9039, 12.0736, 6.36136,   3.28485,   1.43028,  0.416,
      0,         0,        0,        0,       0,       0,         0,         0,        0,
      0,         0,        0,        0,       0,       0,         0,         0,        0}},
}};

/// Sums of the Y rows in the order D50/2, D50/10, D65/2, D65/10: dividing by the
/// sum makes a perfect white come out at Y = 100.
inline constexpr std::array<double, 4> kNormWeighting = {1050.4686900000002, 1140.0734270000003,
                                                         1056.73198, 1161.8872599999997};

/// Photopic luminous efficiency (CIE 1931 y-bar) at the grid wavelengths; the
/// linear weights of the visual density.
inline constexpr SpectralRow kVisualWeights = {
    {0.000039, 0.00012, 0.000396, 0.00121, 0.004,   0.0116,   0.023,    0.038,    0.06,
     0.09098,  0.13902, 0.20802,  0.323,   0.503,   0.71,     0.862,    0.954,    0.9949501,
     0.995,    0.952,   0.87,     0.757,   0.631,   0.503,    0.381,    0.265,    0.175,
     0.107,    0.061,   0.032,    0.017,   0.00821, 0.004102, 0.002091, 0.001047, 0.00052}};

/// Places the entries for firstNm..lastNm on the grid and leaves every other
/// wavelength at 0. A count that does not match the range, or a range off the
/// grid, fails to compile where the table is built.
template <std::size_t N>
constexpr SpectralRow FilterSpan(int firstNm, int lastNm, const double (&entries)[N]) {
    if (firstNm < kGridStartNm || lastNm > kGridStartNm + kGridStepNm * (kGridCount - 1) ||
        (firstNm - kGridStartNm) % kGridStepNm != 0 ||
        static_cast<std::size_t>((lastNm - firstNm) / kGridStepNm + 1) != N) {
        throw "filter entries do not match their wavelength range";
    }
    SpectralRow row{};
    const std::size_t first = static_cast<std::size_t>((firstNm - kGridStartNm) / kGridStepNm);
    for (std::size_t i = 0; i < N; ++i) {
        row[first + i] = entries[i];
    }
    return row;
}

/// Red, green and blue filter of one density filter set. Each entry e is used
/// as the weight 10 to the power e, so a 0 outside a filter's range weighs 1.
using FilterSet = std::array<SpectralRow, 3>;

inline constexpr int kFilterSetCount = 7;

/// Density filter sets 0 to 6; set 0 is the one patches use for their
/// density-based CMYK and the colour engine for its densities.
inline constexpr std::array<FilterSet, kFilterSetCount> kDensityFilterSets = {{
    // Set 0
    {{
        FilterSpan(600, 730,
                   {2.568, 4.638, 5, 4.871, 4.604, 4.286, 3.9, 3.551, 3.165, 2.776, 2.383, 1.97,
                    1.551, 1.141}),
        FilterSpan(510, 590, {3.822, 4.782, 5, 4.906, 4.644, 4.221, 3.609, 2.766, 1.579}),
        FilterSpan(420, 500, {3.602, 4.819, 5, 4.912, 4.62, 4.04, 2.989, 1.566, 0.165}),
    }},
    // Set 1
    {{
        FilterSpan(
            620, 730,
            {2.109, 4.479, 5, 4.899, 4.578, 4.252, 3.875, 3.491, 3.099, 2.687, 2.269, 1.859}),
        FilterSpan(470, 610,
                   {1.152, 2.207, 3.156, 3.804, 4.272, 4.626, 4.872, 5, 4.995, 4.818, 4.458, 3.915,
                    3.172, 2.239, 1.07}),
        FilterSpan(410, 510,
                   {2.103, 4.111, 4.632, 4.871, 5, 4.955, 4.743, 4.343, 3.743, 2.99, 1.852}),
    }},
    // Set 2
    {{
        FilterSpan(570, 710,
                   {1.778, 2.653, 4.477, 5, 4.929, 4.74, 4.398, 4, 3.699, 3.176, 2.699, 2.477,
                    2.176, 1.699, 1}),
        FilterSpan(480, 620,
                   {3, 3.699, 4.477, 4.833, 4.964, 5, 4.944, 4.82, 4.623, 4.342, 3.954, 3.398,
                    2.845, 1.954, 1}),
        FilterSpan(380, 540,
                   {2.477, 3.176, 3.778, 4.23, 4.602, 4.778, 4.914, 4.973, 5, 4.987, 4.929, 4.813,
                    4.602, 4.255, 3.699, 2.301, 1.602}),
    }},
    // Set 3
    {{
        FilterSpan(570, 710,
                   {1.778, 2.653, 4.477, 5, 4.929, 4.74, 4.398, 4, 3.699, 3.176, 2.699, 2.477,
                    2.176, 1.699, 1}),
        FilterSpan(480, 620,
                   {3, 3.699, 4.477, 4.833, 4.964, 5, 4.944, 4.82, 4.623, 4.342, 3.954, 3.398,
                    2.845, 1.954, 1}),
        FilterSpan(380, 520,
                   {2.431, 3.431, 4.114, 4.477, 4.778, 4.914, 5, 4.959, 4.881, 4.672, 4.255, 3.778,
                    2.903, 1.699, 1}),
    }},
    // Set 4
    {{
        FilterSpan(600, 650, {2.1706e-05, 0.013645, 0.88077, 0.59779, 0.015173, 1.785e-06}),
        FilterSpan(510, 560, {8.6315e-06, 0.005274, 0.77772, 0.88401, 0.019638, 8.8443e-06}),
        FilterSpan(410, 460, {6.66e-06, 0.31152, 0.91617, 0.50769, 0.0024174, 1.4256e-05}),
    }},
    // Set 5
    {{
        FilterSpan(560, 710,
                   {0.00013, 0.00072, 0.00509, 0.31712, 1, 0.80547, 0.4923, 0.21361, 0.08165,
                    0.03909, 0.01125, 0.0036, 0.00209, 0.00101, 0.00033, 6e-05}),
        FilterSpan(470, 620,
                   {0.00018, 0.0163, 0.07243, 0.391, 0.80684, 1, 0.99016, 0.79953, 0.55571, 0.32835,
                    0.16068, 0.06172, 0.01603, 0.00424, 0.00052, 5e-05}),
        FilterSpan(380, 510,
                   {0.00822, 0.06851, 0.26415, 0.50777, 0.8704, 1, 0.92475, 0.52543, 0.2417,
                    0.10509, 0.03678, 0.00596, 0.0005, 1e-05}),
    }},
    // Set 6
    {{
        FilterSpan(590, 650, {0.1, 0.5, 0.8, 1, 0.8, 0.5, 0.1}),
        FilterSpan(500, 560, {0.1, 0.5, 0.8, 1, 0.8, 0.5, 0.1}),
        FilterSpan(400, 460, {0.1, 0.5, 0.8, 1, 0.8, 0.5, 0.1}),
    }},
}};

/// The weighting set of a type code (0 = D50/2, 1 = D65/2, 4 = D50/10,
/// 5 = D65/10) and the index of its normalising sum in kNormWeighting; null and
/// -1 for any other type.
constexpr const WeightingSet* WeightingSetForType(int type) {
    switch (type) {
    case 0:
        return &kD50Observer2;
    case 1:
        return &kD65Observer2;
    case 4:
        return &kD50Observer10;
    case 5:
        return &kD65Observer10;
    default:
        return nullptr;
    }
}
constexpr int NormWeightingIndexForType(int type) {
    switch (type) {
    case 0:
        return 0;
    case 1:
        return 2;
    case 4:
        return 1;
    case 5:
        return 3;
    default:
        return -1;
    }
}

/// Linear filter weights (10 to the power of each entry) of one density filter
/// set, and each filter's total weight. Computed once, on first use; defined in
/// the library (colorimetry_tables.cpp), not available to the colour engine.
struct FilterWeights {
    FilterSet weights; ///< red, green, blue rows of 10^entry
    std::array<double, 3> totals;
};
/// The weights of set `filterSet` (0 to 6); null for any other set.
const FilterWeights* DensityFilterWeights(long filterSet);

} // namespace colorimetry
