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

/// Whether `keyword` is one of the descriptive keywords a new file puts first
/// (ORIGINATOR, DESCRIPTOR, CREATED, MANUFACTURER ... PRINT_CONDITIONS).
bool IsLeadingKeyword(const std::string& keyword);
/// The keyword lines of a new chart file from header lines (key, value as
/// written): "CGATS.17" first, then the leading keywords, then the others, each
/// group in the given order; a keyword the format does not define gets a
/// KEYWORD declaration before its first line. The caller leaves out what may
/// not be written (counts, comments, invalid names).
std::vector<std::pair<std::string, std::string>>
NewFileKeywordLines(std::vector<std::pair<std::string, std::string>> keywords);

} // namespace swatchlog
