#include "chart_lines.h"

#include <cstring>

namespace swatchlog {
namespace {

bool IsSeparator(char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

} // namespace

ChartLines::ChartLines(std::string text) : text_(std::move(text)) {
    const std::size_t firstBreak = text_.find_first_of("\r\n");
    const bool crOnly = firstBreak != std::string::npos && text_[firstBreak] == '\r' &&
                        (firstBreak + 1 == text_.size() || text_[firstBreak + 1] != '\n');
    const char delimiter = crOnly ? '\r' : '\n';
    lineEnd_ = crOnly ? "\r" : "\n";
    if (!crOnly && firstBreak != std::string::npos && text_[firstBreak] == '\r') {
        lineEnd_ = "\r\n";
    }
    std::size_t position = 0;
    while (position < text_.size()) {
        const std::size_t found = text_.find(delimiter, position);
        std::size_t length = (found == std::string::npos ? text_.size() : found) - position;
        std::size_t next = found == std::string::npos ? text_.size() : found + 1;
        if (!crOnly && length > 0 && text_[position + length - 1] == '\r') {
            --length;
        } else if (crOnly && next < text_.size() && text_[next] == '\n') {
            ++next;
        }
        const void* nul = std::memchr(text_.data() + position, '\0', length);
        if (nul != nullptr) {
            length =
                static_cast<std::size_t>(static_cast<const char*>(nul) - text_.data()) - position;
        }
        lines_.push_back({position, length});
        position = next;
    }
}

std::string_view ChartLines::Line(std::size_t index) const {
    return std::string_view(text_).substr(lines_[index].begin, lines_[index].length);
}

std::size_t ChartLines::Begin(std::size_t index) const {
    return index < lines_.size() ? lines_[index].begin : text_.size();
}

std::vector<LineToken> SplitTokens(std::string_view line) {
    std::vector<LineToken> tokens;
    std::size_t i = 0;
    while (i < line.size()) {
        while (i < line.size() && IsSeparator(line[i])) {
            ++i;
        }
        const std::size_t start = i;
        while (i < line.size() && !IsSeparator(line[i])) {
            ++i;
        }
        if (i > start) {
            tokens.push_back({line.substr(start, i - start), start});
        }
    }
    return tokens;
}

std::string_view TokenAt(std::string_view line, std::size_t index) {
    std::size_t i = 0;
    for (std::size_t n = 0;; ++n) {
        while (i < line.size() && IsSeparator(line[i])) {
            ++i;
        }
        const std::size_t start = i;
        while (i < line.size() && !IsSeparator(line[i])) {
            ++i;
        }
        if (i == start) {
            return {};
        }
        if (n == index) {
            return line.substr(start, i - start);
        }
    }
}

std::vector<std::string> SplitWords(std::string_view line) {
    std::vector<std::string> words;
    for (const auto& token : SplitTokens(line)) {
        words.emplace_back(token.text);
    }
    return words;
}

std::string UpperAscii(std::string_view text) {
    std::string upper(text);
    for (char& c : upper) {
        if (c >= 'a' && c <= 'z') {
            c = static_cast<char>(c - 'a' + 'A');
        }
    }
    return upper;
}

std::string Unquoted(std::string_view text) {
    if (text.size() >= 2 && text.front() == '"' && text.back() == '"') {
        text = text.substr(1, text.size() - 2);
    }
    return std::string(text);
}

} // namespace swatchlog
