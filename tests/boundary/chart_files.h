// Chart files written by the host tests and read through a factory-made
// reader-writer, the way a host application uses the library.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "redavudeva/swatchlog_factory.h"
#include "temp_files.h"

namespace host_charts {

using Host = std::unique_ptr<CSwatchlogBase>;

/// A new chart reader-writer from the factory, owned as a host owns it.
inline Host NewHost() {
    return Host(CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
}

/// A chart text: identification, `header` lines, NUMBER_OF_SETS for the rows,
/// the one-line data format and the rows.
inline std::string ChartText(const std::string& fields, const std::vector<std::string>& rows,
                             const std::vector<std::string>& header = {}) {
    std::string text = "CGATS.17\n";
    for (const std::string& line : header) {
        text += line + "\n";
    }
    text += "NUMBER_OF_SETS\t" + std::to_string(rows.size()) + "\n";
    text += "BEGIN_DATA_FORMAT\n" + fields + "\nEND_DATA_FORMAT\nBEGIN_DATA\n";
    for (const std::string& row : rows) {
        text += row + "\n";
    }
    return text + "END_DATA\n";
}

/// A host with a temporary folder; each read writes the chart text to a file first.
class HostChart : public ::testing::Test {
protected:
    /// Writes the chart to `name` and reads it: the result of ReadChartFile.
    int Read(const std::string& fields, const std::vector<std::string>& rows,
             const std::vector<std::string>& header = {}, const std::string& name = "chart.txt") {
        lastPath = dir.write(name, ChartText(fields, rows, header));
        return host->ReadChartFile(test_support::Wide(lastPath));
    }

    test_support::TempDir dir;
    Host host = NewHost();
    std::filesystem::path lastPath;
};

/// Labels of patches, in list order.
inline std::vector<std::string> Labels(const std::vector<CColorPatch>& patches) {
    std::vector<std::string> labels;
    for (const CColorPatch& patch : patches) {
        labels.push_back(patch.GetLabel());
    }
    return labels;
}

inline std::vector<double> Values(const tagCMYK& v) {
    return {v.c, v.m, v.y, v.k};
}
inline std::vector<double> Values(const tagXYZ& v) {
    return {v.x, v.y, v.z};
}
inline std::vector<double> Values(const tagLAB& v) {
    return {v.l, v.a, v.b};
}
inline std::vector<double> Values(const tagDENSITY& v) {
    return {v.red, v.green, v.blue, v.visual, v.majorFilter};
}

/// One record's values per entry of a list.
template <typename Record>
std::vector<std::vector<double>> ValueRows(const std::vector<Record>& list) {
    std::vector<std::vector<double>> rows;
    for (const Record& record : list) {
        rows.push_back(Values(record));
    }
    return rows;
}

} // namespace host_charts
