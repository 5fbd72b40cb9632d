// Splitting chart lines into tokens without copying them.
#pragma once

#include <string_view>
#include <vector>

#include "it8/read/chart_line_reader.h"

namespace it8 {

/// The separators of header, format and data lines: tab, LF, CR and blank.
inline bool IsFieldSeparator(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

inline std::string_view View(const LineSpan& span) {
    return std::string_view(span.data, span.size);
}

/// Tokens of a header, format or data line (never empty; runs of separators count
/// as one). `tokens` is cleared first and reused, so no allocation is needed once
/// it has grown to the longest line.
void SplitFields(std::string_view line, std::vector<std::string_view>& tokens);
/// The same for a writable line, whose tokens the caller may rewrite in place.
void SplitFields(const LineSpan& line, std::vector<LineSpan>& tokens);

} // namespace it8
