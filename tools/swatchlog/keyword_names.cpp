#include "keyword_names.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <utility>

namespace swatchlog {
namespace {

// Keywords in the order a reader expects them; the rest follow in their own order.
constexpr std::array<const char*, 12> kLeadingKeywords{
    "ORIGINATOR",   "FILE_DESCRIPTOR", "DESCRIPTOR",         "CREATED",
    "MANUFACTURER", "MANUFACTURE",     "PROD_DATE",          "SERIAL",
    "MATERIAL",     "INSTRUMENTATION", "MEASUREMENT_SOURCE", "PRINT_CONDITIONS"};

bool IsNumber(const std::string& text) {
    std::size_t i = (text[0] == '-' || text[0] == '+') ? 1 : 0;
    bool digits = false;
    bool point = false;
    for (; i < text.size(); ++i) {
        const char c = text[i];
        if (std::isdigit(static_cast<unsigned char>(c))) {
            digits = true;
        } else if (c == '.' && !point) {
            point = true;
        } else {
            return false;
        }
    }
    return digits;
}

} // namespace

bool IsStandardKeyword(const std::string& keyword) {
    static const std::array<const char*, 16> standard{
        "ORIGINATOR",     "FILE_DESCRIPTOR", "DESCRIPTOR",         "CREATED",
        "MANUFACTURER",   "MANUFACTURE",     "PROD_DATE",          "SERIAL",
        "MATERIAL",       "INSTRUMENTATION", "MEASUREMENT_SOURCE", "PRINT_CONDITIONS",
        "SAMPLE_BACKING", "KEYWORD",         "NUMBER_OF_FIELDS",   "NUMBER_OF_SETS"};
    return std::find(standard.begin(), standard.end(), keyword) != standard.end();
}

bool IsStructuralKeyword(const std::string& keyword) {
    static const std::array<const char*, 7> structural{
        "BEGIN_DATA_FORMAT", "END_DATA_FORMAT", "BEGIN_DATA", "END_DATA",
        "NUMBER_OF_FIELDS",  "NUMBER_OF_SETS",  "KEYWORD"};
    return std::find(structural.begin(), structural.end(), keyword) != structural.end();
}

bool IsValidKeywordName(const std::string& keyword) {
    if (keyword.empty() || !std::isalpha(static_cast<unsigned char>(keyword[0]))) {
        return false;
    }
    return std::all_of(keyword.begin(), keyword.end(), [](char c) {
        return std::isalnum(static_cast<unsigned char>(c)) || c == '_';
    });
}

std::string KeywordValueText(const std::string& value, bool& ok) {
    ok = value.find_first_of("\r\n") == std::string::npos;
    if (!ok) {
        return "";
    }
    if (!value.empty() && IsNumber(value)) {
        return value;
    }
    const bool quoted = value.size() >= 2 && value.front() == '"' && value.back() == '"';
    const std::string inner = quoted ? value.substr(1, value.size() - 2) : value;
    if (inner.find('"') != std::string::npos) {
        ok = false;
        return "";
    }
    return "\"" + inner + "\"";
}

bool IsLeadingKeyword(const std::string& keyword) {
    return std::find(kLeadingKeywords.begin(), kLeadingKeywords.end(), keyword) !=
           kLeadingKeywords.end();
}

std::vector<std::pair<std::string, std::string>>
NewFileKeywordLines(std::vector<std::pair<std::string, std::string>> keywords) {
    std::stable_partition(keywords.begin(), keywords.end(),
                          [](const auto& line) { return IsLeadingKeyword(line.first); });
    std::vector<std::pair<std::string, std::string>> out{{"CGATS.17", ""}};
    std::vector<std::string> announced;
    for (auto& [key, value] : keywords) {
        if (!IsStandardKeyword(key) &&
            std::find(announced.begin(), announced.end(), key) == announced.end()) {
            out.emplace_back("KEYWORD", "\"" + key + "\"");
            announced.push_back(key);
        }
        out.emplace_back(std::move(key), std::move(value));
    }
    return out;
}

} // namespace swatchlog
