// Rebuilding a source chart's data block with the store's measurements.
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/chart_sections.h"
#include "it8/write/line_text.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"
#include "it8/write/store_list_checks.h"

namespace {

// Values of one row, each followed by a tab, in general notation with six
// significant digits.
class RowText {
public:
    void Add(double value) { text_ += it8::FormatGeneral(value) + '\t'; }
    void Add(int value) { text_ += it8::FormatInteger(value) + '\t'; }
    // A decimal comma never reaches the file.
    std::string Finish() const { return it8::ReplaceAll(text_, ",", "."); }

private:
    std::string text_;
};

double ChannelValue(const std::map<int, tagNCLR>& channels, int channel) {
    const auto found = channels.find(channel);
    return found == channels.end() ? 0.0 : found->second.value;
}

} // namespace

int CIT8ReaderWriter::WriteMeasurementFile(std::wstring sourcePath, std::wstring targetPath) {
    CIT8ReaderWriter source;
    std::vector<std::string> lines;
    it8::ChartSections sections;
    if (const int loaded = LoadMergeSource(sourcePath, source, lines, sections); loaded != 0) {
        return loaded;
    }
    const std::size_t rows = sections.rowCount;
    if (numberOfSets < 0 || rows != static_cast<std::size_t>(numberOfSets) ||
        (!xyzList.empty() && xyzList.size() != rows) || !it8::ListCovers(labList, rows) ||
        !it8::ListCovers(densityList, rows) || !it8::SpectralListCovers(spectralList, rows)) {
        return 24;
    }
    const std::string firstLine = lines.front();
    const std::size_t fieldsIndex = it8::FindLineStartingWith(lines, "NUMBER_OF_FIELDS");
    lines.resize(sections.dataIndex + 1);

    const bool sourceCMYK = source.IsColorSpacePresent(COLORSPACE_CMYK);
    const bool sourceRGB = source.IsColorSpacePresent(COLORSPACE_RGB);
    const bool sourceNColor = source.IsColorSpacePresent(COLORSPACE_NCOLOR);
    int patchResult = 0;
    const std::map<int, tagNCLR> firstChannels = source.GetPatch(1, patchResult).GetNColorMap();
    const int channelCount = static_cast<int>(firstChannels.size());

    std::string fieldNames = "SAMPLE_ID\t";
    int fieldCount = 1;
    if (sourceCMYK) {
        fieldNames += "CMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t";
        fieldCount += 4;
    }
    if (sourceRGB) {
        fieldNames += "RGB_R\tRGB_G\tRGB_B\t";
        fieldCount += 3;
    }
    if (sourceNColor) {
        for (int channel = 0; channel < channelCount; ++channel) {
            const auto found = firstChannels.find(channel);
            fieldNames +=
                (found == firstChannels.end() ? std::string() : found->second.name) + '\t';
        }
        fieldCount += channelCount;
    }
    if (!labList.empty()) {
        fieldNames += "LAB_L\tLAB_A\tLAB_B\t";
        fieldCount += 3;
    }
    if (!xyzList.empty()) {
        fieldNames += "XYZ_X\tXYZ_Y\tXYZ_Z\t";
        fieldCount += 3;
    }
    if (!densityList.empty()) {
        fieldNames += "D_RED\tD_GREEN\tD_BLUE\tD_VIS\t";
        fieldCount += 4;
    }
    if (!spectralList.empty()) {
        for (const auto& field : spectralList.front()) {
            std::string name = field.first;
            const std::size_t lead =
                name.size() > 10 ? name.find("SPECTRAL_NM") : std::string::npos;
            if (lead != std::string::npos) {
                name.replace(lead, 11, "SPECTRAL");
            }
            fieldNames += name + '\t';
            ++fieldCount;
        }
    }
    lines[sections.FieldLineIndex()] = fieldNames;

    const std::string fieldsLine = "NUMBER_OF_FIELDS\t" + it8::FormatInteger(fieldCount);
    if (fieldsIndex < lines.size()) {
        lines[fieldsIndex] = fieldsLine;
    } else {
        lines.insert(lines.begin() + static_cast<std::ptrdiff_t>(sections.formatIndex), fieldsLine);
    }

    std::vector<std::string> output;
    if (!it8::HasIdentification(firstLine)) {
        output.emplace_back("CGATS.17");
    }
    for (const std::string& line : lines) {
        output.push_back(it8::SpacesToTabsUnlessQuoted(line));
    }
    for (std::size_t k = 0; k < rows; ++k) {
        RowText row;
        const int sampleId = static_cast<int>(k) + 1;
        row.Add(sampleId);
        const CColorPatch patch = source.GetPatch(sampleId, patchResult);
        if (sourceCMYK) {
            const tagCMYK cmyk = patch.GetCMYK();
            for (const double value : {cmyk.c, cmyk.m, cmyk.y, cmyk.k}) {
                row.Add(value);
            }
        }
        if (sourceRGB) {
            const tagRGB rgb = patch.GetRGB();
            for (const int value : {rgb.r, rgb.g, rgb.b}) {
                row.Add(value);
            }
        }
        if (sourceNColor) {
            const std::map<int, tagNCLR> channels = patch.GetNColorMap();
            for (int channel = 0; channel < channelCount; ++channel) {
                row.Add(ChannelValue(channels, channel));
            }
        }
        if (!labList.empty()) {
            for (const double value : {labList[k].l, labList[k].a, labList[k].b}) {
                row.Add(value);
            }
        }
        if (!xyzList.empty()) {
            for (const double value : {xyzList[k].x, xyzList[k].y, xyzList[k].z}) {
                row.Add(value);
            }
        }
        if (!densityList.empty()) {
            const tagDENSITY& d = densityList[k];
            for (const double value : {d.red, d.green, d.blue, d.visual}) {
                row.Add(value);
            }
        }
        if (!spectralList.empty()) {
            for (const auto& field : spectralList[k]) {
                row.Add(field.second);
            }
        }
        output.push_back(row.Finish());
    }
    output.emplace_back("END_DATA");

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), output) ? 0 : 23;
}
