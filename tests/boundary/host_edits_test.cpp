// Host edits on a chart read from a file: the chart's norm light and clearing
// the value lists, seen through the patches and the files written afterwards.
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "chart_files.h"

namespace {

using namespace host_charts;

// A written file's text with the platform's CR LF line ends read as LF.
std::string WithoutCR(std::string text) {
    for (auto cr = text.find('\r'); cr != std::string::npos; cr = text.find('\r', cr)) {
        text.erase(cr, 1);
    }
    return text;
}

// First line after `marker` in `text` ("" when there is none).
std::string LineAfter(std::string text, const std::string& marker) {
    text = WithoutCR(std::move(text));
    const auto at = text.find(marker + "\n");
    if (at == std::string::npos) {
        return "";
    }
    const auto start = at + marker.size() + 1;
    return text.substr(start, text.find('\n', start) - start);
}

void ExpectNear(const std::vector<double>& got, const std::vector<double>& expected) {
    ASSERT_EQ(got.size(), expected.size());
    for (std::size_t i = 0; i < got.size(); ++i) {
        EXPECT_NEAR(got[i], expected[i], 1e-9) << "position " << i;
    }
}

using HostEdits = HostChart;

TEST_F(HostEdits, ChartNormLightReachesEveryPatchAndRecomputesNothing) {
    // Patch 1 is the default norm light (96.38, 100, 82.45), patch 2 half of it.
    ASSERT_EQ(Read("SAMPLE_ID XYZ_X XYZ_Y XYZ_Z", {"1 96.38 100 82.45", "2 48.19 50 41.225"}), 0);
    const tagXYZ light{48.19, 50, 41.225};
    host->SetChartNormLight(light);
    for (int sample : {1, 2}) {
        int result = -1;
        CColorPatch patch = host->GetPatch(sample, result);
        ASSERT_EQ(result, 0);
        // Scaling a patch's own XYZ as media white gives back its norm light.
        ExpectNear(Values(patch.XYZAbsoluteToRelative(patch.GetXYZ())), Values(light));
    }
    // Nothing is recomputed: the Lab stays as read against the default norm light,
    // where every ratio is 0.5 for patch 2, so
    // L* = 116 * 0.5^(1/3) - 16 = 116 * 0.79370052598 - 16 = 76.06926101, a* = b* = 0.
    tagLAB lab;
    ASSERT_EQ(host->GetPatchLAB(2, lab), 0);
    ExpectNear(Values(lab), {76.06926101415557, 0, 0});
}

TEST_F(HostEdits, ClearListsKeepsSampleNamesAndDensities) {
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 10 20 30", "2 100 0 0 0"}), 0);

    std::map<std::string, double> spectrum;
    for (int nm = 380; nm <= 730; nm += 10) {
        spectrum["SPECTRAL_NM_" + std::to_string(nm)] = 0.5;
    }
    host->SetSampleNameList({"A", "B"});
    host->SetCMYKList({tagCMYK{1, 2, 3, 4}, tagCMYK{5, 6, 7, 8}});
    host->SetRGBList({tagRGB{1, 2, 3}, tagRGB{4, 5, 6}});
    host->SetCMYKOGList({tagCMYKOG{}, tagCMYKOG{}});
    host->SetCMYKRGBList({tagCMYKRGB{}, tagCMYKRGB{}});
    host->SetNColorList({{{0, tagNCLR{1, 0, "1CLR_1", 5}}}, {{0, tagNCLR{1, 0, "1CLR_1", 6}}}});
    host->SetKeywordList({{"ORIGINATOR", "host"}});
    host->SetSpectralDataList({spectrum, spectrum}, true); // XYZ, Lab and densities
    host->ClearLists();

    // The densities stay: the merged file still carries them, and nothing else of the store.
    const auto merged = dir.file("merged.txt");
    ASSERT_EQ(host->WriteMeasurementFile(test_support::Wide(lastPath), test_support::Wide(merged)),
              0);
    EXPECT_EQ(LineAfter(test_support::ReadBytes(merged), "BEGIN_DATA_FORMAT"),
              "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tD_RED\tD_GREEN\tD_BLUE\tD_VIS\t");

    // The sample names stay: a file from the store alone has them and nothing else,
    // not even the keyword list.
    const auto fresh = dir.file("fresh.txt");
    ASSERT_EQ(host->WriteChartFile(L"", test_support::Wide(fresh), false), 0);
    const std::string written = WithoutCR(test_support::ReadBytes(fresh));
    EXPECT_EQ(LineAfter(written, "BEGIN_DATA_FORMAT"), "SAMPLE_ID\tSAMPLE_NAME");
    EXPECT_NE(written.find("NUMBER_OF_SETS\t0\n"), std::string::npos) << written;
    EXPECT_EQ(written.find("ORIGINATOR"), std::string::npos) << written;
}

} // namespace
