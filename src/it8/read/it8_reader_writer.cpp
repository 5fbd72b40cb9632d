// Construction of the reader-writer and the entry point of reading a chart file.
#include "it8/it8_reader_writer.h"

#include <utility>

#include "it8/chart_file_text.h"
#include "it8/file_path.h"
#include "it8/read/chart_line_reader.h"

CIT8ReaderWriter::CIT8ReaderWriter() = default;

CIT8ReaderWriter::~CIT8ReaderWriter() = default;

int CIT8ReaderWriter::CanReadFile(std::wstring /*path*/) {
    return 1;
}

void CIT8ReaderWriter::ResetReaderState() {
    ResetChart();
    fieldColumns.clear();
    spectralColumns.clear();
    nColorColumns.clear();
    deviceControlLines.clear();
    processColorIds.clear();
    lastRowMask = 0;
}

int CIT8ReaderWriter::ReadChartFile(std::wstring path) {
    if (path.empty()) {
        return 4;
    }
    // The whole file is read at once and closed again before parsing starts, so
    // the parse works on memory and no file stays open on any way out. Only a
    // regular file is read: a device or a pipe answers 3.
    std::string text;
    if (!it8::ReadChartFileText(it8::ToFileSystemPath(path), text)) {
        return 3;
    }
    crLineEnds = it8::HasCrLineEnds(text);
    chartStream.Open(std::move(text), crLineEnds);
    const it8::ChartLineReaderCloser closer(chartStream);

    ResetReaderState();
    filePath = std::move(path);
    int code = 0;
    try {
        code = ParseChartText();
    } catch (...) {
        // A patch that cannot be built (an unreadable spectral field name) or
        // exhausted memory ends the read: no half-read chart stays behind.
        ResetReaderState();
        throw;
    }
    if (code != 0) {
        ResetReaderState();
    }
    // May throw the whole-number errors for NUMBER_OF_STRIPS or NUMBER_OF_COLS
    // without a number; the chart read so far stays in the store then.
    ReadLayoutKeywords();
    return code;
}
