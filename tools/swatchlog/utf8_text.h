// UTF-8 text helpers: validation, repair and display width.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace swatchlog {

/// Whether `text` is well-formed UTF-8.
bool IsValidUtf8(std::string_view text);
/// `text` with every ill-formed UTF-8 sequence replaced by U+FFFD.
std::string RepairUtf8(std::string_view text);
/// Number of code points of UTF-8 text (the column count of a plain terminal).
std::size_t DisplayWidth(std::string_view text);
/// Code points of well-formed UTF-8 text as a wide string (UTF-16 where wchar_t
/// has 16 bits). Returns false for ill-formed text.
bool WideFromUtf8(std::string_view text, std::wstring& wide);

} // namespace swatchlog
