// Line-by-line access to a chart file's text held in memory.
#pragma once

#include <cstddef>
#include <filesystem>
#include <string>

namespace it8 {

/// One line of the text: a writable range inside the reader's buffer. The data-row
/// reader rewrites decimal marks in place, so the range is not const.
struct LineSpan {
    char* data = nullptr;
    std::size_t size = 0;
};

/// Reads a whole file into `text`. False when the path names a directory or the
/// file cannot be opened or read.
bool ReadWholeFile(const std::filesystem::path& path, std::string& text);

/// True when the first line break of `text` is a CR that is not followed by LF.
bool HasCrLineEnds(const std::string& text);

/// Serves the lines of a text one after the other. With LF line ends a CR right
/// before the LF belongs to the line end; with CR line ends an LF right after the
/// CR does. A line ends at its first NUL character; it may be empty.
class ChartLineReader {
public:
    /// Takes over the text and starts at its first line.
    void Open(std::string text, bool crLineEnds);
    /// Releases the text.
    void Close();
    /// Next line; false when nothing is left.
    bool ReadLine(LineSpan& line);
    /// True once every character has been consumed.
    bool AtEnd() const { return position_ >= text_.size(); }

private:
    std::string text_;
    std::size_t position_ = 0;
    char delimiter_ = '\n';
};

/// Closes the reader when the reading call ends, on every path.
class ChartLineReaderCloser {
public:
    explicit ChartLineReaderCloser(ChartLineReader& reader) : reader_(reader) {}
    ~ChartLineReaderCloser() { reader_.Close(); }
    ChartLineReaderCloser(const ChartLineReaderCloser&) = delete;
    ChartLineReaderCloser& operator=(const ChartLineReaderCloser&) = delete;

private:
    ChartLineReader& reader_;
};

} // namespace it8
