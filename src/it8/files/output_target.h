// Replacing what a file, a device or a pipe holds while keeping what makes the
// file the same to its users: its owner, permissions, access lists, extended
// attributes and hard links, and the file a symbolic link names.
#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <system_error>

#include "it8/files/content.h"
#include "it8/files/write_result.h"

namespace it8::files {

enum class TargetKind {
    Missing, ///< no file there yet: one is made
    Regular, ///< an existing regular file
    Device,  ///< a device or a pipe: written as it is
};

/// A target held open from the moment it is checked until its content is
/// replaced, so that both concern the same file.
class OutputTarget {
public:
    OutputTarget();
    ~OutputTarget();
    OutputTarget(const OutputTarget&) = delete;
    OutputTarget& operator=(const OutputTarget&) = delete;

    /// Opens `path` for writing without truncating it: that, not the permission
    /// bits, decides whether the caller may write it. A symbolic link is followed
    /// to the file it names. Answers why the target cannot be written (no
    /// permission, a folder, a loop of links, a pipe without a reader, a
    /// read-only file system); a missing target is no error, it will be made.
    /// Call once.
    std::error_code Open(const std::filesystem::path& path);
    /// What was found when opening.
    TargetKind Kind() const;
    /// The folder where a file made beside the target goes (links followed);
    /// empty for a device or pipe, or where the name does not lead to the file
    /// opened (a link of the system's own kind).
    std::filesystem::path Folder() const;
    /// Whether the target's name still leads to the regular file opened; true
    /// for the other kinds. Not checked on Windows: always true there.
    bool StillNamed() const;
    /// Replaces the target's content by `content` and closes it. Call once,
    /// after a successful Open.
    ///
    /// A new target is written to a temporary file beside it and renamed into
    /// place, so it appears only when complete. On POSIX an existing regular
    /// file is replaced the same way where that keeps its identity: it has one
    /// link, belongs to the caller and carries no extended attributes or access
    /// lists; the temporary file has the target's group and mode from its
    /// creation. Every other existing file (on Windows every one) is rewritten in
    /// place (see RewriteInPlace). A device or pipe is written as it is.
    WriteResult Replace(const Content& content);

private:
    struct Opened; // the target as the platform holds it open
    std::unique_ptr<Opened> opened_;
};

/// An empty new file in `folder`, for the caller alone, with a short name of
/// its own that starts with `prefix`. Its path, or an empty one with `error`
/// set when none can be made.
std::filesystem::path MakeTemporaryFile(const std::filesystem::path& folder,
                                        const std::string& prefix, std::error_code& error);

} // namespace it8::files
