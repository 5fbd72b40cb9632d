// A chart that another program holds open can still be read, and a target a
// viewer holds open can still be replaced. Windows decides this by the share
// modes of every open handle; other systems do not lock files this way.
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#define WIN32_LEAN_AND_MEAN
#include <windows.h>

#include <filesystem>
#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "platform_chart.h"
#include "temp_files.h"

namespace {

using test_support::Wide;

// A file handle held open by "another program"; empty when the open failed.
struct HandleCloser {
    void operator()(HANDLE handle) const { CloseHandle(handle); }
};
using HeldFile = std::unique_ptr<void, HandleCloser>;
HeldFile Hold(const std::filesystem::path& path, DWORD access, DWORD share) {
    const HANDLE handle = CreateFileW(path.wstring().c_str(), access, share, nullptr, OPEN_EXISTING,
                                      FILE_ATTRIBUTE_NORMAL, nullptr);
    return HeldFile(handle == INVALID_HANDLE_VALUE ? nullptr : handle);
}

// The sharing the C runtime gives every file it opens (fopen, std::fstream).
constexpr DWORD kShareReadWrite = FILE_SHARE_READ | FILE_SHARE_WRITE;

// Two handles on one file coexist only when each one's share mode admits the
// other's access: a read while another handle has the chart open for reading
// and writing shows that the library shares both, a read while another denies
// writing that the library asks for no write access.
TEST(FileSharing, ChartAndTargetHeldElsewhereAreUsedUnlessHeldExclusively) {
    struct Case {
        const char* holder;
        DWORD access;
        DWORD share;
        int expected;
    };
    const Case cases[] = {
        {"reading and writing, sharing both", GENERIC_READ | GENERIC_WRITE, kShareReadWrite, 0},
        {"reading, sharing reading only", GENERIC_READ, FILE_SHARE_READ, 0},
        {"reading, sharing nothing", GENERIC_READ, 0, 3},
    };
    test_support::TempDir dir;
    const auto chart = dir.write("chart.txt", platform_test::ChartText("\r\n"));
    // A viewer holds the writers' target open as the C runtime opens files.
    const auto target = dir.write("target.txt", "old content\n");
    const HeldFile viewer = Hold(target, GENERIC_READ, kShareReadWrite);
    ASSERT_TRUE(viewer);
    for (const auto& held : cases) {
        SCOPED_TRACE(held.holder);
        const HeldFile file = Hold(chart, held.access, held.share);
        ASSERT_TRUE(file);
        auto readerWriter = platform_test::NewReaderWriter();
        EXPECT_EQ(held.expected, readerWriter->ReadChartFile(Wide(chart)));
        if (held.expected == 0) {
            EXPECT_EQ(platform_test::kChartSets, readerWriter->GetPatchCount());
            // Writers read their source the same way and replace a target held open.
            EXPECT_EQ(0, readerWriter->InsertKeywords(Wide(chart), Wide(target), {}));
            EXPECT_EQ(0u, test_support::ReadBytes(target).find("CGATS.17"));
        }
    }
}

} // namespace

#endif // _WIN32
