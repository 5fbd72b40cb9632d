// Every writer puts the platform's line end on disk: CR LF on Windows, LF
// elsewhere, whatever line ends its source had and even where one output entry
// holds several lines.
#include <functional>
#include <regex>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::kChartSets;
using platform_test::kNativeLineEnd;
using Write =
    std::function<int(CSwatchlogBase&, const std::wstring& source, const std::wstring& target)>;

TEST(WriterLineEnds, EveryWriterPutsTheNativeLineEndOnDisk) {
    const std::vector<std::pair<const char*, Write>> writers = {
        {"WriteChartFile, new file",
         [](auto& rw, auto&, auto& out) {
             // No keyword list: the first entry is "IT8" and NUMBER_OF_FIELDS in one.
             rw.SetCMYKList(std::vector<tagCMYK>(kChartSets, tagCMYK{100, 0, 0, 0}));
             return rw.WriteChartFile(L"", out, false);
         }},
        {"WriteChartFile, appended columns",
         [](auto& rw, auto& in, auto& out) { return rw.WriteChartFile(in, out, true); }},
        {"AppendColumnsWithWhitePoint", // its white-point entry holds several lines
         [](auto& rw, auto& in, auto& out) {
             return rw.AppendColumnsWithWhitePoint(in, out, CColorPatch(), CColorPatch());
         }},
        {"WriteMeasurementFile",
         [](auto& rw, auto& in, auto& out) { return rw.WriteMeasurementFile(in, out); }},
        {"AppendMissingColumns",
         [](auto& rw, auto& in, auto& out) {
             rw.SetRGBList(std::vector<tagRGB>(kChartSets, tagRGB{1, 2, 3}));
             rw.AddKeyword({"CREATED", "\"today\""});
             return rw.AppendMissingColumns(in, out, false);
         }},
        {"InsertKeywords",
         [](auto& rw, auto& in, auto& out) {
             return rw.InsertKeywords(in, out, {{"CREATED", "\"today\""}});
         }},
        {"WriteTargetFile",
         [](auto& rw, auto& in, auto& out) {
             rw.AddKeyword({"CREATED", "\"today\""});
             return rw.WriteTargetFile(in, out);
         }},
    };
    // The device-control writer is checked with the line ends read.
    for (const std::string sourceLineEnd : {"\n", "\r\n"}) {
        SCOPED_TRACE(sourceLineEnd == "\n" ? "LF source" : "CR LF source");
        test_support::TempDir dir;
        const auto source =
            test_support::Wide(dir.write("source.txt", platform_test::ChartText(sourceLineEnd)));
        const auto target = dir.file("target.txt");
        for (const auto& [name, write] : writers) {
            SCOPED_TRACE(name);
            auto readerWriter = platform_test::NewReaderWriter();
            ASSERT_EQ(0, readerWriter->ReadChartFile(source));
            readerWriter->SetXYZList(std::vector<tagXYZ>(kChartSets, tagXYZ{10, 20, 30}));
            ASSERT_EQ(0, write(*readerWriter, source, test_support::Wide(target)));
            const std::string written = test_support::ReadBytes(target);
            EXPECT_EQ(kNativeLineEnd, written.substr(written.size() - kNativeLineEnd.size()));
            // Without its native line ends, a CR or LF left over is a foreign one.
            EXPECT_EQ(
                std::string::npos,
                std::regex_replace(written, std::regex(kNativeLineEnd), "").find_first_of("\r\n"));
            EXPECT_NE(std::string::npos, written.find("END_DATA")) << "output incomplete";
        }
    }
}

} // namespace
