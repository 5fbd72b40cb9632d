#include "it8/write/text_builder.h"

#include <algorithm>
#include <utility>

#include "it8/write/number_format.h"

namespace it8 {

void TextBuilder::Reserve(std::size_t more) {
    if (buffer_.size() - used_ < more) {
        Grow(more);
    }
}

void TextBuilder::Grow(std::size_t more) {
    buffer_.resize(std::max({buffer_.size() * 2, used_ + more, std::size_t{64}}));
}

void TextBuilder::Append(const std::string& piece) {
    Reserve(piece.size());
    std::copy(piece.begin(), piece.end(), buffer_.begin() + static_cast<std::ptrdiff_t>(used_));
    used_ += piece.size();
}

// The formatters tell when the room is too small; the buffer then doubles and
// the number is written again.
void TextBuilder::AppendFixed(double value, int decimals) {
    for (;;) {
        if (const char* const end =
                FormatFixedInto(buffer_.data() + used_, buffer_.size() - used_, value, decimals)) {
            used_ = static_cast<std::size_t>(end - buffer_.data());
            return;
        }
        Grow(32);
    }
}

void TextBuilder::AppendInteger(long long value) {
    for (;;) {
        if (const char* const end =
                FormatIntegerInto(buffer_.data() + used_, buffer_.size() - used_, value)) {
            used_ = static_cast<std::size_t>(end - buffer_.data());
            return;
        }
        Grow(32);
    }
}

std::string TextBuilder::Take() {
    buffer_.resize(used_);
    std::string text = std::move(buffer_);
    buffer_.clear();
    used_ = 0;
    return text;
}

} // namespace it8
