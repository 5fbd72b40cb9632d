// Line-by-line access to a chart file's text held in memory.
#pragma once

#include <cstddef>
#include <string>

namespace it8 {

/// One line of the text: a writable range inside the reader's buffer. The data-row
/// reader rewrites decimal marks in place, so the range is not const.
struct LineSpan {
    char* data = nullptr;
    std::size_t size = 0;
};

/// The longest line the chart format knows, in characters.
constexpr std::size_t kLongestFormatLine = 1023;

/// True when `text` is to be read with CR line ends. A text whose first line
/// (the characters before its first LF, a CR right before that LF not counted)
/// holds at most kLongestFormatLine characters is read with LF line ends,
/// whatever CRs that line holds. A longer first line means CR line ends when a
/// CR comes within the first kLongestFormatLine characters. A text without any
/// LF is read with CR line ends when it holds a CR, so a CR-only file reads line
/// by line whatever its length.
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
