// Charts are read alike whatever their line ends: CR LF (written on Windows),
// LF and CR alone; nothing a host gets back keeps a CR of a line end.
#include <array>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::kChartSets;
using platform_test::kNativeLineEnd;

TEST(ChartLineEnds, CrLfLfAndCrOnlyChartsReadAlike) {
    for (const std::string lineEnd : {"\r\n", "\n", "\r"}) {
        SCOPED_TRACE(lineEnd == "\r\n" ? "CR LF" : lineEnd == "\n" ? "LF" : "CR");
        test_support::TempDir dir;
        const std::string text = platform_test::ChartText(lineEnd);
        // Read CR-only only when the text before the (missing) first LF is
        // longer than one 1023-character line.
        ASSERT_GT(text.size(), 1023u);
        const auto chart = dir.write("chart.txt", text);
        auto readerWriter = platform_test::NewReaderWriter();
        ASSERT_EQ(0, readerWriter->ReadChartFile(test_support::Wide(chart)));

        EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());
        EXPECT_EQ(10, readerWriter->GetNumberOfStrips());
        EXPECT_EQ(3, readerWriter->GetNumberOfCols());
        // Tokens of a header value are each followed by one blank; a Ctrl-Z
        // byte (end of file to a Windows text-mode read) is just a character.
        EXPECT_EQ("\"Platform test\" ", readerWriter->GetKeywordValue("ORIGINATOR"));
        EXPECT_EQ("stop\x1Ahere ", readerWriter->GetKeywordValue("COMMENT"));
        for (const auto& [key, value] : readerWriter->GetKeywords()) {
            EXPECT_EQ(std::string::npos, (key + value).find('\r')) << key;
        }
        // Each field name followed by one tab.
        EXPECT_EQ("SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\t",
                  readerWriter->GetDataFormatLine());

        std::vector<tagCMYK> cmyk;
        std::vector<tagLAB> lab;
        ASSERT_EQ(0, readerWriter->CollectCMYK(cmyk));
        ASSERT_EQ(0, readerWriter->CollectLAB(lab));
        ASSERT_EQ(static_cast<std::size_t>(kChartSets), cmyk.size());
        ASSERT_EQ(static_cast<std::size_t>(kChartSets), lab.size());
        EXPECT_EQ(100, cmyk[1].c);
        // Row 30: 5 + (30 % 19) * 5, 5 + (30 % 17) * 5, 5 + (30 % 13) * 5, 5 + (30 % 7) * 5.
        const tagCMYK& c = cmyk[29];
        EXPECT_EQ((std::array<double, 4>{60, 70, 25, 15}), (std::array{c.c, c.m, c.y, c.k}));
        // Row 7: 20 + 7 ".5", 7, -7.
        EXPECT_EQ((std::array<double, 3>{27.5, 7, -7}), (std::array{lab[6].l, lab[6].a, lab[6].b}));

        // Device-control lines are kept whole (blanks and tabs included) but
        // without their line end; written back, each gets one native line end.
        const auto sequence = dir.file("sequence.txt");
        ASSERT_EQ(0, readerWriter->WriteDeviceControlSequence(sequence.string()));
        EXPECT_EQ("\tSET SPEED 2" + kNativeLineEnd + "MOVE  TO 10 20" + kNativeLineEnd,
                  test_support::ReadBytes(sequence));
    }
}

} // namespace
