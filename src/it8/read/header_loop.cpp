// The header loop: keywords, sections and the hand-over to the data readers.
#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "it8/read/tokens.h"
#include "patch/text_number.h"

namespace {

std::string WithoutDoubleQuotes(std::string text) {
    text.erase(std::remove(text.begin(), text.end(), '"'), text.end());
    return text;
}

} // namespace

void CIT8ReaderWriter::StoreKeywordLine(const std::vector<std::string_view>& tokens) {
    if (tokens.empty()) {
        return;
    }
    std::string value;
    for (std::size_t i = 1; i < tokens.size(); ++i) {
        value.append(tokens[i]);
        value += ' ';
    }
    keywordMap[std::string(tokens.front())] = std::move(value);
}

int CIT8ReaderWriter::StoreNumericKeywordLine(const std::vector<std::string_view>& tokens) {
    StoreKeywordLine(tokens);
    return text_number::ParseIntLenient(
        WithoutDoubleQuotes(keywordMap[std::string(tokens.front())]));
}

int CIT8ReaderWriter::ParseChartText() {
    if (chartStream.AtEnd()) {
        return 9;
    }
    // Keywords whose whole-number value goes into a layout member of the store.
    struct NumericKeyword {
        std::string_view keyword;
        int CSwatchlogBase::*member;
    };
    const NumericKeyword numericKeywords[] = {
        {"BORDER_PATCHES", &CIT8ReaderWriter::borderPatches},
        {"UV_CUT_MODE", &CIT8ReaderWriter::uvCutMode},
        {"ZEBRA_RULER_MODE", &CIT8ReaderWriter::zebraRulerMode},
        {"ORIGINAL_NUMBER_OF_SETS", &CIT8ReaderWriter::originalNumberOfSets},
        {"NUMBER_OF_FIELDS", &CIT8ReaderWriter::numberOfFields},
        {"NUMBER_OF_PAGES", &CIT8ReaderWriter::numberOfPages},
        {"PATCHES_PER_PAGE", &CIT8ReaderWriter::patchesPerPage},
        {"DEVICE", &CIT8ReaderWriter::device},
    };

    bool formatRead = false;
    bool setsRead = false;
    bool dataRead = false;
    std::vector<std::string_view> tokens;
    it8::LineSpan line;
    // Every read consumes at least one character, so the loop ends at the end of
    // the text whatever the text holds.
    while (chartStream.ReadLine(line)) {
        it8::SplitFields(it8::View(line), tokens);
        const std::string_view first = tokens.empty() ? std::string_view() : tokens.front();
        if (tokens.empty()) {
            // An empty or blank line.
        } else if (first == "BEGIN_DEVICE_CONTROL_SEQUENCE") {
            ReadDeviceControlSequence();
        } else if (first == "BEGIN_MEASUREMENT_SCRIPT") {
            SkipSection("END_MEASUREMENT_SCRIPT");
        } else if (first == "BEGIN_REPORTING_FORMAT") {
            SkipSection("END_REPORTING_FORMAT");
        } else if (first == "BEGIN_TARGET_FORMAT") {
            SkipSection("END_TARGET_FORMAT");
        } else if (first == "BEGIN_DATA_FORMAT") {
            if (ReadDataFormat() != 0) {
                return 5;
            }
            formatRead = true;
        } else if (first == "NUMBER_OF_SETS") {
            numberOfSets = StoreNumericKeywordLine(tokens);
            if (numberOfSets < 1) {
                return 6;
            }
            setsRead = true;
        } else if (first == "BEGIN_DATA") {
            if (!formatRead || !setsRead) {
                return 9;
            }
            const int code = ReadDataRows();
            if (code != 0) {
                return code;
            }
            dataRead = true;
        } else if (first == "PROCESSCOLOR_ID") {
            StoreKeywordLine(tokens);
            processColorIds.push_back(WithoutDoubleQuotes(keywordMap[std::string(first)]));
        } else {
            const auto numeric =
                std::find_if(std::begin(numericKeywords), std::end(numericKeywords),
                             [first](const NumericKeyword& k) { return k.keyword == first; });
            if (numeric != std::end(numericKeywords)) {
                this->*(numeric->member) = StoreNumericKeywordLine(tokens);
            } else {
                StoreKeywordLine(tokens);
            }
        }
        if (chartStream.AtEnd()) {
            break;
        }
    }
    return dataRead ? 0 : 9;
}
