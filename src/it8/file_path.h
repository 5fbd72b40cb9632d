// Wide-character chart paths as file-system paths.
#pragma once

#include <filesystem>
#include <string>

namespace it8 {

/// On Windows the wide path is used as it is; elsewhere it is encoded as a
/// UTF-8 file name (each wchar_t one Unicode code point).
std::filesystem::path ToFileSystemPath(const std::wstring& path);

/// UTF-8 encoding of a wide string; code points that are not valid Unicode
/// scalar values become U+FFFD.
std::string EncodeUtf8(const std::wstring& text);

} // namespace it8
