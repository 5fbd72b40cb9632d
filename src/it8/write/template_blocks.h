// Columns the template writers append to a template chart's lines.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <vector>

#include "it8/write/chart_sections.h"
#include "redavudeva/records.h"

namespace it8 {

/// The store lists a template writer prints, by reference.
struct TemplateLists {
    const std::vector<tagCMYK>& cmyk;
    const std::vector<tagXYZ>& xyz;
    const std::vector<tagLAB>& lab;
    const std::vector<tagRGB>& rgb;
    const std::vector<std::map<std::string, double>>& spectral;

    /// True when every non-empty list can fill `rows` rows (see store_list_checks.h).
    bool Cover(std::size_t rows) const;
};

/// A template's lines with its sections; the worked rows are the lines between
/// "BEGIN_DATA" and the last line, and row r takes store entry r.
struct TemplateChart {
    std::vector<std::string> lines;
    ChartSections sections;

    std::string& FieldLine() { return lines[sections.FieldLineIndex()]; }
    std::size_t RowCount() const { return sections.rowCount; }
    std::string& Row(std::size_t r) { return lines[sections.FirstRowIndex() + r]; }
};

/// Reads and locates a template: 0, 21 (unreadable) or 24 (no data format or
/// no data block).
int LoadTemplate(const std::wstring& path, TemplateChart& chart);

/// Appends the CMYK names to the field-name line and "\t%.2f" of C, M, Y, K to
/// each worked row. Returns the number of fields added.
int AppendCMYKColumns(TemplateChart& chart, const std::vector<tagCMYK>& cmyk);

/// Appends the XYZ ("%9.2f"), Lab ("%.2f"), RGB ("%d") and spectral ("%.5f")
/// columns of the non-empty lists, in that order. Returns the number of fields added.
int AppendMeasurementColumns(TemplateChart& chart, const TemplateLists& lists);

} // namespace it8
