// Result codes of malformed, unusual or unreadable files; every failed read empties
// the store.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <random>
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
        // No data block: empty, NULs only, no format, no set count, keywords are
        // case-sensitive, data without a format, unclosed sections swallow the rest.
        {"", 9},
        {std::string(5000, '\0'), 9},
        {Without(chart, "BEGIN_DATA_FORMAT"), 9},
        {Without(chart, "NUMBER_OF_SETS 2"), 9},
        {"number_of_sets 1\n" + Without(cmyk, "NUMBER_OF_SETS 1"), 9},
        {Lines({"NUMBER_OF_SETS 1", "BEGIN_DATA", "END_DATA"}), 9},
        {"BEGIN_TARGET_FORMAT\n" + cmyk, 9},
        {"BEGIN_DEVICE_CONTROL_SEQUENCE\n" + cmyk, 9},
        // Set counts below 1 or not a number, at once, also after a good data block.
        {"NUMBER_OF_SETS 0\n" + cmyk, 6},
        {"NUMBER_OF_SETS -2\n" + cmyk, 6},
        {"NUMBER_OF_SETS many\n" + cmyk, 6},
        {cmyk + "NUMBER_OF_SETS 0\n", 6},
        // No END_DATA_FORMAT, a field count other than NUMBER_OF_FIELDS (a repeated
        // name counts once; 0 checks nothing), a second format after the data.
        {Without(chart, "END_DATA_FORMAT"), 5},
        {"NUMBER_OF_FIELDS 6\n" + cmyk, 5},
        {"NUMBER_OF_FIELDS 3\n" + Chart("A B A", {"1 2 3"}), 5},
        {"NUMBER_OF_FIELDS 0\n" + cmyk, 0},
        {chart + "BEGIN_DATA_FORMAT\nSAMPLE_ID\n", 5},
        // No END_DATA (its line end is optional), also in a second data block.
        {open, 7},
        {open + "END_DATA", 0},
        {chart + "BEGIN_DATA\n", 7},
        // Rows and set counts that disagree; blank rows do not count; quotes do not
        // join words; a NUL ends its line; a second block must fit too.
        {Without(chart, "102 A2 100 0 0 0 55 -37 -50"), 8},
        {Insert(chart, "END_DATA\n", "103 A3 1 2 3 4 5 6 7"), 8},
        {Insert(chart, "102", "103 A3 1 2 3 4 5 6 7 8"), 8},
        {Chart("SAMPLE_ID SAMPLE_NAME", {"1 \"a b\""}), 8},
        {nul, 8},
        {Chart("SAMPLE_ID CMYK_C", {"", "1 0", " \t ", "2 0"}, 2), 0},
        {chart + "BEGIN_DATA\n1 2 3\nEND_DATA\n", 8},
        {chart + "NUMBER_OF_SETS 1\nBEGIN_DATA\n1 A 1 2 3 4 5 6 7\nEND_DATA\n", 8},
        // Columns beyond the row's values (NUMBER_OF_FIELDS lowered after the format,
        // or a repeated name moving CMYK_C past the end); a repeat never read is harmless.
        {Insert(cmyk, "BEGIN_DATA\n", "NUMBER_OF_FIELDS 4"), 8},
        {Chart("CMYK_C CMYK_M CMYK_Y CMYK_K CMYK_C", {"1 2 3 4"}), 8},
        {Chart("SAMPLE_ID CMYK_C SAMPLE_ID", {"1 2"}), 0},
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

TEST(ResultCodes, BinaryGarbageAndMutatedChartsNeverFault) {
    TempDir dir;
    CIT8ReaderWriter reader;
    std::mt19937 random(20261206);
    const std::string chart =
        Chart("SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K DRGB RGB_R RGB_G RGB_B",
              {"a 1,5 2.5 3 4 #A0B0C0 1 2 3", "b 1e999 -1e999 nan inf 0 # 4 5 6"});
    const std::string replacements("\0\r\n\t ,.#-x9", 12);
    for (int round = 0; round < 320; ++round) {
        std::string text = chart;
        if (round < 20) { // random bytes
            text.assign(1 + round * 300, '\0');
            for (char& c : text) {
                c = static_cast<char>(random() % 256);
            }
        } else { // the chart with three bytes changed: any code, but no fault
            for (int change = 0; change < 3; ++change) {
                text[random() % text.size()] = replacements[random() % replacements.size()];
            }
        }
        if (ReadText(reader, dir, text) != 0) {
            ExpectEmptyStore(reader, text);
        }
    }
}
