// A light pass over a chart's lines that finds where a read went wrong, so
// that a failure can be explained with line numbers. It judges nothing
// itself: the library's result code says what failed.
#pragma once

#include <string>
#include <vector>

namespace swatchlog {

struct DataRowInfo {
    int line = 0;       ///< line number
    int valueCount = 0; ///< number of values on the line
    /// The first double-quoted value that holds a blank or tab, quotes
    /// included, and its 1-based character column; empty when there is none.
    std::string quotedWithBlank;
    int quotedColumn = 0;
};

struct ChartScan {
    bool readable = false;
    bool empty = true;
    int lineCount = 0;
    int lastLine = 0;          ///< number of the last line
    int fieldsValue = 0;       ///< NUMBER_OF_FIELDS in force at BEGIN_DATA
    int setsValue = 0;         ///< first NUMBER_OF_SETS value
    int setsLine = 0;          ///< its line, 0 when absent
    int badSetsLine = 0;       ///< first NUMBER_OF_SETS line with a value below 1
    int firstFormatLine = 0;   ///< the first BEGIN_DATA_FORMAT
    int formatBeginLine = 0;   ///< the BEGIN_DATA_FORMAT whose block failed (else the first)
    int formatEndLine = 0;     ///< its END_DATA_FORMAT, 0 when missing
    int formatFieldCount = 0;  ///< distinct field names of all formats up to its end
    int formatFieldsValue = 0; ///< NUMBER_OF_FIELDS in force at its end
    int formatFieldsLine = 0;  ///< the line that set it, 0 when none did
    int dataBeginLine = 0;     ///< BEGIN_DATA
    int dataEndLine = 0;       ///< END_DATA, 0 when missing
    int openSectionLine = 0;   ///< a BEGIN_ section never closed
    std::string openSection;
    std::vector<DataRowInfo> rows;
};

/// Scans the chart file at `utf8Path` (readable false when it cannot be opened).
ChartScan ScanChartFile(const std::string& utf8Path);
/// Scans chart text already in memory whose first line is line `firstLine` of its file.
ChartScan ScanChartText(const std::string& text, int firstLine = 1);
/// A sentence for a failed read with result `code`, with line numbers where the scan has them.
std::string ExplainReadFailure(int code, const ChartScan& scan);
/// Words on a double-quoted value with blanks in a data row: the reader splits
/// values at blanks even inside quotes. Empty when the row has none.
std::string ExplainQuotedBlank(const DataRowInfo& row);

} // namespace swatchlog
