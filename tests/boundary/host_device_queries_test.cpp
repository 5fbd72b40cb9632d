// Device colour space, channel count, device values and process colour names of
// charts read from files, asked through the base-class interface a host holds.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_files.h"

namespace {

using namespace host_charts;
using Lists = std::vector<std::vector<double>>;

using HostDeviceQueries = HostChart;

TEST_F(HostDeviceQueries, SpaceChannelsAndValuesPerKindOfChart) {
    struct Case {
        const char* fields;
        std::vector<std::string> rows;
        int space;
        int channels;
        int listsResult;
        Lists lists;
    };
    const Case cases[] = {
        {"SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A LAB_B",
         {"1 0 10 20 30 95 -1 2", "2 100 0 0 0 55 -37 -50"},
         COLORSPACE_CMYK,
         4,
         0,
         {{0, 10, 20, 30}, {100, 0, 0, 0}}},
        // Six-colour fields are n-colour channels, channel 0 first.
        {"SAMPLE_ID 6CLR_1 6CLR_2 6CLR_3 6CLR_4 6CLR_5 6CLR_6",
         {"1 10 20 30 40 50 60", "2 1 2 3 4 5 6"},
         COLORSPACE_NCOLOR,
         6,
         0,
         {{10, 20, 30, 40, 50, 60}, {1, 2, 3, 4, 5, 6}}},
        {"SAMPLE_ID RGB_R RGB_G RGB_B", {"1 255 128 0"}, COLORSPACE_RGB, 3, 12, {}},
        // Orange, green and violet are not among the spaces asked for: plain CMYK.
        {"SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K ORANGE GREEN VIOLET",
         {"1 1 2 3 4 5 6 7"},
         COLORSPACE_CMYK,
         4,
         0,
         {{1, 2, 3, 4}}},
        // An HTML colour answers CMYK's number even beside n-colour channels; the
        // channel count and the values still follow the n-colour channels.
        {"SAMPLE_ID DRGB 3CLR_1 3CLR_2 3CLR_3",
         {"1 #102030 5 6 7"},
         COLORSPACE_CMYK,
         3,
         0,
         {{5, 6, 7}}},
        {"SAMPLE_ID RGB_R RGB_G RGB_B DRGB", {"1 1 2 3 #010203"}, COLORSPACE_CMYK, 3, 12, {}},
        // The last row's colour decides for the chart: here it is no HTML colour.
        {"SAMPLE_ID RGB_R RGB_G RGB_B DRGB",
         {"1 1 2 3 #010203", "2 4 5 6 010203"},
         COLORSPACE_RGB,
         3,
         12,
         {}},
    };
    for (const Case& c : cases) {
        ASSERT_EQ(Read(c.fields, c.rows), 0) << c.fields;
        EXPECT_EQ(host->GetDeviceColorSpace(), c.space) << c.fields;
        EXPECT_EQ(host->GetDeviceChannelCount(), c.channels) << c.fields;
        Lists lists{{-1.0}};
        EXPECT_EQ(host->GetDeviceValueLists(lists), c.listsResult) << c.fields;
        EXPECT_EQ(lists, c.lists) << c.fields;
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

    ASSERT_EQ(Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0"}), 0);
    EXPECT_EQ(host->GetProcessColorNames(names), 1);
    EXPECT_TRUE(names.empty());
}

TEST_F(HostDeviceQueries, AfterAFailedRead) {
    ASSERT_EQ(
        Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0"}, {"PROCESSCOLOR_ID 1 Cyan"}),
        0);
    // A row with one value too many fails the read with 8 and empties the chart.
    ASSERT_EQ(
        Read("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0 0"}, {"PROCESSCOLOR_ID 1 Cyan"}),
        8);
    EXPECT_EQ(host->GetDeviceColorSpace(), -1);
    EXPECT_EQ(host->GetDeviceChannelCount(), 4);
    Lists lists{{1.0}};
    EXPECT_EQ(host->GetDeviceValueLists(lists), 12);
    EXPECT_TRUE(lists.empty());
    std::vector<std::string> names{"stale"};
    EXPECT_EQ(host->GetProcessColorNames(names), 1);
    EXPECT_TRUE(names.empty());
}

} // namespace
