// Opening chart files, line ends, long lines and NUL characters.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "chart_text.h"
#include "it8/read/chart_line_reader.h"

using namespace reader_test;
using test_support::TempDir;
using test_support::Wide;
using Strings = std::vector<std::string>;

namespace {

Strings AllLines(std::string text) {
    it8::ChartLineReader reader;
    reader.Open(text, it8::HasCrLineEnds(text));
    Strings lines;
    it8::LineSpan line;
    while (reader.ReadLine(line)) {
        lines.emplace_back(line.data, line.size);
    }
    return lines;
}

} // namespace

TEST(ChartLineReader, LineEndsAndNulCharacters) {
    // LF ends (the first break is an LF or CR LF): a CR right before the LF is
    // part of the line end, any other CR stays; the last line needs no line end.
    EXPECT_EQ(AllLines("a\r\nb\n\nc"), (Strings{"a", "b", "", "c"}));
    EXPECT_EQ(AllLines("x\na\r\r\nb\rc\n"), (Strings{"x", "a\r", "b\rc"}));
    // CR ends (the first break is a lone CR): an LF right after a CR is part of it.
    EXPECT_EQ(AllLines("a\rb\r\nc\r\rd"), (Strings{"a", "b", "c", "", "d"}));
    // A line ends at its first NUL.
    EXPECT_EQ(AllLines(std::string("ab\0cd\nef", 8)), (Strings{"ab", "ef"}));
    EXPECT_EQ(AllLines(""), Strings{});
}

TEST(ReadChartFile, PathsThatCannotBeRead) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, CmykLabChart()), 0);
    EXPECT_EQ(reader.ReadChartFile(L""), 4);
    EXPECT_EQ(reader.ReadChartFile(Wide(dir.file("missing.txt"))), 3);
    EXPECT_EQ(reader.ReadChartFile(Wide(dir.path())), 3);
    // A failed open leaves the chart read before untouched.
    EXPECT_EQ(reader.GetPatchCount(), 2);
    EXPECT_EQ(reader.CanReadFile(Wide(dir.file("missing.txt"))), 1);

    const auto locked = dir.write("locked.txt", CmykLabChart());
    std::filesystem::permissions(locked, std::filesystem::perms::none);
    if (!std::ifstream(locked).is_open()) { // a privileged user reads it anyway
        EXPECT_EQ(reader.ReadChartFile(Wide(locked)), 3);
    }
    EXPECT_EQ(ReadText(reader, dir, CmykLabChart(), "Farbkarte \xC3\xA4\xC3\xB6 \xE6\xB5\x8B.it8"),
              0);
}

TEST(ReadChartFile, LfCrLfAndCrOnlyFilesReadAlike) {
    TempDir dir;
    CIT8ReaderWriter lf;
    ASSERT_EQ(ReadText(lf, dir, CmykLabChart("\n")), 0);
    // The CR-only text is shorter than 1023 characters and has no LF at all.
    std::string longCr;
    for (int i = 0; i < 100; ++i) {
        longCr += "KEYWORD_" + std::to_string(i) + " \"some text\"\r";
    }
    for (const std::string& text :
         {CmykLabChart("\r\n"), CmykLabChart("\r"), longCr + CmykLabChart("\r")}) {
        CIT8ReaderWriter other;
        ASSERT_EQ(ReadText(other, dir, text), 0);
        EXPECT_EQ(other.GetDataFormatLine(), lf.GetDataFormatLine());
        EXPECT_EQ(other.GetKeywordValue("ORIGINATOR"), "\"Chart maker\" ");
        ASSERT_EQ(other.GetPatchCount(), 2);
        EXPECT_EQ(PatchOf(other, 2).GetLabel(), "A2");
        EXPECT_EQ(PatchOf(other, 2).GetLAB().b, -50.0);
    }
}

TEST(ReadChartFile, LongLinesAndNulCharacters) {
    TempDir dir;
    CIT8ReaderWriter reader;
    const std::string exact(1023 - 8, 'y'); // "COMMENT " + value: 1023 characters
    const std::string longValue(3000, 'x');
    ASSERT_EQ(
        ReadText(reader, dir, Lines({"COMMENT " + exact, "LONG " + longValue}) + CmykLabChart()),
        0);
    EXPECT_EQ(reader.GetKeywordValue("COMMENT"), exact + " ");
    EXPECT_EQ(reader.GetKeywordValue("LONG"), longValue + " ");
    // The NUL hides the third value of the row.
    std::string text = Chart("SAMPLE_ID CMYK_C XYZ_X", {"1 2 3"});
    text[text.find("2 3") + 1] = '\0';
    EXPECT_EQ(ReadText(reader, dir, text), 8);
}
