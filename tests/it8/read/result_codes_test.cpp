// Result codes of malformed, unusual or unreadable files; every failed read empties
// the store.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>

#include "chart_text.h"

using namespace reader_test;
using test_support::TempDir;
using test_support::Wide;

namespace {

void ExpectEmptyStore(CIT8ReaderWriter& reader, const std::string& text) {
    std::map<int, int> references;
    EXPECT_EQ(reader.GetPatchCount(), 0) << text;
    EXPECT_TRUE(reader.GetKeywords().empty()) << text;
    EXPECT_EQ(reader.GetDeviceColorSpace(), -1) << text;
    EXPECT_EQ(reader.GetReferenceSampleMap(references), 25) << text;
}

std::string Insert(std::string text, const std::string& before, const std::string& line) {
    return text.insert(text.find(before), line + "\n");
}

std::string Without(std::string text, const std::string& line) {
    return text.erase(text.rfind(line), line.size() + 1);
}

} // namespace

TEST(ResultCodes, EachFileGetsItsCode) {
    TempDir dir;
    CIT8ReaderWriter reader;
    const std::string chart = CmykLabChart();
    const std::string cmyk = Chart("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 0 0 0 0"});
    const std::string open = Without(cmyk, "END_DATA");
    std::string nul = Chart("SAMPLE_ID CMYK_C XYZ_X", {"1 2 3"});
    nul[nul.find("2 3") + 1] = '\0'; // hides the row's third value
    const struct {
        std::string text;
        int code;
    } cases[] = {
        // No data block: empty, NULs only, no format, no set count, data without a
        // format, an unclosed section swallows the rest.
        {"", 9},
        {std::string(5000, '\0'), 9},
        {Without(chart, "BEGIN_DATA_FORMAT"), 9},
        {Without(chart, "NUMBER_OF_SETS 2"), 9},
        {Lines({"NUMBER_OF_SETS 1", "BEGIN_DATA", "END_DATA"}), 9},
        {"BEGIN_DEVICE_CONTROL_SEQUENCE\n" + cmyk, 9},
        // Set counts below 1 or not a number.
        {"NUMBER_OF_SETS 0\n" + cmyk, 6},
        {"NUMBER_OF_SETS many\n" + cmyk, 6},
        // No END_DATA_FORMAT, a field count other than NUMBER_OF_FIELDS, a second
        // format after the data.
        {Without(chart, "END_DATA_FORMAT"), 5},
        {"NUMBER_OF_FIELDS 6\n" + cmyk, 5},
        {chart + "BEGIN_DATA_FORMAT\nSAMPLE_ID\n", 5},
        // No END_DATA (its line end is optional), also in a second data block.
        {open, 7},
        {open + "END_DATA", 0},
        {chart + "BEGIN_DATA\n", 7},
        // Rows and set counts that disagree; blank rows do not count; quotes do not
        // join words; a NUL ends its line; a second block must fit too.
        {Without(chart, "102 A2 100 0 0 0 55 -37 -50"), 8},
        {Insert(chart, "END_DATA\n", "103 A3 1 2 3 4 5 6 7"), 8},
        {Chart("SAMPLE_ID SAMPLE_NAME", {"1 \"a b\""}), 8},
        {nul, 8},
        {Chart("SAMPLE_ID CMYK_C", {"", "1 0", " \t ", "2 0"}, 2), 0},
        {chart + "NUMBER_OF_SETS 1\nBEGIN_DATA\n1 A 1 2 3 4 5 6 7\nEND_DATA\n", 8},
        // A column beyond the row's values (NUMBER_OF_FIELDS lowered after the format).
        {Insert(cmyk, "BEGIN_DATA\n", "NUMBER_OF_FIELDS 4"), 8},
    };
    for (const auto& c : cases) {
        ASSERT_EQ(ReadText(reader, dir, chart), 0);
        EXPECT_EQ(ReadText(reader, dir, c.text), c.code) << c.text;
        if (c.code != 0) {
            ExpectEmptyStore(reader, c.text);
        }
    }
}

TEST(ResultCodes, PathsThatCannotBeRead) {
    TempDir dir;
    CIT8ReaderWriter reader;
    ASSERT_EQ(ReadText(reader, dir, CmykLabChart(), "Farbkarte \xC3\xA4\xC3\xB6 \xE6\xB5\x8B.it8"),
              0);
    EXPECT_EQ(reader.ReadChartFile(L""), 4);
    EXPECT_EQ(reader.ReadChartFile(Wide(dir.file("missing.txt"))), 3);
    EXPECT_EQ(reader.ReadChartFile(Wide(dir.path())), 3);
    EXPECT_EQ(reader.CanReadFile(Wide(dir.file("missing.txt"))), 1);
    const auto locked = dir.write("locked.txt", CmykLabChart());
    std::filesystem::permissions(locked, std::filesystem::perms::none);
    if (!std::ifstream(locked).is_open()) { // a privileged user reads it anyway
        EXPECT_EQ(reader.ReadChartFile(Wide(locked)), 3);
    }
    // A failed open leaves the chart read before untouched.
    EXPECT_EQ(reader.GetPatchCount(), 2);
}
