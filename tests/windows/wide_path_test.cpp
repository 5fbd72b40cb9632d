// Charts are opened by their wide-character path: names outside any narrow
// code page reach the file system unchanged, for reading and for writing.
#include <filesystem>
#include <iterator>
#include <string>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using test_support::Wide;

TEST(Paths, NonAsciiNamesAreReadAndWritten) {
    test_support::TempDir dir;
    // "Farbtafel_äöü_Ωμέτρο_測定_" and U+1F3A8 (a surrogate pair in UTF-16).
    const auto named = [&dir](const char* suffix) {
        return dir.path() /
               std::filesystem::u8path(std::string(u8"Farbtafel_\u00e4\u00f6\u00fc_"
                                                   u8"\u03a9\u03bc\u03ad\u03c4\u03c1"
                                                   u8"\u03bf_\u6e2c\u5b9a_\U0001F3A8") +
                                       suffix);
    };
    const auto source = named(".txt");
    test_support::WriteBytes(source, platform_test::ChartText("\r\n"));
    auto readerWriter = platform_test::NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(source)));
    EXPECT_EQ(platform_test::kChartSets, readerWriter->GetPatchCount());
    const auto copy = named("-copy.txt");
    EXPECT_EQ(0, readerWriter->InsertKeywords(Wide(source), Wide(copy), {}));
    EXPECT_NE(std::string::npos, test_support::ReadBytes(copy).find("NUMBER_OF_SETS"));

    // Nothing else was created, for instance under a mangled name.
    EXPECT_EQ(2, std::distance(std::filesystem::directory_iterator(dir.path()),
                               std::filesystem::directory_iterator()));
}

} // namespace
