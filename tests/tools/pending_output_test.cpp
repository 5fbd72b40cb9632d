// Output files through their temporary file, on every platform (the command
// tests cover modes, links and users on POSIX).
#include <gtest/gtest.h>

#include <filesystem>

#include "file_paths.h"
#include "temp_files.h"

namespace swatchlog {
namespace {

namespace fs = std::filesystem;
using test_support::ReadBytes;
using test_support::WriteBytes;

std::size_t EntryCount(const fs::path& folder) {
    return static_cast<std::size_t>(
        std::distance(fs::directory_iterator(folder), fs::directory_iterator()));
}

TEST(PendingOutput, AppearsOnlyOnCommitAndAnExistingOneKeepsItsHardLinks) {
    const test_support::TempDir dir;
    const std::string output = dir.file("out.it8").u8string();
    for (const bool commit : {false, true}) {
        PendingOutput pending(output);
        WriteBytes(fs::u8path(pending.TemporaryPath()), "new\n");
        if (commit) {
            pending.Commit();
        }
    }
    EXPECT_EQ(ReadBytes(dir.file("out.it8")), "new\n");
    EXPECT_EQ(EntryCount(dir.path()), 1u);

    std::error_code ec;
    fs::create_hard_link(dir.file("out.it8"), dir.file("second name"), ec);
    if (ec) {
        GTEST_SKIP() << "no hard links here: " << ec.message();
    }
    for (const std::string& text : {std::string(70000, 'n'), std::string("a\n")}) {
        PendingOutput pending(output);
        WriteBytes(fs::u8path(pending.TemporaryPath()), text);
        pending.Commit();
        EXPECT_EQ(ReadBytes(dir.file("second name")), text);
        EXPECT_EQ(EntryCount(dir.path()), 2u);
    }
}

} // namespace
} // namespace swatchlog
