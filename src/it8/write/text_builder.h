// A long text built from many short pieces, such as a chart's data rows.
#pragma once

#include <cstddef>
#include <string>

namespace it8 {

/// Collects text in one growing buffer; numbers are formatted straight into it
/// (as FormatFixed and FormatInteger would), without a string per piece.
class TextBuilder {
public:
    /// Makes room for at least `more` further characters.
    void Reserve(std::size_t more);
    void Append(char c) {
        if (used_ == buffer_.size()) {
            Grow(1);
        }
        buffer_[used_++] = c;
    }
    void Append(const std::string& piece);
    /// "%.<decimals>f" in the classic locale.
    void AppendFixed(double value, int decimals);
    /// "%d".
    void AppendInteger(long long value);
    /// Characters collected so far.
    std::size_t Size() const { return used_; }
    /// The text collected; the builder is empty afterwards.
    std::string Take();

private:
    void Grow(std::size_t more);

    std::string buffer_;   // its size is the room; the first used_ characters are the text
    std::size_t used_ = 0; // so far
};

} // namespace it8
