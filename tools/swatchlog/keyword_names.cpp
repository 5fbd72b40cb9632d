#include "keyword_names.h"

#include <algorithm>
#include <array>
#include <cctype>

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

std::vector<std::pair<std::string, std::string>>
OutputKeywords(const std::vector<std::pair<std::string, std::string>>& keywords,
               const std::vector<std::string>& processColors) {
    std::vector<std::pair<std::string, std::string>> out{{"CGATS.17", ""}};
    auto add = [&out](const std::string& key, const std::string& value) {
        if (!IsStandardKeyword(key)) {
            out.emplace_back("KEYWORD", "\"" + key + "\"");
        }
        out.emplace_back(key, value);
    };
    for (const char* leading : kLeadingKeywords) {
        for (const auto& [key, value] : keywords) {
            if (key == leading) {
                add(key, value);
            }
        }
    }
    for (const auto& [key, value] : keywords) {
        const bool leading = std::find(kLeadingKeywords.begin(), kLeadingKeywords.end(), key) !=
                             kLeadingKeywords.end();
        if (!leading && key != "NUMBER_OF_FIELDS" && key != "NUMBER_OF_SETS" &&
            IsValidKeywordName(key)) {
            add(key, value);
        }
    }
    if (!processColors.empty()) {
        out.emplace_back("KEYWORD", "\"PROCESSCOLOR_ID\"");
        for (std::size_t i = 0; i < processColors.size(); ++i) {
            out.emplace_back("PROCESSCOLOR_ID",
                             "\"" + std::to_string(i + 1) + " " + processColors[i] + "\"");
        }
    }
    return out;
}

} // namespace swatchlog
