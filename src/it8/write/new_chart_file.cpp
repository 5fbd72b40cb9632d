// Writing a new chart file from the store's value lists alone.
#include <initializer_list>
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/number_format.h"
#include "it8/write/output_file.h"
#include "it8/write/store_list_checks.h"

namespace {

std::string FixedColumns(std::initializer_list<double> values) {
    std::string text;
    for (const double value : values) {
        text += '\t';
        text += it8::FormatFixed(value, 2);
    }
    return text;
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
// WriteNewChartFile before it calls this).
void CIT8ReaderWriter::AppendDataRows(std::vector<std::string>& lines, std::uint32_t setCount) {
    for (std::size_t i = 0; i < setCount; ++i) {
        std::string row = it8::FormatInteger(static_cast<long long>(i) + 1);
        if (!sampleNameList.empty()) {
            row += '\t' + sampleNameList[i];
        }
        if (!nColorList.empty()) {
            std::string channels;
            for (const auto& channel : nColorList[i]) {
                channels += '\t' + it8::FormatFixed(channel.second.value, 2);
            }
            if (!channels.empty()) {
                row += '\t' + channels;
            }
        }
        if (!spectralList.empty()) {
            std::string spectrum;
            for (const auto& field : spectralList[i]) {
                spectrum += '\t' + it8::FormatFixed(field.second, 5);
            }
            if (!spectrum.empty()) {
                row += '\t' + spectrum;
            }
        }
        if (!cmykList.empty()) {
            const tagCMYK& v = cmykList[i];
            row += FixedColumns({v.c, v.m, v.y, v.k});
        }
        if (!cmykogList.empty()) {
            const tagCMYKOG& v = cmykogList[i];
            row += FixedColumns({v.c, v.m, v.y, v.k, v.o, v.g});
        }
        if (!cmykrgbList.empty()) {
            const tagCMYKRGB& v = cmykrgbList[i];
            row += FixedColumns({v.c, v.m, v.y, v.k, v.r, v.g, v.b});
        }
        if (!xyzList.empty()) {
            const tagXYZ& v = xyzList[i];
            row += FixedColumns({v.x, v.y, v.z});
        }
        if (!labList.empty()) {
            const tagLAB& v = labList[i];
            row += FixedColumns({v.l, v.a, v.b});
        }
        if (!rgbList.empty()) {
            const tagRGB& v = rgbList[i];
            row += '\t' + it8::FormatInteger(v.r) + '\t' + it8::FormatInteger(v.g) + '\t' +
                   it8::FormatInteger(v.b);
        }
        lines.push_back(std::move(row));
    }
}

int CIT8ReaderWriter::WriteNewChartFile(const std::wstring& targetPath) {
    std::uint32_t setCount = 0;
    const std::uint32_t fieldCount = CountDataFields(setCount);

    const std::size_t sets = setCount;
    if (!it8::ListCovers(sampleNameList, sets) || !it8::ListCovers(cmykList, sets) ||
        !it8::ListCovers(cmykogList, sets) || !it8::ListCovers(cmykrgbList, sets) ||
        !it8::ListCovers(xyzList, sets) || !it8::ListCovers(labList, sets) ||
        !it8::ListCovers(rgbList, sets) || !it8::SpectralListCovers(spectralList, sets) ||
        !it8::NColorListCovers(nColorList, sets)) {
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
        AppendDataRows(lines, setCount);
    }
    lines.emplace_back("END_DATA");

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), lines) ? 0 : 23;
}
