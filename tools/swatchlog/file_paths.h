// File paths given on the command line: the library's wide form, identity of
// two paths, and output files that appear whole or not at all.
#pragma once

#include <filesystem>
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

/// An output file written first under a temporary name beside it and renamed
/// into place by Commit(), so that a failure leaves no output file and an
/// existing one untouched. The temporary file is removed unless committed.
class PendingOutput {
public:
    explicit PendingOutput(std::string finalPath);
    ~PendingOutput();
    PendingOutput(const PendingOutput&) = delete;
    PendingOutput& operator=(const PendingOutput&) = delete;

    /// The temporary file's path (UTF-8) for the writer to create.
    const std::string& TemporaryPath() const { return temporary_; }
    /// Moves the written temporary file to the final path; ChartError on failure.
    void Commit();

private:
    std::string final_;
    std::string temporary_;
    bool committed_ = false;
};

} // namespace swatchlog
