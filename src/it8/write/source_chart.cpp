// The source chart of the merge and target writers, read both ways.
#include <string>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "it8/write/chart_sections.h"

int CIT8ReaderWriter::LoadSourceChart(const std::wstring& path, CIT8ReaderWriter& source,
                                      std::vector<std::string>& lines) {
    // The chart tells which colour spaces and patches the file holds; the lines
    // are what the writer edits.
    if (source.ReadChartFile(path) != 0) {
        return 22;
    }
    return ReadFileLines(path, lines);
}

int CIT8ReaderWriter::LoadMergeSource(const std::wstring& path, CIT8ReaderWriter& source,
                                      std::vector<std::string>& lines,
                                      it8::ChartSections& sections) {
    if (const int loaded = LoadSourceChart(path, source, lines); loaded != 0) {
        return loaded;
    }
    sections = it8::LocateSections(lines);
    if (originalNumberOfSets < 1) {
        originalNumberOfSets = numberOfSets;
    }
    return sections.usable ? 0 : 24;
}
