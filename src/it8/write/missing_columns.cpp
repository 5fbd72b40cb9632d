// Appending the colour spaces a source chart lacks and the store holds.
#include <algorithm>
#include <functional>
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

// One colour space to append: the source must lack it and the store hold it.
struct MissingSpace {
    bool sourceHasIt;
    std::size_t entries;    // length of the store's list
    bool isCMYK;            // CMYK takes the equality test whatever the flag
    bool entriesUsable;     // spectra with names that match the first one's
    std::string fieldNames; // appended to the field-name line, space-separated
    int fieldCount;         // how many names that text adds
    std::function<std::string(std::size_t)> values; // " v1 v2 ..." of entry r
};

std::string Fixed(std::initializer_list<double> values, int decimals) {
    std::string text;
    for (const double value : values) {
        text += ' ' + it8::FormatFixed(value, decimals);
    }
    return text;
}

} // namespace

int CIT8ReaderWriter::AppendMissingColumns(std::wstring sourcePath, std::wstring targetPath,
                                           bool exactCounts) {
    CIT8ReaderWriter source;
    std::vector<std::string> lines;
    it8::ChartSections sections;
    if (const int loaded = LoadMergeSource(sourcePath, source, lines, sections); loaded != 0) {
        return loaded;
    }
    const long long firstSets = originalNumberOfSets;
    const long long fileRows = static_cast<long long>(sections.rowCount);
    const long long worked =
        std::max(0LL, exactCounts ? std::max<long long>(firstSets, numberOfSets)
                                  : std::min<long long>(firstSets, numberOfSets));
    // The worked rows have to exist in the source.
    if (worked > fileRows) {
        return 24;
    }
    const std::size_t rows = static_cast<std::size_t>(worked);
    int fieldCount = source.numberOfFields;

    std::string spectralNames;
    for (const auto& field : spectralList.empty() ? SpectralMap() : spectralList.front()) {
        spectralNames += ' ' + field.first;
    }
    const std::vector<MissingSpace> spaces = {
        {source.IsColorSpacePresent(COLORSPACE_CMYK), cmykList.size(), true, true,
         " CMYK_C CMYK_M CMYK_Y CMYK_K", 4,
         [this](std::size_t r) {
             const tagCMYK& v = cmykList[r];
             return Fixed({v.c, v.m, v.y, v.k}, 2);
         }},
        {source.IsColorSpacePresent(COLORSPACE_XYZ), xyzList.size(), false, true,
         " XYZ_X XYZ_Y XYZ_Z", 3,
         [this](std::size_t r) {
             return Fixed({xyzList[r].x, xyzList[r].y, xyzList[r].z}, 2);
         }},
        {source.IsColorSpacePresent(COLORSPACE_LAB), labList.size(), false, true,
         " LAB_L LAB_A LAB_B", 3,
         [this](std::size_t r) {
             return Fixed({labList[r].l, labList[r].a, labList[r].b}, 2);
         }},
        {source.IsColorSpacePresent(COLORSPACE_RGB), rgbList.size(), false, true,
         " RGB_R RGB_G RGB_B", 3,
         [this](std::size_t r) {
             const tagRGB& v = rgbList[r];
             return ' ' + it8::FormatInteger(v.r) + ' ' + it8::FormatInteger(v.g) + ' ' +
                    it8::FormatInteger(v.b);
         }},
        {source.IsColorSpacePresent(COLORSPACE_DENSITY), densityList.size(), false, true,
         " D_RED D_GREEN D_BLUE D_VIS", 4,
         [this](std::size_t r) {
             const tagDENSITY& v = densityList[r];
             return Fixed({v.red, v.green, v.blue, v.visual}, 5);
         }},
        {source.IsColorSpacePresent(COLORSPACE_SPECTRAL), spectralList.size(), false,
         it8::SpectralListCovers(spectralList, rows),
         it8::ReplaceAll(spectralNames, "SPECTRAL_NM", "SPECTRAL"),
         spectralList.empty() ? 0 : static_cast<int>(spectralList.front().size()),
         [this](std::size_t r) {
             // The first value follows the row after a space, as every later one does.
             std::string text = " ";
             bool first = true;
             for (const auto& field : spectralList[r]) {
                 text += (first ? "" : " ") + it8::FormatFixed(field.second, 5);
                 first = false;
             }
             return text;
         }},
    };

    std::string& fieldLine = lines[sections.FieldLineIndex()];
    for (const MissingSpace& space : spaces) {
        if (space.sourceHasIt || space.entries == 0) {
            continue;
        }
        const long long entries = static_cast<long long>(space.entries);
        const bool countFits = (space.isCMYK || exactCounts)
                                   ? (entries == firstSets || entries == fileRows)
                                   : (entries >= firstSets && entries <= fileRows);
        // Every worked row takes one entry, so the list may not be shorter.
        if (!countFits || space.entries < rows || !space.entriesUsable) {
            return 24;
        }
        fieldLine += space.fieldNames;
        fieldCount += space.fieldCount;
        for (std::size_t r = 0; r < rows; ++r) {
            std::string& row = lines[sections.FirstRowIndex() + r];
            row = it8::ReplaceAll(row + space.values(r), ",", ".");
        }
    }

    const std::size_t fieldsIndex = it8::FindLineContaining(lines, "NUMBER_OF_FIELDS");
    const bool hasFieldsLine = fieldsIndex < lines.size();
    if (hasFieldsLine) {
        lines[fieldsIndex] = "NUMBER_OF_FIELDS " + it8::FormatInteger(fieldCount);
    }

    std::vector<std::string> output;
    for (const auto& keyword : keywordList) {
        output.push_back(keyword.first + ' ' + keyword.second);
    }
    if (!it8::HasIdentification(lines.front())) {
        output.emplace_back("CGATS.17");
    }
    const std::string setsLine =
        "NUMBER_OF_SETS " + it8::FormatInteger(exactCounts ? numberOfSets : originalNumberOfSets);
    for (std::size_t i = 0; i <= sections.dataIndex + rows; ++i) {
        std::string line = it8::SpacesToTabsUnlessQuoted(lines[i]);
        if (!hasFieldsLine && it8::Contains(line, "BEGIN_DATA_FORMAT")) {
            output.push_back("NUMBER_OF_FIELDS\t" + it8::FormatInteger(fieldCount));
        }
        if (!it8::Contains(line, "ORIGINAL_NUMBER_OF_SETS") &&
            it8::Contains(line, "NUMBER_OF_SETS")) {
            line = setsLine;
        }
        output.push_back(std::move(line));
    }
    output.emplace_back("END_DATA");

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), output) ? 0 : 23;
}
