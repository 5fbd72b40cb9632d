// Copying a chart file with keyword lines after its identification line.
#include <string>
#include <vector>

#include "it8/file_path.h"
#include "it8/it8_reader_writer.h"
#include "it8/write/line_text.h"
#include "it8/write/output_file.h"

int CIT8ReaderWriter::InsertKeywords(
    std::wstring sourcePath, std::wstring targetPath,
    const std::vector<std::pair<std::string, std::string>>& keywords) {
    std::vector<std::string> lines;
    const int readResult = ReadFileLines(sourcePath, lines);
    if (readResult != 0) {
        return readResult;
    }
    // A first line that already names CGATS.17 stays first; any other first
    // line follows the new identification and keyword lines.
    const bool keepFirst = !lines.empty() && it8::Contains(lines.front(), "CGATS.17");
    std::vector<std::string> output;
    output.reserve(lines.size() + keywords.size() + 1);
    output.push_back(keepFirst ? lines.front() : std::string("CGATS.17"));
    for (const auto& keyword : keywords) {
        output.push_back(keyword.first + '\t' + keyword.second);
    }
    output.insert(output.end(), lines.begin() + (keepFirst ? 1 : 0), lines.end());

    return it8::WriteLinesToFile(it8::ToFileSystemPath(targetPath), output) ? 0 : 23;
}
