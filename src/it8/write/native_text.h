// The bytes of a finished chart text as they go to disk.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "it8/files/content.h"

namespace it8 {

/// The number of bytes that ForEachTextPiece hands out for `lines`.
std::uint64_t NativeTextSize(const std::vector<std::string>& lines);

/// Hands the text to `sink` piece by piece: every line followed by a line end,
/// where every LF, also one inside a line, becomes the platform's text-file
/// line end (CR LF on Windows, LF elsewhere), as a text-mode stream writes it.
/// False when the sink stopped.
bool ForEachTextPiece(const std::vector<std::string>& lines, const files::PieceSink& sink);

/// The text as a content for a file; `lines` must outlive it.
files::Content NativeTextContent(const std::vector<std::string>& lines);

} // namespace it8
