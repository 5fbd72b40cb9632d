// Runs the built swatchlog program and checks JSON with jq.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace tool_test {

struct RunResult {
    int status = -1;
    std::string out;
    std::string err;
};

/// Runs swatchlog with `args` (each passed as one word, whatever it holds) in
/// `workDir`, with `env` (e.g. "LC_ALL=C.UTF-8") set for the run.
RunResult RunSwatchlog(const std::vector<std::string>& args,
                       const std::filesystem::path& workDir = std::filesystem::current_path(),
                       const std::string& env = "");

/// Whether jq is installed.
bool HaveJq();
/// Runs `jq -e FILTER` on `json`; true when jq parsed it and the filter's
/// last output is neither false nor null.
bool JqTrue(const std::string& json, const std::string& filter);
/// Output of `jq -r FILTER` on `json` (trailing newline removed).
std::string JqRaw(const std::string& json, const std::string& filter);

/// A small valid chart: CMYK, Lab and names; `rows` lines of "ID NAME C M Y K L A B".
std::string LabChart(const std::vector<std::string>& rows, const std::string& extraHeader = "");

/// Quotes a word for the POSIX shell.
std::string ShellWord(const std::string& word);

} // namespace tool_test
