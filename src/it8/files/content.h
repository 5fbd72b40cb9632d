// The bytes that go into a file, handed out piece by piece so that a large
// content never has to be held whole or twice.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>

namespace it8::files {

/// Receives consecutive pieces of a content; answers false to stop.
using PieceSink = std::function<bool(const char* data, std::size_t size)>;

/// A content: its length in bytes and a way to hand its bytes, in order, to a
/// sink. `pieces` answers false when the sink stopped or the bytes could not be
/// produced; the pieces it hands out add up to exactly `size` bytes.
struct Content {
    std::uint64_t size = 0;
    std::function<bool(const PieceSink& sink)> pieces;
};

/// `bytes` as a content, in one piece; `bytes` must outlive it.
Content BytesContent(const std::string& bytes);

} // namespace it8::files
