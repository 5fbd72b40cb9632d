// Writing a finished chart text to its target file.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace it8 {

/// Writes every line followed by a line end as a text file holds it (CR LF on
/// Windows). Returns true when the whole text was written.
///
/// Whether the target may be written is decided by opening it for writing, not
/// from its permission bits: a target the caller may not write answers false
/// and stays as it was. A symbolic link is followed to the file it names; a loop
/// of links answers false.
///
/// A new target is written to a temporary file beside it and renamed into
/// place, so it appears only when complete. An existing regular file is
/// replaced the same way only where that keeps its identity: it has one link,
/// belongs to the caller and carries no extended attributes or access lists
/// (POSIX only); the temporary file is given the target's group and mode from
/// its creation. Every other existing file (on Windows every one) is rewritten
/// in place and so keeps its owner, permissions, links and attributes; if that
/// write fails the old content is put back, and where it cannot be (the old
/// content could not be read, or putting it back failed too) the target is left
/// empty. A device or pipe is written as it is. A folder is refused. In no case
/// is part of the new text left behind.
bool WriteLinesToFile(const std::filesystem::path& target, const std::vector<std::string>& lines);

} // namespace it8
