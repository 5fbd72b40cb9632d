#include <gtest/gtest.h>

#include <locale>
#include <sstream>

#include "arguments.h"
#include "json_writer.h"
#include "keyword_names.h"
#include "number_format.h"
#include "statistics.h"
#include "text_table.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// A numeric facet that writes a decimal comma and groups thousands, as some
// locales do; the tool's numbers must not follow it.
struct CommaFacet : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

TEST(NumberFormat, WritesAPointWhateverTheGlobalLocale) {
    const std::locale previous =
        std::locale::global(std::locale(std::locale::classic(), new CommaFacet));
    EXPECT_EQ(FormatFixed(1234.5, 2), "1234.50");
    EXPECT_EQ(FormatShortest(0.1), "0.1");
    std::ostringstream json;
    JsonWriter writer(json);
    writer.BeginArray(true);
    writer.Number(2.5);
    writer.Number(12.345678, 2);
    writer.EndArray();
    std::locale::global(previous);
    EXPECT_EQ(json.str(), "[2.5, 12.35]");
}

TEST(NumberFormat, RoundsAndShowsNonFiniteValues) {
    EXPECT_EQ(FormatFixed(2.675, 0), "3");
    EXPECT_EQ(FormatFixed(-0.004, 2), "0.00"); // no "-0.00" in tables
    EXPECT_EQ(FormatFixed(-0.006, 2), "-0.01");
    EXPECT_EQ(FormatFixed(std::numeric_limits<double>::quiet_NaN(), 2), "nan");
    EXPECT_EQ(FormatFixed(-std::numeric_limits<double>::infinity(), 2), "-inf");
    EXPECT_DOUBLE_EQ(RoundToDecimals(1.23456, 3), 1.235);
}

TEST(JsonWriter, EscapesTextAndRepairsBrokenUtf8) {
    EXPECT_EQ(JsonWriter::Quote("a\"b\\c"), "\"a\\\"b\\\\c\"");
    EXPECT_EQ(JsonWriter::Quote("tab\tnew\nline"), "\"tab\\tnew\\nline\"");
    EXPECT_EQ(JsonWriter::Quote(std::string("\x01", 1)), "\"\\u0001\"");
    EXPECT_EQ(JsonWriter::Quote("Grün"), "\"Grün\"");
    // A Latin-1 byte is no UTF-8: it becomes U+FFFD instead of breaking the document.
    EXPECT_EQ(JsonWriter::Quote("Gr\xFCn"), "\"Gr\xEF\xBF\xBDn\"");
}

TEST(JsonWriter, NestsWithCommasAndWritesNullForNonFinite) {
    std::ostringstream out;
    JsonWriter json(out);
    json.BeginObject();
    json.Key("a");
    json.Integer(1);
    json.Key("list");
    json.BeginArray(true);
    json.Number(std::numeric_limits<double>::infinity());
    json.Bool(false);
    json.String("x");
    json.EndArray();
    json.Key("empty");
    json.BeginObject();
    json.EndObject();
    json.EndObject();
    json.Finish();
    EXPECT_EQ(out.str(), "{\n  \"a\": 1,\n  \"list\": [null, false, \"x\"],\n  \"empty\": {}\n}\n");
}

TEST(TextTable, AlignsByCharactersAndQuotesCsv) {
    TextTable table;
    table.AddColumn("NAME", false);
    table.AddColumn("L", true);
    table.AddRow({"Grün", "5.00"});
    table.AddRow({"a,\"b\"", "12.50"});
    std::ostringstream aligned;
    table.Print(aligned, TableFormat::Table);
    // "Grün" is four characters (five bytes) wide; numbers are right-aligned.
    EXPECT_EQ(aligned.str(), "NAME       L\n"
                             "Grün    5.00\n"
                             "a,\"b\"  12.50\n");
    std::ostringstream csv;
    table.Print(csv, TableFormat::Csv);
    EXPECT_EQ(csv.str(), "NAME,L\nGrün,5.00\n\"a,\"\"b\"\"\",12.50\n");
    std::ostringstream tsv;
    table.AddRow({"tab\there", "1"});
    table.Print(tsv, TableFormat::Tsv);
    EXPECT_NE(tsv.str().find("tab here\t1\n"), std::string::npos);
}

TEST(Statistics, MeanPercentileAndMaximum) {
    // Sorted 1, 2, 3, 4, 10: rank 0.95 * 4 = 3.8, so 4 + 0.8 * (10 - 4) = 8.8.
    const Summary s = Summarise({10, 2, 4, 1, 3});
    EXPECT_DOUBLE_EQ(s.mean, 4.0);
    EXPECT_DOUBLE_EQ(s.max, 10.0);
    EXPECT_NEAR(s.p95, 8.8, 1e-12);
    EXPECT_DOUBLE_EQ(Percentile({7}, 95), 7.0);
    EXPECT_DOUBLE_EQ(Percentile({1, 3}, 50), 2.0);
    const Summary none = Summarise({});
    EXPECT_EQ(none.mean + none.p95 + none.max, 0.0);
}

TEST(Arguments, LongShortInlineValuesAndErrors) {
    const std::vector<OptionDefinition> options{{"output", 'o', true}, {"exact", '\0', false}};
    const ParsedArguments a = ParseArguments({"in.it8", "-o", "out", "--exact", "x"}, options);
    EXPECT_EQ(a.positionals, (std::vector<std::string>{"in.it8", "x"}));
    EXPECT_EQ(a.Value("output"), "out");
    EXPECT_TRUE(a.Has("exact"));
    EXPECT_EQ(ParseArguments({"--output=a=b"}, options).Value("output"), "a=b");
    EXPECT_EQ(ParseArguments({"-oout"}, options).Value("output"), "out");
    // After "--" everything is positional, also words that look like options.
    EXPECT_EQ(ParseArguments({"--", "-o", "-"}, options).positionals.size(), 2u);
    EXPECT_THROW(ParseArguments({"--colour"}, options), UsageError);
    EXPECT_THROW(ParseArguments({"-o"}, options), UsageError);
    EXPECT_THROW(ParseArguments({"--exact=yes"}, options), UsageError);
    EXPECT_THROW(ParseArguments({"-o", "a", "-o", "b"}, options), UsageError);
    EXPECT_EQ(SplitList("lab,,xyz,"), (std::vector<std::string>{"lab", "xyz"}));
    EXPECT_THROW(RequireChoice("format", "xml", {"table", "json"}), UsageError);
}

TEST(Utf8, ValidatesAndWidens) {
    EXPECT_TRUE(IsValidUtf8("Grün €"));
    EXPECT_FALSE(IsValidUtf8("\xC3"));         // cut short
    EXPECT_FALSE(IsValidUtf8("\xC0\xAF"));     // overlong "/"
    EXPECT_FALSE(IsValidUtf8("\xED\xA0\x80")); // a surrogate
    EXPECT_EQ(DisplayWidth("Grün €"), 6u);
    std::wstring wide;
    ASSERT_TRUE(WideFromUtf8("a ü €", wide));
    EXPECT_EQ(wide, L"a \u00FC \u20AC");
    EXPECT_FALSE(WideFromUtf8("\xFF", wide));
}

TEST(KeywordValues, NumbersStayTextsAreQuoted) {
    bool ok = false;
    EXPECT_EQ(KeywordValueText("12000", ok), "12000");
    EXPECT_TRUE(ok);
    EXPECT_EQ(KeywordValueText("-1.5", ok), "-1.5");
    EXPECT_EQ(KeywordValueText("ISO coated", ok), "\"ISO coated\"");
    EXPECT_EQ(KeywordValueText("\"already\"", ok), "\"already\"");
    EXPECT_EQ(KeywordValueText("", ok), "\"\"");
    KeywordValueText("two\nlines", ok);
    EXPECT_FALSE(ok);
    KeywordValueText("say \"hi\"", ok);
    EXPECT_FALSE(ok);
    EXPECT_TRUE(IsValidKeywordName("PRESS_SPEED2"));
    EXPECT_FALSE(IsValidKeywordName("2PRESS"));
    EXPECT_FALSE(IsValidKeywordName("PRESS SPEED"));
    EXPECT_TRUE(IsStructuralKeyword("BEGIN_DATA"));
    EXPECT_TRUE(IsStandardKeyword("ORIGINATOR"));
    EXPECT_FALSE(IsStandardKeyword("NUMBER_OF_STRIPS"));
}

} // namespace
} // namespace swatchlog
