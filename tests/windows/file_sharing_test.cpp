// A chart that another program holds open can still be read. Windows decides
// this by the share modes of every open handle; other systems do not lock files
// this way.
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#define WIN32_LEAN_AND_MEAN
#include <windows.h>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

// Two handles on one file coexist only when each one's share mode admits the
// other's access: a read while another handle has the chart open for reading
// and writing shows that the library shares both, a read while another denies
// writing that the library asks for no write access.
TEST(FileSharing, ChartHeldElsewhereIsReadUnlessHeldExclusively) {
    struct Case {
        const char* holder;
        DWORD access;
        DWORD share;
        int expected;
    };
    const Case cases[] = {
        {"reading and writing, sharing both", GENERIC_READ | GENERIC_WRITE,
         FILE_SHARE_READ | FILE_SHARE_WRITE, 0},
        {"reading, sharing reading only", GENERIC_READ, FILE_SHARE_READ, 0},
        {"reading, sharing nothing", GENERIC_READ, 0, 3},
    };
    test_support::TempDir dir;
    const auto chart = dir.write("chart.txt", platform_test::ChartText("\r\n"));
    for (const auto& held : cases) {
        SCOPED_TRACE(held.holder);
        // The chart held open by "another program".
        const HANDLE file = CreateFileW(chart.wstring().c_str(), held.access, held.share, nullptr,
                                        OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
        ASSERT_NE(INVALID_HANDLE_VALUE, file);
        EXPECT_EQ(held.expected,
                  platform_test::NewReaderWriter()->ReadChartFile(test_support::Wide(chart)));
        CloseHandle(file);
    }
}

} // namespace

#endif // _WIN32
