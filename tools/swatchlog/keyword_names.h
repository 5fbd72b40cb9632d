// Header keywords: which ones CGATS.17 knows (others need a KEYWORD line) and
// how a value given on the command line is written.
#pragma once

#include <string>
#include <utility>
#include <vector>

namespace swatchlog {

/// Whether `keyword` is one of the format's own header keywords.
bool IsStandardKeyword(const std::string& keyword);
/// Whether `keyword` is a structural line (data format, data block, counts)
/// that must not be inserted as a keyword.
bool IsStructuralKeyword(const std::string& keyword);
/// Whether `keyword` can stand as a keyword: letters, digits and underscores,
/// beginning with a letter.
bool IsValidKeywordName(const std::string& keyword);
/// A value as written: numbers and quoted texts as they are, other texts in
/// double quotes. Empty when the value cannot be written (line breaks, or
/// double quotes inside it).
std::string KeywordValueText(const std::string& value, bool& ok);

/// The keyword lines of a new chart file: "CGATS.17" first, the common
/// descriptive keywords in the order readers expect, the others by their order
/// in `keywords`, each keyword the format does not define declared by a KEYWORD
/// line, then the process colour names as numbered PROCESSCOLOR_ID lines.
/// NUMBER_OF_FIELDS, NUMBER_OF_SETS and names that cannot stand as keywords are
/// left out (the writer adds the counts itself).
std::vector<std::pair<std::string, std::string>>
OutputKeywords(const std::vector<std::pair<std::string, std::string>>& keywords,
               const std::vector<std::string>& processColors);

} // namespace swatchlog
