// Numbers as the tool writes them, in text and JSON.
#include <gtest/gtest.h>

#include <limits>
#include <locale>
#include <sstream>

#include "json_writer.h"
#include "number_format.h"

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

} // namespace
} // namespace swatchlog
