// Header keywords of the file read, the keyword list to be written, the chart
// type, and the strip and page layout numbers.
#include <algorithm>

#include "patch/text_number.h"
#include "redavudeva/swatchlog_base.h"

int CSwatchlogBase::GetNumberOfCols() {
    return numberOfCols;
}

int CSwatchlogBase::GetNumberOfStrips() {
    return numberOfStrips;
}

int CSwatchlogBase::GetNumberOfPages() {
    return numberOfPages;
}

int CSwatchlogBase::GetDevice() {
    return device;
}

int CSwatchlogBase::GetPatchesPerPage() {
    return patchesPerPage;
}

int CSwatchlogBase::SetLayout(int strips, int columns) {
    if (strips < 1 || columns < 1) {
        return 15;
    }
    numberOfStrips = strips;
    numberOfCols = columns;
    return 0;
}

int CSwatchlogBase::SetNumberOfPages(int pages) {
    if (pages < 1) {
        return 18;
    }
    numberOfPages = pages;
    return 0;
}

std::map<std::string, std::string> CSwatchlogBase::GetKeywords() {
    return keywordMap;
}

std::string CSwatchlogBase::GetKeywordValue(std::string keyword) {
    const auto found = keywordMap.find(keyword);
    return found == keywordMap.end() ? std::string() : found->second;
}

int CSwatchlogBase::GetChartType(std::string& chartType) {
    const std::string value = GetKeywordValue("CHART_TYPE");
    chartType = value.empty() ? std::string("unknown") : value;
    return 0;
}

void CSwatchlogBase::SetChartType(std::string chartType) {
    SetKeyword({"CHART_TYPE", std::move(chartType)});
}

void CSwatchlogBase::SetKeywordList(
    const std::vector<std::pair<std::string, std::string>>& keywords) {
    keywordList = keywords;
}

void CSwatchlogBase::AddKeyword(std::pair<std::string, std::string> keyword) {
    keywordList.push_back(std::move(keyword));
}

// Every entry of that keyword takes the new value; a keyword not yet listed is
// appended.
void CSwatchlogBase::SetKeyword(std::pair<std::string, std::string> keyword) {
    bool matched = false;
    for (auto& entry : keywordList) {
        if (entry.first == keyword.first) {
            entry.second = keyword.second;
            matched = true;
        }
    }
    if (!matched) {
        AddKeyword(std::move(keyword));
    }
}

// Takes the strip and column counts from the header keywords. Quotes around the
// number are dropped; text that does not start with a number, or a number out of
// range, raises the conversion's exception (after any earlier count was set).
void CSwatchlogBase::ReadLayoutKeywords() {
    const auto readCount = [this](const char* keyword, int& target) {
        const auto found = keywordMap.find(keyword);
        if (found == keywordMap.end()) {
            return;
        }
        std::string text = found->second;
        text.erase(std::remove(text.begin(), text.end(), '"'), text.end());
        target = text_number::ParseLongStrict(text);
    };
    readCount("NUMBER_OF_STRIPS", numberOfStrips);
    readCount("NUMBER_OF_COLS", numberOfCols);
}
