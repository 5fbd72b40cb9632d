// Where the data format and the data block stand in a chart file's lines.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace it8 {

/// Positions in a line list as ReadFileLines gives it.
struct ChartSections {
    /// False when "BEGIN_DATA_FORMAT" or "BEGIN_DATA" is missing, or when no
    /// field-name line stands between them; the writers then refuse the file.
    bool usable = false;
    /// First line equal to "BEGIN_DATA_FORMAT"; the field names are on the next line.
    std::size_t formatIndex = 0;
    /// First line equal to "BEGIN_DATA".
    std::size_t dataIndex = 0;
    /// Lines between "BEGIN_DATA" and the last line, which is taken to be
    /// "END_DATA"; 0 when there are none.
    std::size_t rowCount = 0;

    std::size_t FieldLineIndex() const { return formatIndex + 1; }
    std::size_t FirstRowIndex() const { return dataIndex + 1; }
};

ChartSections LocateSections(const std::vector<std::string>& lines);

} // namespace it8
