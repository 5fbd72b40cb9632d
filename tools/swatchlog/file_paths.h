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
/// untouched. The temporary file is removed unless committed.
///
/// An existing output is opened for writing (not truncated) when the object is
/// made: one the user may not write, a folder or a loop of symbolic links is
/// refused there with ChartError (the file and the reason) before any work is
/// done. A symbolic link is followed to the file it names. The temporary file is
/// made at once, empty, with no more permissions than the output it replaces
/// (a new output gets the usual mode for a new file).
///
/// Commit() renames the temporary file over the output where that keeps the
/// output's identity: a new output, or on POSIX the user's own regular file with
/// one link and no extended attributes or access lists, given its group and mode.
/// Any other existing output (on Windows every one) gets the new content copied
/// in place and keeps its owner, permissions, links and attributes; when that
/// copy fails its old content is put back where it can be, and the ChartError
/// says which state the output was left in. A device or a pipe is written as it
/// is.
class PendingOutput {
public:
    explicit PendingOutput(std::string finalPath);
    ~PendingOutput();
    PendingOutput(const PendingOutput&) = delete;
    PendingOutput& operator=(const PendingOutput&) = delete;

    /// The temporary file's path (UTF-8) for the writer to fill; it exists, empty.
    const std::string& TemporaryPath() const { return temporary_; }
    /// Puts the written temporary file's content in place; ChartError on failure.
    void Commit();

private:
    struct Target; // the output as the platform holds it open
    std::string final_;
    std::string temporary_;
    std::unique_ptr<Target> target_;
    bool committed_ = false;
};

} // namespace swatchlog
