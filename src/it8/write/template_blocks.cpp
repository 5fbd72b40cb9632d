#include "it8/write/template_blocks.h"

#include "it8/it8_reader_writer.h"
#include "it8/write/number_format.h"
#include "it8/write/store_list_checks.h"

namespace it8 {
namespace {

void AppendNames(std::string& fieldLine, std::initializer_list<const char*> names) {
    for (const char* name : names) {
        fieldLine += '\t';
        fieldLine += name;
    }
}

void AppendFixed(std::string& row, std::initializer_list<double> values, int width) {
    for (const double value : values) {
        row += '\t' + FormatFixedWidth(value, width, 2);
    }
}

} // namespace

bool TemplateLists::Cover(std::size_t rows) const {
    return ListCovers(cmyk, rows) && ListCovers(xyz, rows) && ListCovers(lab, rows) &&
           ListCovers(rgb, rows) && SpectralListCovers(spectral, rows);
}

int LoadTemplate(const std::wstring& path, TemplateChart& chart) {
    const int result = CIT8ReaderWriter::ReadFileLines(path, chart.lines);
    if (result != 0) {
        return result;
    }
    chart.sections = LocateSections(chart.lines);
    return chart.sections.usable ? 0 : 24;
}

int AppendCMYKColumns(TemplateChart& chart, const std::vector<tagCMYK>& cmyk) {
    if (cmyk.empty()) {
        return 0;
    }
    AppendNames(chart.FieldLine(), {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"});
    for (std::size_t r = 0; r < chart.RowCount(); ++r) {
        AppendFixed(chart.Row(r), {cmyk[r].c, cmyk[r].m, cmyk[r].y, cmyk[r].k}, 0);
    }
    return 4;
}

int AppendMeasurementColumns(TemplateChart& chart, const TemplateLists& lists) {
    int added = 0;
    if (!lists.xyz.empty()) {
        AppendNames(chart.FieldLine(), {"XYZ_X", "XYZ_Y", "XYZ_Z"});
        for (std::size_t r = 0; r < chart.RowCount(); ++r) {
            // Right-aligned in nine characters, as other programs expect.
            AppendFixed(chart.Row(r), {lists.xyz[r].x, lists.xyz[r].y, lists.xyz[r].z}, 9);
        }
        added += 3;
    }
    if (!lists.lab.empty()) {
        AppendNames(chart.FieldLine(), {"LAB_L", "LAB_A", "LAB_B"});
        for (std::size_t r = 0; r < chart.RowCount(); ++r) {
            AppendFixed(chart.Row(r), {lists.lab[r].l, lists.lab[r].a, lists.lab[r].b}, 0);
        }
        added += 3;
    }
    if (!lists.rgb.empty()) {
        AppendNames(chart.FieldLine(), {"RGB_R", "RGB_G", "RGB_B"});
        for (std::size_t r = 0; r < chart.RowCount(); ++r) {
            const tagRGB& v = lists.rgb[r];
            chart.Row(r) +=
                '\t' + FormatInteger(v.r) + '\t' + FormatInteger(v.g) + '\t' + FormatInteger(v.b);
        }
        added += 3;
    }
    if (!lists.spectral.empty()) {
        for (const auto& field : lists.spectral.front()) {
            chart.FieldLine() += '\t' + field.first;
            ++added;
        }
        for (std::size_t r = 0; r < chart.RowCount(); ++r) {
            // The values start after an empty position: two tabs before the first.
            std::string& row = chart.Row(r);
            row += '\t';
            for (const auto& field : lists.spectral[r]) {
                row += '\t' + FormatFixed(field.second, 5);
            }
        }
    }
    return added;
}

} // namespace it8
