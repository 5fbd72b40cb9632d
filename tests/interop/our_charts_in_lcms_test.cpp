// Charts our writers produce load with Little CMS, with the same set count,
// the same field names and the same values to the printed precision.
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "lcms_table.h"
#include "temp_files.h"

namespace {

using interop::LcmsTable;
using test_support::TempDir;
using test_support::Wide;

std::vector<std::string> SpectralNames() {
    std::vector<std::string> names;
    for (int nm = 380; nm <= 730; nm += 10) {
        names.push_back("SPECTRAL_NM_" + std::to_string(nm));
    }
    return names;
}

LcmsTable LoadOrFail(const std::filesystem::path& path) {
    LcmsTable table = interop::LoadWithLcms(path);
    EXPECT_TRUE(table.loaded) << table.error << "\n" << test_support::ReadBytes(path);
    return table;
}

void ExpectCell(const LcmsTable& table, int row, const std::string& field, double expected) {
    const int col = table.Field(field);
    ASSERT_GE(col, 0) << field;
    ASSERT_LT(row, static_cast<int>(table.numbers.size()));
    EXPECT_NEAR(table.numbers[row][col], expected, 1e-9) << field << " of row " << row;
}

// A CMYK source chart of three patches: cyan, magenta and paper white last,
// so that a target file written from it holds all three.
const char kCmykSource[] = "CGATS.17\n"
                           "ORIGINATOR \"interop\"\n"
                           "NUMBER_OF_FIELDS 5\n"
                           "BEGIN_DATA_FORMAT\n"
                           "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                           "END_DATA_FORMAT\n"
                           "NUMBER_OF_SETS 3\n"
                           "BEGIN_DATA\n"
                           "1 100 0 0 0\n"
                           "2 0 100 0 0\n"
                           "3 0 0 0 0\n"
                           "END_DATA\n";

TEST(OurChartsInLcms, NewChartFileWithEveryColumnKind) {
    TempDir dir;
    CIT8ReaderWriter store;
    store.SetSampleNameList({"A1", "A2", "A3"});
    store.SetCMYKList(
        {{100.0, 0.0, 0.0, 0.0}, {0.0, 33.333, 0.0, 0.0}, {12.345, 50.0, 0.0, 99.999}});
    store.SetXYZList({{41.25, 21.26, 1.93}, {35.76, 71.52, 11.92}, {18.05, 7.22, 95.05}});
    store.SetLABList({{55.0, -37.0, -50.0}, {48.0, 74.0, -3.0}, {-0.004, 0.005, 100.0}});
    store.SetRGBList({{255, 0, 0}, {0, 255, 0}, {0, 0, 255}});
    std::vector<std::map<std::string, double>> spectra(3);
    const std::vector<std::string> names = SpectralNames();
    for (int r = 0; r < 3; ++r) {
        for (int k = 0; k < 36; ++k) {
            spectra[r][names[k]] = 0.1 * r + 0.0123456 * k;
        }
    }
    store.SetSpectralDataList(spectra, false);
    const auto path = dir.file("new.it8");
    ASSERT_EQ(store.WriteChartFile(L"", Wide(path), false), 0);

    const LcmsTable table = LoadOrFail(path);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.sheetType, "IT8");
    EXPECT_EQ(table.numberOfSets, 3);
    // SAMPLE_ID, SAMPLE_NAME, 36 spectral, 4 CMYK, 3 XYZ, 3 Lab, 3 RGB = 51.
    EXPECT_EQ(table.numberOfFields, 51);
    std::vector<std::string> expected = {"SAMPLE_ID", "SAMPLE_NAME"};
    expected.insert(expected.end(), names.begin(), names.end());
    for (const char* name : {"CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K", "XYZ_X", "XYZ_Y", "XYZ_Z",
                             "LAB_L", "LAB_A", "LAB_B", "RGB_R", "RGB_G", "RGB_B"}) {
        expected.emplace_back(name);
    }
    EXPECT_EQ(table.fields, expected);
    ASSERT_EQ(table.text.size(), 3u);
    EXPECT_EQ(table.text[1][table.Field("SAMPLE_NAME")], "A2");
    ExpectCell(table, 0, "SAMPLE_ID", 1);
    ExpectCell(table, 2, "SAMPLE_ID", 3);
    // "%.2f": 33.333 -> 33.33, 12.345 -> 12.35 (the double nearest 12.345 lies
    // just above it), 99.999 -> 100.00, -0.004 -> -0.00.
    ExpectCell(table, 1, "CMYK_M", 33.33);
    ExpectCell(table, 2, "CMYK_C", 12.35);
    ExpectCell(table, 2, "CMYK_K", 100.0);
    ExpectCell(table, 0, "XYZ_X", 41.25);
    ExpectCell(table, 2, "XYZ_Z", 95.05);
    ExpectCell(table, 1, "LAB_A", 74.0);
    ExpectCell(table, 2, "LAB_L", 0.0);
    ExpectCell(table, 2, "LAB_B", 100.0);
    ExpectCell(table, 0, "RGB_R", 255);
    ExpectCell(table, 2, "RGB_B", 255);
    ExpectCell(table, 1, "RGB_R", 0);
    // "%.5f": 0.1 + 0.0123456 * 35 = 0.532096 -> 0.53210; 0.0123456 * 7 = 0.0864192 -> 0.08642.
    ExpectCell(table, 1, "SPECTRAL_NM_730", 0.53210);
    ExpectCell(table, 0, "SPECTRAL_NM_450", 0.08642);
}

TEST(OurChartsInLcms, NewChartFileWithKeywordsAndCmykLast) {
    TempDir dir;
    CIT8ReaderWriter store;
    store.SetKeywordList({{"CGATS.17", ""},
                          {"ORIGINATOR", "\"Redavudeva interop\""},
                          {"CREATED", "\"2026-12-06\""}});
    store.SetCMYKList({{0.0, 0.0, 0.0, 0.0}, {25.0, 50.0, 75.0, 100.0}});
    const auto path = dir.file("keywords.it8");
    ASSERT_EQ(store.WriteChartFile(L"", Wide(path), false), 0);

    const LcmsTable table = LoadOrFail(path);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.sheetType, "CGATS.17");
    EXPECT_EQ(table.Property("ORIGINATOR"), "Redavudeva interop");
    EXPECT_EQ(table.numberOfSets, 2);
    EXPECT_EQ(table.numberOfFields, 5);
    EXPECT_EQ(table.fields,
              (std::vector<std::string>{"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"}));
    ExpectCell(table, 1, "CMYK_C", 25.0);
    ExpectCell(table, 1, "CMYK_K", 100.0);
}

// Six-colour and n-colour columns carry names that begin with a digit
// ("6CLR_1", "3CLR_2"). Little CMS's lexer reads such a name as a number
// followed by a word and mangles the field names, so for these charts only the
// set count and the values are compared; the names are checked on our side by
// the writer's own tests.
TEST(OurChartsInLcms, NewChartFileWithDigitLeadNamesKeepsCountsAndValues) {
    TempDir dir;
    CIT8ReaderWriter store;
    store.SetCMYKOGList({{1.0, 2.0, 3.0, 4.0, 5.0, 6.0}, {10.0, 20.0, 30.0, 40.0, 50.0, 60.0}});
    std::vector<std::map<int, tagNCLR>> ncolor(2);
    for (int r = 0; r < 2; ++r) {
        for (int k = 0; k < 3; ++k) {
            ncolor[r][k] = tagNCLR{3, k, "3CLR_" + std::to_string(k + 1), 7.5 * (r + k)};
        }
    }
    store.SetNColorList(ncolor);
    const auto path = dir.file("ncolor.it8");
    ASSERT_EQ(store.WriteChartFile(L"", Wide(path), false), 0);

    const LcmsTable table = LoadOrFail(path);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 2);
    // SAMPLE_ID, 3 n-colour channels, 6 six-colour channels.
    EXPECT_EQ(table.numberOfFields, 10);
    ASSERT_EQ(table.numbers.size(), 2u);
    ASSERT_EQ(table.numbers[1].size(), 10u);
    // Row 2: 2, then channels 7.5 * (1 + k) = 7.5, 15, 22.5, then 10 ... 60.
    const std::vector<double> row2 = {2, 7.5, 15, 22.5, 10, 20, 30, 40, 50, 60};
    for (std::size_t i = 0; i < row2.size(); ++i) {
        EXPECT_NEAR(table.numbers[1][i], row2[i], 1e-9) << "column " << i;
    }
}

TEST(OurChartsInLcms, MeasurementFileAndAppendedColumns) {
    TempDir dir;
    const auto source = dir.write("source.it8", kCmykSource);
    CIT8ReaderWriter store;
    ASSERT_EQ(store.ReadChartFile(Wide(source)), 0);
    store.SetLABList({{95.123456, -0.5, 2.0}, {55.0, -37.0, -50.0}, {48.0, 74.0, -3.0}});
    store.SetXYZList({{86.41, 89.93, 71.77}, {13.2, 22.5, 55.9}, {33.46, 17.75, 3.04}});

    const auto measured = dir.file("measured.it8");
    ASSERT_EQ(store.WriteMeasurementFile(Wide(source), Wide(measured)), 0);
    LcmsTable table = LoadOrFail(measured);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 3);
    EXPECT_EQ(table.numberOfFields, 11);
    EXPECT_EQ(table.fields,
              (std::vector<std::string>{"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K",
                                        "LAB_L", "LAB_A", "LAB_B", "XYZ_X", "XYZ_Y", "XYZ_Z"}));
    // Six significant digits: 95.123456 -> 95.1235.
    ExpectCell(table, 0, "LAB_L", 95.1235);
    ExpectCell(table, 0, "CMYK_C", 100.0);
    ExpectCell(table, 1, "CMYK_M", 100.0);
    ExpectCell(table, 2, "CMYK_C", 0.0);
    ExpectCell(table, 2, "XYZ_Z", 3.04);

    const auto appended = dir.file("appended.it8");
    ASSERT_EQ(store.AppendMissingColumns(Wide(source), Wide(appended), true), 0);
    table = LoadOrFail(appended);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 3);
    EXPECT_EQ(table.numberOfFields, 11);
    // The source has CMYK; XYZ comes before Lab in the appended order.
    EXPECT_EQ(table.fields,
              (std::vector<std::string>{"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K",
                                        "XYZ_X", "XYZ_Y", "XYZ_Z", "LAB_L", "LAB_A", "LAB_B"}));
    // "%.2f": 95.123456 -> 95.12.
    ExpectCell(table, 0, "LAB_L", 95.12);
    ExpectCell(table, 1, "XYZ_Y", 22.5);
    EXPECT_EQ(table.Property("ORIGINATOR"), "interop");
}

TEST(OurChartsInLcms, TemplateColumnsKeywordsAndTargetFile) {
    TempDir dir;
    const auto source = dir.write("source.it8", kCmykSource);
    CIT8ReaderWriter store;
    ASSERT_EQ(store.ReadChartFile(Wide(source)), 0);
    store.SetXYZList({{86.41, 89.93, 71.77}, {13.2, 22.5, 55.9}, {33.46, 17.75, 3.04}});

    // Template columns: XYZ right-aligned in nine characters.
    const auto templated = dir.file("templated.it8");
    ASSERT_EQ(store.WriteChartFile(Wide(source), Wide(templated), true), 0);
    LcmsTable table = LoadOrFail(templated);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 3);
    EXPECT_EQ(table.numberOfFields, 8);
    EXPECT_EQ(table.fields.back(), "XYZ_Z");
    ExpectCell(table, 0, "XYZ_X", 86.41);
    ExpectCell(table, 0, "CMYK_C", 100.0);

    // Keyword insertion after the identification line.
    const auto keyworded = dir.file("keyworded.it8");
    ASSERT_EQ(store.InsertKeywords(Wide(source), Wide(keyworded), {{"DESCRIPTOR", "\"inserted\""}}),
              0);
    table = LoadOrFail(keyworded);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.sheetType, "CGATS.17");
    EXPECT_EQ(table.Property("DESCRIPTOR"), "inserted");
    EXPECT_EQ(table.numberOfSets, 3);
    ExpectCell(table, 1, "CMYK_M", 100.0);

    // Target file: the two clean patches and the white that ends the walk.
    const auto target = dir.file("target.it8");
    ASSERT_EQ(store.WriteTargetFile(Wide(source), Wide(target)), 0);
    table = LoadOrFail(target);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 3);
    EXPECT_EQ(table.fields,
              (std::vector<std::string>{"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"}));
    ExpectCell(table, 0, "CMYK_C", 100.0);
    ExpectCell(table, 1, "CMYK_M", 100.0);
    ExpectCell(table, 2, "CMYK_Y", 0.0);
    ExpectCell(table, 2, "SAMPLE_ID", 3);
}

TEST(OurChartsInLcms, WhitePointColumns) {
    TempDir dir;
    const auto source = dir.write("source.it8", kCmykSource);
    CIT8ReaderWriter store;
    ASSERT_EQ(store.ReadChartFile(Wide(source)), 0);
    store.SetCMYKList({{0.0, 0.0, 0.0, 0.0}, {100.0, 0.0, 0.0, 0.0}, {0.0, 100.0, 0.0, 0.0}});
    store.SetLABList({{95.0, 0.0, 2.0}, {55.0, -37.0, -50.0}, {48.0, 74.0, -3.0}});
    int result = -1;
    const CColorPatch white = store.GetPatch(3, result);
    const auto target = dir.file("white_point.it8");
    ASSERT_EQ(store.AppendColumnsWithWhitePoint(Wide(source), Wide(target), white, white), 0);

    const LcmsTable table = LoadOrFail(target);
    ASSERT_TRUE(table.loaded);
    EXPECT_EQ(table.numberOfSets, 3);
    // SAMPLE_ID + 4 CMYK + 3 Lab.
    EXPECT_EQ(table.numberOfFields, 8);
    EXPECT_EQ(table.fields, (std::vector<std::string>{"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y",
                                                      "CMYK_K", "LAB_L", "LAB_A", "LAB_B"}));
    EXPECT_FALSE(table.Property("WHITE_POINT_MEASURED_XYZ").empty());
    ExpectCell(table, 2, "LAB_A", 74.0);
    ExpectCell(table, 2, "SAMPLE_ID", 3);
}

} // namespace
