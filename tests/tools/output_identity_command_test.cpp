// -o onto an existing file: the output keeps its mode, hard links and the file
// a link names, and an output that cannot be written is refused and left alone.
// Who may write what is decided by the library's own target code, whose tests
// run a writer as an unprivileged user.
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>

#include "tool_runner.h"

namespace tool_test {
namespace {

namespace fs = std::filesystem;

const std::string kExamples = SWATCHLOG_EXAMPLES_DIR;

// Every command that writes a file, with OUT for its output.
const std::vector<std::string> kWriters[] = {
    {"convert", kExamples + "/press_sheet.it8", "-o", "OUT"},
    {"merge", kExamples + "/press_target.it8", kExamples + "/press_sheet.it8", "-o", "OUT"},
    {"target", kExamples + "/press_target.it8", "-o", "OUT"},
    {"keywords", kExamples + "/press_sheet.it8", "-o", "OUT", "PRESS_SPEED=12000"},
    {"render", kExamples + "/press_proof.it8", "-o", "OUT"},
};

std::vector<std::string> Writing(std::vector<std::string> args, const std::string& output) {
    std::replace(args.begin(), args.end(), std::string("OUT"), output);
    return args;
}

struct stat Info(const fs::path& path) {
    struct stat info {};
    EXPECT_EQ(lstat(path.c_str(), &info), 0) << path;
    return info;
}

// With a umask that differs from the modes under test.
class OutputIdentityTest : public ToolTest {
protected:
    void SetUp() override { previous_ = umask(022); }
    void TearDown() override { umask(previous_); }

private:
    mode_t previous_ = 0;
};

TEST_F(OutputIdentityTest, AnExistingOutputKeepsItsModeLinksAndTheFileALinkNames) {
    for (const auto& writer : kWriters) {
        SCOPED_TRACE(writer[0]);
        Ok(Writing(writer, "new"));
        const std::string expected = Read("new");
        EXPECT_EQ(Info(dir.file("new")).st_mode & 07777, 0644u); // 0666 less the umask
        ASSERT_FALSE(expected.empty());

        dir.write("private", "old");
        ASSERT_EQ(chmod(dir.file("private").c_str(), 0600), 0);
        dir.write("linked", "old");
        fs::create_hard_link(dir.file("linked"), dir.file("second name"));
        dir.write("real", "old");
        fs::create_symlink("real", dir.file("link"));
        for (const char* output : {"private", "linked", "link"}) {
            Ok(Writing(writer, output));
        }
        EXPECT_EQ(Read("private"), expected);
        EXPECT_EQ(Info(dir.file("private")).st_mode & 07777, 0600u);
        EXPECT_EQ(Read("second name"), expected);
        EXPECT_EQ(Info(dir.file("linked")).st_nlink, 2u);
        EXPECT_TRUE(fs::is_symlink(dir.file("link")));
        EXPECT_EQ(Read("real"), expected);
        EXPECT_EQ(FileCount(), 6u); // no temporary file left behind
        for (const auto& entry : fs::directory_iterator(dir.path())) {
            fs::remove(entry.path());
        }
    }
}

TEST_F(OutputIdentityTest, AnOutputThatCannotBeWrittenIsRefusedAndLeftAlone) {
    fs::create_symlink("loop-b", dir.file("loop-a"));
    fs::create_symlink("loop-a", dir.file("loop-b"));
    fs::create_directory(dir.file("folder"));
    ASSERT_EQ(mkfifo(dir.file("pipe").c_str(), 0600), 0);
    const struct {
        const char* output;
        int error;
    } cases[] = {{"loop-a", ELOOP}, {"folder", EISDIR}, {"pipe", ENXIO}}; // a pipe without reader
    for (const auto& c : cases) {
        const RunResult run = Tool(Writing(kWriters[0], c.output));
        EXPECT_EQ(run.status, 1) << c.output;
        ExpectIn(run.err, {std::string(c.output) + ": the output file cannot be written (" +
                           std::strerror(c.error) + "); nothing was written"});
    }
    EXPECT_TRUE(fs::is_symlink(dir.file("loop-a")));
    EXPECT_TRUE(fs::is_symlink(dir.file("loop-b")));
    EXPECT_TRUE(fs::is_empty(dir.file("folder")));
    EXPECT_EQ(FileCount(), 4u);

    // A pipe with a reader gets the output, and stays a pipe.
    Ok(Writing(kWriters[2], "new"));
    const int reader = open(dir.file("pipe").c_str(), O_RDONLY | O_NONBLOCK);
    ASSERT_GE(reader, 0);
    Ok(Writing(kWriters[2], "pipe"));
    std::string got(Read("new").size() + 1, '\0');
    const ssize_t size = read(reader, got.data(), got.size());
    close(reader);
    EXPECT_EQ(got.substr(0, static_cast<std::size_t>(std::max<ssize_t>(size, 0))), Read("new"));
    EXPECT_TRUE(S_ISFIFO(Info(dir.file("pipe")).st_mode));
}

} // namespace
} // namespace tool_test
