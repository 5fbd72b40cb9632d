// Result codes of malformed or unusual files; every failed read empties the store.
#include <gtest/gtest.h>

#include <random>
#include <string>

#include "chart_text.h"

using namespace reader_test;
using test_support::TempDir;

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
    const struct {
        std::string text;
        int code;
    } cases[] = {
        // Files without a data block.
        {"", 9},
        {"\n\n\r\n \t \n", 9},
        {std::string(5000, '\0'), 9},
        {"CGATS.17", 9},
        {Without(chart, "BEGIN_DATA_FORMAT"), 9},
        {Without(chart, "NUMBER_OF_SETS 2"), 9},
        {"number_of_sets 1\n" + Without(cmyk, "NUMBER_OF_SETS 1"), 9},
        {Lines({"NUMBER_OF_SETS 1", "BEGIN_DATA", "END_DATA"}), 9},
        {"BEGIN_TARGET_FORMAT\n" + cmyk, 9}, // unclosed sections swallow the rest
        {"BEGIN_MEASUREMENT_SCRIPT\n" + cmyk, 9},
        {"BEGIN_REPORTING_FORMAT\n" + cmyk, 9},
        {"BEGIN_DEVICE_CONTROL_SEQUENCE\n" + cmyk, 9},
        // Set counts below 1, at once, also after a good data block.
        {"NUMBER_OF_SETS 0\n" + cmyk, 6},
        {"NUMBER_OF_SETS -2\n" + cmyk, 6},
        {"NUMBER_OF_SETS many\n" + cmyk, 6},
        {cmyk + "NUMBER_OF_SETS 0\n", 6},
        // Data formats: no end, or a field count other than NUMBER_OF_FIELDS
        // (a repeated name counts once).
        {Without(chart, "END_DATA_FORMAT"), 5},
        {"BEGIN_DATA_FORMAT", 5},
        {"NUMBER_OF_SETS 1\nBEGIN_DATA_FORMAT\nSAMPLE_ID\nend_data_format\n", 5},
        {"NUMBER_OF_FIELDS 6\n" + cmyk, 5},
        {"NUMBER_OF_FIELDS 3\n" + Chart("A B A", {"1 2 3"}), 5},
        {chart + "BEGIN_DATA_FORMAT\nSAMPLE_ID\n", 5},
        {"NUMBER_OF_FIELDS 0\n" + cmyk, 0},
        // Data blocks that do not end.
        {open, 7},
        {open + "END_DATA", 0}, // no line end after END_DATA
        {open + "end_data", 8}, // a row of one value
        {chart + "BEGIN_DATA\n", 7},
        {cmyk.substr(0, cmyk.find("BEGIN_DATA\n") + 10), 7},
        // Rows and set counts that disagree.
        {Without(chart, "102 A2 100 0 0 0 55 -37 -50"), 8},
        {Insert(chart, "END_DATA\n", "103 A3 1 2 3 4 5 6 7"), 8},
        {Insert(chart, "102", "103 A3 1 2 3 4 5 6 7 8"), 8},
        {Insert(chart, "102", "# comment"), 8},
        {Chart("SAMPLE_ID SAMPLE_NAME", {"1 \"a b\""}), 8},
        {Chart("", {"1"}), 8},
        {chart + "BEGIN_DATA\n1 2 3\nEND_DATA\n", 8},
        {chart + "NUMBER_OF_SETS 1\nBEGIN_DATA\n1 A 1 2 3 4 5 6 7\nEND_DATA\n", 8},
        {Chart("SAMPLE_ID CMYK_C", {"", "1 0", " \t ", "2 0"}, 2), 0},
        // Columns beyond the row's values: NUMBER_OF_FIELDS lowered after the
        // format, or a repeated name that moves CMYK_C behind the last value. A
        // repeated field that is never read does no harm.
        {Insert(cmyk, "BEGIN_DATA\n", "NUMBER_OF_FIELDS 4"), 8},
        {Insert(Chart("SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", {"1 2 3"}), "BEGIN_DATA\n",
                "NUMBER_OF_FIELDS 3"),
         8},
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

TEST(ResultCodes, BinaryGarbageAndMutatedChartsNeverFault) {
    TempDir dir;
    CIT8ReaderWriter reader;
    std::mt19937 random(20261206);
    std::uniform_int_distribution<int> byte(0, 255);
    for (int round = 0; round < 20; ++round) {
        std::string garbage(1 + round * 300, '\0');
        for (char& c : garbage) {
            c = static_cast<char>(byte(random));
        }
        if (ReadText(reader, dir, garbage) != 0) {
            ExpectEmptyStore(reader, "garbage");
        }
    }
    // A chart with a few bytes changed: any code may come back, nothing may fault.
    const std::string chart =
        Chart("SAMPLE_NAME CMYK_C CMYK_M CMYK_Y CMYK_K DRGB RGB_R RGB_G RGB_B",
              {"a 1,5 2.5 3 4 #A0B0C0 1 2 3", "b 1e999 -1e999 nan inf 0 # 4 5 6"});
    const std::string replacements("\0\r\n\t ,.#-x9", 12);
    std::uniform_int_distribution<std::size_t> position(0, chart.size() - 1);
    std::uniform_int_distribution<std::size_t> pick(0, replacements.size() - 1);
    for (int round = 0; round < 300; ++round) {
        std::string mutated = chart;
        for (int change = 0; change < 3; ++change) {
            mutated[position(random)] = replacements[pick(random)];
        }
        if (ReadText(reader, dir, mutated) != 0) {
            ExpectEmptyStore(reader, mutated);
        }
    }
}
