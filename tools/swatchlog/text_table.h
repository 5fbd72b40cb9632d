// Rows of text cells printed as an aligned terminal table, TSV or CSV.
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace swatchlog {

enum class TableFormat { Table, Tsv, Csv };

class TextTable {
public:
    /// Adds a column; numeric columns are right-aligned in the terminal table.
    void AddColumn(std::string header, bool numeric);
    /// Adds a row; missing trailing cells are empty, surplus cells are dropped.
    void AddRow(std::vector<std::string> cells);

    std::size_t ColumnCount() const { return headers_.size(); }
    std::size_t RowCount() const { return rows_.size(); }

    void Print(std::ostream& out, TableFormat format) const;

private:
    void PrintAligned(std::ostream& out) const;
    void PrintSeparated(std::ostream& out, TableFormat format) const;

    std::vector<std::string> headers_;
    std::vector<bool> numeric_;
    std::vector<std::vector<std::string>> rows_;
};

/// A CSV field, quoted when it holds a comma, quote, CR or LF.
std::string CsvField(const std::string& text);
/// A TSV field: tabs, CR and LF become blanks.
std::string TsvField(const std::string& text);

} // namespace swatchlog
