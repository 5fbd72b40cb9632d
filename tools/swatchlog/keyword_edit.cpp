#include "keyword_edit.h"

#include <map>

#include "keyword_names.h"

namespace swatchlog {

EditedText SetKeywords(const ChartLines& file, const TableExtent& table,
                       const std::vector<HeaderLine>& header,
                       const std::vector<KeywordEdit>& edits) {
    const std::size_t offset = static_cast<std::size_t>(table.firstLine - 1);
    const std::string& end = file.LineEnd();
    std::map<std::size_t, std::string> replacements; // file line index -> new line text
    std::string inserted;
    EditedText result;
    for (const auto& edit : edits) {
        const HeaderLine* last = nullptr;
        bool declared = false;
        for (const auto& line : header) {
            if (line.key == edit.key) {
                last = &line;
            }
            declared = declared || (line.key == "KEYWORD" && Unquoted(line.value) == edit.key);
        }
        if (last != nullptr) {
            // The key and the blanks after it stay as they are.
            const std::size_t index = last->index + offset;
            const std::string_view line = file.Line(index);
            const auto tokens = SplitTokens(line);
            const std::size_t keyEnd = tokens[0].offset + tokens[0].text.size();
            const std::size_t valueStart = tokens.size() > 1 ? tokens[1].offset : keyEnd;
            const std::string separator =
                valueStart > keyEnd ? std::string(line.substr(keyEnd, valueStart - keyEnd)) : "\t";
            replacements[index] = std::string(line.substr(0, keyEnd)) + separator + edit.value;
            result.replaced.push_back(edit.key + " on line " + std::to_string(index + 1));
            continue;
        }
        if (!IsStandardKeyword(edit.key) && !declared) {
            inserted += "KEYWORD\t\"" + edit.key + "\"" + end;
        }
        inserted += edit.key + "\t" + edit.value + end;
        result.added.push_back(edit.key);
    }
    // New lines go after the identification line, else before the table's first line.
    const std::size_t insertAt =
        table.identificationLine == 0 ? offset : static_cast<std::size_t>(table.identificationLine);
    const std::string& text = file.Text();
    std::size_t position = 0;
    for (std::size_t index = 0; index <= file.Count(); ++index) {
        if (index == insertAt) {
            result.text += text.substr(position, file.Begin(index) - position);
            position = file.Begin(index);
            if (index == file.Count() && !text.empty() && text.back() != '\n' &&
                text.back() != '\r') {
                result.text += end; // the identification line was the file's last, without an end
            }
            result.text += inserted;
        }
        const auto replacement = replacements.find(index);
        if (index < file.Count() && replacement != replacements.end()) {
            result.text += text.substr(position, file.Begin(index) - position);
            result.text += replacement->second;
            position = file.Begin(index) + file.Line(index).size();
        }
    }
    result.text += text.substr(position);
    return result;
}

} // namespace swatchlog
