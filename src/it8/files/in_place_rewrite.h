// Rewriting an existing file in place, so that it keeps its identity (owner,
// permissions, access lists, extended attributes, hard links), and putting the
// old content back when the new one cannot be written whole.
#pragma once

#include <cstddef>
#include <cstdint>
#include <system_error>

#include "it8/files/content.h"
#include "it8/files/write_result.h"

namespace it8::files {

/// An open regular file, as the platform gives access to it. Each operation
/// answers false on failure; Error() then tells why.
class RewritableFile {
public:
    virtual ~RewritableFile() = default;
    /// Reads exactly `size` bytes from `offset`.
    virtual bool ReadAt(std::uint64_t offset, char* data, std::size_t size) = 0;
    /// Writes all `size` bytes at `offset`.
    virtual bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) = 0;
    /// Makes sure the file has room for `size` bytes (false: the disk or the
    /// quota is full). May leave the file longer than before.
    virtual bool Reserve(std::uint64_t size) = 0;
    /// Sets the file's length.
    virtual bool Resize(std::uint64_t size) = 0;
    /// Pushes what was written to the disk, so that late write errors show here.
    virtual bool Flush() = 0;
    /// Why the last failed operation failed.
    virtual std::error_code Error() const = 0;
};

/// Replaces the content of `file` (`oldSize` bytes long) by `content`. Room is
/// reserved first, so a full disk leaves the file as it was. The bytes about to
/// be overwritten are kept in memory when `readable` (never more than the new
/// content's length) and put back if a later step fails; where they cannot be,
/// the file is left empty. In no case is a part of the new content left.
/// Answers Written, Unchanged, Restored or Emptied.
WriteResult RewriteInPlace(RewritableFile& file, std::uint64_t oldSize, bool readable,
                           const Content& content);

} // namespace it8::files
