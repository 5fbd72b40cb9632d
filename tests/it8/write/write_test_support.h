// Helpers shared by the chart writer tests.
#pragma once

#include <filesystem>
#include <initializer_list>
#include <string>

#include "it8/it8_reader_writer.h"
#include "temp_files.h"

namespace write_test {

/// The lines joined, each followed by `end`; a line end inside an entry becomes `end` too.
inline std::string Joined(std::initializer_list<std::string> lines, const std::string& end) {
    std::string text;
    for (const std::string& line : lines) {
        for (const char c : line) {
            text += c == '\n' ? end : std::string(1, c);
        }
        text += end;
    }
    return text;
}

/// The lines as a file written in text mode holds them.
inline std::string FileText(std::initializer_list<std::string> lines) {
#if defined(_WIN32)
    return Joined(lines, "\r\n");
#else
    return Joined(lines, "\n");
#endif
}

/// The lines as a source file handed to a writer (LF line ends).
inline std::string Source(std::initializer_list<std::string> lines) {
    return Joined(lines, "\n");
}

/// The new-file writer; it does not use the template path.
inline int WriteNew(CIT8ReaderWriter& chart, const std::filesystem::path& target) {
    return chart.WriteChartFile(L"no such template", test_support::Wide(target), false);
}

/// How many entries a folder holds.
inline long EntryCount(const std::filesystem::path& folder) {
    return static_cast<long>(std::distance(std::filesystem::directory_iterator(folder), {}));
}

} // namespace write_test
