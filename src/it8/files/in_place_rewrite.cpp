#include "it8/files/in_place_rewrite.h"

#include <algorithm>
#include <string>

namespace it8::files {

WriteResult RewriteInPlace(RewritableFile& file, std::uint64_t oldSize, bool readable,
                           const Content& content) {
    const std::uint64_t newSize = content.size;
    std::error_code error;
    const auto failed = [&file, &error] {
        error = file.Error();
        return false;
    };
    // Only the bytes the new content overwrites need to be kept; the rest of a
    // longer old file stays on disk until the final resize.
    std::string keep;
    bool kept = false;
    if (readable) {
        keep.resize(static_cast<std::size_t>(std::min(oldSize, newSize)));
        kept = file.ReadAt(0, keep.data(), keep.size());
    }
    if (newSize > oldSize && !file.Reserve(newSize)) {
        failed();
        file.Resize(oldSize); // nothing of the old content was changed yet
        return {Outcome::Unchanged, error};
    }
    std::uint64_t offset = 0;
    const bool written = content.pieces([&](const char* data, std::size_t size) {
        if (size > newSize - offset) {
            return false; // more bytes than the content announced
        }
        const bool ok = file.WriteAt(offset, data, size) || failed();
        offset += size;
        return ok;
    });
    // The old tail is cut off only once the new content is on disk, so that up
    // to then the old content can still be put back whole. Once it is cut, the
    // kept bytes no longer make the whole old content.
    bool tailCut = false;
    if (written && offset == newSize && (file.Flush() || failed())) {
        if (file.Resize(newSize) || failed()) {
            tailCut = newSize < oldSize;
            if (file.Flush() || failed()) {
                return {Outcome::Written, {}};
            }
        }
    }
    if (!error) {
        error = std::make_error_code(std::errc::io_error); // the content's source failed
    }
    if (kept && !tailCut && file.WriteAt(0, keep.data(), keep.size()) && file.Resize(oldSize) &&
        file.Flush()) {
        return {Outcome::Restored, error};
    }
    file.Resize(0);
    file.Flush();
    return {Outcome::Emptied, error};
}

} // namespace it8::files
