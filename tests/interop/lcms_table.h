// Charts as Little CMS reads and writes them, for the interoperability tests.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace interop {

/// The first table of a chart file as Little CMS loaded it.
struct LcmsTable {
    bool loaded = false;
    std::string error;     ///< Little CMS's message when the load failed
    std::string sheetType; ///< the identification line
    int tableCount = 0;
    int numberOfSets = 0;   ///< NUMBER_OF_SETS of the first table
    int numberOfFields = 0; ///< NUMBER_OF_FIELDS of the first table
    std::vector<std::string> fields;
    std::vector<std::vector<std::string>> text; ///< cell text, [row][field]
    std::vector<std::vector<double>> numbers;   ///< cells read as numbers, [row][field]
    std::vector<std::pair<std::string, std::string>> properties; ///< header keywords

    /// Index of a field, or -1.
    int Field(const std::string& name) const;
    /// Value of a header keyword ("" when absent).
    std::string Property(const std::string& name) const;
};

/// Loads a chart file with cmsIT8LoadFromFile.
LcmsTable LoadWithLcms(const std::filesystem::path& path);

/// A table to be saved by Little CMS: text cells are written as strings,
/// numeric cells as doubles.
struct LcmsCell {
    bool isText = false;
    std::string text;
    double number = 0.0;
};

/// Saves one table with cmsIT8SaveToFile under the identification "CGATS.17";
/// answers false when Little CMS refuses.
bool SaveWithLcms(const std::filesystem::path& path, const std::vector<std::string>& fields,
                  const std::vector<std::vector<LcmsCell>>& rows);

} // namespace interop
