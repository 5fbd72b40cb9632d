// Numbers, JSON strings and failure explanations as the tool writes them.
#include <gtest/gtest.h>

#include <limits>
#include <locale>
#include <sstream>

#include "chart_scan.h"
#include "json_writer.h"
#include "number_format.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// A numeric facet with a decimal comma and grouped thousands, as some locales have.
struct CommaFacet : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

TEST(NumberFormat, PointWhateverTheLocaleNoNegativeZeroNullForInfinity) {
    const std::locale previous =
        std::locale::global(std::locale(std::locale::classic(), new CommaFacet));
    EXPECT_EQ(FormatFixed(1234.5, 2), "1234.50");
    EXPECT_EQ(FormatShortest(0.1), "0.1");
    std::ostringstream json;
    JsonWriter writer(json);
    writer.BeginArray(true);
    writer.Number(2.5);
    writer.Number(12.345678, 2);
    writer.Number(std::numeric_limits<double>::infinity()); // JSON has no infinity
    writer.EndArray();
    std::locale::global(previous);
    EXPECT_EQ(json.str(), "[2.5, 12.35, null]");
    EXPECT_EQ(FormatFixed(-0.004, 2), "0.00");
    EXPECT_EQ(FormatFixed(-std::numeric_limits<double>::infinity(), 2), "-inf");
}

TEST(JsonWriter, EscapesTextAndRepairsBrokenUtf8) {
    EXPECT_EQ(JsonWriter::Quote("a\"b\\c\td\n"), "\"a\\\"b\\\\c\\td\\n\"");
    EXPECT_EQ(JsonWriter::Quote(std::string("\x01", 1)), "\"\\u0001\"");
    EXPECT_EQ(JsonWriter::Quote("Grün"), "\"Grün\"");
    // A Latin-1 byte is no UTF-8: it becomes U+FFFD instead of breaking the document.
    EXPECT_EQ(JsonWriter::Quote("Gr\xFCn"), "\"Gr\xEF\xBF\xBDn\"");
    EXPECT_FALSE(IsValidUtf8("\xC3"));         // cut short
    EXPECT_FALSE(IsValidUtf8("\xC0\xAF"));     // overlong "/"
    EXPECT_FALSE(IsValidUtf8("\xED\xA0\x80")); // a surrogate
}

// Lines 1 to 7 of a chart of three fields and `sets` rows; `rows` follow from line 8.
std::string Chart(const std::string& rows, const std::string& sets = "2") {
    return "CGATS.17\nNUMBER_OF_FIELDS 3\nBEGIN_DATA_FORMAT\nSAMPLE_ID LAB_L LAB_A\n"
           "END_DATA_FORMAT\nNUMBER_OF_SETS " +
           sets + "\nBEGIN_DATA\n" + rows;
}

TEST(ChartScan, ExplainsReadFailuresWithLineNumbers) {
    const struct {
        int code;
        std::string text;
        std::string expected;
    } cases[] = {
        // The blank line still counts as a line but not as a row.
        {8, Chart("1 50 0\n\n2 40 1 7\nEND_DATA\n"),
         "row 2 (line 10) has 4 values but NUMBER_OF_FIELDS is 3"},
        {8, Chart("1 50 0\nEND_DATA\n"),
         "NUMBER_OF_SETS on line 6 is 2 but the data block on line 7 holds 1 row"},
        {6, Chart("", "\"0\""), "NUMBER_OF_SETS on line 6 is below 1"},
        // Field names are told apart without regard to case.
        {5, "NUMBER_OF_FIELDS 4\nBEGIN_DATA_FORMAT\nSAMPLE_ID lab_l LAB_L\nEND_DATA_FORMAT\n",
         "the data format on line 2 names 2 different fields but NUMBER_OF_FIELDS on line 1 is 4"},
        {9, "CGATS.17\nORIGINATOR x\n", "the file has no data block (no BEGIN_DATA line)"},
        {9, "NUMBER_OF_SETS 1\nBEGIN_DATA\n1\nEND_DATA\n",
         "BEGIN_DATA on line 2 comes before the data format"},
        {9, "CGATS.17\nBEGIN_MEASUREMENT_SCRIPT\nx\n",
         "the section BEGIN_MEASUREMENT_SCRIPT on line 2 is never closed, so the file has no "
         "data block"},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(ExplainReadFailure(c.code, ScanChartText(c.text)), c.expected) << c.text;
    }
}

} // namespace
} // namespace swatchlog
