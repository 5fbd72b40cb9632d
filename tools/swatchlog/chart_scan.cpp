#include "chart_scan.h"

#include <cctype>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <set>

#include "file_paths.h"
#include "result_messages.h"

namespace swatchlog {
namespace {

std::vector<std::string> SplitLines(const std::string& text) {
    std::vector<std::string> lines;
    std::string current;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (c == '\r' || c == '\n') {
            lines.push_back(current);
            current.clear();
            if (c == '\r' && i + 1 < text.size() && text[i + 1] == '\n') {
                ++i;
            }
        } else {
            current += c;
        }
    }
    if (!current.empty()) {
        lines.push_back(current);
    }
    return lines;
}

std::vector<std::string> Tokens(const std::string& line) {
    std::vector<std::string> tokens;
    std::string current;
    for (const char c : line) {
        if (c == ' ' || c == '\t') {
            if (!current.empty()) {
                tokens.push_back(current);
                current.clear();
            }
        } else {
            current += c;
        }
    }
    if (!current.empty()) {
        tokens.push_back(current);
    }
    return tokens;
}

// The whole-number value of a keyword line, quotes removed, atoi-like.
int KeywordNumber(const std::vector<std::string>& tokens) {
    if (tokens.size() < 2) {
        return 0;
    }
    std::string value;
    for (const char c : tokens[1]) {
        if (c != '"') {
            value += c;
        }
    }
    return std::atoi(value.c_str());
}

std::string Upper(std::string text) {
    for (char& c : text) {
        c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
    }
    return text;
}

std::string Line(int number) {
    return "line " + std::to_string(number);
}

} // namespace

ChartScan ScanChartText(const std::string& text) {
    ChartScan scan;
    scan.readable = true;
    const std::vector<std::string> lines = SplitLines(text);
    scan.lineCount = static_cast<int>(lines.size());
    const int count = scan.lineCount;
    for (int i = 0; i < count; ++i) {
        const auto tokens = Tokens(lines[i]);
        if (tokens.empty()) {
            continue;
        }
        scan.empty = false;
        const std::string& key = tokens[0];
        const int lineNumber = i + 1;
        if (key == "BEGIN_DEVICE_CONTROL_SEQUENCE" || key == "BEGIN_MEASUREMENT_SCRIPT" ||
            key == "BEGIN_REPORTING_FORMAT" || key == "BEGIN_TARGET_FORMAT") {
            const std::string end = "END_" + key.substr(6);
            int j = i + 1;
            while (j < count && (Tokens(lines[j]).empty() || Tokens(lines[j])[0] != end)) {
                ++j;
            }
            if (j >= count) {
                scan.openSection = key;
                scan.openSectionLine = lineNumber;
                return scan;
            }
            i = j;
        } else if (key == "NUMBER_OF_FIELDS" && scan.dataBeginLine == 0) {
            scan.fieldsValue = KeywordNumber(tokens);
            scan.fieldsLine = lineNumber;
        } else if (key == "NUMBER_OF_SETS") {
            const int value = KeywordNumber(tokens);
            if (value < 1 && scan.badSetsLine == 0) {
                scan.badSetsLine = lineNumber;
            }
            if (scan.setsLine == 0) {
                scan.setsValue = value;
                scan.setsLine = lineNumber;
            }
        } else if (key == "BEGIN_DATA_FORMAT" && scan.formatBeginLine == 0) {
            scan.formatBeginLine = lineNumber;
            scan.formatFieldsValue = scan.fieldsValue;
            scan.formatFieldsLine = scan.fieldsLine;
            std::set<std::string> names;
            int j = i + 1;
            for (; j < count; ++j) {
                const auto fields = Tokens(lines[j]);
                if (!fields.empty() && fields[0] == "END_DATA_FORMAT") {
                    scan.formatEndLine = j + 1;
                    break;
                }
                for (const auto& name : fields) {
                    names.insert(Upper(name));
                }
            }
            scan.formatFieldCount = static_cast<int>(names.size());
            if (scan.formatEndLine == 0) {
                return scan;
            }
            if (scan.fieldsValue == 0) {
                scan.fieldsValue = scan.formatFieldCount;
            }
            i = j;
        } else if (key == "BEGIN_DATA" && scan.dataBeginLine == 0) {
            scan.dataBeginLine = lineNumber;
            int j = i + 1;
            for (; j < count; ++j) {
                const auto values = Tokens(lines[j]);
                if (values.empty()) {
                    continue;
                }
                if (values[0] == "END_DATA") {
                    scan.dataEndLine = j + 1;
                    break;
                }
                scan.rows.push_back({j + 1, static_cast<int>(values.size())});
            }
            i = j;
        }
    }
    return scan;
}

ChartScan ScanChartFile(const std::string& utf8Path) {
    std::ifstream in(FileSystemPath(utf8Path), std::ios::binary);
    if (!in) {
        return ChartScan{};
    }
    const std::string text((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
    return ScanChartText(text);
}

std::string ExplainReadFailure(int code, const ChartScan& scan) {
    const std::string fields = std::to_string(scan.fieldsValue);
    switch (code) {
    case 5:
        if (scan.formatBeginLine != 0 && scan.formatEndLine == 0) {
            return "the data format that begins on " + Line(scan.formatBeginLine) +
                   " has no END_DATA_FORMAT";
        }
        if (scan.formatBeginLine != 0 && scan.formatFieldsLine != 0) {
            return "the data format on " + Line(scan.formatBeginLine) + " names " +
                   std::to_string(scan.formatFieldCount) +
                   " different fields but NUMBER_OF_FIELDS on " + Line(scan.formatFieldsLine) +
                   " is " + std::to_string(scan.formatFieldsValue);
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
                   " ends before END_DATA (the file ends on " + Line(scan.lineCount) + ")";
        }
        break;
    case 8:
        for (std::size_t r = 0; r < scan.rows.size(); ++r) {
            if (scan.rows[r].valueCount != scan.fieldsValue) {
                return "row " + std::to_string(r + 1) + " (" + Line(scan.rows[r].line) + ") has " +
                       std::to_string(scan.rows[r].valueCount) +
                       " values but NUMBER_OF_FIELDS is " + fields;
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
        if (scan.formatBeginLine == 0 || scan.formatBeginLine > scan.dataBeginLine) {
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
