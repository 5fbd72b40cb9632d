// Writing a finished chart text to its target file.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace it8 {

/// Writes every line followed by "\n" in text mode (CR LF on Windows). The text
/// goes to a temporary file beside the target, which is renamed into place only
/// when writing and closing succeeded; on failure the temporary file is removed
/// and an existing target is left as it was. When no temporary file can be
/// created there (a folder that takes no new file) or the target cannot be
/// replaced by renaming, the target is written in place, and removed again if
/// that write fails part-way. A target that exists but is no regular file (a
/// device, a pipe) is written in place; a folder is refused.
/// Returns true when the whole text was written and closed.
bool WriteLinesToFile(const std::filesystem::path& target, const std::vector<std::string>& lines);

} // namespace it8
