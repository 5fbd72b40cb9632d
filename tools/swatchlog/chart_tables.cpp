#include "chart_tables.h"

#include <algorithm>
#include <chrono>
#include <exception>
#include <filesystem>
#include <fstream>
#include <random>
#include <system_error>

#include "chart_scan.h"
#include "file_paths.h"
#include "result_messages.h"
#include "utf8_text.h"

namespace swatchlog {
namespace fs = std::filesystem;

namespace {

int Number(std::size_t index) {
    return static_cast<int>(index) + 1;
}

TableExtent Extent(const ChartLines& lines, const TableText& text, std::size_t first,
                   std::size_t last) {
    TableExtent table;
    table.firstLine = Number(first);
    table.lastLine = Number(last);
    table.dataLine = text.dataLine == kNoLine ? 0 : Number(text.dataLine);
    table.rowCount = static_cast<int>(text.rowLines.size());
    table.fields = text.fields;
    for (std::size_t i = first; i <= last; ++i) {
        const auto words = SplitWords(lines.Line(i));
        if (words.empty()) {
            continue;
        }
        if (words.size() == 1 && !IsStructureWord(words[0])) {
            table.identification = words[0];
            table.identificationLine = Number(i);
        }
        break;
    }
    return table;
}

std::size_t FirstWordLine(const ChartLines& lines, std::size_t from, std::size_t last) {
    for (std::size_t i = from; i <= last; ++i) {
        if (!SplitTokens(lines.Line(i)).empty()) {
            return i;
        }
    }
    return from;
}

std::string ReadWholeFile(const std::string& utf8Path) {
    const fs::path path = FileSystemPath(utf8Path);
    std::error_code ec;
    if (fs::is_directory(path, ec)) {
        throw TableReadError(RepairUtf8(utf8Path) + ": is a folder, not a chart file", 3, utf8Path,
                             0, 0);
    }
    const bool exists = fs::exists(path, ec);
    if (exists && !fs::is_regular_file(path, ec)) {
        throw TableReadError(RepairUtf8(utf8Path) + ": is a device or a pipe, not a chart file", 3,
                             utf8Path, 0, 0);
    }
    std::string text;
    if (!ReadRegularFile(utf8Path, text)) {
        throw TableReadError(RepairUtf8(utf8Path) + ": " + WithCode(DescribeReadResult(3), 3), 3,
                             utf8Path, 0, 0);
    }
    return text;
}

// The line a read failure points at, for callers that want it as a number.
int FailureLine(int code, const ChartScan& scan) {
    switch (code) {
    case 5:
        return scan.formatBeginLine;
    case 6:
        return scan.badSetsLine;
    case 7:
        return scan.dataBeginLine;
    case 8:
        for (const auto& row : scan.rows) {
            if (row.valueCount != scan.fieldsValue) {
                return row.line;
            }
        }
        return scan.setsLine;
    case 9:
        return scan.openSectionLine != 0 ? scan.openSectionLine : scan.dataBeginLine;
    default:
        return 0;
    }
}

} // namespace

// A temporary file beside nothing else, removed when the table is let go.
class LoadedTable::Scratch {
public:
    explicit Scratch(const std::string& content) {
        std::error_code ec;
        const fs::path folder = fs::temp_directory_path(ec);
        if (ec) {
            throw ChartError("no folder for temporary files (" + ec.message() + ")");
        }
        std::random_device random;
        const auto stamp = std::chrono::steady_clock::now().time_since_epoch().count();
        path_ = folder / ("swatchlog-table-" + std::to_string(random()) + "-" +
                          std::to_string(stamp) + ".txt");
        std::ofstream out(path_, std::ios::binary | std::ios::trunc);
        out.write(content.data(), static_cast<std::streamsize>(content.size()));
        out.close();
        if (!out) {
            fs::remove(path_, ec);
            throw ChartError(RepairUtf8(path_.u8string()) + ": a temporary file cannot be written");
        }
    }
    ~Scratch() {
        std::error_code ec;
        fs::remove(path_, ec);
    }
    Scratch(const Scratch&) = delete;
    Scratch& operator=(const Scratch&) = delete;

    std::string Utf8Path() const { return path_.u8string(); }

private:
    fs::path path_;
};

LoadedTable::LoadedTable(LoadedTable&&) noexcept = default;
LoadedTable& LoadedTable::operator=(LoadedTable&&) noexcept = default;
LoadedTable::~LoadedTable() {
    // The text goes first, while few small blocks wait to be merged by the
    // allocator; the chart object goes before the temporary file it read.
    lines_.reset();
    chart_.reset();
}

std::vector<TableExtent> FindTables(const ChartLines& lines) {
    std::vector<TableExtent> tables;
    const std::size_t count = lines.Count();
    std::size_t start = 0;
    while (start < count) {
        const std::size_t first = tables.empty() ? start : FirstWordLine(lines, start, count - 1);
        const TableText text = ReadTableText(lines, first, count - 1, true);
        if (text.dataEndLine == kNoLine) {
            // No complete data block follows: these lines close the last table,
            // or are a table of their own when they hold a data block's start
            // or the file has no table yet.
            if (!tables.empty() && text.dataLine == kNoLine) {
                tables.back().lastLine = Number(count - 1);
            } else {
                tables.push_back(Extent(lines, text, first, count - 1));
            }
            break;
        }
        tables.push_back(Extent(lines, text, first, text.dataEndLine));
        start = text.dataEndLine + 1;
    }
    if (tables.empty()) {
        tables.push_back(TableExtent{});
        tables.back().firstLine = 1;
        tables.back().lastLine = static_cast<int>(count);
    }
    for (std::size_t i = 0; i < tables.size(); ++i) {
        tables[i].number = static_cast<int>(i) + 1;
    }
    return tables;
}

std::vector<TableExtent> ListTables(const std::string& utf8Path) {
    return FindTables(ChartLines(ReadWholeFile(utf8Path)));
}

int DefaultTable(const std::vector<TableExtent>& tables) {
    for (const auto& table : tables) {
        if (table.rowCount > 0) {
            return table.number;
        }
    }
    return 1;
}

std::string LoadedTable::Name() const {
    std::string name = RepairUtf8(path_);
    if (tables_.size() > 1) {
        name += ", table " + std::to_string(number_);
    }
    return name;
}

std::vector<std::string> LoadedTable::ColumnText(const std::string& field) const {
    std::vector<std::string> cells;
    const int column = FieldColumn(text_, field);
    if (column < 0) {
        return cells;
    }
    for (const std::size_t line : text_.rowLines) {
        cells.push_back(Unquoted(TokenAt(lines_->Line(line), static_cast<std::size_t>(column))));
    }
    return cells;
}

LoadedTable LoadTable(const std::string& utf8Path, int number) {
    LoadedTable loaded;
    loaded.path_ = utf8Path;
    const std::wstring filePath = LibraryPath(utf8Path);
    ChartLines fileLines(ReadWholeFile(utf8Path));
    loaded.tables_ = FindTables(fileLines);
    const int count = static_cast<int>(loaded.tables_.size());
    if (number == 0) {
        number = DefaultTable(loaded.tables_);
    }
    if (number < 1 || number > count) {
        throw NoSuchTable(RepairUtf8(utf8Path) + ": the file holds " + std::to_string(count) +
                              (count == 1 ? " table" : " tables") + ", not a table " +
                              std::to_string(number),
                          0, utf8Path, number, 0);
    }
    loaded.number_ = number;
    const TableExtent& table = loaded.Table();
    std::string where = RepairUtf8(utf8Path);
    if (count == 1) {
        loaded.lines_ = std::make_unique<ChartLines>(std::move(fileLines));
        loaded.libraryPath_ = filePath;
    } else {
        const std::size_t begin = fileLines.Begin(static_cast<std::size_t>(table.firstLine - 1));
        const std::size_t end = fileLines.End(static_cast<std::size_t>(table.lastLine - 1));
        loaded.lines_ = std::make_unique<ChartLines>(fileLines.Text().substr(begin, end - begin));
        loaded.firstLine_ = table.firstLine;
        loaded.scratch_ = std::make_unique<LoadedTable::Scratch>(loaded.lines_->Text());
        loaded.libraryPath_ = LibraryPath(loaded.scratch_->Utf8Path());
        where += ", table " + std::to_string(number) + " (lines " +
                 std::to_string(table.firstLine) + "-" + std::to_string(table.lastLine) + ")";
    }
    loaded.text_ = ReadTableText(*loaded.lines_, 0, loaded.lines_->Count() - 1);
    const int tableNumber = count == 1 ? 0 : number;

    loaded.chart_.reset(CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    if (!loaded.chart_) {
        throw TableReadError("the library offers no chart reader", 0, utf8Path, tableNumber, 0);
    }
    int code = 0;
    try {
        code = loaded.chart_->ReadChartFile(loaded.libraryPath_);
    } catch (const std::exception& error) {
        // The library's exception stays attached, for callers that tell its kind apart.
        std::throw_with_nested(TableReadError(where + ": " + DescribeLibraryException(error), 0,
                                              utf8Path, tableNumber, 0, error.what()));
    }
    if (code != 0) {
        const ChartScan scan = ScanChartText(loaded.lines_->Text(), loaded.firstLine_);
        throw TableReadError(where + ": " + WithCode(ExplainReadFailure(code, scan), code), code,
                             utf8Path, tableNumber, FailureLine(code, scan));
    }
    return loaded;
}

} // namespace swatchlog
