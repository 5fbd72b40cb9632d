// Writing a new chart file from the store's value lists alone.
#include <algorithm>
#include <array>
#include <initializer_list>
#include <map>
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"
#include "it8/write/store_list_checks.h"
#include "it8/write/text_builder.h"

namespace {

// Each value as a tab and "%.2f".
void AppendFixedColumns(it8::TextBuilder& text, std::initializer_list<double> values) {
    for (const double value : values) {
        text.Append('\t');
        text.AppendFixed(value, 2);
    }
}

// The first row's keys, which name the spectral or n-colour columns.
template <typename Key, typename Value>
std::vector<Key> KeysOf(const std::vector<std::map<Key, Value>>& list) {
    std::vector<Key> keys;
    if (!list.empty()) {
        for (const auto& entry : list.front()) {
            keys.push_back(entry.first);
        }
    }
    return keys;
}

// Rows are written in blocks of this many, whose spectral and n-colour maps
// are read side by side: a map's entries lie apart in memory, and walking
// several maps at once lets their reads overlap instead of each waiting for
// the one before (for thousands of spectra, most of the writing time).
constexpr std::size_t kBlockRows = 8;

// The most room made for the data rows at once; beyond it the text grows as
// it is written.
constexpr std::size_t kMostRoomAtOnce = std::size_t{64} << 20;

// The values of maps [first, first + count) of `list`, count at most
// kBlockRows, into `values` row after row. False when a map's keys are not
// exactly `keys`.
template <typename Key, typename Value, typename Number>
bool GatherBlock(const std::vector<std::map<Key, Value>>& list, std::size_t first,
                 std::size_t count, const std::vector<Key>& keys, Number number,
                 std::vector<double>& values) {
    std::array<typename std::map<Key, Value>::const_iterator, kBlockRows> entries;
    const std::size_t columns = keys.size();
    for (std::size_t row = 0; row < count; ++row) {
        if (list[first + row].size() != columns) {
            return false;
        }
        entries[row] = list[first + row].begin();
    }
    values.resize(count * columns);
    for (std::size_t column = 0; column < columns; ++column) {
        for (std::size_t row = 0; row < count; ++row) {
            if (entries[row]->first != keys[column]) {
                return false;
            }
            values[row * columns + column] = number(entries[row]->second);
            ++entries[row];
        }
    }
    return true;
}

// A block row's map values: none for empty maps, else an extra tab, then a
// tab and the value of each column.
void AppendBlockColumns(it8::TextBuilder& text, const std::vector<double>& values, std::size_t row,
                        std::size_t columns, int decimals) {
    if (columns == 0) {
        return;
    }
    text.Append('\t');
    for (std::size_t column = 0; column < columns; ++column) {
        text.Append('\t');
        text.AppendFixed(values[row * columns + column], decimals);
    }
}

} // namespace

int CIT8ReaderWriter::WriteChartFile(std::wstring templatePath, std::wstring targetPath,
                                     bool append) {
    if (append) {
        return AppendColumnsToFile(templatePath, targetPath);
    }
    return WriteNewChartFile(targetPath);
}

std::uint32_t CIT8ReaderWriter::CountDataFields(std::uint32_t& setCount) {
    std::uint32_t fields = 0;
    setCount = 0;
    const auto count = [](std::size_t size) { return static_cast<std::uint32_t>(size); };
    if (!sampleNameList.empty()) {
        fields += 1;
    }
    // The device lists decide the set count, the last non-empty one winning.
    if (!cmykList.empty()) {
        fields += 4;
        setCount = count(cmykList.size());
    }
    if (!cmykogList.empty()) {
        fields += 6;
        setCount = count(cmykogList.size());
    }
    if (!cmykrgbList.empty()) {
        fields += 7;
        setCount = count(cmykrgbList.size());
    }
    // The measurement lists decide it only when no device list is present.
    const auto measured = [&](std::uint32_t columns, std::size_t entries) {
        fields += columns;
        if (setCount == 0) {
            setCount = count(entries);
        }
    };
    if (!xyzList.empty()) {
        measured(3, xyzList.size());
    }
    if (!labList.empty()) {
        measured(3, labList.size());
    }
    if (!rgbList.empty()) {
        measured(3, rgbList.size());
    }
    if (!spectralList.empty()) {
        measured(count(spectralList.front().size()), spectralList.size());
    }
    if (!nColorList.empty()) {
        measured(count(nColorList.front().size()), nColorList.size());
    }
    if (fields != 0) {
        fields += 1; // SAMPLE_ID
    }
    return fields;
}

std::string CIT8ReaderWriter::FormatDataFormatLine() {
    // The empty positions after CMYK_K and before the n-colour and spectral
    // names are part of the file layout other programs know; readers treat a
    // run of tabs as one separator.
    std::string line = "SAMPLE_ID";
    if (!sampleNameList.empty()) {
        line += "\tSAMPLE_NAME";
    }
    if (!nColorList.empty()) {
        line += '\t';
        for (const auto& channel : nColorList.front()) {
            line += '\t' + channel.second.name;
        }
    }
    if (!spectralList.empty()) {
        line += '\t';
        for (const auto& field : spectralList.front()) {
            line += '\t' + field.first;
        }
    }
    if (!cmykList.empty()) {
        line += "\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t";
    }
    if (!cmykogList.empty()) {
        line += "\t6CLR_1\t6CLR_2\t6CLR_3\t6CLR_4\t6CLR_5\t6CLR_6";
    }
    if (!cmykrgbList.empty()) {
        line += "\t7CLR_1\t7CLR_2\t7CLR_3\t7CLR_4\t7CLR_5\t7CLR_6\t7CLR_7";
    }
    if (!xyzList.empty()) {
        line += "\tXYZ_X\tXYZ_Y\tXYZ_Z";
    }
    if (!labList.empty()) {
        line += "\tLAB_L\tLAB_A\tLAB_B";
    }
    if (!rgbList.empty()) {
        line += "\tRGB_R\tRGB_G\tRGB_B";
    }
    return line;
}

// Every non-empty list must hold at least setCount entries (checked by
// WriteNewChartFile before it calls this). The rows go into one entry of
// `lines`, separated by line ends, so that thousands of rows cost neither a
// string each nor a string per number. When a row's spectral names or n-colour
// channels differ from the first row's, nothing is added, and
// WriteNewChartFile refuses the chart.
void CIT8ReaderWriter::AppendDataRows(std::vector<std::string>& lines, std::uint32_t setCount) {
    const std::vector<int> channels = KeysOf(nColorList);
    const std::vector<std::string> wavelengths = KeysOf(spectralList);
    const auto channelValue = [](const tagNCLR& channel) { return channel.value; };
    const auto spectralValue = [](double value) { return value; };
    std::vector<double> channelValues;
    std::vector<double> spectralValues;
    it8::TextBuilder text;
    for (std::size_t i = 0; i < setCount; ++i) {
        const std::size_t row = i % kBlockRows;
        if (row == 0) {
            const std::size_t rows = std::min<std::size_t>(kBlockRows, setCount - i);
            if ((!nColorList.empty() &&
                 !GatherBlock(nColorList, i, rows, channels, channelValue, channelValues)) ||
                (!spectralList.empty() &&
                 !GatherBlock(spectralList, i, rows, wavelengths, spectralValue, spectralValues))) {
                return;
            }
        }
        if (i == 1) {
            // Room for rows about as long as the first, made at once; capped,
            // as an unusually long first row must not claim room for thousands.
            text.Reserve(std::min(text.Size() * (setCount - 1) / 8 * 9, kMostRoomAtOnce));
        }
        if (i != 0) {
            text.Append('\n');
        }
        text.AppendInteger(static_cast<long long>(i) + 1);
        if (!sampleNameList.empty()) {
            text.Append('\t');
            text.Append(sampleNameList[i]);
        }
        AppendBlockColumns(text, channelValues, row, channels.size(), 2);
        AppendBlockColumns(text, spectralValues, row, wavelengths.size(), 5);
        if (!cmykList.empty()) {
            const tagCMYK& v = cmykList[i];
            AppendFixedColumns(text, {v.c, v.m, v.y, v.k});
        }
        if (!cmykogList.empty()) {
            const tagCMYKOG& v = cmykogList[i];
            AppendFixedColumns(text, {v.c, v.m, v.y, v.k, v.o, v.g});
        }
        if (!cmykrgbList.empty()) {
            const tagCMYKRGB& v = cmykrgbList[i];
            AppendFixedColumns(text, {v.c, v.m, v.y, v.k, v.r, v.g, v.b});
        }
        if (!xyzList.empty()) {
            const tagXYZ& v = xyzList[i];
            AppendFixedColumns(text, {v.x, v.y, v.z});
        }
        if (!labList.empty()) {
            const tagLAB& v = labList[i];
            AppendFixedColumns(text, {v.l, v.a, v.b});
        }
        if (!rgbList.empty()) {
            const tagRGB& v = rgbList[i];
            for (const int channel : {v.r, v.g, v.b}) {
                text.Append('\t');
                text.AppendInteger(channel);
            }
        }
    }
    lines.push_back(text.Take());
}

int CIT8ReaderWriter::WriteNewChartFile(const std::wstring& targetPath) {
    std::uint32_t setCount = 0;
    const std::uint32_t fieldCount = CountDataFields(setCount);

    const std::size_t sets = setCount;
    if (!it8::ListCovers(sampleNameList, sets) || !it8::ListCovers(cmykList, sets) ||
        !it8::ListCovers(cmykogList, sets) || !it8::ListCovers(cmykrgbList, sets) ||
        !it8::ListCovers(xyzList, sets) || !it8::ListCovers(labList, sets) ||
        !it8::ListCovers(rgbList, sets) || !it8::ListCovers(spectralList, sets) ||
        !it8::ListCovers(nColorList, sets)) {
        return 24;
    }

    std::vector<std::string> lines;
    const std::string fieldsLine = "NUMBER_OF_FIELDS\t" + it8::FormatInteger(fieldCount);
    if (keywordList.empty()) {
        lines.push_back("IT8\n" + fieldsLine);
    } else {
        for (const auto& keyword : keywordList) {
            lines.push_back(keyword.first + '\t' + keyword.second);
        }
        lines.push_back(fieldsLine);
    }
    lines.emplace_back("BEGIN_DATA_FORMAT");
    if (fieldCount != 0) {
        lines.push_back(FormatDataFormatLine());
    }
    lines.emplace_back("END_DATA_FORMAT");
    lines.push_back("NUMBER_OF_SETS\t" + it8::FormatInteger(setCount));
    lines.emplace_back("BEGIN_DATA");
    if (setCount != 0) {
        const std::size_t before = lines.size();
        AppendDataRows(lines, setCount);
        if (lines.size() == before) {
            return 24; // spectra or n-colour maps that differ from the first row's
        }
    }
    lines.emplace_back("END_DATA");

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), lines) ? 0 : 23;
}
