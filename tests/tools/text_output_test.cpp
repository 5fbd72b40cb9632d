// Numbers as the tool writes them, in text and JSON, and the cells of a patch.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <locale>
#include <sstream>

#include "json_writer.h"
#include "number_format.h"
#include "patch_values.h"

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

TEST(PatchCells, AFieldThePatchHasNoValueForIsEmptyNeverZero) {
    // The chart's spectral fields are four, this patch has two of them.
    const CColorPatch patch(tagCMYK{}, tagXYZ{}, tagLAB{}, tagRGB{}, tagCMYKOG{}, tagCMYKRGB{},
                            tagCMYKOGV{}, {{"SPECTRAL_NM_380", 0.25}, {"SPECTRAL_NM_390", 0.5}}, {},
                            tagHTMLCOLOR{}, tagDENSITY{}, "");
    EXPECT_EQ(SpaceCells(patch, Space::Spectral, 4),
              (std::vector<std::string>{"0.2500", "0.5000", "", ""}));
    const std::vector<double> numbers = SpaceNumbers(patch, Space::Spectral, 4);
    ASSERT_EQ(numbers.size(), 4u);
    EXPECT_TRUE(numbers[1] == 0.5 && std::isnan(numbers[2]) && std::isnan(numbers[3]));
}

} // namespace
} // namespace swatchlog
