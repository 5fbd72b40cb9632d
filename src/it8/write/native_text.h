// The bytes of a finished chart text as they go to disk.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace it8 {

/// Receives consecutive pieces of the text; answers false to stop.
using TextSink = std::function<bool(const char* data, std::size_t size)>;

/// The number of bytes that ForEachTextPiece hands out for `lines`.
std::uint64_t NativeTextSize(const std::vector<std::string>& lines);

/// Hands the text to `sink` piece by piece: every line followed by a line end,
/// where every LF, also one inside a line, becomes the platform's text-file
/// line end (CR LF on Windows, LF elsewhere), as a text-mode stream writes it.
/// False when the sink stopped.
bool ForEachTextPiece(const std::vector<std::string>& lines, const TextSink& sink);

} // namespace it8
