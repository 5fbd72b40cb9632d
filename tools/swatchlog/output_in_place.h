// Copying a checked output into the existing file in place, so that the file
// keeps its owner, permissions, hard links and attributes, with its old content
// put back when the copy fails; and the messages for an output that cannot be
// written.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "tool_error.h"

namespace swatchlog {

/// An existing output file held open, as the platform gives access to it. Each
/// operation answers false on failure; Reason() then tells why in words.
class OpenOutput {
public:
    virtual ~OpenOutput() = default;
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
    virtual std::string Reason() const = 0;
};

/// "OUTPUT: the output file cannot be written (REASON)", then "; " and `state`
/// when that is not empty.
ChartError OutputError(const std::string& output, const std::string& reason,
                       const std::string& state = "");

/// Replaces the content of `file` (`oldSize` bytes long, named `output` in
/// messages) by `text`. Room is reserved first, so a full disk leaves the file
/// as it was. The bytes about to be overwritten are kept when `readable` and put
/// back if a later write fails; where they cannot be, the file is left empty,
/// never with a part of `text`. ChartError on failure, saying which of these
/// states the file is in.
void CopyInPlace(OpenOutput& file, std::uint64_t oldSize, bool readable, const std::string& text,
                 const std::string& output);

} // namespace swatchlog
