// Charts are read alike whatever their line ends: CR LF (written on Windows),
// LF and CR alone.
#include <array>
#include <map>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::ChartLines;
using platform_test::JoinLines;
using platform_test::kChartSets;
using platform_test::NewReaderWriter;
using test_support::TempDir;
using test_support::Wide;

// What a host sees of a chart after reading it.
struct ChartView {
    int result = -1;
    int patchCount = 0;
    int strips = 0;
    int columns = 0;
    std::map<std::string, std::string> keywords;
    std::vector<std::array<double, 4>> cmyk;
    std::vector<std::array<double, 3>> lab;
    std::string dataFormatLine;
};

ChartView ReadChart(const std::string& text) {
    TempDir dir;
    const auto path = dir.write("chart.txt", text);
    auto readerWriter = NewReaderWriter();
    ChartView view;
    view.result = readerWriter->ReadChartFile(Wide(path));
    view.patchCount = readerWriter->GetPatchCount();
    view.strips = readerWriter->GetNumberOfStrips();
    view.columns = readerWriter->GetNumberOfCols();
    view.keywords = readerWriter->GetKeywords();
    std::vector<tagCMYK> cmyk;
    readerWriter->CollectCMYK(cmyk);
    for (const auto& c : cmyk) {
        view.cmyk.push_back({c.c, c.m, c.y, c.k});
    }
    std::vector<tagLAB> lab;
    readerWriter->CollectLAB(lab);
    for (const auto& l : lab) {
        view.lab.push_back({l.l, l.a, l.b});
    }
    view.dataFormatLine = readerWriter->GetDataFormatLine();
    return view;
}

void ExpectSameChart(const ChartView& expected, const ChartView& actual, const char* style) {
    SCOPED_TRACE(style);
    EXPECT_EQ(expected.result, actual.result);
    EXPECT_EQ(expected.patchCount, actual.patchCount);
    EXPECT_EQ(expected.strips, actual.strips);
    EXPECT_EQ(expected.columns, actual.columns);
    EXPECT_EQ(expected.keywords, actual.keywords);
    EXPECT_EQ(expected.cmyk, actual.cmyk);
    EXPECT_EQ(expected.lab, actual.lab);
    EXPECT_EQ(expected.dataFormatLine, actual.dataFormatLine);
}

TEST(ChartLineEnds, CrLfLfAndCrOnlyChartsReadAlike) {
    const auto lines = ChartLines();
    const std::string crOnly = JoinLines(lines, "\r");
    // A chart without any LF is read with CR as the line end only when its text
    // before the (missing) first LF is longer than one 1023-character line.
    ASSERT_GT(crOnly.size(), 1023u);

    const ChartView lf = ReadChart(JoinLines(lines, "\n"));
    // The LF chart as its text says.
    ASSERT_EQ(0, lf.result);
    EXPECT_EQ(kChartSets, lf.patchCount);
    EXPECT_EQ(10, lf.strips);
    EXPECT_EQ(3, lf.columns);
    // Tokens of a header value are each followed by one blank.
    EXPECT_EQ("\"Platform test\" ", lf.keywords.at("ORIGINATOR"));
    ASSERT_EQ(static_cast<std::size_t>(kChartSets), lf.cmyk.size());
    EXPECT_EQ((std::array<double, 4>{100, 0, 0, 0}), lf.cmyk[1]);
    // Row 7: 5 + (7 % 19) * 5, 5 + (7 % 17) * 5, 5 + (7 % 13) * 5, 5 + (7 % 7) * 5.
    EXPECT_EQ((std::array<double, 4>{40, 40, 40, 5}), lf.cmyk[6]);
    // Row 30: 5 + 11 * 5, 5 + 13 * 5, 5 + 4 * 5, 5 + 2 * 5.
    EXPECT_EQ((std::array<double, 4>{60, 70, 25, 15}), lf.cmyk[29]);
    ASSERT_EQ(static_cast<std::size_t>(kChartSets), lf.lab.size());
    EXPECT_EQ((std::array<double, 3>{27.5, 7, -7}), lf.lab[6]);

    ExpectSameChart(lf, ReadChart(JoinLines(lines, "\r\n")), "CR LF");
    ExpectSameChart(lf, ReadChart(crOnly), "CR only");
}

TEST(ChartLineEnds, CrLfChartKeepsNoCarriageReturnInWhatItCaptures) {
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\r\n"));
    auto readerWriter = NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));

    // Device-control lines are kept whole (blanks and tabs included) but without
    // the CR of their line end; written back, each gets one native line end.
    const auto sequence = dir.file("sequence.txt");
    ASSERT_EQ(0, readerWriter->WriteDeviceControlSequence(sequence.string()));
    const std::string end = platform_test::NativeLineEnd();
    EXPECT_EQ("\tSET SPEED 2" + end + "MOVE  TO 10 20" + end, test_support::ReadBytes(sequence));

    for (const auto& [key, value] : readerWriter->GetKeywords()) {
        EXPECT_EQ(std::string::npos, (key + value).find('\r')) << key;
    }
    EXPECT_EQ(std::string::npos, readerWriter->GetDataFormatLine().find('\r'));
}

TEST(ChartLineEnds, ControlZInsideAChartDoesNotEndIt) {
    // A Ctrl-Z byte ends a file read in the C runtime's Windows text mode; a
    // chart must be read to its real end whatever bytes its header holds.
    auto lines = ChartLines();
    lines.insert(lines.begin() + 1, "COMMENT\tstop\x1Ahere");
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(lines, "\r\n"));
    auto readerWriter = NewReaderWriter();
    EXPECT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));
    EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());
    EXPECT_EQ("stop\x1Ahere ", readerWriter->GetKeywordValue("COMMENT"));
}

} // namespace
