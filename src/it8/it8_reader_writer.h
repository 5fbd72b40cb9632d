// CIT8ReaderWriter: the IT8.7 / CGATS.17 reader-writer behind the factory.
//
// Reading lives in src/it8/read/, writing in src/it8/write/. The class exports
// no symbols; hosts reach it through CSwatchlogBase.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "it8/read/chart_line_reader.h"
#include "redavudeva/swatchlog_base.h"

namespace it8 {
struct ChartSections;
}

class CIT8ReaderWriter : public CSwatchlogBase {
public:
    CIT8ReaderWriter();
    ~CIT8ReaderWriter() override;

    // File operations.
    int ReadChartFile(std::wstring path) override;
    int AppendColumnsWithWhitePoint(std::wstring templatePath, std::wstring targetPath,
                                    CColorPatch measuredWhite, CColorPatch profileWhite) override;
    int WriteChartFile(std::wstring templatePath, std::wstring targetPath, bool append) override;
    int WriteMeasurementFile(std::wstring sourcePath, std::wstring targetPath) override;
    int AppendMissingColumns(std::wstring sourcePath, std::wstring targetPath,
                             bool exactCounts) override;
    int InsertKeywords(std::wstring sourcePath, std::wstring targetPath,
                       const std::vector<std::pair<std::string, std::string>>& keywords) override;
    int CanReadFile(std::wstring path) override;
    int WriteTargetFile(std::wstring sourcePath, std::wstring targetPath) override;

    // Store operations the reader-writer answers itself.
    int GetDeviceValueLists(std::vector<std::vector<double>>& lists) override;
    int GetDeviceColorSpace() override;
    int GetDeviceChannelCount() override;
    int WriteDeviceControlSequence(std::string path) override;
    std::string GetDataFormatLine() override;
    void SetDataFormatLine(std::string line) override;
    int GetProcessColorNames(std::vector<std::string>& names) override;

    /// Splits a line into non-empty tokens at runs of the separator characters.
    static std::vector<std::string> SplitLine(const std::string& line,
                                              const std::string& separators);
    /// Reads a number written with a decimal point or a decimal comma, whatever the
    /// process locale; rewrites the token's decimal mark as it goes.
    static double ParseNumber(std::string& token);

    /// Reads a whole file as trimmed, non-empty lines: 0, or 21 when it cannot be opened.
    static int ReadFileLines(std::wstring path, std::vector<std::string>& lines);

    // ---- reading (src/it8/read/) -------------------------------------------
private:
    /// Empties the chart store, the column maps and the captured lines.
    void ResetReaderState();
    /// The header loop over the whole text: 0, 5, 6, 7, 8 or 9.
    int ParseChartText();
    /// First token as key, the others each followed by one blank as value.
    void StoreKeywordLine(const std::vector<std::string_view>& tokens);
    /// Stores a keyword line and answers its value read as a whole number.
    int StoreNumericKeywordLine(const std::vector<std::string_view>& tokens);
    void ReadDeviceControlSequence();
    void SkipSection(std::string_view endKeyword);
    /// Field names to column maps: 0, 1 (no END_DATA_FORMAT) or 5 (field count).
    int ReadDataFormat();
    /// Data rows to numbered patches: 0, 7 or 8.
    int ReadDataRows();

    it8::ChartLineReader chartStream; // the file's text, held only while it is read
    std::map<std::string, int> fieldColumns;
    std::map<std::string, int> spectralColumns;
    std::map<std::string, int> nColorColumns;
    std::vector<std::string> deviceControlLines;
    std::vector<std::string> processColorIds;
    std::string dataFormatLine;
    bool crLineEnds = false;
    std::uint32_t lastRowMask = 0; // missing-space mask of the last data row built

    // ---- writing (src/it8/write/) ------------------------------------------
private:
    /// A chart file from the value lists alone: 0, 23 (not written) or 24 (a list
    /// shorter than the set count, or spectra / n-colour maps that differ).
    int WriteNewChartFile(const std::wstring& targetPath);
    /// Number of columns the value lists yield; the set count goes to `setCount`.
    std::uint32_t CountDataFields(std::uint32_t& setCount);
    /// The field names between BEGIN_DATA_FORMAT and END_DATA_FORMAT.
    std::string FormatDataFormatLine();
    /// The data rows of sets 0 to setCount - 1 as one entry, rows separated by line
    /// ends; nothing when a set's spectral or n-colour names differ from the first's.
    /// Every non-empty list must hold `setCount` entries.
    void AppendDataRows(std::vector<std::string>& lines, std::uint32_t setCount);
    /// The template's lines with the store's columns appended: 0, 21, 23, 24.
    int AppendColumnsToFile(const std::wstring& templatePath, const std::wstring& targetPath);
    /// Reads a source chart into `source` and as plain lines: 0, 22 (not a readable
    /// chart) or 21 (cannot be opened).
    static int LoadSourceChart(const std::wstring& path, CIT8ReaderWriter& source,
                               std::vector<std::string>& lines);
    /// LoadSourceChart for the merge writers, which then take the first set count
    /// to be the set count when it is below 1 and need both sections: 0, 21, 22, 24.
    int LoadMergeSource(const std::wstring& path, CIT8ReaderWriter& source,
                        std::vector<std::string>& lines, it8::ChartSections& sections);
};
