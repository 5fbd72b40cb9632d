// The bytes of a chart file, for the reader and for the writers' line reading.
#pragma once

#include <filesystem>
#include <string>

namespace it8 {

/// Reads a chart file whole into `text`. Only a regular file is read: a folder,
/// a device, a pipe or a socket answers false without a byte being read, so an
/// endless device cannot exhaust memory and a pipe without a writer cannot
/// block the call. The length is taken when the file is opened and at most that
/// many bytes are read, so a file that grows meanwhile is read as it was. A
/// UTF-8 byte-order mark at the start is dropped. False also when the file
/// cannot be opened or a read fails.
bool ReadChartFileText(const std::filesystem::path& path, std::string& text);

} // namespace it8
