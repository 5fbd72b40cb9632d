#include "table_text.h"

namespace swatchlog {
namespace {

std::string Trim(std::string_view text) {
    const std::size_t begin = text.find_first_not_of(" \t\r\n");
    if (begin == std::string_view::npos) {
        return "";
    }
    const std::size_t end = text.find_last_not_of(" \t\r\n");
    return std::string(text.substr(begin, end - begin + 1));
}

// The line after the one that closes the section opened on line `i`, or `last` + 1.
std::size_t SkipSection(const ChartLines& lines, std::size_t i, std::size_t last,
                        const std::string& opening) {
    const std::string closing = "END_" + opening.substr(6);
    const bool wholeLine = opening == "BEGIN_DEVICE_CONTROL_SEQUENCE";
    for (std::size_t j = i + 1; j <= last; ++j) {
        const std::string_view line = lines.Line(j);
        if (wholeLine ? line == closing : TokenAt(line, 0) == closing) {
            return j + 1;
        }
    }
    return last + 1;
}

bool IsSection(std::string_view key) {
    return key == "BEGIN_DEVICE_CONTROL_SEQUENCE" || key == "BEGIN_MEASUREMENT_SCRIPT" ||
           key == "BEGIN_REPORTING_FORMAT" || key == "BEGIN_TARGET_FORMAT";
}

} // namespace

TableText ReadTableText(const ChartLines& lines, std::size_t first, std::size_t last,
                        bool stopAtDataEnd) {
    TableText table;
    std::size_t i = first;
    while (i <= last && i < lines.Count()) {
        table.lastLine = i;
        const std::string_view line = lines.Line(i);
        const std::string_view first = TokenAt(line, 0);
        if (first.empty()) {
            ++i;
            continue;
        }
        const std::string key(first);
        if (IsSection(key)) {
            table.sections.push_back(i);
            i = SkipSection(lines, i, last, key);
            table.lastLine = i - 1;
            continue;
        }
        if (key == "BEGIN_DATA_FORMAT") {
            if (table.formatLine == kNoLine) {
                table.formatLine = i;
            }
            for (++i; i <= last; ++i) {
                table.lastLine = i;
                const auto names = SplitTokens(lines.Line(i));
                if (!names.empty() && names.front().text == "END_DATA_FORMAT") {
                    break;
                }
                for (const auto& name : names) {
                    table.fields.push_back(UpperAscii(name.text));
                }
            }
            ++i;
            continue;
        }
        if (key == "BEGIN_DATA") {
            const bool firstBlock = table.dataLine == kNoLine;
            if (firstBlock) {
                table.dataLine = i;
            }
            for (++i; i <= last; ++i) {
                table.lastLine = i;
                const std::string_view first = TokenAt(lines.Line(i), 0);
                if (first.empty()) {
                    continue;
                }
                if (first == "END_DATA") {
                    break;
                }
                if (firstBlock) {
                    table.rowLines.push_back(i);
                }
            }
            if (firstBlock && i <= last) {
                table.dataEndLine = i;
            }
            if (stopAtDataEnd) {
                return table;
            }
            ++i;
            continue;
        }
        const std::size_t keyEnd =
            static_cast<std::size_t>(first.data() - line.data()) + first.size();
        table.header.push_back({i, key, Trim(line.substr(keyEnd))});
        ++i;
    }
    return table;
}

int FieldColumn(const TableText& table, const std::string& field) {
    for (std::size_t i = table.fields.size(); i-- > 0;) {
        if (table.fields[i] == field) {
            return static_cast<int>(i);
        }
    }
    return -1;
}

bool IsStructureWord(const std::string& key) {
    return key.rfind("BEGIN_", 0) == 0 || key.rfind("END_", 0) == 0 || key == "NUMBER_OF_FIELDS" ||
           key == "NUMBER_OF_SETS" || key == "KEYWORD" || key.rfind('#', 0) == 0;
}

} // namespace swatchlog
