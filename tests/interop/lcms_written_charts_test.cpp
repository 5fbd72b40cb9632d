// Charts saved by Little CMS read with our reader to the values that were saved.
#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "lcms_table.h"
#include "temp_files.h"

namespace {

using interop::LcmsCell;
using test_support::TempDir;
using test_support::Wide;

LcmsCell Text(const std::string& text) {
    return LcmsCell{true, text, 0.0};
}
LcmsCell Number(double number) {
    return LcmsCell{false, std::string(), number};
}

std::vector<std::string> SpectralNames() {
    std::vector<std::string> names;
    for (int nm = 380; nm <= 730; nm += 10) {
        names.push_back("SPECTRAL_NM_" + std::to_string(nm));
    }
    return names;
}

// Reflectance of patch `row` at spectral position `k`: at most five decimals,
// so Little CMS's ten significant digits print it exactly.
double Reflectance(int row, int k) {
    return 0.04 + 0.2 * row + 0.00125 * k;
}

struct SampleRow {
    const char* name;
    double c, m, y, k, l, a, b, x, yy, z;
};

// Values with at most ten significant digits: Little CMS prints them exactly
// ("%.10g"), so both readers see the same decimal text.
const SampleRow kRows[] = {
    {"white", 0.0, 0.0, 0.0, 0.0, 95.12, -0.5, 2.25, 86.41, 89.93, 71.77},
    {"cyan", 100.0, 0.0, 0.0, 0.0, 55.3, -37.125, -50.0625, 13.2, 22.5, 55.9},
    {"redish", 0.0, 91.5, 87.25, 0.0, 48.75, 68.5, 48.125, 33.46, 17.75, 3.03125},
    {"dark", 60.5, 50.25, 50.125, 100.0, 12.5, 0.75, -1.0000001, 1.23456789, 1.4, 1.1},
};

TEST(LcmsWrittenCharts, CmykLabXyzAndSpectralReadToTheSavedValues) {
    TempDir dir;
    std::vector<std::string> fields = {"SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M",
                                       "CMYK_Y",    "CMYK_K",      "LAB_L",  "LAB_A",
                                       "LAB_B",     "XYZ_X",       "XYZ_Y",  "XYZ_Z"};
    const std::vector<std::string> spectral = SpectralNames();
    fields.insert(fields.end(), spectral.begin(), spectral.end());
    std::vector<std::vector<LcmsCell>> rows;
    for (int r = 0; r < 4; ++r) {
        const SampleRow& s = kRows[r];
        std::vector<LcmsCell> row = {Number(r + 1), Text(s.name), Number(s.c),  Number(s.m),
                                     Number(s.y),   Number(s.k),  Number(s.l),  Number(s.a),
                                     Number(s.b),   Number(s.x),  Number(s.yy), Number(s.z)};
        for (int k = 0; k < 36; ++k) {
            row.push_back(Number(Reflectance(r, k)));
        }
        rows.push_back(row);
    }
    const auto path = dir.file("lcms.it8");
    ASSERT_TRUE(interop::SaveWithLcms(path, fields, rows));

    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(Wide(path)), 0) << test_support::ReadBytes(path);
    ASSERT_EQ(chart.GetPatchCount(), 4);
    const std::vector<std::map<std::string, double>> spectra = chart.GetSpectralDataList();
    ASSERT_EQ(spectra.size(), 4u);
    for (int r = 0; r < 4; ++r) {
        const SampleRow& s = kRows[r];
        SCOPED_TRACE(s.name);
        int result = -1;
        EXPECT_EQ(chart.GetPatch(r + 1, result).GetLabel(), s.name);
        tagCMYK cmyk;
        ASSERT_EQ(chart.GetPatchCMYK(r + 1, cmyk), 0);
        EXPECT_DOUBLE_EQ(cmyk.c, s.c);
        EXPECT_DOUBLE_EQ(cmyk.m, s.m);
        EXPECT_DOUBLE_EQ(cmyk.y, s.y);
        EXPECT_DOUBLE_EQ(cmyk.k, s.k);
        tagLAB lab;
        ASSERT_EQ(chart.GetPatchLAB(r + 1, lab), 0);
        EXPECT_DOUBLE_EQ(lab.l, s.l);
        EXPECT_DOUBLE_EQ(lab.a, s.a);
        EXPECT_DOUBLE_EQ(lab.b, s.b);
        tagXYZ xyz;
        ASSERT_EQ(chart.GetPatchXYZ(r + 1, xyz), 0);
        EXPECT_DOUBLE_EQ(xyz.x, s.x);
        EXPECT_DOUBLE_EQ(xyz.y, s.yy);
        EXPECT_DOUBLE_EQ(xyz.z, s.z);
        ASSERT_EQ(spectra[r].size(), 36u);
        for (int k = 0; k < 36; ++k) {
            const auto value = spectra[r].find(spectral[k]);
            ASSERT_NE(value, spectra[r].end()) << spectral[k];
            EXPECT_DOUBLE_EQ(value->second, Reflectance(r, k)) << spectral[k];
        }
    }
}

TEST(LcmsWrittenCharts, RgbAndDensitiesReadToTheSavedValues) {
    TempDir dir;
    const std::vector<std::string> fields = {"SAMPLE_ID", "RGB_R",   "RGB_G",  "RGB_B",
                                             "D_RED",     "D_GREEN", "D_BLUE", "D_VIS"};
    const std::vector<std::vector<LcmsCell>> rows = {
        {Number(1), Number(255), Number(128), Number(0), Number(0.12), Number(0.5), Number(1.25),
         Number(0.4)},
        {Number(2), Number(0), Number(17), Number(254), Number(2.1), Number(2.25), Number(0.0625),
         Number(1.5)},
    };
    const auto path = dir.file("lcms_rgb.it8");
    ASSERT_TRUE(interop::SaveWithLcms(path, fields, rows));

    CIT8ReaderWriter chart;
    ASSERT_EQ(chart.ReadChartFile(Wide(path)), 0) << test_support::ReadBytes(path);
    ASSERT_EQ(chart.GetPatchCount(), 2);
    for (int r = 0; r < 2; ++r) {
        tagRGB rgb;
        ASSERT_EQ(chart.GetPatchRGB(r + 1, rgb), 0);
        EXPECT_EQ(rgb.r, static_cast<int>(rows[r][1].number));
        EXPECT_EQ(rgb.g, static_cast<int>(rows[r][2].number));
        EXPECT_EQ(rgb.b, static_cast<int>(rows[r][3].number));
        tagDENSITY density;
        ASSERT_EQ(chart.GetPatchDensity(r + 1, density), 0);
        EXPECT_DOUBLE_EQ(density.red, rows[r][4].number);
        EXPECT_DOUBLE_EQ(density.green, rows[r][5].number);
        EXPECT_DOUBLE_EQ(density.blue, rows[r][6].number);
        EXPECT_DOUBLE_EQ(density.visual, rows[r][7].number);
    }
}

// Little CMS quotes a text cell that holds a blank; our format has no quoting
// inside data rows, so the quoted name falls apart into two tokens and the row
// has one token too many: the read fails with 8 and leaves the store empty.
TEST(LcmsWrittenCharts, QuotedNameWithBlankIsRejectedAsRowCountMismatch) {
    TempDir dir;
    const std::vector<std::string> fields = {"SAMPLE_ID", "SAMPLE_NAME", "LAB_L", "LAB_A", "LAB_B"};
    const std::vector<std::vector<LcmsCell>> rows = {
        {Number(1), Text("dark skin"), Number(37.99), Number(13.56), Number(14.06)},
    };
    const auto path = dir.file("lcms_quoted.it8");
    ASSERT_TRUE(interop::SaveWithLcms(path, fields, rows));
    ASSERT_NE(test_support::ReadBytes(path).find("\"dark skin\""), std::string::npos);

    CIT8ReaderWriter chart;
    EXPECT_EQ(chart.ReadChartFile(Wide(path)), 8);
    EXPECT_EQ(chart.GetPatchCount(), 0);
}

} // namespace
