// The library used across its DLL boundary, as a host uses it: objects made in
// the library are used and deleted by the host, values the library allocates
// are freed by the host, and a standard exception thrown inside reaches the
// host as that exception (each module carries its own copy of the runtime).
#include <map>
#include <stdexcept>
#include <string>

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

TEST(LibraryBoundary, ObjectsAndValuesCrossTheBoundary) {
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\r\n"));
    auto first = NewReaderWriter();
    auto second = NewReaderWriter();
    ASSERT_TRUE(first && second);
    ASSERT_NE(first.get(), second.get());
    ASSERT_EQ(0, first->ReadChartFile(Wide(chart)));
    ASSERT_EQ(0, second->ReadChartFile(Wide(chart)));
    first.reset(); // deleted through the base class, inside the library

    int result = -1;
    const CColorPatch patch = second->GetPatch(2, result);
    ASSERT_EQ(0, result);
    EXPECT_EQ(100, patch.GetCMYK().c);
    CColorPatch copy;
    copy = patch;
    EXPECT_EQ(100, copy.GetCMYK().c);

    const std::map<std::string, std::string> keywords = second->GetKeywords();
    EXPECT_EQ(1u, keywords.count("CGATS.17"));
    EXPECT_EQ(static_cast<std::size_t>(kChartSets), second->GetPatchList().size());
}

TEST(LibraryBoundary, ConversionErrorReachesTheHostAsTheStandardException) {
    // A strip layout keyword without a number: the whole-number conversion
    // throws its invalid-argument exception out of ReadChartFile.
    auto lines = ChartLines();
    for (auto& line : lines) {
        if (line.rfind("NUMBER_OF_COLS", 0) == 0) {
            line = "NUMBER_OF_COLS\tmany";
        }
    }
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(lines, "\n"));
    auto readerWriter = NewReaderWriter();
    try {
        readerWriter->ReadChartFile(Wide(chart));
        ADD_FAILURE() << "no exception";
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ("invalid stol argument", error.what());
    } catch (...) {
        ADD_FAILURE() << "another exception than std::invalid_argument";
    }
}

} // namespace
