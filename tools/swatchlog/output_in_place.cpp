#include "output_in_place.h"

#include <algorithm>

#include "utf8_text.h"

namespace swatchlog {

ChartError OutputError(const std::string& output, const std::string& reason,
                       const std::string& state) {
    return ChartError(RepairUtf8(output) + ": the output file cannot be written (" + reason + ")" +
                          (state.empty() ? "" : "; " + state),
                      output, 0);
}

void CopyInPlace(OpenOutput& file, std::uint64_t oldSize, bool readable, const std::string& text,
                 const std::string& output) {
    const std::uint64_t newSize = text.size();
    // Only the bytes that the new content overwrites need keeping: a longer old
    // file's tail stays on disk until the final resize.
    std::string keep;
    bool kept = false;
    if (readable) {
        keep.resize(static_cast<std::size_t>(std::min(oldSize, newSize)));
        kept = file.ReadAt(0, keep.data(), keep.size());
    }
    if (newSize > oldSize && !file.Reserve(newSize)) {
        const std::string reason = file.Reason();
        file.Resize(oldSize); // nothing of the old content was changed yet
        throw OutputError(output, reason, "it is unchanged");
    }
    // The old tail is cut off only once the new content is on disk, so that up
    // to then the old content can still be put back whole.
    if (file.WriteAt(0, text.data(), text.size()) && file.Flush() && file.Resize(newSize) &&
        file.Flush()) {
        return;
    }
    const std::string reason = file.Reason();
    if (kept && file.WriteAt(0, keep.data(), keep.size()) && file.Resize(oldSize) && file.Flush()) {
        throw OutputError(output, reason, "its old content was put back");
    }
    file.Resize(0);
    file.Flush();
    throw OutputError(output, reason,
                      "it is now empty, since its old content could not be put back");
}

} // namespace swatchlog
