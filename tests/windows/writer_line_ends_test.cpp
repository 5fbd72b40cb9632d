// Every writer puts the platform's line end on disk: CR LF on Windows, LF
// elsewhere, whatever line ends its source file had and even where one output
// entry holds several lines.
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::ChartLines;
using platform_test::HasOnlyNativeLineEnds;
using platform_test::JoinLines;
using platform_test::kChartSets;
using platform_test::NewReaderWriter;
using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;

struct Writer {
    const char* name;
    // Writes `target` with a reader-writer that has read `source`; answers the result.
    std::function<int(CSwatchlogBase&, const std::wstring& source, const std::wstring& target)>
        write;
};

std::vector<tagXYZ> XYZList() {
    std::vector<tagXYZ> list(kChartSets);
    for (int i = 0; i < kChartSets; ++i) {
        list[i].x = 10 + i;
        list[i].y = 20 + i;
        list[i].z = 30 + i;
    }
    return list;
}

std::vector<tagRGB> RGBList() {
    std::vector<tagRGB> list(kChartSets);
    for (int i = 0; i < kChartSets; ++i) {
        list[i].r = i;
        list[i].g = 2 * i;
        list[i].b = 3 * i;
    }
    return list;
}

std::vector<Writer> AllWriters() {
    return {
        {"WriteChartFile, new file",
         [](CSwatchlogBase& rw, const std::wstring&, const std::wstring& target) {
             // No keyword list: the first entry is "IT8" and NUMBER_OF_FIELDS in one.
             rw.SetSampleNameList({"A", "B"});
             rw.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 0, 0}});
             return rw.WriteChartFile(L"", target, false);
         }},
        {"WriteChartFile, appended columns",
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             rw.SetXYZList(XYZList());
             return rw.WriteChartFile(source, target, true);
         }},
        {"AppendColumnsWithWhitePoint",
         // The white-point entry holds several lines in one.
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             rw.SetXYZList(XYZList());
             return rw.AppendColumnsWithWhitePoint(source, target, CColorPatch(), CColorPatch());
         }},
        {"WriteMeasurementFile",
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             rw.SetXYZList(XYZList());
             return rw.WriteMeasurementFile(source, target);
         }},
        {"AppendMissingColumns",
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             rw.SetRGBList(RGBList());
             rw.AddKeyword({"CREATED", "\"today\""});
             return rw.AppendMissingColumns(source, target, false);
         }},
        {"InsertKeywords",
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             return rw.InsertKeywords(source, target, {{"CREATED", "\"today\""}});
         }},
        {"WriteTargetFile",
         [](CSwatchlogBase& rw, const std::wstring& source, const std::wstring& target) {
             rw.AddKeyword({"CREATED", "\"today\""});
             return rw.WriteTargetFile(source, target);
         }},
    };
}

TEST(WriterLineEnds, EveryWriterPutsTheNativeLineEndOnDisk) {
    for (const std::string sourceLineEnd : {"\n", "\r\n"}) {
        SCOPED_TRACE(sourceLineEnd == "\n" ? "LF source" : "CR LF source");
        TempDir dir;
        const auto source = dir.write("source.txt", JoinLines(ChartLines(), sourceLineEnd));
        for (const auto& writer : AllWriters()) {
            SCOPED_TRACE(writer.name);
            auto readerWriter = NewReaderWriter();
            ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(source)));
            const auto target = dir.file("target.txt");
            ASSERT_EQ(0, writer.write(*readerWriter, Wide(source), Wide(target)));
            const std::string written = ReadBytes(target);
            EXPECT_TRUE(HasOnlyNativeLineEnds(written));
            EXPECT_NE(std::string::npos, written.find("END_DATA")) << "output incomplete";
        }

        // The device-control writer takes a narrow path.
        auto readerWriter = NewReaderWriter();
        ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(source)));
        const auto sequence = dir.file("sequence.txt");
        ASSERT_EQ(0, readerWriter->WriteDeviceControlSequence(sequence.string()));
        EXPECT_TRUE(HasOnlyNativeLineEnds(ReadBytes(sequence))) << "WriteDeviceControlSequence";
    }
}

TEST(WriterLineEnds, WrittenChartReadsBackWithItsPatches) {
    // A chart written here, with this platform's line ends, is read again as it
    // was written: two sets with the CMYK values handed in.
    TempDir dir;
    const auto target = dir.file("new.txt");
    auto writer = NewReaderWriter();
    writer->SetSampleNameList({"A", "B"});
    writer->SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 50, 0}});
    ASSERT_EQ(0, writer->WriteChartFile(L"", Wide(target), false));

    auto reader = NewReaderWriter();
    ASSERT_EQ(0, reader->ReadChartFile(Wide(target)));
    std::vector<tagCMYK> cmyk;
    ASSERT_EQ(0, reader->CollectCMYK(cmyk));
    ASSERT_EQ(2u, cmyk.size());
    EXPECT_EQ(0, cmyk[1].c);
    EXPECT_EQ(100, cmyk[1].m);
    EXPECT_EQ(50, cmyk[1].y);
}

} // namespace
