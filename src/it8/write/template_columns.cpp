// Appending the store's colour columns to a template chart's rows.
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/line_text.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"
#include "it8/write/template_blocks.h"
#include "patch/text_number.h"

int CIT8ReaderWriter::AppendColumnsToFile(const std::wstring& templatePath,
                                          const std::wstring& targetPath) {
    it8::TemplateChart chart;
    const int loadResult = it8::LoadTemplate(templatePath, chart);
    if (loadResult != 0) {
        return loadResult;
    }
    const it8::TemplateLists lists{cmykList, xyzList, labList, rgbList, spectralList};
    if (!lists.Cover(chart.RowCount())) {
        return 24;
    }
    long long added = it8::AppendCMYKColumns(chart, cmykList);
    added += it8::AppendMeasurementColumns(chart, lists);

    // The template's own field count grows by the fields added; a value that is
    // missing or not a number counts 0.
    const std::size_t fieldsIndex = it8::FindLineContaining(chart.lines, "NUMBER_OF_FIELDS");
    if (fieldsIndex < chart.lines.size()) {
        const std::vector<std::string> tokens = SplitLine(chart.lines[fieldsIndex], "\t ");
        const long long value = tokens.size() > 1 ? text_number::ParseIntLenient(tokens[1]) : 0;
        chart.lines[fieldsIndex] = "NUMBER_OF_FIELDS\t" + it8::FormatInteger(value + added);
    }

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), chart.lines) ? 0 : 23;
}
