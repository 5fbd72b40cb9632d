// Setting header keywords of one table of a chart file as a text edit: the
// file stays byte for byte as it was except for the lines that set the
// keywords, so its identification line (CTI3, IT8.7/2 ...) and everything the
// library does not interpret are kept.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "chart_lines.h"
#include "chart_tables.h"

namespace swatchlog {

struct KeywordEdit {
    std::string key;
    std::string value; ///< as written after the key
};

struct EditedText {
    std::string text;
    std::vector<std::string> replaced; ///< "KEY on line N" for values replaced
    std::vector<std::string> added;    ///< keys given new lines
};

/// `file` with each keyword set in the header of `table` (whose header lines
/// `header` are numbered from the table's first line): an existing line of
/// the key has its value replaced (the last such line, the one the reader
/// keeps); other keys get new lines, with a KEYWORD declaration for keys the
/// format does not define and the header does not declare, right after the
/// table's identification line, or at its top when it has none. New lines
/// take the file's line end and a tab between key and value.
EditedText SetKeywords(const ChartLines& file, const TableExtent& table,
                       const std::vector<HeaderLine>& header,
                       const std::vector<KeywordEdit>& edits);

} // namespace swatchlog
