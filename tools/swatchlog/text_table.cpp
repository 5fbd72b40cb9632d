#include "text_table.h"

#include <algorithm>

#include "utf8_text.h"

namespace swatchlog {

void TextTable::AddColumn(std::string header, bool numeric) {
    headers_.push_back(std::move(header));
    numeric_.push_back(numeric);
}

void TextTable::AddRow(std::vector<std::string> cells) {
    cells.resize(headers_.size());
    rows_.push_back(std::move(cells));
}

void TextTable::Print(std::ostream& out, TableFormat format) const {
    if (format == TableFormat::Table) {
        PrintAligned(out);
    } else {
        PrintSeparated(out, format);
    }
}

void TextTable::PrintAligned(std::ostream& out) const {
    std::vector<std::size_t> widths(headers_.size(), 0);
    auto measure = [&](const std::vector<std::string>& cells) {
        for (std::size_t i = 0; i < cells.size(); ++i) {
            widths[i] = std::max(widths[i], DisplayWidth(cells[i]));
        }
    };
    measure(headers_);
    for (const auto& row : rows_) {
        measure(row);
    }
    auto printRow = [&](const std::vector<std::string>& cells) {
        std::string line;
        for (std::size_t i = 0; i < cells.size(); ++i) {
            const std::string cell = TsvField(cells[i]);
            const std::string pad(widths[i] - DisplayWidth(cell), ' ');
            if (i > 0) {
                line += "  ";
            }
            line += numeric_[i] ? pad + cell : cell + pad;
        }
        line.erase(line.find_last_not_of(' ') + 1);
        out << line << '\n';
    };
    printRow(headers_);
    for (const auto& row : rows_) {
        printRow(row);
    }
}

void TextTable::PrintSeparated(std::ostream& out, TableFormat format) const {
    auto printRow = [&](const std::vector<std::string>& cells) {
        for (std::size_t i = 0; i < cells.size(); ++i) {
            if (i > 0) {
                out << (format == TableFormat::Csv ? ',' : '\t');
            }
            out << (format == TableFormat::Csv ? CsvField(cells[i]) : TsvField(cells[i]));
        }
        out << '\n';
    };
    printRow(headers_);
    for (const auto& row : rows_) {
        printRow(row);
    }
}

std::string CsvField(const std::string& text) {
    if (text.find_first_of(",\"\r\n") == std::string::npos) {
        return text;
    }
    std::string out = "\"";
    for (const char c : text) {
        out += c;
        if (c == '"') {
            out += '"';
        }
    }
    return out + "\"";
}

std::string TsvField(const std::string& text) {
    std::string out = text;
    std::replace_if(
        out.begin(), out.end(), [](char c) { return c == '\t' || c == '\r' || c == '\n'; }, ' ');
    return out;
}

} // namespace swatchlog
