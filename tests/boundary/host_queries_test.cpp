// Patch queries on charts read from files through a factory-made reader-writer:
// records by number, per-strip collections, densities, closest patch and
// reference samples.
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

#include "chart_files.h"

namespace {

using namespace host_charts;
using Rows = std::vector<std::vector<double>>;

const std::string kFullFields =
    "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K RGB_R RGB_G RGB_B XYZ_X XYZ_Y XYZ_Z";

// Ten patches; patch i has CMYK (10i, i, 0, 0), RGB (i, 2i, 3i), XYZ (i, i+1, i+2).
std::vector<std::string> TenPatchRows() {
    std::vector<std::string> rows;
    for (int i = 1; i <= 10; ++i) {
        const auto n = [](int v) { return std::to_string(v); };
        rows.push_back(n(i) + " P" + n(i) + " " + n(10 * i) + " " + n(i) + " 0 0 " + n(i) + " " +
                       n(2 * i) + " " + n(3 * i) + " " + n(i) + " " + n(i + 1) + " " + n(i + 2));
    }
    return rows;
}

using HostQueries = HostChart;

TEST_F(HostQueries, StripsOfTenPatchesInThreeStripsOfFour) {
    ASSERT_EQ(Read(kFullFields, TenPatchRows(), {"NUMBER_OF_STRIPS\t3", "NUMBER_OF_COLS\t4"}), 0);

    std::vector<tagCMYK> cmyk{tagCMYK{}};
    EXPECT_EQ(host->CollectStripCMYK(1, cmyk), 0);
    EXPECT_EQ(ValueRows(cmyk), (Rows{{10, 1, 0, 0}, {20, 2, 0, 0}, {30, 3, 0, 0}, {40, 4, 0, 0}}));
    EXPECT_EQ(host->CollectStripCMYK(2, cmyk), 0);
    EXPECT_EQ(ValueRows(cmyk), (Rows{{50, 5, 0, 0}, {60, 6, 0, 0}, {70, 7, 0, 0}, {80, 8, 0, 0}}));
    EXPECT_EQ(host->CollectStripCMYK(3, cmyk), 0); // what is left: samples 9 and 10
    EXPECT_EQ(ValueRows(cmyk), (Rows{{90, 9, 0, 0}, {100, 10, 0, 0}}));
    EXPECT_EQ(host->CollectStripCMYK(4, cmyk), 17);
    EXPECT_EQ(cmyk.size(), 2u) << "a refused strip leaves the list alone";

    // Spaces the chart does not carry answer 12, before any strip test.
    std::vector<tagCMYKOGV> cmykogv;
    EXPECT_EQ(host->CollectStripCMYKOGV(99, cmykogv), 12);
}

TEST_F(HostQueries, StripLayoutsTakenFromTheFile) {
    struct Case {
        std::vector<std::string> header;
        int strip;
        int expected;
        std::size_t size; // failures leave the three entries alone
    };
    const std::string max = "2147483647";
    const Case cases[] = {
        {{}, 1, 16, 3},                                              // no layout keywords
        {{"NUMBER_OF_COLS\t5"}, 1, 15, 3},                           // columns without strips
        {{"NUMBER_OF_STRIPS\t2", "NUMBER_OF_COLS\t-1"}, 1, 15, 3},   // negative columns
        {{"NUMBER_OF_STRIPS\t\"5\"", "NUMBER_OF_COLS\t4"}, 3, 0, 2}, // quoted: samples 9, 10
        {{"NUMBER_OF_STRIPS\t5", "NUMBER_OF_COLS\t4"}, 6, 17, 3},
        // The first sample of a strip must not overflow.
        {{"NUMBER_OF_STRIPS " + max, "NUMBER_OF_COLS " + max}, 1, 0, 10},
        {{}, 1, 16, 3}, // a later read without the keywords starts from no layout again
    };
    for (const Case& c : cases) {
        ASSERT_EQ(Read(kFullFields, TenPatchRows(), c.header), 0);
        std::vector<tagXYZ> xyz{tagXYZ{}, tagXYZ{}, tagXYZ{}};
        EXPECT_EQ(host->CollectStripXYZ(c.strip, xyz), c.expected)
            << ::testing::PrintToString(c.header) << " strip " << c.strip;
        EXPECT_EQ(xyz.size(), c.size) << ::testing::PrintToString(c.header);
    }
}

TEST_F(HostQueries, RecordByNumberTestsEmptyStoreThenSpaceThenNumber) {
    // A new object has no patches and no spaces: 11 comes first.
    int result = -1;
    EXPECT_EQ(host->GetPatch(1, result).GetLabel(), "");
    EXPECT_EQ(result, 11);
    tagXYZ xyz{7, 8, 9};
    EXPECT_EQ(host->GetPatchXYZ(1, xyz), 11);

    // CMYK only: XYZ is not carried, whatever the sample number.
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 10 20 30 40", "2 0 0 0 0"}), 0);
    EXPECT_EQ(host->GetPatchXYZ(99, xyz), 12);
    tagRGB rgb{1, 2, 3}; // the patches derive RGB, the chart does not carry it
    EXPECT_EQ(host->GetPatchRGB(1, rgb), 12);
    EXPECT_EQ(Values(xyz), (std::vector<double>{7, 8, 9})); // failures leave it alone

    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    EXPECT_EQ(host->GetPatchXYZ(11, xyz), 10);
    EXPECT_EQ(host->GetPatchXYZ(3, xyz), 0);
    EXPECT_EQ(Values(xyz), (std::vector<double>{3, 4, 5}));
    EXPECT_EQ(host->GetPatch(11, result).GetLabel(), "");
    EXPECT_EQ(result, 10);
    EXPECT_EQ(host->GetPatch(7, result).GetLabel(), "P7");
    EXPECT_EQ(result, 0);
}

TEST_F(HostQueries, APatchWhoseSpectrumGaveNoColourAnswers12) {
    // 10 nm from 360 to 780 nm; patch 1 reflects 0.5 everywhere, patch 2 has
    // "nan" at 500 nm. One patch per strip.
    std::string fields = "SAMPLE_ID", flat = "1", broken = "2";
    for (int nm = 360; nm <= 780; nm += 10) {
        fields += " SPECTRAL_NM_" + std::to_string(nm);
        flat += " 0.5";
        broken += nm == 500 ? " nan" : " 0.5";
    }
    ASSERT_EQ(Read(fields, {flat, broken}, {"NUMBER_OF_STRIPS\t2", "NUMBER_OF_COLS\t1"}), 0);
    // The engine's perfect white has Y = 100, so a flat 0.5 gives Y = 50 and
    // L* = 116 * 0.5^(1/3) - 16 = 76.0693.
    tagLAB lab{1, 2, 3};
    tagCMYK cmyk;
    tagXYZ xyz;
    EXPECT_EQ((std::vector<int>{host->GetPatchLAB(2, lab), host->GetPatchXYZ(2, xyz),
                                host->GetPatchCMYK(2, cmyk)}),
              (std::vector<int>{12, 12, 12}));
    EXPECT_EQ(Values(lab), (std::vector<double>{1, 2, 3}));
    ASSERT_EQ(host->GetPatchLAB(1, lab), 0);
    EXPECT_NEAR(lab.l, 76.0693, 1e-4);
    std::vector<tagLAB> labs{tagLAB{1, 2, 3}};
    EXPECT_EQ(host->CollectLAB(labs), 12); // not a zero record for patch 2
    EXPECT_EQ(ValueRows(labs), (Rows{{1, 2, 3}}));
    EXPECT_EQ((std::vector<int>{host->CollectStripLAB(1, labs), host->CollectStripLAB(2, labs)}),
              (std::vector<int>{0, 12}));
    EXPECT_TRUE(host->IsColorSpacePresent(COLORSPACE_LAB)); // the chart as a whole carries it
}

TEST_F(HostQueries, DensitiesPerPatchInSampleOrder) {
    std::vector<tagDENSITY> densities{tagDENSITY{}};
    EXPECT_EQ(host->CollectDensities(densities), 11);
    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    EXPECT_EQ(host->CollectDensities(densities), 12);
    EXPECT_EQ(densities.size(), 1u);

    ASSERT_EQ(
        Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K D_RED D_GREEN D_BLUE D_VIS D_MAJOR_FILTER",
             {"1 0 0 0 0 0.05 0.06 0.07 0.08 0.09", "2 100 0 0 0 1.25 0.5 0.25 0.75 1.25",
              "3 0 100 0 0 0.1 1.4 0.6 0.9 1.4"}),
        0);
    EXPECT_EQ(host->CollectDensities(densities), 0);
    EXPECT_EQ(ValueRows(densities), (Rows{{0.05, 0.06, 0.07, 0.08, 0.09},
                                          {1.25, 0.5, 0.25, 0.75, 1.25},
                                          {0.1, 1.4, 0.6, 0.9, 1.4}}));
}

TEST_F(HostQueries, ClosestCmykPatch) {
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{}), -1); // an empty store
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                   {"1 0 0 0 0", "2 100 100 100 100", "3 52 50 50 50", "4 80 80 80 80",
                    "5 60 60 60 60", "6 30 30 30 30", "7 50 48 50 50"}),
              0);
    // Samples 3 and 7 are both at distance 2 from (50, 50, 50, 50): the lower number wins.
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 50, 50, 50}, 2.0), 3);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 50, 50, 50}, 1.999), -1);
    // Sample 1 is nearest to (0, 0, 6, 0), at distance 6; the maximum is inclusive.
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 6, 0}, 5.0), -1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 6, 0}, 6.0), 1);

    // Ceilings: 400 with a maximum, 10000 without.
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 10000", "2 450 0 0 0"}), 0);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{}, 1000.0), -1); // nearest at 450
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{}), 2);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 0, 0, 0}, 1000.0), -1); // at exactly 400
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{51, 0, 0, 0}, 1000.0), 2);  // at 399
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 10000"}), 0);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{}), -1);          // at exactly 10000
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 0, 1}), 1); // at 9999
}

TEST_F(HostQueries, ReferenceSampleMap) {
    std::map<int, int> map{{1, 1}};
    EXPECT_EQ(host->GetReferenceSampleMap(map), 25);
    // Reference 7 is used twice: the later patch (3) is kept.
    ASSERT_EQ(Read("SAMPLE_ID REFERENCE_SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                   {"1 7 0 0 0 0", "2 3 10 0 0 0", "3 7 20 0 0 0", "4 12 30 0 0 0"}),
              0);
    EXPECT_EQ(host->GetReferenceSampleMap(map), 0);
    EXPECT_EQ(map, (std::map<int, int>{{3, 2}, {7, 3}, {12, 4}}));
    // A chart without the column has none, also after one that had them.
    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    EXPECT_EQ(host->GetReferenceSampleMap(map), 25);
    EXPECT_EQ(map.size(), 3u);
}

} // namespace
