// Device colour space, channel count and process colour names of
// charts read from files, asked through the base-class interface a host holds.
// The reader's own tests cover each kind of chart; these check that a host gets
// the reader-writer's answers, not the store's fallbacks, and the mixed charts.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_files.h"

namespace {

using namespace host_charts;

using HostDeviceQueries = HostChart;

TEST_F(HostDeviceQueries, SpaceChannelsAndValuesPerKindOfChart) {
    const std::string rgbHtml = "SAMPLE_ID RGB_R RGB_G RGB_B DRGB";
    struct Case {
        std::string fields;
        std::vector<std::string> rows;
        int space;
        int channels;
    };
    const Case cases[] = {
        {"SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A LAB_B",
         {"1 0 10 20 30 95 -1 2", "2 100 0 0 0 55 -37 -50"},
         COLORSPACE_CMYK,
         4},
        // An HTML colour answers CMYK's number even beside n-colour channels; the
        // channel count still follows the n-colour channels.
        {"SAMPLE_ID DRGB 3CLR_1 3CLR_2 3CLR_3", {"1 #102030 5 6 7"}, COLORSPACE_CMYK, 3},
        // The last row's colour decides for the chart: here it is no HTML colour.
        {rgbHtml, {"1 1 2 3 #010203", "2 4 5 6 010203"}, COLORSPACE_RGB, 3},
    };
    for (const Case& c : cases) {
        ASSERT_EQ(Read(c.fields, c.rows), 0) << c.fields;
        EXPECT_EQ(host->GetDeviceColorSpace(), c.space) << c.fields;
        EXPECT_EQ(host->GetDeviceChannelCount(), c.channels) << c.fields;
    }
}

TEST_F(HostDeviceQueries, ProcessColourNames) {
    std::vector<std::string> names{"stale"};
    // The quoted value keeps its two words; the last word is the name. A line
    // without a value gives no name.
    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0"},
                   {"PROCESSCOLOR_ID\t\"1 Cyan\"", "PROCESSCOLOR_ID 2 Magenta", "PROCESSCOLOR_ID",
                    "PROCESSCOLOR_ID Yellow"}),
              0);
    EXPECT_EQ(host->GetProcessColorNames(names), 0);
    EXPECT_EQ(names, (std::vector<std::string>{"Cyan", "Magenta", "Yellow"}));

    // A row with one value too many fails the read with 8 and empties the chart.
    ASSERT_EQ(
        Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0 0"}, {"PROCESSCOLOR_ID 1 Cyan"}),
        8);
    EXPECT_EQ(host->GetProcessColorNames(names), 1);
    EXPECT_TRUE(names.empty());
}

} // namespace
