// Helpers shared by the chart writer tests.
#pragma once

#include <initializer_list>
#include <string>

#include "it8/it8_reader_writer.h"
#include "temp_files.h"

namespace write_test {

/// The lines as a file written in text mode holds them.
inline std::string FileText(std::initializer_list<std::string> lines) {
#if defined(_WIN32)
    const char* end = "\r\n";
#else
    const char* end = "\n";
#endif
    std::string text;
    for (const std::string& line : lines) {
        // A line end inside an entry is written as a line end too.
        for (const char c : line) {
            if (c == '\n') {
                text += end;
            } else {
                text += c;
            }
        }
        text += end;
    }
    return text;
}

/// The lines joined with LF, as a source file the tests hand to a writer.
inline std::string Source(std::initializer_list<std::string> lines) {
    std::string text;
    for (const std::string& line : lines) {
        text += line + "\n";
    }
    return text;
}

} // namespace write_test
