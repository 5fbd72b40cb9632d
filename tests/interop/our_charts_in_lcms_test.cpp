// Charts our writers produce load with Little CMS, with the same set count,
// the same field names and the same values to the printed precision.
#include <gtest/gtest.h>

#include <cmath>
#include <map>
#include <string>
#include <vector>

#include "lcms_table.h"
#include "temp_files.h"

namespace {

using Names = std::vector<std::string>;
using Rows = std::vector<std::vector<double>>;

// A CMYK source chart of three patches: cyan, magenta and paper white last,
// so that a target file written from it holds all three.
const char kCmykSource[] = "CGATS.17\nORIGINATOR \"interop\"\nNUMBER_OF_FIELDS 5\n"
                           "BEGIN_DATA_FORMAT\nSAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                           "END_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA\n"
                           "1 100 0 0 0\n2 0 100 0 0\n3 0 0 0 0\nEND_DATA\n";
const Names kCmyk = {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"};
const Names kXyz = {"XYZ_X", "XYZ_Y", "XYZ_Z"};
const Names kLab = {"LAB_L", "LAB_A", "LAB_B"};
const Rows kSourceRows = {{1, 100, 0, 0, 0}, {2, 0, 100, 0, 0}, {3, 0, 0, 0, 0}};
// The source's rows with the store's XYZ ("%9.2f") and Lab ("%.2f": 95.123456
// -> 95.12, 12.345 -> 12.35 as the double nearest 12.345 lies just above it).
const Rows kWithXyzLab = {{1, 100, 0, 0, 0, 86.41, 89.93, 71.77, 95.12, -0.5, 2},
                          {2, 0, 100, 0, 0, 13.2, 22.5, 55.9, 12.35, -37, -50},
                          {3, 0, 0, 0, 0, 33.46, 17.75, 3.04, 48, 74, -3}};

const Names kSpectral = [] {
    Names names;
    for (int nm = 380; nm <= 730; nm += 10) {
        names.push_back("SPECTRAL_NM_" + std::to_string(nm));
    }
    return names;
}();
// Reflectance k (0 to 35) of row r in the chart with every column kind.
double Reflectance(int r, int k) {
    return 0.1 * r + 0.0123456 * k;
}

Names Join(std::initializer_list<Names> parts) {
    Names joined;
    for (const Names& part : parts) {
        joined.insert(joined.end(), part.begin(), part.end());
    }
    return joined;
}

enum class Writer { Kinds, Digits, Measure, Append, Template, Insert, Target, White };

// Writes with a store that read the source and holds Lab and XYZ values.
int Write(Writer writer, const std::wstring& source, const std::wstring& target) {
    CIT8ReaderWriter store;
    int result = store.ReadChartFile(source);
    store.SetLABList({{95.123456, -0.5, 2.0}, {12.345, -37.0, -50.0}, {48.0, 74.0, -3.0}});
    store.SetXYZList({{86.41, 89.93, 71.77}, {13.2, 22.5, 55.9}, {33.46, 17.75, 3.04}});
    const std::vector<tagCMYK> cmyk = {{100, 0, 0, 0}, {0, 100, 0, 0}, {0, 0, 0, 0}};
    switch (writer) {
    case Writer::Kinds: { // a new chart with keywords and every column kind
        store.SetKeywordList({{"CGATS.17", ""}, {"ORIGINATOR", "\"Redavudeva interop\""}});
        std::vector<std::map<std::string, double>> spectra(3);
        for (int r = 0; r < 3; ++r) {
            for (int k = 0; k < 36; ++k) {
                spectra[r][kSpectral[k]] = Reflectance(r, k);
            }
        }
        store.SetSpectralDataList(spectra, false);
        store.SetSampleNameList({"A1", "A2", "A3"});
        store.SetRGBList({{255, 0, 0}, {0, 255, 0}, {0, 0, 255}});
        store.SetCMYKList(cmyk);
        return result + store.WriteChartFile(L"", target, false);
    }
    case Writer::Digits: { // a new chart of six-colour and n-colour channels, no keywords
        store.SetLABList({});
        store.SetXYZList({});
        store.SetCMYKOGList({{1.0, 2.0, 3.0, 4.0, 5.0, 6.0}, {10.0, 20.0, 30.0, 40.0, 50.0, 60.0}});
        std::vector<std::map<int, tagNCLR>> ncolor(2);
        for (int r = 0; r < 2; ++r) {
            for (int k = 0; k < 3; ++k) {
                ncolor[r][k] = tagNCLR{3, k, "3CLR_" + std::to_string(k + 1), 7.5 * (r + k)};
            }
        }
        store.SetNColorList(ncolor);
        return result + store.WriteChartFile(L"", target, false);
    }
    case Writer::Measure:
        return result + store.WriteMeasurementFile(source, target);
    case Writer::Append:
        return result + store.AppendMissingColumns(source, target, true);
    case Writer::Template:
        return result + store.WriteChartFile(source, target, true);
    case Writer::Insert:
        return result + store.InsertKeywords(source, target, {{"DESCRIPTOR", "\"inserted\""}});
    case Writer::Target:
        return result + store.WriteTargetFile(source, target);
    case Writer::White: {
        store.SetCMYKList({{0, 0, 0, 0}, {100, 0, 0, 0}, {0, 100, 0, 0}});
        const CColorPatch white = store.GetPatch(3, result);
        return result + store.AppendColumnsWithWhitePoint(source, target, white, white);
    }
    }
    return -1;
}

struct WriterCase {
    Writer writer;
    Names fields;                                 // empty: names not compared
    Rows rows;                                    // every cell of every row; NaN for a label
    std::pair<std::string, std::string> property; // a header keyword and its value
};

// The chart with every column kind: SAMPLE_ID, the label, the reflectances
// printed "%.5f" (0.1 + 0.0123456 * 35 = 0.532096 -> 0.53210; 1234.56 * k is
// never an odd multiple of 0.5, so no value ends in a tie), CMYK, XYZ and Lab
// as above, and RGB.
Rows EveryKindRows() {
    const Rows rgb = {{255, 0, 0}, {0, 255, 0}, {0, 0, 255}};
    Rows rows;
    for (int r = 0; r < 3; ++r) {
        rows.push_back({r + 1.0, NAN});
        for (int k = 0; k < 36; ++k) {
            rows.back().push_back(std::round(Reflectance(r, k) * 1e5) / 1e5);
        }
        rows.back().insert(rows.back().end(), kWithXyzLab[r].begin() + 1, kWithXyzLab[r].end());
        rows.back().insert(rows.back().end(), rgb[r].begin(), rgb[r].end());
    }
    return rows;
}

TEST(OurChartsInLcms, EveryWriterOutputLoadsWithTheSameCountsNamesAndValues) {
    const Names colours = Join({kCmyk, kXyz, kLab});
    const Names sourceFields = Join({{"SAMPLE_ID"}, kCmyk});
    const Names cmykXyzLab = Join({{"SAMPLE_ID"}, colours});
    const Names everyKind =
        Join({{"SAMPLE_ID", "SAMPLE_NAME"}, kSpectral, colours, {"RGB_R", "RGB_G", "RGB_B"}});
    // Six significant digits: 95.123456 -> 95.1235, 12.345 stays.
    const Rows measured = {{1, 100, 0, 0, 0, 95.1235, -0.5, 2, 86.41, 89.93, 71.77},
                           {2, 0, 100, 0, 0, 12.345, -37, -50, 13.2, 22.5, 55.9},
                           {3, 0, 0, 0, 0, 48, 74, -3, 33.46, 17.75, 3.04}};
    // Six-colour and n-colour channels ("6CLR_1", "3CLR_2") have names that
    // begin with a digit, which Little CMS's lexer reads as a number and a
    // word: only the values are compared. A row holds SAMPLE_ID, three
    // n-colour channels 7.5 * (row + k) and six six-colour channels.
    const Rows digits = {{1, 0, 7.5, 15, 1, 2, 3, 4, 5, 6},
                         {2, 7.5, 15, 22.5, 10, 20, 30, 40, 50, 60}};
    // Rows renumbered with the store's CMYK, then its XYZ and Lab. The white
    // is the source's patch 3, which carries no XYZ: a zero record, written
    // with six significant digits as "0".
    const Rows whitePoint = {{1, 0, 0, 0, 0, 86.41, 89.93, 71.77, 95.12, -0.5, 2},
                             {2, 100, 0, 0, 0, 13.2, 22.5, 55.9, 12.35, -37, -50},
                             {3, 0, 100, 0, 0, 33.46, 17.75, 3.04, 48, 74, -3}};
    const std::pair<std::string, std::string> originator = {"ORIGINATOR", "interop"};
    const WriterCase cases[] = {
        {Writer::Kinds, everyKind, EveryKindRows(), {"ORIGINATOR", "Redavudeva interop"}},
        {Writer::Digits, {}, digits, {}},
        {Writer::Measure, Join({sourceFields, kLab, kXyz}), measured, originator},
        {Writer::Append, cmykXyzLab, kWithXyzLab, originator},
        {Writer::Template, cmykXyzLab, kWithXyzLab, originator},
        {Writer::Insert, sourceFields, kSourceRows, {"DESCRIPTOR", "inserted"}},
        // The two clean patches and the white that ends the walk.
        {Writer::Target, sourceFields, kSourceRows, originator},
        {Writer::White, cmykXyzLab, whitePoint, {"WHITE_POINT_MEASURED_XYZ", "0\t0\t0"}},
    };
    test_support::TempDir dir;
    const std::wstring source = test_support::Wide(dir.write("source.it8", kCmykSource));
    for (const WriterCase& c : cases) {
        SCOPED_TRACE("writer " + std::to_string(static_cast<int>(c.writer)));
        const auto path = dir.file("written.it8");
        ASSERT_EQ(Write(c.writer, source, test_support::Wide(path)), 0);
        const interop::LcmsTable table = interop::LoadWithLcms(path);
        ASSERT_TRUE(table.loaded) << table.error << "\n" << test_support::ReadBytes(path);
        // Only the new chart without keywords gets the default identification.
        EXPECT_EQ(table.sheetType, c.writer == Writer::Digits ? "IT8" : "CGATS.17");
        if (!c.fields.empty()) {
            EXPECT_EQ(table.fields, c.fields);
            EXPECT_EQ(table.numberOfFields, static_cast<int>(c.fields.size()));
        }
        EXPECT_EQ(table.numberOfSets, static_cast<int>(c.rows.size()));
        ASSERT_EQ(table.numbers.size(), c.rows.size());
        for (std::size_t r = 0; r < c.rows.size(); ++r) {
            ASSERT_EQ(table.numbers[r].size(), c.rows[r].size()) << "row " << r;
            for (std::size_t col = 0; col < c.rows[r].size(); ++col) {
                if (std::isnan(c.rows[r][col])) {
                    EXPECT_EQ(table.text[r][col], "A" + std::to_string(r + 1));
                } else {
                    EXPECT_NEAR(table.numbers[r][col], c.rows[r][col], 1e-9) << r << "/" << col;
                }
            }
        }
        if (!c.property.first.empty()) {
            const auto it = table.properties.find(c.property.first);
            EXPECT_EQ(it == table.properties.end() ? "<absent>" : it->second, c.property.second);
        }
    }
}

} // namespace
