// Charts read with our reader agree with Little CMS: charts it saves read to
// the saved values, and the CGATS files that Debian's argyll-ref and
// colord-data packages ship read alike wherever our format rules accept them.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "lcms_table.h"
#include "temp_files.h"

namespace {

namespace fs = std::filesystem;
using interop::LcmsCell;

struct SavedChart {
    const char* name;
    std::vector<std::string> fields;
    std::vector<std::vector<LcmsCell>> rows;
    int readResult;
};

// Every colour group our reader keeps, in one table. The values have at most
// ten significant digits: Little CMS prints numbers with "%.10g", so the file
// holds them exactly. Reflectance 0.04 + 0.2 * row + 0.00125 * k has at most
// five decimals.
SavedChart EveryColourGroup() {
    SavedChart chart{"every colour group",
                     {"SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K", "LAB_L",
                      "LAB_A", "LAB_B", "XYZ_X", "XYZ_Y", "XYZ_Z", "RGB_R", "RGB_G", "RGB_B",
                      "D_RED", "D_GREEN", "D_BLUE", "D_VIS"},
                     {{1.0, "white", 0.0, 0.0, 0.0, 0.0, 95.12, -0.5, 2.25, 86.41, 89.93, 71.77,
                       255.0, 255.0, 254.0, 0.12, 0.5, 1.25, 0.4},
                      {2.0, "cyan", 100.0, 0.0, 0.0, 0.0, 55.3, -37.125, -50.0625, 13.2, 22.5, 55.9,
                       0.0, 17.0, 128.0, 2.1, 2.25, 0.0625, 1.5},
                      {3.0, "redish", 0.0, 91.5, 87.25, 0.0, 48.75, 68.5, 48.125, 33.46, 17.75,
                       3.03125, 200.0, 3.0, 1.0, 0.0, 0.01, 3.5, 0.75},
                      {4.0, "dark", 60.5, 50.25, 50.125, 100.0, 12.5, 0.75, -1.0000001, 1.23456789,
                       1.4, 1.1, 9.0, 8.0, 7.0, 2.5, 2.4, 2.3, 2.45}},
                     0};
    for (int k = 0; k < 36; ++k) {
        chart.fields.push_back("SPECTRAL_NM_" + std::to_string(380 + 10 * k));
        for (std::size_t r = 0; r < chart.rows.size(); ++r) {
            chart.rows[r].push_back(0.04 + 0.2 * static_cast<double>(r) + 0.00125 * k);
        }
    }
    return chart;
}

TEST(LcmsWrittenCharts, ReadToTheSavedValuesOrAreRejected) {
    const SavedChart charts[] = {
        EveryColourGroup(),
        // Little CMS quotes a text cell that holds a blank; our rows have no
        // quoting, so "dark skin" falls apart into two tokens and the row has
        // one token too many: the read answers 8 and keeps no patch.
        {"quoted name with a blank",
         {"SAMPLE_ID", "SAMPLE_NAME", "LAB_L", "LAB_A", "LAB_B"},
         {{1.0, "dark skin", 37.99, 13.56, 14.06}},
         8},
    };
    test_support::TempDir dir;
    for (const SavedChart& saved : charts) {
        SCOPED_TRACE(saved.name);
        const auto path = dir.file("lcms.it8");
        ASSERT_TRUE(interop::SaveWithLcms(path, saved.fields, saved.rows));
        CIT8ReaderWriter chart;
        ASSERT_EQ(chart.ReadChartFile(test_support::Wide(path)), saved.readResult)
            << test_support::ReadBytes(path);
        const int patches = saved.readResult == 0 ? static_cast<int>(saved.rows.size()) : 0;
        ASSERT_EQ(chart.GetPatchCount(), patches);
        for (int r = 0; r < patches; ++r) {
            int result = -1;
            EXPECT_EQ(chart.GetPatch(r + 1, result).GetLabel(),
                      std::get<std::string>(saved.rows[r][1]));
            const std::map<std::string, double> ours = interop::OurValues(chart, r + 1);
            for (std::size_t col = 2; col < saved.fields.size(); ++col) {
                const auto value = ours.find(saved.fields[col]);
                ASSERT_NE(value, ours.end()) << saved.fields[col];
                EXPECT_DOUBLE_EQ(value->second, std::get<double>(saved.rows[r][col]))
                    << saved.fields[col] << " of row " << r;
            }
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

std::vector<fs::path> PackagedCharts() {
    const std::vector<std::string> extensions = {".ti1", ".ti2", ".ti3", ".cie",
                                                 ".sp",  ".cal", ".gam", ".cmf"};
    std::vector<fs::path> files;
    // argyll-ref; colord-data (ti1/, illuminant/, ref/, cmf/).
    for (const char* folder : {"/usr/share/color/argyll/ref", "/usr/share/colord"}) {
        std::error_code ec;
        for (const auto& entry : fs::recursive_directory_iterator(folder, ec)) {
            const std::string ext = entry.path().extension().string();
            if (entry.is_regular_file() &&
                std::find(extensions.begin(), extensions.end(), ext) != extensions.end()) {
                files.push_back(entry.path());
            }
        }
    }
    std::sort(files.begin(), files.end());
    return files;
}

TEST(PackagedCharts, ReadAlikeWithLcmsOrAreRejectedForAListedReason) {
    const std::vector<fs::path> files = PackagedCharts();
    ASSERT_GE(files.size(), 40u) << "the CGATS files of Debian's argyll-ref and colord-data "
                                    "packages are missing; install both packages";
    int accepted = 0;
    int cells = 0;
    for (const fs::path& file : files) {
        SCOPED_TRACE(file.string());
        CIT8ReaderWriter chart;
        int code = -1;
        try {
            code = chart.ReadChartFile(test_support::Wide(file));
        } catch (const std::exception& e) {
            ADD_FAILURE() << "reading threw " << e.what();
            continue;
        }
        const char* reason = nullptr;
        for (const auto& [why, names] : kRejected) {
            if (std::count(names.begin(), names.end(), file.filename().string()) != 0) {
                reason = why;
            }
        }
        if (reason != nullptr) {
            EXPECT_EQ(code, 5) << reason;
            continue;
        }
        const interop::LcmsTable table = interop::LoadWithLcms(file);
        EXPECT_EQ(code, 0);
        EXPECT_TRUE(table.loaded) << table.error;
        EXPECT_EQ(chart.GetPatchCount(), table.numberOfSets);
        if (code != 0 || !table.loaded || chart.GetPatchCount() != table.numberOfSets) {
            continue;
        }
        ++accepted;
        const auto label = std::find_if(table.fields.begin(), table.fields.end(), [](auto& name) {
            return name == "SAMPLE_NAME" || name == "SAMPLE_LOC";
        });
        for (int patch = 0; patch < table.numberOfSets; ++patch) {
            const std::vector<double>& theirs = table.numbers[patch];
            int result = -1;
            std::string ourLabel = chart.GetPatch(patch + 1, result).GetLabel();
            // Our reader keeps a label's double quotes; Little CMS takes them off.
            ourLabel.erase(std::remove(ourLabel.begin(), ourLabel.end(), '"'), ourLabel.end());
            if (label != table.fields.end()) {
                EXPECT_EQ(ourLabel, table.text[patch][label - table.fields.begin()]);
            }
            const std::map<std::string, double> ours = interop::OurValues(chart, patch + 1);
            for (std::size_t col = 0; col < table.fields.size(); ++col) {
                const std::string& name = table.fields[col];
                const auto value = ours.find(name); // SAMPLE_ID and the like are not kept
                if (value != ours.end()) {
                    // RGB is kept as whole numbers, truncated toward zero.
                    const double expected =
                        name.rfind("RGB_", 0) == 0 ? std::trunc(theirs[col]) : theirs[col];
                    EXPECT_NEAR(value->second, expected, 1e-12 * std::max(1.0, std::fabs(expected)))
                        << name << " of patch " << patch + 1;
                    ++cells;
                }
            }
        }
    }
    std::printf("%d packaged charts read alike, %d cells compared\n", accepted, cells);
    EXPECT_GE(accepted, 30);
    EXPECT_GE(cells, 20000);
}

} // namespace
