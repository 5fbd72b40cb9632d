// Charts as Little CMS reads and writes them, and the values our reader keeps
// for the same fields, for the interoperability tests.
#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <variant>
#include <vector>

#include "it8/it8_reader_writer.h"

namespace interop {

/// The first table of a chart file as Little CMS loaded it.
struct LcmsTable {
    bool loaded = false;
    std::string error;     ///< Little CMS's messages when the load failed
    std::string sheetType; ///< the identification line
    int numberOfSets = 0;
    int numberOfFields = 0;
    std::vector<std::string> fields;
    std::vector<std::vector<std::string>> text; ///< cell text, [row][field]
    std::vector<std::vector<double>> numbers;   ///< cells read as numbers, [row][field]
    std::map<std::string, std::string> properties;
};

/// Loads a chart file with cmsIT8LoadFromFile.
LcmsTable LoadWithLcms(const std::filesystem::path& path);

/// A cell to save: text is written as a string, a number as a double.
using LcmsCell = std::variant<double, std::string>;

/// Saves one table with cmsIT8SaveToFile under the identification "CGATS.17";
/// false when Little CMS refuses or reports an error.
bool SaveWithLcms(const std::filesystem::path& path, const std::vector<std::string>& fields,
                  const std::vector<std::vector<LcmsCell>>& rows);

/// The values our reader keeps for sample `sample` by field name: the colour
/// records (RGB as whole numbers), densities, spectral and n-colour values.
std::map<std::string, double> OurValues(CIT8ReaderWriter& chart, int sample);

} // namespace interop
