#include "it8/write/white_point_columns.h"

#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/line_text.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"
#include "patch/text_number.h"

namespace it8 {
namespace {

// The identifier column: the first field name containing "ID", or the first
// field name when none does.
std::string IdentifierField(const std::string& fieldLine) {
    const std::vector<std::string> names = CIT8ReaderWriter::SplitLine(fieldLine, "\t ");
    for (const std::string& name : names) {
        if (Contains(name, "ID")) {
            return name;
        }
    }
    return names.empty() ? std::string() : names.front();
}

std::string QuotedXYZ(const tagXYZ& xyz) {
    return '"' + FormatGeneral(xyz.x) + '\t' + FormatGeneral(xyz.y) + '\t' + FormatGeneral(xyz.z) +
           '"';
}

std::string QuotedSpectrum(const std::map<std::string, double>& spectrum) {
    std::string text = "\"";
    for (const auto& field : spectrum) {
        text += FormatGeneral(field.second) + '\t';
    }
    return text + '"';
}

// One list entry that, written with its line end, gives an empty line and
// four pairs of KEYWORD declaration and quoted values.
std::string WhitePointBlock(const CColorPatch& measuredWhite, const CColorPatch& profileWhite) {
    return "\nKEYWORD\tWHITE_POINT_MEASURED_XYZ\nWHITE_POINT_MEASURED_XYZ\t" +
           QuotedXYZ(measuredWhite.GetXYZ()) +
           "\nKEYWORD\tWHITE_POINT_MEASURED_SPECTRAL\nWHITE_POINT_MEASURED_SPECTRAL\t" +
           QuotedSpectrum(measuredWhite.GetSpectralData()) +
           "\nKEYWORD\tWHITE_POINT_PROFILE_XYZ\nWHITE_POINT_PROFILE_XYZ\t" +
           QuotedXYZ(profileWhite.GetXYZ()) +
           "\nKEYWORD\tWHITE_POINT_PROFILE_SPECTRAL\nWHITE_POINT_PROFILE_SPECTRAL\t" +
           QuotedSpectrum(profileWhite.GetSpectralData());
}

} // namespace

int WriteColumnsWithWhitePoint(const std::wstring& templatePath, const std::wstring& targetPath,
                               const TemplateLists& lists, const CColorPatch& measuredWhite,
                               const CColorPatch& profileWhite, const DiagnosticSink& sink) {
    TemplateChart chart;
    const int loadResult = LoadTemplate(templatePath, chart);
    if (loadResult != 0) {
        return loadResult;
    }
    if (!lists.Cover(chart.RowCount())) {
        return 24;
    }

    int fieldCount = 0;
    if (!chart.FieldLine().empty()) {
        sink.Print(chart.FieldLine());
        chart.FieldLine() = IdentifierField(chart.FieldLine());
        fieldCount = 1;
        sink.Print(chart.FieldLine());
    }
    if (!lists.cmyk.empty()) {
        chart.FieldLine() += "\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K";
        fieldCount += 4;
        // The template's own row fields give way to a fresh numbering.
        for (std::size_t r = 0; r < chart.RowCount(); ++r) {
            const tagCMYK& v = lists.cmyk[r];
            chart.Row(r) = FormatInteger(static_cast<long long>(r) + 1) + '\t' +
                           FormatFixed(v.c, 2) + '\t' + FormatFixed(v.m, 2) + '\t' +
                           FormatFixed(v.y, 2) + '\t' + FormatFixed(v.k, 2);
        }
    }
    fieldCount += AppendMeasurementColumns(chart, lists);
    if (!lists.spectral.empty()) {
        const std::map<std::string, double>& first = lists.spectral.front();
        for (const auto& field : first) {
            sink.Print('\n' + field.first + " : " + FormatFixed(field.second, 5) + '\n');
        }
        sink.Print("sdMap.size(): " + FormatInteger(static_cast<long long>(first.size())) + '\n');
    }

    const std::size_t fieldsIndex = FindLineContaining(chart.lines, "NUMBER_OF_FIELDS");
    if (fieldsIndex < chart.lines.size()) {
        // The old value is only validated: it must be a 32-bit number.
        const std::vector<std::string> tokens =
            CIT8ReaderWriter::SplitLine(chart.lines[fieldsIndex], "\t ");
        if (tokens.size() > 1) {
            static_cast<void>(text_number::ParseLongStrict(tokens[1]));
        }
        chart.lines[fieldsIndex] = "NUMBER_OF_FIELDS\t" + FormatInteger(fieldCount);
    }

    // The template's last line, normally "END_DATA", is replaced by "END_DATA".
    const std::size_t templateLines = chart.lines.size();
    chart.lines.insert(chart.lines.begin() +
                           static_cast<std::ptrdiff_t>(chart.sections.formatIndex),
                       WhitePointBlock(measuredWhite, profileWhite));
    chart.lines.resize(templateLines);
    chart.lines.emplace_back("END_DATA");

    return WriteLinesToFile(ToFileSystemPath(targetPath), chart.lines) ? 0 : 23;
}

} // namespace it8

int CIT8ReaderWriter::AppendColumnsWithWhitePoint(std::wstring templatePath,
                                                  std::wstring targetPath,
                                                  CColorPatch measuredWhite,
                                                  CColorPatch profileWhite) {
    const it8::TemplateLists lists{cmykList, xyzList, labList, rgbList, spectralList};
    return it8::WriteColumnsWithWhitePoint(templatePath, targetPath, lists, measuredWhite,
                                           profileWhite, it8::DiagnosticSink());
}
