#include "chart_scan.h"

#include <cstdlib>
#include <set>

#include "chart_lines.h"
#include "file_paths.h"
#include "result_messages.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// The whole-number value of a keyword line, quotes removed, atoi-like.
int KeywordNumber(const std::vector<LineToken>& tokens) {
    if (tokens.size() < 2) {
        return 0;
    }
    std::string value;
    for (const char c : tokens[1].text) {
        if (c != '"') {
            value += c;
        }
    }
    return std::atoi(value.c_str());
}

std::string Line(int number) {
    return "line " + std::to_string(number);
}

// The first "..." of `line` that holds a blank or a tab.
void FindQuotedBlank(std::string_view line, DataRowInfo& row) {
    std::size_t open = line.find('"');
    while (open != std::string_view::npos) {
        const std::size_t close = line.find('"', open + 1);
        if (close == std::string_view::npos) {
            return;
        }
        const std::string_view inner = line.substr(open + 1, close - open - 1);
        if (inner.find_first_of(" \t") != std::string_view::npos) {
            row.quotedWithBlank = std::string(line.substr(open, close - open + 1));
            row.quotedColumn = static_cast<int>(DisplayWidth(line.substr(0, open))) + 1;
            return;
        }
        open = line.find('"', close + 1);
    }
}

} // namespace

ChartScan ScanChartText(const std::string& text, int firstLine) {
    ChartScan scan;
    scan.readable = true;
    const ChartLines lines(text);
    scan.lineCount = static_cast<int>(lines.Count());
    scan.lastLine = firstLine + scan.lineCount - 1;
    const std::size_t count = lines.Count();
    auto number = [firstLine](std::size_t i) { return static_cast<int>(i) + firstLine; };
    int fieldsValue = 0;
    int fieldsLine = 0;
    std::set<std::string> names;
    for (std::size_t i = 0; i < count; ++i) {
        const auto tokens = SplitTokens(lines.Line(i));
        if (tokens.empty()) {
            continue;
        }
        scan.empty = false;
        const std::string_view key = tokens[0].text;
        if (key == "BEGIN_DEVICE_CONTROL_SEQUENCE" || key == "BEGIN_MEASUREMENT_SCRIPT" ||
            key == "BEGIN_REPORTING_FORMAT" || key == "BEGIN_TARGET_FORMAT") {
            const std::string end = "END_" + std::string(key.substr(6));
            const bool wholeLine = key == "BEGIN_DEVICE_CONTROL_SEQUENCE";
            std::size_t j = i + 1;
            for (; j < count; ++j) {
                const auto words = SplitTokens(lines.Line(j));
                if (wholeLine ? lines.Line(j) == end : !words.empty() && words[0].text == end) {
                    break;
                }
            }
            if (j >= count) {
                scan.openSection = std::string(key);
                scan.openSectionLine = number(i);
                return scan;
            }
            i = j;
        } else if (key == "NUMBER_OF_FIELDS" && scan.dataBeginLine == 0) {
            fieldsValue = KeywordNumber(tokens);
            fieldsLine = number(i);
        } else if (key == "NUMBER_OF_SETS") {
            const int value = KeywordNumber(tokens);
            if (value < 1 && scan.badSetsLine == 0) {
                scan.badSetsLine = number(i);
            }
            if (scan.setsLine == 0) {
                scan.setsValue = value;
                scan.setsLine = number(i);
            }
        } else if (key == "BEGIN_DATA_FORMAT") {
            // The reader adds the names of every data format to one set and
            // checks the count against NUMBER_OF_FIELDS at the end of each block.
            scan.formatBeginLine = number(i);
            if (scan.firstFormatLine == 0) {
                scan.firstFormatLine = number(i);
            }
            scan.formatEndLine = 0;
            std::size_t j = i + 1;
            for (; j < count; ++j) {
                const auto fields = SplitTokens(lines.Line(j));
                if (!fields.empty() && fields[0].text == "END_DATA_FORMAT") {
                    scan.formatEndLine = number(j);
                    break;
                }
                for (const auto& name : fields) {
                    names.insert(UpperAscii(name.text));
                }
            }
            scan.formatFieldCount = static_cast<int>(names.size());
            scan.formatFieldsValue = fieldsValue;
            scan.formatFieldsLine = fieldsLine;
            if (scan.formatEndLine == 0) {
                return scan;
            }
            if (fieldsValue == 0) {
                fieldsValue = scan.formatFieldCount;
                fieldsLine = 0;
            } else if (fieldsValue != scan.formatFieldCount) {
                return scan;
            }
            i = j;
        } else if (key == "BEGIN_DATA" && scan.dataBeginLine == 0) {
            scan.dataBeginLine = number(i);
            scan.fieldsValue = fieldsValue;
            std::size_t j = i + 1;
            for (; j < count; ++j) {
                const auto values = SplitTokens(lines.Line(j));
                if (values.empty()) {
                    continue;
                }
                if (values[0].text == "END_DATA") {
                    scan.dataEndLine = number(j);
                    break;
                }
                DataRowInfo row;
                row.line = number(j);
                row.valueCount = static_cast<int>(values.size());
                FindQuotedBlank(lines.Line(j), row);
                scan.rows.push_back(row);
            }
            i = j;
        }
    }
    return scan;
}

ChartScan ScanChartFile(const std::string& utf8Path) {
    std::string text;
    if (!ReadRegularFile(utf8Path, text)) {
        return ChartScan{};
    }
    return ScanChartText(text);
}

std::string ExplainQuotedBlank(const DataRowInfo& row) {
    if (row.quotedWithBlank.empty()) {
        return "";
    }
    const std::size_t pieces = SplitTokens(row.quotedWithBlank).size();
    return "the quoted value " + row.quotedWithBlank + " (" + Line(row.line) + ", column " +
           std::to_string(row.quotedColumn) +
           ") holds a blank, and values are separated at blanks even inside double quotes, "
           "so it counts as " +
           std::to_string(pieces) + " values";
}

std::string ExplainReadFailure(int code, const ChartScan& scan) {
    switch (code) {
    case 5:
        if (scan.formatBeginLine != 0 && scan.formatEndLine == 0) {
            return "the data format that begins on " + Line(scan.formatBeginLine) +
                   " has no END_DATA_FORMAT";
        }
        if (scan.formatBeginLine != 0 && scan.formatFieldsValue != 0) {
            const std::string fields =
                scan.formatFieldsLine != 0
                    ? "NUMBER_OF_FIELDS on " + Line(scan.formatFieldsLine) + " is "
                    : "the data format before it set NUMBER_OF_FIELDS to ";
            if (scan.formatBeginLine != scan.firstFormatLine) {
                return "the data formats on " + Line(scan.firstFormatLine) + " and " +
                       Line(scan.formatBeginLine) + " together name " +
                       std::to_string(scan.formatFieldCount) + " different fields (one table " +
                       "has one data format) but " + fields +
                       std::to_string(scan.formatFieldsValue);
            }
            return "the data format on " + Line(scan.formatBeginLine) + " names " +
                   std::to_string(scan.formatFieldCount) + " different fields but " + fields +
                   std::to_string(scan.formatFieldsValue);
        }
        break;
    case 6:
        if (scan.badSetsLine != 0) {
            return "NUMBER_OF_SETS on " + Line(scan.badSetsLine) + " is below 1";
        }
        break;
    case 7:
        if (scan.dataBeginLine != 0) {
            return "the data block that begins on " + Line(scan.dataBeginLine) +
                   " ends before END_DATA (the file ends on " + Line(scan.lastLine) + ")";
        }
        break;
    case 8:
        for (std::size_t r = 0; r < scan.rows.size(); ++r) {
            const DataRowInfo& row = scan.rows[r];
            if (row.valueCount != scan.fieldsValue) {
                const std::string quoted = ExplainQuotedBlank(row);
                return "row " + std::to_string(r + 1) + " (" + Line(row.line) + ") has " +
                       std::to_string(row.valueCount) + " values but NUMBER_OF_FIELDS is " +
                       std::to_string(scan.fieldsValue) + (quoted.empty() ? "" : ": " + quoted);
            }
        }
        if (scan.dataBeginLine != 0 && scan.setsLine != 0) {
            return "NUMBER_OF_SETS on " + Line(scan.setsLine) + " is " +
                   std::to_string(scan.setsValue) + " but the data block on " +
                   Line(scan.dataBeginLine) + " holds " + std::to_string(scan.rows.size()) +
                   (scan.rows.size() == 1 ? " row" : " rows");
        }
        break;
    case 9:
        if (scan.readable && scan.empty) {
            return "the file is empty";
        }
        if (scan.openSectionLine != 0) {
            return "the section " + scan.openSection + " on " + Line(scan.openSectionLine) +
                   " is never closed, so the file has no data block";
        }
        if (scan.dataBeginLine == 0) {
            return "the file has no data block (no BEGIN_DATA line)";
        }
        if (scan.firstFormatLine == 0 || scan.firstFormatLine > scan.dataBeginLine) {
            return "BEGIN_DATA on " + Line(scan.dataBeginLine) + " comes before the data format";
        }
        if (scan.setsLine == 0 || scan.setsLine > scan.dataBeginLine) {
            return "BEGIN_DATA on " + Line(scan.dataBeginLine) + " comes before NUMBER_OF_SETS";
        }
        break;
    default:
        break;
    }
    return DescribeReadResult(code);
}

} // namespace swatchlog
