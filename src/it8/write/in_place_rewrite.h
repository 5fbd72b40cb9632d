// Rewriting an existing file in place, so that it keeps its identity (owner,
// permissions, access lists, extended attributes, hard links), and putting the
// old content back when the new one cannot be written whole.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace it8 {

/// An open regular file, as the platform gives access to it.
class RewritableFile {
public:
    virtual ~RewritableFile() = default;
    /// Reads exactly `size` bytes from `offset`; false when it cannot.
    virtual bool ReadAt(std::uint64_t offset, char* data, std::size_t size) = 0;
    /// Writes all `size` bytes at `offset`; false when it cannot.
    virtual bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) = 0;
    /// Makes sure the file has room for `size` bytes; false when the disk or the
    /// quota has not. May leave the file longer than before.
    virtual bool Reserve(std::uint64_t size) = 0;
    /// Sets the file's length.
    virtual bool Resize(std::uint64_t size) = 0;
    /// Pushes what was written to the disk, so that late write errors show here.
    virtual bool Flush() = 0;
};

/// Replaces the content of `file` (`oldSize` bytes long) by the lines as a text
/// file holds them. Room for the new text is reserved first; a full disk then
/// leaves the file as it was. The bytes about to be overwritten are kept in
/// memory when `readable`, and put back if a later write fails. True when the
/// new text was written whole. On false the file holds its old content, or,
/// when that could not be read or put back, nothing at all: never a part of
/// the new text.
bool RewriteInPlace(RewritableFile& file, std::uint64_t oldSize, bool readable,
                    const std::vector<std::string>& lines);

} // namespace it8
