// A light pass over a chart file's lines that finds where a read went wrong,
// so that a failure can be explained with line numbers. It judges nothing
// itself: the library's result code says what failed.
#pragma once

#include <string>
#include <vector>

namespace swatchlog {

struct DataRowInfo {
    int line = 0;       ///< 1-based line number
    int valueCount = 0; ///< number of values on the line
};

struct ChartScan {
    bool readable = false;
    bool empty = true;
    int lineCount = 0;
    int fieldsValue = 0;       ///< NUMBER_OF_FIELDS in force at BEGIN_DATA
    int fieldsLine = 0;        ///< its line, 0 when absent
    int formatFieldsValue = 0; ///< NUMBER_OF_FIELDS in force at BEGIN_DATA_FORMAT
    int formatFieldsLine = 0;  ///< its line, 0 when absent
    int setsValue = 0;         ///< first NUMBER_OF_SETS value
    int setsLine = 0;          ///< its line, 0 when absent
    int badSetsLine = 0;       ///< first NUMBER_OF_SETS line with a value below 1
    int formatBeginLine = 0;   ///< BEGIN_DATA_FORMAT
    int formatEndLine = 0;     ///< END_DATA_FORMAT, 0 when missing
    int formatFieldCount = 0;  ///< distinct field names of the data format
    int dataBeginLine = 0;     ///< BEGIN_DATA
    int dataEndLine = 0;       ///< END_DATA, 0 when missing
    int openSectionLine = 0;   ///< a BEGIN_ section never closed
    std::string openSection;
    std::vector<DataRowInfo> rows;
};

/// Scans the chart file at `utf8Path` (readable false when it cannot be opened).
ChartScan ScanChartFile(const std::string& utf8Path);
/// Scans chart text already in memory.
ChartScan ScanChartText(const std::string& text);
/// A sentence for a failed read with result `code`, with line numbers where the scan has them.
std::string ExplainReadFailure(int code, const ChartScan& scan);

} // namespace swatchlog
