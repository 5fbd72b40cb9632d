// Interoperability with Little CMS: charts our writers produce load there with
// the same set count, field names and values to the printed precision; a chart
// it saves reads here to the saved values; and the CGATS files that Debian's
// argyll-ref and colord-data packages ship read alike wherever our format
// rules accept them.
#include <gtest/gtest.h>
#include <lcms2.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <map>
#include <memory>
#include <string>
#include <variant>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "temp_files.h"

namespace {

namespace fs = std::filesystem;

using Handle = std::unique_ptr<void, decltype(&cmsIT8Free)>;

// Little CMS's error messages since the last ResetErrors().
std::string gErrors;
void ResetErrors() {
    gErrors.clear();
    cmsSetLogErrorHandler([](cmsContext, cmsUInt32Number, const char* text) { gErrors += text; });
}

/// The first table of a chart file as Little CMS loaded it.
struct LcmsTable {
    bool loaded = false;
    int numberOfSets = 0;
    std::vector<std::string> fields;
    std::vector<std::vector<std::string>> text; ///< cell text, [row][field]
    std::vector<std::vector<double>> numbers;   ///< cells read as numbers, [row][field]
};

LcmsTable LoadWithLcms(const std::filesystem::path& path) {
    LcmsTable table;
    ResetErrors();
    Handle handle(cmsIT8LoadFromFile(nullptr, path.string().c_str()), cmsIT8Free);
    cmsHANDLE it8 = handle.get();
    if (it8 == nullptr) {
        return table;
    }
    table.loaded = true;
    table.numberOfSets = static_cast<int>(cmsIT8GetPropertyDbl(it8, "NUMBER_OF_SETS"));
    char** names = nullptr;
    const int fieldCount = cmsIT8EnumDataFormat(it8, &names);
    table.fields.assign(names, names + std::max(fieldCount, 0));
    table.text.resize(table.numberOfSets);
    table.numbers.resize(table.numberOfSets);
    for (int row = 0; row < table.numberOfSets; ++row) {
        for (int col = 0; col < fieldCount; ++col) {
            const char* cell = cmsIT8GetDataRowCol(it8, row, col);
            table.text[row].emplace_back(cell != nullptr ? cell : "");
            table.numbers[row].push_back(cmsIT8GetDataRowColDbl(it8, row, col));
        }
    }
    return table;
}

/// A cell to save: text is written as a string, a number as a double.
using LcmsCell = std::variant<double, std::string>;

/// Saves one table under the identification "CGATS.17"; false when Little CMS
/// reports an error.
bool SaveWithLcms(const std::filesystem::path& path, const std::vector<std::string>& fields,
                  const std::vector<std::vector<LcmsCell>>& rows) {
    ResetErrors();
    Handle handle(cmsIT8Alloc(nullptr), cmsIT8Free);
    cmsHANDLE it8 = handle.get();
    cmsIT8SetSheetType(it8, "CGATS.17");
    cmsIT8SetPropertyDbl(it8, "NUMBER_OF_FIELDS", static_cast<double>(fields.size()));
    cmsIT8SetPropertyDbl(it8, "NUMBER_OF_SETS", static_cast<double>(rows.size()));
    for (int col = 0; col < static_cast<int>(fields.size()); ++col) {
        cmsIT8SetDataFormat(it8, col, fields[col].c_str());
    }
    for (int row = 0; row < static_cast<int>(rows.size()); ++row) {
        for (int col = 0; col < static_cast<int>(rows[row].size()); ++col) {
            const LcmsCell& cell = rows[row][col];
            (void)(std::holds_alternative<std::string>(cell)
                       ? cmsIT8SetDataRowCol(it8, row, col, std::get<std::string>(cell).c_str())
                       : cmsIT8SetDataRowColDbl(it8, row, col, std::get<double>(cell)));
        }
    }
    return cmsIT8SaveToFile(it8, path.string().c_str()) && gErrors.empty();
}

/// The values our reader keeps for sample `sample` by field name: the colour
/// records (RGB as whole numbers) and spectral values.
std::map<std::string, double> OurValues(CIT8ReaderWriter& chart, int sample) {
    int result = -1;
    const CColorPatch patch = chart.GetPatch(sample, result);
    const tagCMYK c = patch.GetCMYK();
    const tagXYZ x = patch.GetXYZ();
    const tagLAB l = patch.GetLAB();
    const tagRGB r = patch.GetRGB();
    std::map<std::string, double> values = {
        {"CMYK_C", c.c},     {"CMYK_M", c.m}, {"CMYK_Y", c.y},      {"CMYK_K", c.k},
        {"XYZ_X", x.x},      {"XYZ_Y", x.y},  {"XYZ_Z", x.z},       {"LAB_L", l.l},
        {"LAB_A", l.a},      {"LAB_B", l.b},  {"RGB_R", 1.0 * r.r}, {"RGB_G", 1.0 * r.g},
        {"RGB_B", 1.0 * r.b}};
    values.merge(patch.GetSpectralData());
    return values;
}

using Names = std::vector<std::string>;
using Rows = std::vector<std::vector<double>>;

// A CMYK source chart of three patches: cyan, magenta and paper white last,
// so that a target file written from it holds all three.
const char kCmykSource[] = "CGATS.17\nORIGINATOR \"interop\"\nNUMBER_OF_FIELDS 5\n"
                           "BEGIN_DATA_FORMAT\nSAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\n"
                           "END_DATA_FORMAT\nNUMBER_OF_SETS 3\nBEGIN_DATA\n"
                           "1 100 0 0 0\n2 0 100 0 0\n3 0 0 0 0\nEND_DATA\n";
const Names kSourceFields = {"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"};
const Names kWithXyzLabFields = {"SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K", "XYZ_X",
                                 "XYZ_Y",     "XYZ_Z",  "LAB_L",  "LAB_A",  "LAB_B"};
const Rows kSourceRows = {{1, 100, 0, 0, 0}, {2, 0, 100, 0, 0}, {3, 0, 0, 0, 0}};
// The source's rows with the store's XYZ ("%9.2f") and Lab ("%.2f": 95.123456
// -> 95.12, 12.345 -> 12.35 as the double nearest 12.345 lies just above it).
const Rows kWithXyzLab = {{1, 100, 0, 0, 0, 86.41, 89.93, 71.77, 95.12, -0.5, 2},
                          {2, 0, 100, 0, 0, 13.2, 22.5, 55.9, 12.35, -37, -50},
                          {3, 0, 0, 0, 0, 33.46, 17.75, 3.04, 48, 74, -3}};

// Spectral field k (0 to 35), and its reflectance in row r of the new chart.
std::string Band(int k) {
    return "SPECTRAL_NM_" + std::to_string(380 + 10 * k);
}
double Reflectance(int r, int k) {
    return 0.1 * r + 0.0123456 * k;
}

enum class Writer { Kinds, Measure, Append, Template, Insert, Target, White };

// Writes with a store that read the source and holds Lab and XYZ values.
int Write(Writer writer, const std::wstring& source, const std::wstring& target) {
    CIT8ReaderWriter store;
    int result = store.ReadChartFile(source);
    store.SetLABList({{95.123456, -0.5, 2.0}, {12.345, -37.0, -50.0}, {48.0, 74.0, -3.0}});
    store.SetXYZList({{86.41, 89.93, 71.77}, {13.2, 22.5, 55.9}, {33.46, 17.75, 3.04}});
    switch (writer) {
    case Writer::Kinds: { // a new chart with keywords and spectral values
        store.SetKeywordList({{"CGATS.17", ""}, {"ORIGINATOR", "\"Redavudeva interop\""}});
        std::vector<std::map<std::string, double>> spectra(3);
        for (int i = 0; i < 3 * 36; ++i) { // row i / 36, band i % 36
            spectra[i / 36][Band(i % 36)] = Reflectance(i / 36, i % 36);
        }
        store.SetSpectralDataList(spectra, false);
        store.SetCMYKList({{100, 0, 0, 0}, {0, 100, 0, 0}, {0, 0, 0, 0}});
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
    Names fields;
    Rows rows; // every cell of every row
};

// The new chart: SAMPLE_ID, the reflectances printed "%.5f" (0.1 + 0.0123456
// * 35 = 0.532096 -> 0.53210; 1234.56 * k is never an odd multiple of 0.5, so
// no value ends in a tie), then CMYK, XYZ and Lab as above.
WriterCase EveryKind() {
    WriterCase c{Writer::Kinds, {"SAMPLE_ID"}, {}};
    for (int k = 0; k < 36; ++k) {
        c.fields.push_back(Band(k));
    }
    c.fields.insert(c.fields.end(), kWithXyzLabFields.begin() + 1, kWithXyzLabFields.end());
    for (int r = 0; r < 3; ++r) {
        Rows::value_type& row = c.rows.emplace_back(Rows::value_type{r + 1.0});
        for (int k = 0; k < 36; ++k) {
            row.push_back(std::round(Reflectance(r, k) * 1e5) / 1e5);
        }
        row.insert(row.end(), kWithXyzLab[r].begin() + 1, kWithXyzLab[r].end());
    }
    return c;
}

TEST(OurChartsInLcms, EveryWriterOutputLoadsWithTheSameCountsNamesAndValues) {
    Names measuredFields = kSourceFields; // Lab before XYZ
    measuredFields.insert(measuredFields.end(),
                          {"LAB_L", "LAB_A", "LAB_B", "XYZ_X", "XYZ_Y", "XYZ_Z"});
    // Six significant digits: 95.123456 -> 95.1235, 12.345 stays.
    const Rows measured = {{1, 100, 0, 0, 0, 95.1235, -0.5, 2, 86.41, 89.93, 71.77},
                           {2, 0, 100, 0, 0, 12.345, -37, -50, 13.2, 22.5, 55.9},
                           {3, 0, 0, 0, 0, 48, 74, -3, 33.46, 17.75, 3.04}};
    // Rows renumbered with the store's CMYK, then its XYZ and Lab. The white
    // is the source's patch 3, which carries no XYZ: a zero record, written
    // with six significant digits as "0".
    const Rows whitePoint = {{1, 0, 0, 0, 0, 86.41, 89.93, 71.77, 95.12, -0.5, 2},
                             {2, 100, 0, 0, 0, 13.2, 22.5, 55.9, 12.35, -37, -50},
                             {3, 0, 100, 0, 0, 33.46, 17.75, 3.04, 48, 74, -3}};
    const WriterCase cases[] = {
        EveryKind(),
        {Writer::Measure, measuredFields, measured},
        {Writer::Append, kWithXyzLabFields, kWithXyzLab},
        {Writer::Template, kWithXyzLabFields, kWithXyzLab},
        {Writer::Insert, kSourceFields, kSourceRows},
        // The two clean patches and the white that ends the walk.
        {Writer::Target, kSourceFields, kSourceRows},
        {Writer::White, kWithXyzLabFields, whitePoint},
    };
    test_support::TempDir dir;
    const std::wstring source = test_support::Wide(dir.write("source.it8", kCmykSource));
    for (const WriterCase& c : cases) {
        SCOPED_TRACE("writer " + std::to_string(static_cast<int>(c.writer)));
        const auto path = dir.file("written.it8");
        ASSERT_EQ(Write(c.writer, source, test_support::Wide(path)), 0);
        const LcmsTable table = LoadWithLcms(path);
        ASSERT_TRUE(table.loaded) << gErrors << "\n" << test_support::ReadBytes(path);
        ASSERT_EQ(table.fields, c.fields);
        ASSERT_EQ(table.numberOfSets, static_cast<int>(c.rows.size()));
        for (std::size_t r = 0; r < c.rows.size(); ++r) {
            for (std::size_t col = 0; col < c.rows[r].size(); ++col) {
                EXPECT_NEAR(table.numbers[r][col], c.rows[r][col], 1e-9) << r << "/" << col;
            }
        }
    }
}

// Every colour group our reader keeps, in one table; every column has a value
// other than 0 in some row, so a field left unread shows. The values have at
// most ten significant digits: Little CMS prints numbers with "%.10g", so the
// file holds them exactly. Reflectance 0.04 + 0.2 * row + 0.00125 * k has at
// most five decimals.
TEST(LcmsWrittenCharts, ReadToTheSavedValues) {
    std::vector<std::string> fields = {"SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M", "CMYK_Y",
                                       "CMYK_K",    "LAB_L",       "LAB_A",  "LAB_B",  "XYZ_X",
                                       "XYZ_Y",     "XYZ_Z",       "RGB_R",  "RGB_G",  "RGB_B"};
    std::vector<std::vector<LcmsCell>> rows = {{1.0, "cyan", 100.0, 0.0, 0.0, 0.0, 55.3, -37.125,
                                                -50.0625, 13.2, 22.5, 55.9, 0.0, 17.0, 128.0},
                                               {2.0, "dark", 60.5, 50.25, 50.125, 100.0, 12.5, 0.75,
                                                -1.0000001, 1.23456789, 1.4, 1.1, 9.0, 8.0, 7.0}};
    for (int k = 0; k < 36; ++k) {
        fields.push_back("SPECTRAL_NM_" + std::to_string(380 + 10 * k));
        for (std::size_t r = 0; r < rows.size(); ++r) {
            rows[r].push_back(0.04 + 0.2 * static_cast<double>(r) + 0.00125 * k);
        }
    }
    test_support::TempDir dir;
    const auto path = dir.file("lcms.it8");
    ASSERT_TRUE(SaveWithLcms(path, fields, rows)) << gErrors;
    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(test_support::Wide(path)), 0) << test_support::ReadBytes(path);
    ASSERT_EQ(chart.GetPatchCount(), static_cast<int>(rows.size()));
    for (int r = 0; r < chart.GetPatchCount(); ++r) {
        int result = -1;
        EXPECT_EQ(chart.GetPatch(r + 1, result).GetLabel(), std::get<std::string>(rows[r][1]));
        std::map<std::string, double> ours = OurValues(chart, r + 1);
        for (std::size_t col = 2; col < fields.size(); ++col) {
            EXPECT_DOUBLE_EQ(ours[fields[col]], std::get<double>(rows[r][col]))
                << fields[col] << " of row " << r;
        }
    }
}

// Files our reader rejects, by reason; every one answers 5 (field count).
const std::pair<const char*, std::vector<std::string>> kRejected[] = {
    // Little CMS refuses these two as well.
    {"NUMBER_OF_FIELDS 9 against 8 field names", {"ColorChecker.ti2", "FograStrip3.ti1"}},
    // Files of several tables. A chart holds one table, so a second data
    // format adds its names to the first's, and the distinct names outnumber
    // the second NUMBER_OF_FIELDS: SAMPLE_ID and INDEX plus six colour fields
    // make 8 against 7 (RGB) or 9 against 8 (CMYK); the gamut file's 4 vertex
    // and 3 triangle fields make 7 against 3.
    {"second table: 9 distinct names against 8", {"FograStrip2.ti1"}},
    {"second table: 8 distinct names against 7",
     {"display-long.ti1", "display-normal.ti1", "display-short.ti1", "printer-long.ti1",
      "printer-normal.ti1", "printer-short.ti1"}},
    {"second table: 7 distinct names against 3", {"RefMediumGamut.gam"}},
};

// The CGATS files of argyll-ref and colord-data (ti1/, illuminant/, ref/, cmf/).
std::vector<fs::path> PackagedCharts() {
    const std::string extensions = " .ti1 .ti2 .ti3 .cie .sp .cal .gam .cmf ";
    std::vector<fs::path> files;
    for (const char* folder : {"/usr/share/color/argyll/ref", "/usr/share/colord"}) {
        std::error_code ec;
        for (const auto& entry : fs::recursive_directory_iterator(folder, ec)) {
            const std::string ext = " " + entry.path().extension().string() + " ";
            if (entry.is_regular_file() && extensions.find(ext) != std::string::npos) {
                files.push_back(entry.path());
            }
        }
    }
    std::sort(files.begin(), files.end());
    return files;
}

TEST(PackagedCharts, ReadAlikeWithLcmsOrAreRejectedForAListedReason) {
    int accepted = 0;
    for (const fs::path& file : PackagedCharts()) {
        SCOPED_TRACE(file.string());
        CIT8ReaderWriter chart;
        const int code = chart.ReadChartFile(test_support::Wide(file));
        const auto rejected =
            std::find_if(std::begin(kRejected), std::end(kRejected), [&](const auto& reason) {
                return std::count(reason.second.begin(), reason.second.end(),
                                  file.filename().string()) != 0;
            });
        if (rejected != std::end(kRejected)) {
            EXPECT_EQ(code, 5) << rejected->first;
            continue;
        }
        const LcmsTable table = LoadWithLcms(file);
        if (code != 0 || !table.loaded || chart.GetPatchCount() != table.numberOfSets) {
            ADD_FAILURE() << "ours: " << code << ", " << chart.GetPatchCount()
                          << " patches; Little CMS: " << table.numberOfSets << " " << gErrors;
            continue;
        }
        ++accepted;
        const auto label = std::find_if(table.fields.begin(), table.fields.end(), [](auto& name) {
            return name == "SAMPLE_NAME" || name == "SAMPLE_LOC";
        });
        for (int patch = 0; patch < table.numberOfSets; ++patch) {
            int result = -1;
            std::string ourLabel = chart.GetPatch(patch + 1, result).GetLabel();
            // Our reader keeps a label's double quotes; Little CMS takes them off.
            ourLabel.erase(std::remove(ourLabel.begin(), ourLabel.end(), '"'), ourLabel.end());
            if (label != table.fields.end()) {
                EXPECT_EQ(ourLabel, table.text[patch][label - table.fields.begin()]);
            }
            const std::map<std::string, double> ours = OurValues(chart, patch + 1);
            for (std::size_t col = 0; col < table.fields.size(); ++col) {
                const std::string& name = table.fields[col];
                const auto value = ours.find(name); // SAMPLE_ID and the like are not kept
                if (value != ours.end()) {
                    // RGB is kept as whole numbers, truncated toward zero.
                    const double theirs = table.numbers[patch][col];
                    const double expected =
                        name.rfind("RGB_", 0) == 0 ? std::trunc(theirs) : theirs;
                    EXPECT_NEAR(value->second, expected, 1e-12 * std::max(1.0, std::fabs(expected)))
                        << name << " of patch " << patch + 1;
                }
            }
        }
    }
    EXPECT_GE(accepted, 30) << "install Debian's argyll-ref and colord-data packages";
}

} // namespace
