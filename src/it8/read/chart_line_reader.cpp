#include "it8/read/chart_line_reader.h"

#include <cstdint>
#include <cstring>
#include <fstream>
#include <system_error>
#include <utility>

namespace it8 {

bool ReadWholeFile(const std::filesystem::path& path, std::string& text) {
    std::error_code error;
    if (std::filesystem::is_directory(path, error)) {
        return false;
    }
    std::ifstream in(path, std::ios::in | std::ios::binary);
    if (!in.is_open()) {
        return false;
    }
    text.clear();
    // The size is only a hint, taken up to 1 GiB: a file that grew, shrank or has
    // no size is read to its end in chunks.
    const auto expected = std::filesystem::file_size(path, error);
    if (!error && expected <= (std::uintmax_t{1} << 30)) {
        text.resize(static_cast<std::size_t>(expected));
        in.read(text.data(), static_cast<std::streamsize>(text.size()));
        text.resize(static_cast<std::size_t>(in.gcount()));
    }
    constexpr std::size_t chunk = 64 * 1024;
    while (in.good()) {
        const std::size_t before = text.size();
        text.resize(before + chunk);
        in.read(text.data() + before, static_cast<std::streamsize>(chunk));
        text.resize(before + static_cast<std::size_t>(in.gcount()));
    }
    return !in.bad();
}

bool HasCrLineEnds(const std::string& text) {
    const std::size_t lineBreak = text.find_first_of("\r\n");
    return lineBreak != std::string::npos && text[lineBreak] == '\r' &&
           (lineBreak + 1 == text.size() || text[lineBreak + 1] != '\n');
}

void ChartLineReader::Open(std::string text, bool crLineEnds) {
    text_ = std::move(text);
    position_ = 0;
    delimiter_ = crLineEnds ? '\r' : '\n';
}

void ChartLineReader::Close() {
    std::string().swap(text_);
    position_ = 0;
}

bool ChartLineReader::ReadLine(LineSpan& line) {
    if (AtEnd()) {
        line = LineSpan{};
        return false;
    }
    char* const begin = text_.data() + position_;
    const std::size_t remaining = text_.size() - position_;
    const void* found = std::memchr(begin, delimiter_, remaining);
    std::size_t length = remaining;
    if (found != nullptr) {
        length = static_cast<std::size_t>(static_cast<const char*>(found) - begin);
        position_ += length + 1;
        if (delimiter_ == '\n') {
            if (length > 0 && begin[length - 1] == '\r') {
                --length;
            }
        } else if (position_ < text_.size() && text_[position_] == '\n') {
            ++position_;
        }
    } else {
        position_ = text_.size();
    }
    const void* nul = std::memchr(begin, '\0', length);
    if (nul != nullptr) {
        length = static_cast<std::size_t>(static_cast<const char*>(nul) - begin);
    }
    line = LineSpan{begin, length};
    return true;
}

} // namespace it8
