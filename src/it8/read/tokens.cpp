#include "it8/read/tokens.h"

#include <cstddef>
#include <string>

#include "it8/it8_reader_writer.h"

namespace it8 {
namespace {

// Calls `emit(offset, length)` for each token of `text` separated by runs of the
// characters for which `isSeparator` holds.
template <typename IsSeparator, typename Emit>
void ForEachToken(const char* text, std::size_t size, IsSeparator isSeparator, Emit emit) {
    std::size_t i = 0;
    while (i < size) {
        while (i < size && isSeparator(text[i])) {
            ++i;
        }
        const std::size_t start = i;
        while (i < size && !isSeparator(text[i])) {
            ++i;
        }
        if (i > start) {
            emit(start, i - start);
        }
    }
}

} // namespace

void SplitFields(std::string_view line, std::vector<std::string_view>& tokens) {
    tokens.clear();
    ForEachToken(line.data(), line.size(), IsFieldSeparator,
                 [&](std::size_t start, std::size_t length) {
                     tokens.push_back(line.substr(start, length));
                 });
}

void SplitFields(const LineSpan& line, std::vector<LineSpan>& tokens) {
    tokens.clear();
    ForEachToken(line.data, line.size, IsFieldSeparator,
                 [&](std::size_t start, std::size_t length) {
                     tokens.push_back(LineSpan{line.data + start, length});
                 });
}

} // namespace it8

std::vector<std::string> CIT8ReaderWriter::SplitLine(const std::string& line,
                                                     const std::string& separators) {
    std::vector<std::string> tokens;
    const auto isSeparator = [&separators](char c) {
        return separators.find(c) != std::string::npos;
    };
    it8::ForEachToken(
        line.data(), line.size(), isSeparator,
        [&](std::size_t start, std::size_t length) { tokens.emplace_back(line, start, length); });
    return tokens;
}
