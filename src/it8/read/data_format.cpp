// The data format block: field names to column indexes in three maps.
#include <limits>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "it8/read/tokens.h"

namespace {

std::string ToUpperAscii(std::string_view name) {
    std::string upper(name);
    for (char& c : upper) {
        if (c >= 'a' && c <= 'z') {
            c = static_cast<char>(c - 'a' + 'A');
        }
    }
    return upper;
}

} // namespace

int CIT8ReaderWriter::ReadDataFormat() {
    dataFormatLine.clear();
    if (chartStream.AtEnd()) {
        return 1;
    }
    // Field names spread over several lines continue the numbering, so that a
    // field's index is always its position in a data row.
    int column = 0;
    bool endSeen = false;
    std::vector<std::string_view> tokens;
    it8::LineSpan line;
    while (!endSeen && chartStream.ReadLine(line)) {
        it8::SplitFields(it8::View(line), tokens);
        if (!tokens.empty() && tokens.front() == "END_DATA_FORMAT") {
            endSeen = true;
            break;
        }
        for (const std::string_view token : tokens) {
            // A name longer than the longest line the format knows is no field
            // name; every patch would carry a copy of it.
            if (column == std::numeric_limits<int>::max() ||
                token.size() > it8::kLongestFormatLine) {
                return 1;
            }
            std::string name = ToUpperAscii(token);
            dataFormatLine += name;
            dataFormatLine += '\t';
            std::map<std::string, int>* columns = &fieldColumns;
            if (name.find("SPECTRAL") != std::string::npos ||
                name.find("NM") != std::string::npos) {
                columns = &spectralColumns;
            } else if (name.find("CLR") != std::string::npos ||
                       name.find("PC") != std::string::npos) {
                columns = &nColorColumns;
            }
            (*columns)[std::move(name)] = column++;
        }
        if (chartStream.AtEnd()) {
            break;
        }
    }
    if (!endSeen) {
        return 1;
    }
    const auto count =
        static_cast<int>(fieldColumns.size() + spectralColumns.size() + nColorColumns.size());
    if (numberOfFields == 0) {
        numberOfFields = count;
        return 0;
    }
    return numberOfFields == count ? 0 : 5;
}

std::string CIT8ReaderWriter::GetDataFormatLine() {
    return dataFormatLine;
}

void CIT8ReaderWriter::SetDataFormatLine(std::string line) {
    dataFormatLine = std::move(line);
}
