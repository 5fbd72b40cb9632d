// Input an editor or an attacker may hand the reader: devices and pipes, a
// byte-order mark, stray CRs, overlong field names and formats whose names
// outnumber a row's values.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_text.h"
#include "color_patch_probe.h"

#if !defined(_WIN32)
#include <sys/stat.h>
#endif

using reader_test::Chart;
using reader_test::CmykLabChart;
using reader_test::Lines;
using reader_test::PatchOf;
using reader_test::ReadText;
using test_support::TempDir;
using test_support::Wide;

TEST(HostileInput, DevicesAndPipesAreRefusedWithoutReading) {
    TempDir dir;
#if defined(_WIN32)
    const std::vector<std::wstring> paths = {L"NUL"};
#else
    const auto pipe = dir.file("pipe");
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0); // no writer: a blocking open would hang
    const std::vector<std::wstring> paths = {L"/dev/zero", Wide(pipe)};
#endif
    for (const std::wstring& path : paths) {
        CIT8ReaderWriter reader;
        EXPECT_EQ(reader.ReadChartFile(path), 3);
        std::vector<std::string> lines;
        EXPECT_EQ(CIT8ReaderWriter::ReadFileLines(path, lines), 21);
        EXPECT_EQ(reader.InsertKeywords(path, Wide(dir.file("out.txt")), {}), 21);
    }
}

TEST(HostileInput, AByteOrderMarkIsSkipped) {
    TempDir dir;
    // NUMBER_OF_SETS first: with the mark kept it would be no keyword, and the
    // data block would have no set count (9).
    const std::string chart = Chart("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 10 20 30 40"});
    CIT8ReaderWriter plain;
    CIT8ReaderWriter marked;
    ASSERT_EQ(ReadText(plain, dir, chart), 0);
    ASSERT_EQ(ReadText(marked, dir, "\xEF\xBB\xBF" + chart, "marked.txt"), 0);
    EXPECT_EQ(marked.GetKeywordValue("NUMBER_OF_SETS"), "1 ");
    EXPECT_EQ(PatchOf(marked, 1).GetCMYK().k, 40.0);
    EXPECT_EQ(ColorPatchProbe::missingMask(PatchOf(marked, 1)),
              ColorPatchProbe::missingMask(PatchOf(plain, 1)));

    std::vector<std::string> lines;
    ASSERT_EQ(CIT8ReaderWriter::ReadFileLines(Wide(dir.file("marked.txt")), lines), 0);
    EXPECT_EQ(lines.front(), "NUMBER_OF_SETS 1");
}

TEST(HostileInput, TheFirstLineDecidesTheLineEnds) {
    TempDir dir;
    const std::string chart = CmykLabChart("\n");
    struct Case {
        const char* what;
        std::string text;
    };
    const Case cases[] = {
        // A CR inside a short first line separates tokens; the lines end at LF.
        {"stray CR in line 1", "ORIGINATOR \"a\rb\"\n" + chart},
        {"stray CR, line 1 of 1023", "COMMENT \r" + std::string(1014, 'c') + "\n" + chart},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.what);
        CIT8ReaderWriter reader;
        ASSERT_EQ(ReadText(reader, dir, c.text), 0);
        EXPECT_EQ(reader.GetKeywordValue("ORIGINATOR"), "\"Chart maker\" ");
        EXPECT_EQ(reader.GetPatchCount(), 2);
    }
}

TEST(HostileInput, FieldNamesThatEveryPatchWouldCopyAreBounded) {
    TempDir dir;
    // Spectral names of 1023 and 1024 characters; the wavelength is still 380.
    const auto name = [](std::size_t length) {
        return "SPECTRAL_NM_" + std::string(length - 15, '0') + "380";
    };
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, Chart("SAMPLE_ID " + name(1023), {"1 0.5", "2 0.25"})), 0);
    EXPECT_EQ(PatchOf(reader, 2).GetSpectralData().begin()->first.size(), 1023u);
    EXPECT_EQ(ReadText(reader, dir, Chart("SAMPLE_ID " + name(1024), {"1 0.5"})), 5);
    EXPECT_EQ(ReadText(reader, dir, Chart("SAMPLE_ID 6CLR_" + std::string(1019, 'X'), {"1 5"})), 5);

    // A second format block maps two more spectral names onto the first two
    // columns; NUMBER_OF_FIELDS then lets rows of two values through. Each patch
    // would copy three names from two values.
    const std::string overlapping = Lines(
        {"NUMBER_OF_SETS 1", "BEGIN_DATA_FORMAT", "SAMPLE_ID SPECTRAL_NM_380", "END_DATA_FORMAT",
         "NUMBER_OF_FIELDS 4", "BEGIN_DATA_FORMAT", "SPECTRAL_NM_390 SPECTRAL_NM_400",
         "END_DATA_FORMAT", "NUMBER_OF_FIELDS 2", "BEGIN_DATA", "0.5 0.6", "END_DATA"});
    EXPECT_EQ(ReadText(reader, dir, overlapping), 8);
    EXPECT_EQ(reader.GetPatchCount(), 0);
}
