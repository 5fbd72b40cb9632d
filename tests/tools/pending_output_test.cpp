// Output files through their temporary file, on every platform (the command
// tests cover modes, links and users on POSIX).
#include <gtest/gtest.h>

#include <filesystem>

#include "file_paths.h"
#include "temp_files.h"
#include "tool_error.h"

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

#if !defined(_WIN32)
// The output checked at the start is the one committed to: when its name leads
// elsewhere by then, nothing is written, neither there nor to the file checked.
// (POSIX only: on Windows the check is not made.)
TEST(PendingOutput, RefusesWhenTheOutputWasReplacedOrRemovedMeanwhile) {
    enum class Change { Replaced, MovedAway, Removed };
    const struct {
        const char* what;
        Change change;
        std::string output; // what the output's name holds afterwards
        std::size_t entries;
    } cases[] = {
        {"replaced", Change::Replaced, "other\n", 1},
        {"moved away", Change::MovedAway, "", 1},
        {"removed", Change::Removed, "", 0},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.what);
        const test_support::TempDir dir;
        const fs::path output = dir.write("out.it8", "old\n");
        {
            PendingOutput pending(output.u8string());
            WriteBytes(fs::u8path(pending.TemporaryPath()), "new\n");
            if (c.change == Change::Replaced) {
                fs::rename(dir.write("other", "other\n"), output);
            } else if (c.change == Change::MovedAway) {
                fs::rename(output, dir.file("moved"));
            } else {
                fs::remove(output);
            }
            std::string message;
            try {
                pending.Commit();
            } catch (const ChartError& error) {
                message = error.what();
            }
            EXPECT_NE(message.find("it was replaced or removed"), std::string::npos) << message;
        }
        EXPECT_EQ(ReadBytes(output), c.output);
        EXPECT_EQ(EntryCount(dir.path()), c.entries);
        if (c.change == Change::MovedAway) {
            EXPECT_EQ(ReadBytes(dir.file("moved")), "old\n");
        }
    }
}
#endif

} // namespace
} // namespace swatchlog
