// The device-control writer takes its path as a narrow string. A narrow path
// that is not UTF-8 (for instance a Windows code-page name) is answered with a
// result code, never with an exception.
#include <string>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using platform_test::ChartLines;
using platform_test::JoinLines;
using platform_test::NewReaderWriter;
using test_support::TempDir;
using test_support::Wide;

TEST(NarrowPaths, DeviceControlPathThatIsNotUtf8GivesAResult) {
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\n"));
    auto readerWriter = NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));

    // 0xE4 is "a umlaut" in the Western European code pages and no UTF-8 at all.
    const std::string path = dir.path().string() + "/sequence_\xE4.txt";
    int result = -1;
    EXPECT_NO_THROW(result = readerWriter->WriteDeviceControlSequence(path));
    EXPECT_TRUE(result == 0 || result == 23) << result;
}

} // namespace
