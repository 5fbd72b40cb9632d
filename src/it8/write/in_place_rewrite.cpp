#include "it8/write/in_place_rewrite.h"

#include <algorithm>

#include "it8/write/native_text.h"

namespace it8 {

bool RewriteInPlace(RewritableFile& file, std::uint64_t oldSize, bool readable,
                    const std::vector<std::string>& lines) {
    const std::uint64_t newSize = NativeTextSize(lines);
    // Only the bytes the new text overwrites need to be kept; the rest of a
    // longer old file stays on disk until the final resize. So the copy is never
    // larger than the new text.
    const std::uint64_t overwritten = std::min(oldSize, newSize);
    std::string keep;
    bool kept = false;
    if (readable) {
        keep.resize(static_cast<std::size_t>(overwritten));
        kept = file.ReadAt(0, keep.data(), keep.size());
    }
    if (newSize > oldSize && !file.Reserve(newSize)) {
        file.Resize(oldSize); // nothing of the old content was changed yet
        return false;
    }
    std::uint64_t offset = 0;
    const bool written = ForEachTextPiece(lines, [&](const char* data, std::size_t size) {
        const bool ok = file.WriteAt(offset, data, size);
        offset += size;
        return ok;
    });
    // The old file's tail is cut off only once the new text is safely on disk,
    // so that up to then the old content can still be put back whole.
    if (written && file.Flush() && file.Resize(newSize)) {
        file.Flush();
        return true;
    }
    // Put the old content back; where that is not possible, leave no half text.
    if (!(kept && file.WriteAt(0, keep.data(), keep.size()) && file.Resize(oldSize) &&
          file.Flush())) {
        file.Resize(0);
        file.Flush();
    }
    return false;
}

} // namespace it8
