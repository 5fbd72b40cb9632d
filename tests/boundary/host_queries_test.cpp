// Patch queries on charts read from files through a factory-made reader-writer:
// records by number, whole-chart and per-strip collections, presence, closest
// patch and reference samples.
#include <gtest/gtest.h>

#include <climits>
#include <map>
#include <set>
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
    ASSERT_EQ(host->GetPatchCount(), 10);

    std::vector<tagCMYK> cmyk{tagCMYK{}};
    EXPECT_EQ(host->CollectStripCMYK(1, cmyk), 0);
    EXPECT_EQ(ValueRows(cmyk), (Rows{{10, 1, 0, 0}, {20, 2, 0, 0}, {30, 3, 0, 0}, {40, 4, 0, 0}}));
    EXPECT_EQ(host->CollectStripCMYK(2, cmyk), 0);
    EXPECT_EQ(ValueRows(cmyk), (Rows{{50, 5, 0, 0}, {60, 6, 0, 0}, {70, 7, 0, 0}, {80, 8, 0, 0}}));
    EXPECT_EQ(host->CollectStripCMYK(3, cmyk), 0); // what is left: samples 9 and 10
    EXPECT_EQ(ValueRows(cmyk), (Rows{{90, 9, 0, 0}, {100, 10, 0, 0}}));
    for (int strip : {0, 4, -1}) {
        EXPECT_EQ(host->CollectStripCMYK(strip, cmyk), 17) << strip;
        EXPECT_EQ(cmyk.size(), 2u) << "a refused strip leaves the list alone";
    }

    // Every family reads its own record of the same two patches.
    std::vector<tagRGB> rgb;
    EXPECT_EQ(host->CollectStripRGB(3, rgb), 0);
    EXPECT_EQ(ValueRows(rgb), (Rows{{9, 18, 27}, {10, 20, 30}}));
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(host->CollectStripXYZ(3, xyz), 0);
    EXPECT_EQ(ValueRows(xyz), (Rows{{9, 10, 11}, {10, 11, 12}}));
    std::vector<tagLAB> lab; // derived from XYZ, so present
    EXPECT_EQ(host->CollectStripLAB(3, lab), 0);
    EXPECT_EQ(lab.size(), 2u);
    std::vector<tagCMYKRGB> cmykrgb;
    EXPECT_EQ(host->CollectStripCMYKRGB(1, cmykrgb), 0);
    ASSERT_EQ(cmykrgb.size(), 4u);
    EXPECT_EQ(Values(cmykrgb[3]), (std::vector<double>{40, 4, 0, 0, 4, 8, 12}));

    // Spaces the chart does not carry answer 12, before any strip test.
    std::vector<tagCMYKOGV> cmykogv;
    EXPECT_EQ(host->CollectStripCMYKOGV(99, cmykogv), 12);
    std::vector<tagCMYKOG> cmykog;
    EXPECT_EQ(host->CollectStripCMYKOG(1, cmykog), 12);
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
        {{"NUMBER_OF_STRIPS\t0", "NUMBER_OF_COLS\t0"}, 1, 16, 3},    // both zero
        {{"NUMBER_OF_COLS\t5"}, 1, 15, 3},                           // columns without strips
        {{"NUMBER_OF_STRIPS\t2", "NUMBER_OF_COLS\t-1"}, 1, 15, 3},   // negative columns
        {{"NUMBER_OF_STRIPS\t-1", "NUMBER_OF_COLS\t4"}, 1, 15, 3},   // negative strips
        {{"NUMBER_OF_STRIPS\t\"5\"", "NUMBER_OF_COLS\t4"}, 3, 0, 2}, // quoted: samples 9, 10
        {{"NUMBER_OF_STRIPS\t5", "NUMBER_OF_COLS\t4"}, 4, 0, 0},     // wholly beyond the patches
        {{"NUMBER_OF_STRIPS\t5", "NUMBER_OF_COLS\t4"}, 6, 17, 3},
        // The first sample of a strip must not overflow.
        {{"NUMBER_OF_STRIPS " + max, "NUMBER_OF_COLS " + max}, 1, 0, 10},
        {{"NUMBER_OF_STRIPS " + max, "NUMBER_OF_COLS " + max}, 2147483647, 0, 0},
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
    tagCMYK cmyk{1, 2, 3, 4};
    tagDENSITY density;
    EXPECT_EQ(host->GetPatchDensity(1, density), 11);

    // CMYK only: XYZ is not carried, whatever the sample number.
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 10 20 30 40", "2 0 0 0 0"}), 0);
    EXPECT_EQ(host->GetPatchXYZ(1, xyz), 12);
    EXPECT_EQ(host->GetPatchXYZ(99, xyz), 12);
    tagRGB rgb{1, 2, 3}; // the patches derive RGB, the chart does not carry it
    EXPECT_EQ(host->GetPatchRGB(1, rgb), 12);
    tagCMYKOG cmykog;
    EXPECT_EQ(host->GetPatchCMYKOG(1, cmykog), 12);
    EXPECT_EQ(host->GetPatchDensity(1, density), 12);
    EXPECT_EQ(Values(xyz), (std::vector<double>{7, 8, 9}));
    EXPECT_EQ(Values(rgb), (std::vector<double>{1, 2, 3}));
    EXPECT_EQ(host->GetPatchCMYK(2, cmyk), 0);
    EXPECT_EQ(Values(cmyk), (std::vector<double>{0, 0, 0, 0}));

    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    for (int absent : {0, 11, -1}) {
        EXPECT_EQ(host->GetPatchXYZ(absent, xyz), 10) << absent;
    }
    EXPECT_EQ(Values(xyz), (std::vector<double>{7, 8, 9}));
    EXPECT_EQ(host->GetPatchXYZ(3, xyz), 0);
    EXPECT_EQ(Values(xyz), (std::vector<double>{3, 4, 5}));
    EXPECT_EQ(host->GetPatchRGB(2, rgb), 0);
    EXPECT_EQ(Values(rgb), (std::vector<double>{2, 4, 6}));
    tagCMYKRGB cmykrgb;
    EXPECT_EQ(host->GetPatchCMYKRGB(4, cmykrgb), 0);
    EXPECT_EQ(Values(cmykrgb), (std::vector<double>{40, 4, 0, 0, 4, 8, 12}));

    EXPECT_EQ(host->GetPatch(11, result).GetLabel(), "");
    EXPECT_EQ(result, 10);
    EXPECT_EQ(Values(host->GetPatch(11, result).GetRGB()), (std::vector<double>{-1, -1, -1}));
    EXPECT_EQ(host->GetPatch(7, result).GetLabel(), "P7");
    EXPECT_EQ(result, 0);
    const std::vector<std::string> labels = Labels(host->GetPatchList());
    EXPECT_EQ(labels.size(), 10u);
    EXPECT_EQ(labels.front() + labels.back(), "P1P10");
}

TEST_F(HostQueries, CollectionsInSampleOrder) {
    std::vector<tagCMYK> cmyk{tagCMYK{5, 5, 5, 5}};
    EXPECT_EQ(host->CollectCMYK(cmyk), 11);
    std::vector<tagDENSITY> densities{tagDENSITY{}};
    EXPECT_EQ(host->CollectDensities(densities), 11);
    std::vector<std::map<int, tagNCLR>> maps{{}};
    EXPECT_EQ(host->CollectNColorMaps(maps), 12); // no store test, the flag answers
    EXPECT_EQ(cmyk.size() + densities.size() + maps.size(), 3u);

    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    EXPECT_EQ(host->CollectCMYK(cmyk), 0);
    ASSERT_EQ(cmyk.size(), 10u); // the earlier entry is gone
    EXPECT_EQ(Values(cmyk.back()), (std::vector<double>{100, 10, 0, 0}));
    std::vector<tagXYZ> xyz;
    EXPECT_EQ(host->CollectXYZ(xyz), 0);
    ASSERT_EQ(xyz.size(), 10u);
    EXPECT_EQ(Values(xyz[4]), (std::vector<double>{5, 6, 7}));
    std::vector<tagRGB> rgb;
    EXPECT_EQ(host->CollectRGB(rgb), 0);
    ASSERT_EQ(rgb.size(), 10u);
    EXPECT_EQ(Values(rgb[9]), (std::vector<double>{10, 20, 30}));
    std::vector<tagHTMLCOLOR> html;
    EXPECT_EQ(host->CollectHTMLCOLOR(html), 12);
    EXPECT_EQ(host->CollectDensities(densities), 12);
    EXPECT_EQ(densities.size(), 1u);

    // Densities come back per patch, in sample order, as read.
    ASSERT_EQ(
        Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K D_RED D_GREEN D_BLUE D_VIS D_MAJOR_FILTER",
             {"1 0 0 0 0 0.05 0.06 0.07 0.08 0.09", "2 100 0 0 0 1.25 0.5 0.25 0.75 1.25",
              "3 0 100 0 0 0.1 1.4 0.6 0.9 1.4"}),
        0);
    EXPECT_EQ(host->CollectDensities(densities), 0);
    EXPECT_EQ(ValueRows(densities), (Rows{{0.05, 0.06, 0.07, 0.08, 0.09},
                                          {1.25, 0.5, 0.25, 0.75, 1.25},
                                          {0.1, 1.4, 0.6, 0.9, 1.4}}));
    tagDENSITY density;
    EXPECT_EQ(host->GetPatchDensity(2, density), 0);
    EXPECT_EQ(Values(density), (std::vector<double>{1.25, 0.5, 0.25, 0.75, 1.25}));

    // HTML colours and n-colour maps.
    ASSERT_EQ(Read("SAMPLE_ID DRGB 6CLR_1 6CLR_2 6CLR_3 6CLR_4 6CLR_5 6CLR_6",
                   {"1 #0A0B0C 10 20 30 40 50 60", "2 #FF8000 1 2 3 4 5 6"}),
              0);
    EXPECT_EQ(host->CollectHTMLCOLOR(html), 0);
    ASSERT_EQ(html.size(), 2u);
    EXPECT_EQ((Rows{{double(html[0].r), double(html[0].g), double(html[0].b)},
                    {double(html[1].r), double(html[1].g), double(html[1].b)}}),
              (Rows{{10, 11, 12}, {255, 128, 0}}));
    EXPECT_EQ(host->CollectNColorMaps(maps), 0);
    ASSERT_EQ(maps.size(), 2u);
    ASSERT_EQ(maps[1].size(), 6u);
    EXPECT_EQ(maps[1].at(0).name, "6CLR_1");
    EXPECT_EQ(maps[1].at(5).value, 6.0);
    EXPECT_EQ(maps[0].at(2).value, 30.0);
}

TEST_F(HostQueries, SevenColourRecordsAndNoFiveColourOnes) {
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K ORANGE GREEN VIOLET",
                   {"1 1 2 3 4 5 6 7", "2 8 9 10 11 12 13 14", "3 0 0 0 0 0 0 50"},
                   {"NUMBER_OF_STRIPS 2", "NUMBER_OF_COLS 2"}),
              0);
    std::vector<tagCMYKOGV> cmykogv;
    EXPECT_EQ(host->CollectStripCMYKOGV(2, cmykogv), 0);
    EXPECT_EQ(ValueRows(cmykogv), (Rows{{0, 0, 0, 0, 0, 0, 50}}));
    EXPECT_EQ(host->CollectCMYKOGV(cmykogv), 0);
    EXPECT_EQ(cmykogv.size(), 3u);
    EXPECT_EQ(Values(cmykogv[1]), (std::vector<double>{8, 9, 10, 11, 12, 13, 14}));
    // No chart carries five-colour values.
    EXPECT_FALSE(host->IsColorSpacePresent(COLORSPACE_CMYKO));
    std::vector<SWL_CMYKO> cmyko{SWL_CMYKO{}};
    EXPECT_EQ(host->CollectCMYKO(cmyko), 12);
    EXPECT_EQ(host->CollectStripCMYKO(1, cmyko), 12);
    EXPECT_EQ(cmyko.size(), 1u);
}

TEST_F(HostQueries, PresenceFlagsAndOutOfRangeSpaces) {
    ASSERT_EQ(Read(kFullFields, TenPatchRows()), 0);
    // CMYK, RGB, XYZ and CMYK+RGB come from the fields; Lab is derived from XYZ.
    const std::set<int> present = {COLORSPACE_CMYK, COLORSPACE_XYZ, COLORSPACE_LAB, COLORSPACE_RGB,
                                   COLORSPACE_CMYKRGB};
    for (int space : {-1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 100, INT_MAX, INT_MIN}) {
        EXPECT_EQ(host->IsColorSpacePresent(space), present.count(space) == 1) << space;
    }
}

TEST_F(HostQueries, ClosestCmykPatch) {
    // An empty store has no patch to offer.
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{}), -1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYKOG{}, 100.0), -1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYKRGB{}), -1);

    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                   {"1 0 0 0 0", "2 100 100 100 100", "3 52 50 50 50", "4 80 80 80 80",
                    "5 60 60 60 60", "6 30 30 30 30", "7 50 48 50 50"}),
              0);
    // Samples 3 and 7 are both at distance 2 from (50, 50, 50, 50): the lower number wins.
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 50, 50, 50}), 3);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 50, 50, 50}, 2.0), 3);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{50, 50, 50, 50}, 1.999), -1);
    // Sample 1 is nearest to (0, 0, 6, 0), at distance 6; the maximum is inclusive.
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 6, 0}, 5.0), -1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 6, 0}, 6.0), 1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYK{0, 0, 6, 0}), 1);
    // No file field fills the six-colour record, so every patch sits at its zero
    // record and all take part: the lowest sample number wins.
    EXPECT_EQ(host->FindClosestPatch(tagCMYKOG{}), 1);
    EXPECT_EQ(host->FindClosestPatch(tagCMYKOG{3, 0, 0, 4, 0, 0}, 5.0), 1); // distance 5

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

TEST_F(HostQueries, ClosestSevenColourPatchUsesAllChannels) {
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K RGB_R RGB_G RGB_B",
                   {"1 0 0 0 0 255 0 0", "2 0 0 0 0 0 0 255"}),
              0);
    // Equal CMYK; only blue tells them apart: sample 2 is at distance 5.
    const tagCMYKRGB target{0, 0, 0, 0, 0, 0, 250};
    EXPECT_EQ(host->FindClosestPatch(target), 2);
    EXPECT_EQ(host->FindClosestPatch(target, 4.0), -1);
    EXPECT_EQ(host->FindClosestPatch(target, 5.0), 2);
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
