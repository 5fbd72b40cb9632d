#include "it8/write/native_text.h"

#include <algorithm>
#include <cstring>

namespace it8 {
namespace {

#if defined(_WIN32)
constexpr char kLineEnd[] = "\r\n";
#else
constexpr char kLineEnd[] = "\n";
#endif
constexpr std::size_t kLineEndSize = sizeof(kLineEnd) - 1;

// Pieces are gathered in a buffer of this size, so that a text of many short
// lines is written in few calls and never held twice.
constexpr std::size_t kPieceSize = 64 * 1024;

class PieceBuffer {
public:
    explicit PieceBuffer(const TextSink& sink) : sink_(sink) { piece_.reserve(kPieceSize); }

    bool Append(const char* data, std::size_t size) {
        while (size > 0) {
            const std::size_t take = std::min(size, kPieceSize - piece_.size());
            piece_.append(data, take);
            data += take;
            size -= take;
            if (piece_.size() == kPieceSize && !Flush()) {
                return false;
            }
        }
        return true;
    }

    bool Flush() {
        const bool goOn = piece_.empty() || sink_(piece_.data(), piece_.size());
        piece_.clear();
        return goOn;
    }

private:
    const TextSink& sink_;
    std::string piece_;
};

} // namespace

std::uint64_t NativeTextSize(const std::vector<std::string>& lines) {
    std::uint64_t size = 0;
    for (const std::string& line : lines) {
        const auto breaks = static_cast<std::uint64_t>(std::count(line.begin(), line.end(), '\n'));
        size += line.size() - breaks + (breaks + 1) * kLineEndSize;
    }
    return size;
}

bool ForEachTextPiece(const std::vector<std::string>& lines, const TextSink& sink) {
    PieceBuffer buffer(sink);
    for (const std::string& line : lines) {
        // The line's own LFs, if any, are line ends as well.
        const char* rest = line.data();
        const char* const end = line.data() + line.size();
        for (;;) {
            const auto* lf = static_cast<const char*>(
                std::memchr(rest, '\n', static_cast<std::size_t>(end - rest)));
            const char* const stop = lf != nullptr ? lf : end;
            if (!buffer.Append(rest, static_cast<std::size_t>(stop - rest)) ||
                !buffer.Append(kLineEnd, kLineEndSize)) {
                return false;
            }
            if (lf == nullptr) {
                break;
            }
            rest = lf + 1;
        }
    }
    return buffer.Flush();
}

} // namespace it8
