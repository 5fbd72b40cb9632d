// File paths given on the command line: the library's wide form, identity of
// two paths, and output files that appear whole or not at all.
#pragma once

#include <filesystem>
#include <memory>
#include <string>

namespace swatchlog {

/// The command-line path (UTF-8) as a file-system path.
std::filesystem::path FileSystemPath(const std::string& utf8Path);
/// The command-line path as the library's wide-string path; ChartError when
/// the path is not valid UTF-8.
std::wstring LibraryPath(const std::string& utf8Path);
/// Reads the whole of a regular file (also through links) into `text`. False
/// for anything else: a missing or unreadable file, a folder, and devices and
/// pipes, which are never opened since they may not end or may block.
bool ReadRegularFile(const std::string& utf8Path, std::string& text);
/// Whether two paths name the same file (also through links); a path that does
/// not exist yet is compared by its normalised absolute form.
bool SameFile(const std::string& first, const std::string& second);

/// An output file written first under a temporary name and put in place by
/// Commit(), so that a failure leaves no output file and an existing one
/// untouched. The temporary file is removed when the object goes.
///
/// An existing output is opened for writing (not truncated) when the object is
/// made: one the user may not write, a folder or a loop of symbolic links is
/// refused there with ChartError (the file and the reason) before any work is
/// done. A symbolic link is followed to the file it names. The temporary file is
/// made at once, empty and for the user alone: beside a new output (so a folder
/// the user may not write is refused there too); for an existing one beside it
/// (on Windows in the user's temporary folder) or, where that fails, in the
/// other place.
///
/// Commit() refuses (ChartError) when the output's name no longer leads to the
/// file checked at the start. Otherwise it puts the temporary file's content in
/// place with the library's rules for keeping an output's identity: a new
/// output, or on POSIX the user's own regular file with one link and no extended
/// attributes or access lists, is replaced by a complete new file with its group
/// and mode; any other existing output (on Windows every one) gets the content
/// written in place and keeps its owner, permissions, links and attributes;
/// when that fails its old content is put back where it can be, and the
/// ChartError says which state the output was left in. A device or a pipe is
/// written as it is.
class PendingOutput {
public:
    explicit PendingOutput(std::string finalPath);
    ~PendingOutput();
    PendingOutput(const PendingOutput&) = delete;
    PendingOutput& operator=(const PendingOutput&) = delete;

    /// The temporary file's path (UTF-8) for the writer to fill; it exists, empty.
    const std::string& TemporaryPath() const { return temporary_; }
    /// Puts the written temporary file's content in place; ChartError on failure.
    /// Call once.
    void Commit();

private:
    struct Target; // the output, held open from the check to the commit
    std::string final_;
    std::string temporary_;
    std::unique_ptr<Target> target_;
};

} // namespace swatchlog
