// A writer replaces its target's content and nothing else: links, owner, mode,
// extended attributes and access lists stay, a target the caller may not write
// is refused, and a failed write leaves no part of the new text behind.
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <string>

#include "it8_write_helper_chart.h"
#include "write_test_support.h"

#if !defined(_WIN32)
#include <grp.h>
#include <pwd.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>
#if defined(__linux__)
#include <sys/xattr.h>
#endif
#endif

namespace fs = std::filesystem;
using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;

namespace {

std::string HelperChartText() {
    std::string text;
    for (const char* line : write_test::kHelperChartLines) {
        text += line;
#if defined(_WIN32)
        text += "\r\n";
#else
        text += "\n";
#endif
    }
    return text;
}

int WriteHelperChart(const fs::path& target) {
    CIT8ReaderWriter chart;
    write_test::FillHelperChart(chart);
    return write_test::WriteNew(chart, target);
}

} // namespace

TEST(TargetIdentity, HardLinksShareTheNewContent) {
    TempDir dir;
    const auto target = dir.write("chart.txt", "old");
    const auto other = dir.file("other name.txt");
    std::error_code ec;
    fs::create_hard_link(target, other, ec);
    if (ec) {
        GTEST_SKIP() << "no hard links here: " << ec.message();
    }
    ASSERT_EQ(WriteHelperChart(target), 0);
    EXPECT_EQ(ReadBytes(other), HelperChartText());
    EXPECT_TRUE(fs::equivalent(target, other));

    // Source and target the same path, written in place.
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.InsertKeywords(Wide(other), Wide(other), {{"ORIGINATOR", "\"lab\""}}), 0);
    // The first line is no CGATS.17 line: the identification, the keyword, then
    // the whole source.
    EXPECT_EQ(ReadBytes(target),
              write_test::FileText({"CGATS.17", "ORIGINATOR\t\"lab\""}) + HelperChartText());
}

#if !defined(_WIN32)

TEST(TargetIdentity, SymbolicLinksAreFollowedAndALoopRefused) {
    TempDir dir;
    const auto real = dir.write("real.txt", "old");
    fs::create_symlink("real.txt", dir.file("link.txt"));
    fs::create_symlink("loop-b.txt", dir.file("loop-a.txt"));
    fs::create_symlink("loop-a.txt", dir.file("loop-b.txt"));

    ASSERT_EQ(WriteHelperChart(dir.file("link.txt")), 0);
    EXPECT_TRUE(fs::is_symlink(dir.file("link.txt")));
    EXPECT_EQ(ReadBytes(real), HelperChartText());

    EXPECT_EQ(WriteHelperChart(dir.file("loop-a.txt")), 23);
    EXPECT_TRUE(fs::is_symlink(dir.file("loop-a.txt")));
    EXPECT_TRUE(fs::is_symlink(dir.file("loop-b.txt")));
}

TEST(TargetIdentity, OwnerAndAttributesStay) {
    TempDir dir;
    const auto target = dir.write("chart.txt", "old");
    struct stat info {};
#if defined(__linux__)
    const std::string origin = "scanner 7";
    if (setxattr(target.c_str(), "user.origin", origin.data(), origin.size(), 0) == 0) {
        ASSERT_EQ(WriteHelperChart(target), 0);
        char value[32] = {};
        EXPECT_EQ(getxattr(target.c_str(), "user.origin", value, sizeof value),
                  static_cast<ssize_t>(origin.size()));
        EXPECT_EQ(std::string(value), origin);
        EXPECT_EQ(ReadBytes(target), HelperChartText());
    } else {
        std::cout << "user extended attributes not supported here; that case is skipped\n";
    }
#endif
    // A file of another user, written by root, stays that user's.
    if (geteuid() == 0) {
        const auto users = dir.write("users.txt", "old");
        ASSERT_EQ(chown(users.c_str(), 65534, 65534), 0);
        ASSERT_EQ(WriteHelperChart(users), 0);
        ASSERT_EQ(stat(users.c_str(), &info), 0);
        EXPECT_EQ(info.st_uid, 65534u);
        EXPECT_EQ(info.st_gid, 65534u);
        EXPECT_EQ(ReadBytes(users), HelperChartText());
    }
}

TEST(TargetIdentity, APipeWithoutReaderIsRefusedAtOnce) {
    TempDir dir;
    const auto pipe = dir.file("pipe");
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_EQ(WriteHelperChart(pipe), 23);
}

// In a child process whose files may grow to `limit` bytes: the writer's result.
int WriteWithSizeLimit(const fs::path& target, rlim_t limit) {
    const pid_t child = fork();
    if (child == 0) {
        signal(SIGXFSZ, SIG_IGN); // a write past the limit then fails instead
        const rlimit small{limit, limit};
        setrlimit(RLIMIT_FSIZE, &small);
        _exit(WriteHelperChart(target));
    }
    int status = 0;
    waitpid(child, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST(TargetIdentity, AWriteThatDoesNotFitLeavesTheTargetAsItWas) {
    TempDir dir;
    // Replaced through a temporary file, and written in place (a second link).
    const auto own = dir.write("own.txt", "old");
    const auto linked = dir.write("linked.txt", "old");
    fs::create_hard_link(linked, dir.file("link.txt"));
    for (const fs::path& target : {own, linked}) {
        SCOPED_TRACE(target.filename().string());
        EXPECT_EQ(WriteWithSizeLimit(target, 32), 23);
        EXPECT_EQ(ReadBytes(target), "old");
    }
    EXPECT_EQ(write_test::EntryCount(dir.path()), 3);
}

// Runs the helper as the unprivileged user: its exit status, or -1 when the
// machine does not allow switching users.
int WriteAsNobody(const fs::path& target) {
    const std::string command =
        std::string("setpriv --reuid=nobody --regid=nogroup --clear-groups ") +
        REDAVUDEVA_WRITE_CHART_HELPER + " '" + target.string() + "'";
    const int status = std::system(command.c_str());
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST(TargetPermissions, AnUnprivilegedUserWritesWhatItMayAndNothingElse) {
    if (geteuid() != 0) {
        GTEST_SKIP() << "switching to the user nobody needs root";
    }
    if (getpwnam("nobody") == nullptr || getgrnam("nogroup") == nullptr ||
        std::system("command -v setpriv >/dev/null") != 0) {
        GTEST_SKIP() << "no user nobody, group nogroup or setpriv here";
    }
    TempDir dir;
    ASSERT_EQ(chmod(dir.path().c_str(), 0777), 0);
    const auto probe = dir.file("probe.txt");
    if (WriteAsNobody(probe) != 0) {
        GTEST_SKIP() << "the helper cannot run as nobody here";
    }
    struct stat info {};
    ASSERT_EQ(stat(probe.c_str(), &info), 0);
    EXPECT_EQ(info.st_uid, 65534u); // a new file is the writer's own

    // Root's file that nobody may not write: refused, untouched.
    const auto roots = dir.write("roots.txt", "old");
    ASSERT_EQ(chmod(roots.c_str(), 0644), 0);
    EXPECT_EQ(WriteAsNobody(roots), 23);
    EXPECT_EQ(ReadBytes(roots), "old");
    ASSERT_EQ(stat(roots.c_str(), &info), 0);
    EXPECT_EQ(info.st_uid, 0u);

    // Root's file that nobody may write through its group: written, still root's.
    const auto group = dir.write("group.txt", "old");
    ASSERT_EQ(chown(group.c_str(), 0, 65534), 0);
    ASSERT_EQ(chmod(group.c_str(), 0664), 0);
    EXPECT_EQ(WriteAsNobody(group), 0);
    EXPECT_EQ(ReadBytes(group), HelperChartText());
    ASSERT_EQ(stat(group.c_str(), &info), 0);
    EXPECT_EQ(info.st_uid, 0u);
    EXPECT_EQ(info.st_mode & 07777, 0664u);

    // Root's file that an access list lets nobody write: written, list kept.
    const auto listed = dir.write("listed.txt", "old");
    ASSERT_EQ(chmod(listed.c_str(), 0644), 0);
    if (std::system(("setfacl -m u:nobody:rw " + listed.string() + " 2>/dev/null").c_str()) == 0) {
        EXPECT_EQ(WriteAsNobody(listed), 0);
        EXPECT_EQ(ReadBytes(listed), HelperChartText());
        const auto acl = dir.file("acl.txt");
        ASSERT_EQ(std::system(("getfacl -p " + listed.string() + " > " + acl.string()).c_str()), 0);
        EXPECT_NE(ReadBytes(acl).find("user:nobody:rw-"), std::string::npos);
        ASSERT_EQ(stat(listed.c_str(), &info), 0);
        EXPECT_EQ(info.st_uid, 0u);
    } else {
        std::cout << "setfacl missing or access lists not supported; that case is skipped\n";
    }
}

#endif
