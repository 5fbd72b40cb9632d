#include "it8/write/chart_sections.h"

#include <algorithm>

namespace it8 {
namespace {

std::size_t FindExactLine(const std::vector<std::string>& lines, const char* text) {
    return static_cast<std::size_t>(std::find(lines.begin(), lines.end(), text) - lines.begin());
}

} // namespace

ChartSections LocateSections(const std::vector<std::string>& lines) {
    ChartSections sections;
    const std::size_t format = FindExactLine(lines, "BEGIN_DATA_FORMAT");
    const std::size_t data = FindExactLine(lines, "BEGIN_DATA");
    if (format >= lines.size() || data >= lines.size() || format + 1 >= data) {
        return sections;
    }
    sections.usable = true;
    sections.formatIndex = format;
    sections.dataIndex = data;
    sections.rowCount = lines.size() >= data + 2 ? lines.size() - data - 2 : 0;
    return sections;
}

} // namespace it8
