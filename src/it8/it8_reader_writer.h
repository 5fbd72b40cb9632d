// CIT8ReaderWriter: the IT8.7 / CGATS.17 reader-writer behind the factory.
//
// Reading lives in src/it8/read/, writing in src/it8/write/. The class exports
// no symbols; hosts reach it through CSwatchlogBase.
#pragma once

#include <cstdint>
#include <fstream>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "redavudeva/swatchlog_base.h"

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
    void ResetReaderState();
    int ParseChartText();
    void StoreKeywordLine(const std::vector<std::string>& tokens);
    void ReadDeviceControlSequence();
    void SkipSection(const char* endKeyword);
    int ReadDataFormat();
    int ReadDataRows();

    std::ifstream chartStream;
    std::map<std::string, int> fieldColumns;
    std::map<std::string, int> spectralColumns;
    std::map<std::string, int> nColorColumns;
    std::vector<std::string> deviceControlLines;
    std::vector<std::string> processColorIds;
    std::string dataFormatLine;
    bool crLineEnds = false;

    // ---- writing (src/it8/write/) ------------------------------------------
private:
    int WriteNewChartFile(const std::wstring& targetPath);
    std::uint32_t CountDataFields(std::uint32_t& setCount);
    std::string FormatDataFormatLine();
    void AppendDataRows(std::vector<std::string>& lines, std::uint32_t setCount);
    int AppendColumnsToFile(const std::wstring& templatePath, const std::wstring& targetPath);
};
