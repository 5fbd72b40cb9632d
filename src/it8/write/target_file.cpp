// Rewriting a target (layout) file for the chart's clean and white patches.
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/chart_sections.h"
#include "it8/write/line_text.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"

namespace {

double ChannelValue(const std::map<int, tagNCLR>& channels, int channel) {
    const auto found = channels.find(channel);
    return found == channels.end() ? 0.0 : found->second.value;
}

// The layout keywords that follow the new patch count, each written as the
// keyword, one space and the count; the field count follows the new format.
std::string RewriteLayoutLine(const std::string& line, int patchCount, int columns,
                              int fieldCount) {
    const auto with = [](const char* keyword, long long value) {
        return std::string(keyword) + ' ' + it8::FormatInteger(value);
    };
    if (it8::StartsWith(line, "PATCHES_PER_PAGE")) {
        return with("PATCHES_PER_PAGE", patchCount);
    }
    if (it8::StartsWith(line, "NUMBER_OF_STRIPS")) {
        // Strips of `columns` patches, the last one possibly short; without a
        // column count there is no strip layout.
        const long long strips = columns > 0 ? (patchCount + columns - 1LL) / columns : 0;
        return with("NUMBER_OF_STRIPS", strips);
    }
    if (it8::StartsWith(line, "ORIGINAL_NUMBER_OF_SETS")) {
        return with("ORIGINAL_NUMBER_OF_SETS", patchCount);
    }
    if (it8::StartsWith(line, "NUMBER_OF_SETS")) {
        return with("NUMBER_OF_SETS", patchCount);
    }
    // The data format changed, so the field count the file announces must too,
    // or the file could not be read back.
    if (it8::StartsWith(line, "NUMBER_OF_FIELDS")) {
        return "NUMBER_OF_FIELDS\t" + it8::FormatInteger(fieldCount);
    }
    return line;
}

} // namespace

int CIT8ReaderWriter::WriteTargetFile(std::wstring sourcePath, std::wstring targetPath) {
    CIT8ReaderWriter source;
    std::vector<std::string> lines;
    if (const int loaded = LoadSourceChart(sourcePath, source, lines); loaded != 0) {
        return loaded;
    }
    std::vector<CColorPatch> selected;
    if (SelectCleanAndWhitePatches(selected, true)) {
        return 1;
    }
    const it8::ChartSections sections = it8::LocateSections(lines);
    if (!sections.usable) {
        return 24;
    }
    lines.resize(sections.dataIndex + 1);

    std::string fieldNames = "SAMPLE_ID";
    int fieldCount = 1;
    if (source.IsColorSpacePresent(COLORSPACE_NCOLOR)) {
        const int channels = static_cast<int>(selected.front().GetNColorMap().size());
        for (int k = 1; k <= channels; ++k) {
            fieldNames += '\t' + it8::FormatInteger(channels) + "CLR_" + it8::FormatInteger(k);
        }
        fieldCount += channels;
        for (std::size_t i = 0; i < selected.size(); ++i) {
            const std::map<int, tagNCLR> values = selected[i].GetNColorMap();
            std::string row = it8::FormatInteger(static_cast<long long>(i) + 1) + '\t';
            for (int channel = 0; channel < channels; ++channel) {
                row += '\t' + it8::FormatFixed(ChannelValue(values, channel), 2);
            }
            lines.push_back(std::move(row));
        }
    } else if (source.IsColorSpacePresent(COLORSPACE_CMYK)) {
        // The spaces become tabs when the lines are written.
        fieldNames += "\tCMYK_C\t CMYK_M CMYK_Y CMYK_K";
        fieldCount += 4;
        for (std::size_t i = 0; i < selected.size(); ++i) {
            const tagCMYK cmyk = selected[i].GetCMYK();
            lines.push_back(it8::FormatInteger(static_cast<long long>(i) + 1) + '\t' +
                            it8::FormatFixed(cmyk.c, 2) + '\t' + it8::FormatFixed(cmyk.m, 2) +
                            '\t' + it8::FormatFixed(cmyk.y, 2) + '\t' +
                            it8::FormatFixed(cmyk.k, 2));
        }
    }
    lines[sections.FieldLineIndex()] = fieldNames;

    const int patchCount = static_cast<int>(selected.size());
    std::vector<std::string> output;
    for (const auto& keyword : keywordList) {
        output.push_back(keyword.first + ' ' + keyword.second);
    }
    for (const std::string& line : lines) {
        output.push_back(RewriteLayoutLine(it8::SpacesToTabsUnlessQuoted(line), patchCount,
                                           numberOfCols, fieldCount));
    }
    output.emplace_back("END_DATA");

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), output) ? 0 : 23;
}
