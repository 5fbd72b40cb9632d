#include "tool_runner.h"

#include <cstdlib>
#include <sys/wait.h>

#include "temp_files.h"

namespace tool_test {

std::string ShellWord(const std::string& word) {
    std::string out = "'";
    for (const char c : word) {
        if (c == '\'') {
            out += "'\\''";
        } else {
            out += c;
        }
    }
    return out + "'";
}

namespace {

int ShellStatus(const std::string& command) {
    const int raw = std::system(command.c_str());
    return WIFEXITED(raw) ? WEXITSTATUS(raw) : -1;
}

} // namespace

RunResult RunSwatchlog(const std::vector<std::string>& args, const std::filesystem::path& workDir,
                       const std::string& env) {
    test_support::TempDir capture;
    std::string command =
        "cd " + ShellWord(workDir.string()) + " && " + env + " " + ShellWord(SWATCHLOG_BINARY);
    for (const auto& arg : args) {
        command += " " + ShellWord(arg);
    }
    command += " >" + ShellWord(capture.file("out").string()) + " 2>" +
               ShellWord(capture.file("err").string()) + " </dev/null";
    RunResult result;
    result.status = ShellStatus(command);
    result.out = test_support::ReadBytes(capture.file("out"));
    result.err = test_support::ReadBytes(capture.file("err"));
    return result;
}

bool HaveJq() {
    return ShellStatus("command -v jq >/dev/null 2>&1") == 0;
}

bool JqTrue(const std::string& json, const std::string& filter) {
    test_support::TempDir dir;
    const auto file = dir.write("doc.json", json);
    return ShellStatus("jq -e " + ShellWord(filter) + " " + ShellWord(file.string()) +
                       " >/dev/null 2>&1") == 0;
}

std::string JqRaw(const std::string& json, const std::string& filter) {
    test_support::TempDir dir;
    const auto file = dir.write("doc.json", json);
    ShellStatus("jq -r " + ShellWord(filter) + " " + ShellWord(file.string()) + " >" +
                ShellWord(dir.file("out").string()) + " 2>/dev/null");
    std::string out = test_support::ReadBytes(dir.file("out"));
    if (!out.empty() && out.back() == '\n') {
        out.pop_back();
    }
    return out;
}

std::string LabChart(const std::vector<std::string>& rows, const std::string& extraHeader) {
    std::string text = "CGATS.17\n"
                       "ORIGINATOR \"tool test\"\n" +
                       extraHeader +
                       "NUMBER_OF_FIELDS 9\n"
                       "BEGIN_DATA_FORMAT\n"
                       "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A LAB_B\n"
                       "END_DATA_FORMAT\n"
                       "NUMBER_OF_SETS " +
                       std::to_string(rows.size()) + "\nBEGIN_DATA\n";
    for (const auto& row : rows) {
        text += row + "\n";
    }
    return text + "END_DATA\n";
}

} // namespace tool_test
