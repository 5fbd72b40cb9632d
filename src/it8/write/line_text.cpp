#include "it8/write/line_text.h"

#include <algorithm>

namespace it8 {

bool Contains(const std::string& text, const std::string& part) {
    return text.find(part) != std::string::npos;
}

bool StartsWith(const std::string& text, const std::string& lead) {
    return text.compare(0, lead.size(), lead) == 0;
}

std::string ReplaceAll(std::string text, const std::string& from, const std::string& to) {
    if (from.empty()) {
        return text;
    }
    std::size_t position = text.find(from);
    while (position != std::string::npos) {
        text.replace(position, from.size(), to);
        position = text.find(from, position + to.size());
    }
    return text;
}

std::string SpacesToTabsUnlessQuoted(std::string line) {
    if (!Contains(line, "\"")) {
        std::replace(line.begin(), line.end(), ' ', '\t');
    }
    return line;
}

bool HasIdentification(const std::string& firstLine) {
    return Contains(firstLine, "CGATS.17") || Contains(firstLine, "IT8.7/3");
}

std::size_t FindLineStartingWith(const std::vector<std::string>& lines, const std::string& lead) {
    const auto found = std::find_if(lines.begin(), lines.end(), [&lead](const std::string& line) {
        return StartsWith(line, lead);
    });
    return static_cast<std::size_t>(found - lines.begin());
}

std::size_t FindLineContaining(const std::vector<std::string>& lines, const std::string& part) {
    const auto found = std::find_if(lines.begin(), lines.end(), [&part](const std::string& line) {
        return Contains(line, part);
    });
    return static_cast<std::size_t>(found - lines.begin());
}

} // namespace it8
