// Chart files that hold several tables one after another: a profiling tool's
// target and measurement files, calibration curves, gamut surfaces. Each table
// has its own header, data format and data block, and ends with its END_DATA.
// The library reads one table per chart, so a table of such a file is handed
// to it as a temporary file holding exactly that table's lines, byte for byte;
// a file of one table is read directly. Every value still comes from the
// library.
//
// This is the tool's way of reading any chart file; another program that
// wants the same rules (a language binding) calls ListTables and LoadTable.
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <redavudeva/redavudeva.h>

#include "chart_lines.h"
#include "table_text.h"
#include "tool_error.h"

namespace swatchlog {

/// Where a table stands in its file.
struct TableExtent {
    int number = 0;    ///< 1 for the file's first table
    int firstLine = 0; ///< 1-based line numbers in the file, both included
    int lastLine = 0;
    int dataLine = 0; ///< its BEGIN_DATA line, 0 when it has no data block
    int rowCount = 0; ///< data rows in its data block
    /// A word alone on the table's first line that holds any ("CGATS.17",
    /// "CTI3"), else empty; and the number of that line, 0 when there is none.
    std::string identification;
    int identificationLine = 0;
    std::vector<std::string> fields; ///< data format names, upper case, in order
};

/// A chart file that cannot be read, or a table of it: the message names the
/// file, the table (for files of several tables) and the line where known.
/// Code() is the library's result code (3 cannot open, 5 data format ... 9 no
/// data), or 0 for a failure that has none (a bad table number, an exception);
/// Path() is the chart file. When the library's read ended with a standard
/// exception, that exception is attached as the nested exception.
class TableReadError : public ChartError {
public:
    TableReadError(const std::string& message, int code, std::string path, int table, int line,
                   std::string libraryException = "")
        : ChartError(message, std::move(path), code), table_(table), line_(line),
          libraryException_(std::move(libraryException)) {}
    int Table() const { return table_; } ///< 0 when the file has one table
    int Line() const { return line_; }   ///< 0 when unknown
    /// The message of the standard exception the library's read ended with
    /// ("invalid stol argument", "invalid string position" ...), else empty.
    const std::string& LibraryException() const { return libraryException_; }

private:
    int table_;
    int line_;
    std::string libraryException_;
};

/// A table number the file has no table for.
class NoSuchTable : public TableReadError {
public:
    using TableReadError::TableReadError;
};

/// The tables of chart text, in file order; at least one (text without any
/// data block is one table). A table ends at its END_DATA; lines after the
/// last data block that hold none belong to the last table.
std::vector<TableExtent> FindTables(const ChartLines& lines);
/// The tables of the file at `utf8Path`; TableReadError (code 3) when it cannot be read.
std::vector<TableExtent> ListTables(const std::string& utf8Path);
/// The table read when none is asked for: the first with data rows (1 when none has).
int DefaultTable(const std::vector<TableExtent>& tables);

/// One table of a chart file, read by the library.
class LoadedTable {
public:
    LoadedTable(LoadedTable&&) noexcept;
    LoadedTable& operator=(LoadedTable&&) noexcept;
    ~LoadedTable();

    /// The library's chart object holding the table.
    CSwatchlogBase& Chart() const { return *chart_; }
    const std::string& Path() const { return path_; }
    /// The file the library read, as its wide path: the chart file itself, or
    /// the temporary file holding this table alone (it lives as long as this
    /// object). Writers that re-read their source take this path.
    const std::wstring& LibraryPath() const { return libraryPath_; }
    const TableExtent& Table() const { return tables_[static_cast<std::size_t>(number_ - 1)]; }
    const std::vector<TableExtent>& Tables() const { return tables_; }
    /// The path, with ", table N" when the file holds several tables.
    std::string Name() const;

    /// The table's text and its structure; line indexes count from the table's
    /// first line, FileLine turns them into the file's 1-based line numbers.
    const ChartLines& Lines() const { return *lines_; }
    const TableText& Text() const { return text_; }
    int FileLine(std::size_t index) const { return static_cast<int>(index) + firstLine_; }

    /// The text of each data row's cell in column `field` (upper case), without
    /// enclosing double quotes, one per patch in sample order; empty when the
    /// data format has no such field.
    std::vector<std::string> ColumnText(const std::string& field) const;

private:
    friend LoadedTable LoadTable(const std::string& utf8Path, int number);
    LoadedTable() = default;
    class Scratch;

    std::string path_;
    std::vector<TableExtent> tables_;
    int number_ = 1;
    int firstLine_ = 1;
    std::unique_ptr<ChartLines> lines_;
    TableText text_;
    std::unique_ptr<Scratch> scratch_;
    std::wstring libraryPath_;
    std::unique_ptr<CSwatchlogBase> chart_;
};

/// Reads table `number` (1-based; 0 for DefaultTable) of the chart file at
/// `utf8Path` (UTF-8) through the library. TableReadError when the file or the
/// table cannot be read, NoSuchTable when the file has no table of that
/// number; the message says why in words with the result code, e.g.
/// "FograStrip3.ti1, table 1 (lines 1-95): the data format on line 17 names 8
/// different fields but NUMBER_OF_FIELDS on line 16 is 9 [code 5]".
LoadedTable LoadTable(const std::string& utf8Path, int number = 0);

} // namespace swatchlog
