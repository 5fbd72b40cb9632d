// Charts are read alike whatever their line ends: CR LF (written on Windows),
// LF and CR alone; nothing a host gets back keeps a CR of a line end.
#include <array>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::kNativeLineEnd;

TEST(ChartLineEnds, CrLfLfAndCrOnlyChartsReadAlike) {
    for (const std::string lineEnd : {"\r\n", "\n", "\r"}) {
        SCOPED_TRACE(lineEnd == "\r\n" ? "CR LF" : lineEnd == "\n" ? "LF" : "CR");
        test_support::TempDir dir;
        const auto chart = dir.write("chart.txt", platform_test::ChartText(lineEnd));
        auto readerWriter = platform_test::NewReaderWriter();
        ASSERT_EQ(0, readerWriter->ReadChartFile(test_support::Wide(chart)));

        EXPECT_EQ(platform_test::kChartSets, readerWriter->GetPatchCount());
        // A Ctrl-Z byte (end of file to a Windows text-mode read) is just a character.
        EXPECT_EQ("stop\x1Ahere ", readerWriter->GetKeywordValue("COMMENT"));
        for (const auto& [key, value] : readerWriter->GetKeywords()) {
            EXPECT_EQ(std::string::npos, (key + value).find('\r')) << key;
        }
        std::vector<tagCMYK> cmyk;
        ASSERT_EQ(0, readerWriter->CollectCMYK(cmyk));
        ASSERT_EQ(30u, cmyk.size());
        // Row 30: 5 + (30 % 19) * 5, 5 + (30 % 17) * 5, 5 + (30 % 13) * 5, 5 + (30 % 7) * 5.
        const tagCMYK& c = cmyk[29];
        EXPECT_EQ((std::array<double, 4>{60, 70, 25, 15}), (std::array{c.c, c.m, c.y, c.k}));

        // Device-control lines are kept whole (blanks and tabs included) but
        // without their line end; written back, each gets one native line end.
        const auto sequence = dir.file("sequence.txt");
        ASSERT_EQ(0, readerWriter->WriteDeviceControlSequence(sequence.string()));
        EXPECT_EQ("\tSET SPEED 2" + kNativeLineEnd + "MOVE  TO 10 20" + kNativeLineEnd,
                  test_support::ReadBytes(sequence));
    }
}

} // namespace
