#include "it8/read/chart_line_reader.h"

#include <cstring>
#include <utility>

namespace it8 {

bool HasCrLineEnds(const std::string& text) {
    const std::size_t lf = text.find('\n');
    if (lf == std::string::npos) {
        return text.find('\r') != std::string::npos;
    }
    const std::size_t firstLine = lf > 0 && text[lf - 1] == '\r' ? lf - 1 : lf;
    if (firstLine <= kLongestFormatLine) {
        return false;
    }
    const std::size_t cr = text.find('\r');
    return cr != std::string::npos && cr <= kLongestFormatLine;
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
