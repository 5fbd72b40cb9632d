// Chart texts and reading helpers shared by the reader tests.
#pragma once

#include <gtest/gtest.h>

#include <initializer_list>
#include <string>

#include "it8/it8_reader_writer.h"
#include "temp_files.h"

namespace reader_test {

/// The lines joined, each followed by `lineEnd`.
inline std::string Lines(std::initializer_list<std::string> lines,
                         const std::string& lineEnd = "\n") {
    std::string text;
    for (const std::string& line : lines) {
        text += line + lineEnd;
    }
    return text;
}

/// A chart of one data block; `sets` < 0 announces as many sets as there are rows.
inline std::string Chart(const std::string& fields, std::initializer_list<std::string> rows,
                         int sets = -1) {
    const int count = sets < 0 ? static_cast<int>(rows.size()) : sets;
    return Lines({"NUMBER_OF_SETS " + std::to_string(count), "BEGIN_DATA_FORMAT", fields,
                  "END_DATA_FORMAT", "BEGIN_DATA"}) +
           Lines(rows) + "END_DATA\n";
}

/// Two CMYK and Lab patches (SAMPLE_IDs 101, 102) behind an identification line, a
/// quoted keyword and a skipped section; NUMBER_OF_SETS after the format.
inline std::string CmykLabChart(const std::string& lineEnd = "\n") {
    return Lines({"CGATS.17", "ORIGINATOR\t\"Chart maker\"", "BEGIN_MEASUREMENT_SCRIPT",
                  "NUMBER_OF_SETS 99", "END_MEASUREMENT_SCRIPT", "NUMBER_OF_FIELDS 9",
                  "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K LAB_L LAB_A LAB_B",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS 2", "BEGIN_DATA",
                  "101 A1 0 10 20 30 95.5 -1.25 2.5", "102 A2 100 0 0 0 55 -37 -50", "END_DATA"},
                 lineEnd);
}

/// Writes `text` to `name` in `dir` and reads it.
inline int ReadText(CIT8ReaderWriter& reader, const test_support::TempDir& dir,
                    const std::string& text, const std::string& name = "chart.txt") {
    return reader.ReadChartFile(test_support::Wide(dir.write(name, text)));
}

/// Copy of a patch that must exist.
inline CColorPatch PatchOf(CIT8ReaderWriter& reader, int sample) {
    int result = -1;
    CColorPatch patch = reader.GetPatch(sample, result);
    EXPECT_EQ(result, 0) << "sample " << sample;
    return patch;
}

} // namespace reader_test
