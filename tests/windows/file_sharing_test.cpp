// A chart that another program holds open can still be read, and a chart we
// read or write stays open to other readers. Windows decides this by the share
// modes of every open handle; other systems do not lock files this way.
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#define WIN32_LEAN_AND_MEAN
#include <windows.h>

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

// A file handle held open by "another program" for the life of the object.
class HeldFile {
public:
    HeldFile(const std::filesystem::path& path, DWORD access, DWORD share)
        : handle_(CreateFileW(path.wstring().c_str(), access, share, nullptr, OPEN_EXISTING,
                              FILE_ATTRIBUTE_NORMAL, nullptr)) {}
    ~HeldFile() {
        if (IsOpen()) {
            CloseHandle(handle_);
        }
    }
    HeldFile(const HeldFile&) = delete;
    HeldFile& operator=(const HeldFile&) = delete;
    bool IsOpen() const { return handle_ != INVALID_HANDLE_VALUE; }

private:
    HANDLE handle_;
};

// The sharing the C runtime gives every file it opens (fopen, std::fstream):
// others may read and write, but not delete or rename the file.
constexpr DWORD kShareReadWrite = FILE_SHARE_READ | FILE_SHARE_WRITE;

// Two handles on one file coexist only when each one's share mode admits the
// other's access. So a read that succeeds while we hold the chart open for
// reading and writing shows that the library shares reading and writing; the
// library's own open then also lets any later reader in.
TEST(FileSharing, ChartOpenElsewhereForReadingAndWritingIsRead) {
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\r\n"));
    HeldFile held(chart, GENERIC_READ | GENERIC_WRITE, kShareReadWrite);
    ASSERT_TRUE(held.IsOpen());

    auto readerWriter = NewReaderWriter();
    EXPECT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));
    EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());

    // Writers read their source the same way.
    const auto target = dir.file("target.txt");
    EXPECT_EQ(0, readerWriter->InsertKeywords(Wide(chart), Wide(target), {}));
    EXPECT_EQ(0, readerWriter->WriteMeasurementFile(Wide(chart), Wide(target)));
}

TEST(FileSharing, ChartOpenElsewhereWithWritingDeniedIsRead) {
    // A reader that lets others read only: the library must not ask for write
    // access to a chart it reads.
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\n"));
    HeldFile held(chart, GENERIC_READ, FILE_SHARE_READ);
    ASSERT_TRUE(held.IsOpen());

    auto readerWriter = NewReaderWriter();
    EXPECT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));
    EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());
}

TEST(FileSharing, ChartHeldExclusivelyCannotBeOpened) {
    // The counter-check of the two tests above: with no sharing at all the open
    // fails (3), and the chart read before stays in the store.
    TempDir dir;
    const auto chart = dir.write("chart.txt", JoinLines(ChartLines(), "\n"));
    auto readerWriter = NewReaderWriter();
    ASSERT_EQ(0, readerWriter->ReadChartFile(Wide(chart)));

    HeldFile held(chart, GENERIC_READ, 0);
    ASSERT_TRUE(held.IsOpen());
    EXPECT_EQ(3, readerWriter->ReadChartFile(Wide(chart)));
    EXPECT_EQ(kChartSets, readerWriter->GetPatchCount());
}

TEST(FileSharing, TargetOpenElsewhereForReadingIsWritten) {
    // Writers create or truncate their target without exclusive sharing, so a
    // viewer that has the old file open as the C runtime opens files (sharing
    // reading and writing, not deletion) does not stop them.
    TempDir dir;
    const auto target = dir.write("target.txt", "old content\n");
    HeldFile held(target, GENERIC_READ, kShareReadWrite);
    ASSERT_TRUE(held.IsOpen());

    auto readerWriter = NewReaderWriter();
    readerWriter->SetCMYKList({tagCMYK{100, 0, 0, 0}});
    EXPECT_EQ(0, readerWriter->WriteChartFile(L"", Wide(target), false));
    const std::string written = ReadBytes(target);
    EXPECT_EQ(std::string::npos, written.find("old content"));
    EXPECT_NE(std::string::npos, written.find("CMYK_C"));
}

} // namespace

#endif // _WIN32
