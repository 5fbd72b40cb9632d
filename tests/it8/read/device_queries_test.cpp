// Device colour space, channel count and device values of the chart read.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_text.h"

using namespace reader_test;
using test_support::TempDir;
using Lists = std::vector<std::vector<double>>;

TEST(DeviceQueries, CmykAndNColorCharts) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, CmykLabChart()), 0);
    EXPECT_EQ(reader.GetDeviceColorSpace(), COLORSPACE_CMYK);
    EXPECT_EQ(reader.GetDeviceChannelCount(), 4);
    Lists lists{{99.0}};
    EXPECT_EQ(reader.GetDeviceValueLists(lists), 0);
    EXPECT_EQ(lists, (Lists{{0, 10, 20, 30}, {100, 0, 0, 0}}));

    // Six-colour fields stay n-colour channels.
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("SAMPLE_ID 6CLR_1 6CLR_2 6CLR_3 6CLR_4 6CLR_5 6CLR_6",
                             {"1 10 20 30 40 50 60", "2 1 2 3 4 5 6"})),
              0);
    EXPECT_EQ(reader.GetDeviceColorSpace(), COLORSPACE_NCOLOR);
    EXPECT_EQ(reader.GetDeviceChannelCount(), 6);
    EXPECT_FALSE(reader.IsColorSpacePresent(COLORSPACE_CMYKOG));
    EXPECT_EQ(reader.GetDeviceValueLists(lists), 0);
    EXPECT_EQ(lists, (Lists{{10, 20, 30, 40, 50, 60}, {1, 2, 3, 4, 5, 6}}));

    // Ten channels in name order: 10CLR_1, 10CLR_10, 10CLR_2 ... 10CLR_9.
    std::string fields = "SAMPLE_ID";
    std::string row = "1";
    for (int channel = 1; channel <= 10; ++channel) {
        fields += " 10CLR_" + std::to_string(channel);
        row += " " + std::to_string(channel);
    }
    ASSERT_EQ(ReadText(reader, dir, Chart(fields, {row})), 0);
    EXPECT_EQ(reader.GetDeviceValueLists(lists), 0);
    EXPECT_EQ(lists, (Lists{{1, 10, 2, 3, 4, 5, 6, 7, 8, 9}}));
}

TEST(DeviceQueries, OtherSpacesAndAFailedRead) {
    TempDir dir;
    CIT8ReaderWriter reader;
    const struct {
        std::string fields;
        std::string row;
        int space;
        int channels;
        int listsResult;
    } cases[] = {
        {"RGB_R RGB_G RGB_B", "1 2 3", COLORSPACE_RGB, 3, 12},
        {"CMYK_C CMYK_M CMYK_Y CMYK_K RGB_R RGB_G RGB_B", "1 2 3 4 5 6 7", COLORSPACE_CMYKRGB, 7,
         12},
        // The CMYK+OGV record is not among the spaces asked for.
        {"CMYK_C CMYK_M CMYK_Y CMYK_K ORANGE GREEN VIOLET", "1 2 3 4 5 6 7", COLORSPACE_CMYK, 4, 0},
        {"LAB_L LAB_A LAB_B", "50 0 0", COLORSPACE_LAB, 3, 12},
        // An HTML colour means CMYK, whatever else the chart holds.
        {"RGB_R RGB_G RGB_B DRGB", "1 2 3 #010203", COLORSPACE_CMYK, 3, 12},
    };
    for (const auto& c : cases) {
        ASSERT_EQ(ReadText(reader, dir, Chart(c.fields, {c.row})), 0) << c.fields;
        EXPECT_EQ(reader.GetDeviceColorSpace(), c.space) << c.fields;
        EXPECT_EQ(reader.GetDeviceChannelCount(), c.channels) << c.fields;
        Lists lists{{1.0}};
        EXPECT_EQ(reader.GetDeviceValueLists(lists), c.listsResult) << c.fields;
        EXPECT_EQ(lists.size(), c.listsResult == 0 ? 1u : 0u) << c.fields;
    }
    ASSERT_EQ(ReadText(reader, dir, "PROCESSCOLOR_ID 1 Cyan\nNUMBER_OF_SETS 0\n"), 6);
    EXPECT_EQ(reader.GetDeviceColorSpace(), -1);
    EXPECT_EQ(reader.GetDeviceChannelCount(), 4);
    std::vector<std::string> names{"stale"};
    EXPECT_EQ(reader.GetProcessColorNames(names), 1);
    EXPECT_TRUE(names.empty());
}
