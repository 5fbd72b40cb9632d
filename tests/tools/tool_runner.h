// Runs the built swatchlog program through the POSIX shell and checks its output.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <gtest/gtest.h>
#include <iterator>
#include <sys/wait.h>

#include "temp_files.h"

// JSON is checked with jq; a test that needs it is skipped where it is missing.
#define REQUIRE_JQ()                                                                               \
    if (tool_test::Shell("command -v jq >/dev/null") != 0)                                         \
    GTEST_SKIP() << "jq is not installed"

namespace tool_test {

/// `word` quoted for the shell.
inline std::string Word(std::string word) {
    for (auto at = word.find('\''); at != std::string::npos; at = word.find('\'', at + 4)) {
        word.replace(at, 1, "'\\''");
    }
    return "'" + word + "'";
}

inline int Shell(const std::string& command) {
    const int raw = std::system(command.c_str());
    return WIFEXITED(raw) ? WEXITSTATUS(raw) : -1;
}

struct RunResult {
    int status = -1;
    std::string out;
    std::string err;
};

/// A fresh folder for each test, and the tool run inside it.
class ToolTest : public testing::Test {
protected:
    test_support::TempDir dir;
    /// Runs swatchlog in `dir` with `args`, each passed as one word whatever it holds.
    RunResult Tool(const std::vector<std::string>& args) const {
        test_support::TempDir capture;
        std::string command = "cd " + Word(dir.path().string()) + " && " + Word(SWATCHLOG_BINARY);
        for (const auto& arg : args) {
            command += " " + Word(arg);
        }
        const int status = Shell(command + " >" + Word(capture.file("out").string()) + " 2>" +
                                 Word(capture.file("err").string()) + " </dev/null");
        return {status, Read(capture.file("out")), Read(capture.file("err"))};
    }
    /// Standard output of a run that is expected to succeed.
    std::string Ok(const std::vector<std::string>& args) const {
        const RunResult run = Tool(args);
        EXPECT_EQ(run.status, 0) << args[0] << ": " << run.err;
        return run.out;
    }
    /// A file's bytes; a plain name is taken from `dir`.
    std::string Read(const std::filesystem::path& file) const {
        return test_support::ReadBytes(dir.path() / file);
    }
    std::string Tsv(const std::string& file, const std::string& spaces) const {
        return Ok({"patches", file, "--spaces", spaces, "--format", "tsv"});
    }
    std::size_t FileCount() const {
        using std::filesystem::directory_iterator;
        return std::distance(directory_iterator(dir.path()), directory_iterator());
    }
};

/// Expects `json` to be exactly one JSON document for which each `jq -e` filter holds
/// (slurping reads every document, so a second one or trailing garbage fails).
inline void ExpectJson(const std::string& json, std::initializer_list<std::string> filters) {
    test_support::TempDir dir;
    const std::string file = Word(dir.write("doc.json", json).string());
    for (const auto& filter : filters) {
        const std::string program = "length == 1 and (.[0] | " + filter + ")";
        EXPECT_EQ(Shell("jq -e -s " + Word(program) + " " + file + " >/dev/null 2>&1"), 0)
            << filter << " on " << json;
    }
}

/// Expects each of `parts` somewhere in `text`.
inline void ExpectIn(const std::string& text, std::initializer_list<std::string> parts) {
    for (const auto& part : parts) {
        EXPECT_NE(text.find(part), std::string::npos) << "\"" << part << "\" not in:\n" << text;
    }
}

/// A chart with `header` lines after ORIGINATOR (line 2) and `rows` of "ID NAME C M Y K L A B"
/// from line 9 on.
inline std::string LabChart(const std::vector<std::string>& rows, const std::string& header = "") {
    std::string text = "CGATS.17\nORIGINATOR \"tool test\"\n" + header +
                       "NUMBER_OF_FIELDS 9\nBEGIN_DATA_FORMAT\n"
                       "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A LAB_B\n"
                       "END_DATA_FORMAT\nNUMBER_OF_SETS " +
                       std::to_string(rows.size()) + "\nBEGIN_DATA\n";
    for (const auto& row : rows) {
        text += row + "\n";
    }
    return text + "END_DATA\n";
}

} // namespace tool_test
