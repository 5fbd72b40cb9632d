// The structure of one table's text, found the way the library's reader walks
// it: header lines, the sections it passes over, the data format and the data
// rows. The tool takes from here what the library does not keep: the exact
// text of a keyword line or of a cell (SAMPLE_ID, a malformed number) and
// where it stands.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "chart_lines.h"

namespace swatchlog {

constexpr std::size_t kNoLine = static_cast<std::size_t>(-1);

/// A header line: its key and the text after the key, blanks around it removed.
struct HeaderLine {
    std::size_t index = 0; ///< 0-based line index
    std::string key;
    std::string value;
};

struct TableText {
    std::vector<HeaderLine> header;
    std::vector<std::size_t> sections; ///< first lines of the sections passed over
    std::vector<std::string> fields;   ///< data format names, upper case, in column order
    std::size_t formatLine = kNoLine;  ///< the first BEGIN_DATA_FORMAT
    std::size_t dataLine = kNoLine;    ///< the first BEGIN_DATA
    std::size_t dataEndLine = kNoLine; ///< its END_DATA
    std::vector<std::size_t> rowLines; ///< the lines of its data rows, in order
    std::size_t lastLine = kNoLine;    ///< the last line walked
};

/// Walks lines `first` to `last` (0-based, inclusive). With `stopAtDataEnd` the
/// walk ends at the END_DATA of the first data block.
TableText ReadTableText(const ChartLines& lines, std::size_t first, std::size_t last,
                        bool stopAtDataEnd = false);

/// The column of `field` (upper case) among the data format's names, the last
/// one when the name repeats, as the reader maps it; -1 when absent.
int FieldColumn(const TableText& table, const std::string& field);

/// Whether a header key is one of the grammar's own words (BEGIN_..., END_...,
/// NUMBER_OF_FIELDS, NUMBER_OF_SETS, KEYWORD) or a comment.
bool IsStructureWord(const std::string& key);

} // namespace swatchlog
