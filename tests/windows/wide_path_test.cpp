// Charts are opened by their wide-character path: names outside any narrow
// code page (Greek, CJK, a character beyond the 16-bit range) reach the file
// system unchanged, for reading and for writing.
#include <filesystem>
#include <string>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::ChartLines;
using platform_test::JoinLines;
using platform_test::kChartSets;
using platform_test::NewReaderWriter;
using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using test_support::WriteBytes;

// "Farbtafel_äöü_Ωμέτρο_測定_" and U+1F3A8 (a surrogate pair in UTF-16).
const char* const kUtf8Stem =
    u8"Farbtafel_\u00e4\u00f6\u00fc_\u03a9\u03bc\u03ad\u03c4\u03c1\u03bf_\u6e2c\u5b9a_\U0001F3A8";

std::filesystem::path NonAsciiFile(const TempDir& dir, const std::string& suffix) {
    return dir.path() / std::filesystem::u8path(kUtf8Stem + suffix);
}

TEST(WidePaths, ChartWithNonAsciiNameIsRead) {
    TempDir dir;
    const auto chart = NonAsciiFile(dir, ".txt");
    WriteBytes(chart, JoinLines(ChartLines(), "\r\n"));
    ASSERT_TRUE(std::filesystem::exists(chart));

    auto readerWriter = NewReaderWriter();
    EXPECT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));
    EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());
    // A file of a similar name that does not exist cannot be opened.
    EXPECT_EQ(3, readerWriter->ReadChartFile(Wide(NonAsciiFile(dir, "-missing.txt"))));
}

TEST(WidePaths, WritersReadAndCreateNonAsciiNames) {
    TempDir dir;
    const auto source = NonAsciiFile(dir, ".txt");
    WriteBytes(source, JoinLines(ChartLines(), "\n"));

    auto readerWriter = NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(source)));

    // A new chart file under a non-ASCII name.
    const auto newChart = NonAsciiFile(dir, "-new.txt");
    readerWriter->SetCMYKList({tagCMYK{100, 0, 0, 0}});
    EXPECT_EQ(0, readerWriter->WriteChartFile(L"", Wide(newChart), false));
    EXPECT_NE(std::string::npos, ReadBytes(newChart).find("CMYK_C"));

    // A copy of the non-ASCII source under another non-ASCII name.
    const auto copy = NonAsciiFile(dir, "-copy.txt");
    EXPECT_EQ(0, readerWriter->InsertKeywords(Wide(source), Wide(copy), {}));
    EXPECT_NE(std::string::npos, ReadBytes(copy).find("NUMBER_OF_SETS"));

    // Exactly the three named files exist: no file was created under a
    // mangled name.
    int files = 0;
    for (const auto& entry : std::filesystem::directory_iterator(dir.path())) {
        const auto name = entry.path().filename();
        EXPECT_TRUE(name == source.filename() || name == newChart.filename() ||
                    name == copy.filename())
            << entry.path().u8string();
        ++files;
    }
    EXPECT_EQ(3, files);
}

} // namespace
