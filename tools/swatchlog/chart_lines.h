// A chart file's text cut into lines and values the way the library's reader
// cuts it: lines end at LF (a CR before it is dropped), or at CR in a file
// whose first line break is a CR alone; a NUL ends a line's text; values are
// separated by runs of blanks, tabs, CRs and LFs, double quotes included.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace swatchlog {

class ChartLines {
public:
    explicit ChartLines(std::string text);

    const std::string& Text() const { return text_; }
    std::size_t Count() const { return lines_.size(); }
    /// The text of line `index` (0-based), without its line end.
    std::string_view Line(std::size_t index) const;
    /// Byte offset where line `index` begins; Count() gives the text's size.
    std::size_t Begin(std::size_t index) const;
    /// Byte offset just after line `index`'s line end.
    std::size_t End(std::size_t index) const { return Begin(index + 1); }
    /// The line end the file uses: "\n", "\r\n" or "\r".
    const std::string& LineEnd() const { return lineEnd_; }

private:
    struct Span {
        std::size_t begin;
        std::size_t length;
    };
    std::string text_;
    std::vector<Span> lines_;
    std::string lineEnd_;
};

/// A value of a line and where it stands.
struct LineToken {
    std::string_view text;
    std::size_t offset; ///< bytes from the start of the line
};

/// The values of a line, split at blanks, tabs, CR and LF.
std::vector<LineToken> SplitTokens(std::string_view line);
/// Value `index` (0-based) of a line, empty when the line has fewer values.
std::string_view TokenAt(std::string_view line, std::size_t index);
/// The same, as strings.
std::vector<std::string> SplitWords(std::string_view line);
/// Upper case of the ASCII letters, as the reader compares field names.
std::string UpperAscii(std::string_view text);
/// `text` without one pair of enclosing double quotes.
std::string Unquoted(std::string_view text);

} // namespace swatchlog
