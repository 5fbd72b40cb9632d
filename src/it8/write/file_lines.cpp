// Reading a chart file as a list of trimmed, non-empty lines.
#include "it8/chart_file_text.h"
#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"

namespace {

bool IsLineEnd(char c) {
    return c == '\n' || c == '\r';
}

// Removes trailing spaces, then leading spaces; tabs are kept.
std::string TrimSpaces(std::string line) {
    const std::size_t last = line.find_last_not_of(' ');
    if (last == std::string::npos) {
        return std::string();
    }
    line.erase(last + 1);
    line.erase(0, line.find_first_not_of(' '));
    return line;
}

} // namespace

int CIT8ReaderWriter::ReadFileLines(std::wstring path, std::vector<std::string>& lines) {
    lines.clear();
    // Read as bytes: every kind of line end is split off below anyway. Only a
    // regular file is read, so a device or a pipe answers 21.
    std::string text;
    if (!it8::ReadChartFileText(it8::ToFileSystemPath(path), text)) {
        return 21;
    }

    // The text ends at its first NUL character, as a C string would.
    const std::size_t nul = text.find('\0');
    if (nul != std::string::npos) {
        text.erase(nul);
    }

    // Every maximal run of characters other than LF and CR is one line, so LF,
    // CR LF and CR line ends all disappear and empty lines never appear.
    std::size_t position = 0;
    while (position < text.size()) {
        while (position < text.size() && IsLineEnd(text[position])) {
            ++position;
        }
        std::size_t end = position;
        while (end < text.size() && !IsLineEnd(text[end])) {
            ++end;
        }
        if (end > position) {
            lines.push_back(TrimSpaces(text.substr(position, end - position)));
        }
        position = end;
    }
    return 0;
}
