// The library used across its DLL boundary, as a host uses it: objects made in
// the library are used and deleted by the host, values it allocates are freed
// by the host, and a standard exception thrown inside reaches the host as that
// exception (each module carries its own copy of the runtime).
#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

TEST(LibraryBoundary, ObjectsValuesAndExceptionsCrossTheBoundary) {
    test_support::TempDir dir;
    std::string text = platform_test::ChartText("\n");
    const auto chart = test_support::Wide(dir.write("chart.txt", text));
    auto readerWriter = platform_test::NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(chart));
    int result = -1;
    EXPECT_EQ(100, readerWriter->GetPatch(2, result).GetCMYK().c);
    EXPECT_EQ(1u, readerWriter->GetKeywords().count("CGATS.17"));
    EXPECT_EQ(static_cast<std::size_t>(platform_test::kChartSets),
              readerWriter->GetPatchList().size());

    // A layout keyword without a number: the whole-number conversion throws
    // its invalid-argument exception out of ReadChartFile.
    text.replace(text.find("NUMBER_OF_COLS\t3"), 16, "NUMBER_OF_COLS\tmany");
    const auto bad = test_support::Wide(dir.write("bad.txt", text));
    try {
        readerWriter->ReadChartFile(bad);
        ADD_FAILURE() << "no exception";
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ("invalid stol argument", error.what());
    } catch (...) {
        ADD_FAILURE() << "another exception than std::invalid_argument";
    }
    readerWriter.reset(); // deleted through the base class, inside the library
}

} // namespace
