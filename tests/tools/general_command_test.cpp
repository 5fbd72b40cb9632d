// The tool as a whole: help, version, exit statuses and error messages.
#include <gtest/gtest.h>

#include "temp_files.h"
#include "tool_runner.h"

namespace tool_test {
namespace {

const char* const kCommands[] = {"info",     "patches", "convert", "merge",   "target",
                                 "keywords", "compare", "render",  "validate"};

TEST(SwatchlogTool, HelpAndVersionSucceedOnStandardOutput) {
    const RunResult help = RunSwatchlog({"--help"});
    EXPECT_EQ(help.status, 0);
    for (const char* command : kCommands) {
        EXPECT_NE(help.out.find(std::string("  ") + command), std::string::npos) << command;
        const RunResult own = RunSwatchlog({command, "--help"});
        EXPECT_EQ(own.status, 0) << command;
        EXPECT_EQ(own.out.rfind(std::string("Usage: swatchlog ") + command, 0), 0u) << own.out;
        EXPECT_TRUE(own.err.empty());
    }
    const RunResult version = RunSwatchlog({"--version"});
    EXPECT_EQ(version.status, 0);
    EXPECT_EQ(version.out.rfind("swatchlog ", 0), 0u);
}

TEST(SwatchlogTool, UsageMistakesExitWithTwoAndSayWhy) {
    const RunResult none = RunSwatchlog({});
    EXPECT_EQ(none.status, 2);
    EXPECT_TRUE(none.out.empty());
    EXPECT_NE(none.err.find("Usage:"), std::string::npos);

    const RunResult unknown = RunSwatchlog({"frobnicate"});
    EXPECT_EQ(unknown.status, 2);
    EXPECT_NE(unknown.err.find("unknown command \"frobnicate\""), std::string::npos);

    const RunResult option = RunSwatchlog({"info", "x.it8", "--colour"});
    EXPECT_EQ(option.status, 2);
    EXPECT_NE(option.err.find("unknown option --colour"), std::string::npos);

    EXPECT_EQ(RunSwatchlog({"info"}).status, 2);
    EXPECT_EQ(RunSwatchlog({"info", "a.it8", "b.it8"}).status, 2);
    EXPECT_EQ(RunSwatchlog({"patches", "a.it8", "--format", "xml"}).status, 2);
    EXPECT_EQ(RunSwatchlog({"convert", "a.it8"}).status, 2); // no -o
    EXPECT_EQ(RunSwatchlog({"compare", "a.it8", "b.it8", "--by", "colour"}).status, 2);
    EXPECT_EQ(RunSwatchlog({"merge", "a", "b", "-o", "c", "--exact"}).status, 2);
}

TEST(SwatchlogTool, FileErrorsExitWithOneNamingFileReasonAndCode) {
    test_support::TempDir dir;
    const RunResult missing = RunSwatchlog({"info", "no such chart.it8"}, dir.path());
    EXPECT_EQ(missing.status, 1);
    EXPECT_TRUE(missing.out.empty());
    EXPECT_NE(missing.err.find("no such chart.it8: the file cannot be opened for reading [code 3]"),
              std::string::npos)
        << missing.err;

    dir.write("empty.it8", "");
    const RunResult empty = RunSwatchlog({"patches", "empty.it8"}, dir.path());
    EXPECT_EQ(empty.status, 1);
    EXPECT_NE(empty.err.find("empty.it8: the file is empty [code 9]"), std::string::npos)
        << empty.err;
}

} // namespace
} // namespace tool_test
