// The CGATS files that Debian's argyll-ref and colord-data packages ship read
// with our reader; where our format rules accept a file, the patch count and
// every cell we expose equal Little CMS's reading of the same file.
#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <cmath>
#include <cstdio>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "lcms_table.h"
#include "temp_files.h"

namespace {

namespace fs = std::filesystem;
using interop::LcmsTable;

const char* const kPackageFolders[] = {
    "/usr/share/color/argyll/ref", // argyll-ref
    "/usr/share/colord",           // colord-data (ti1/, illuminant/, ref/, cmf/)
};
const char* const kChartExtensions[] = {".ti1", ".ti2", ".ti3", ".cie",
                                        ".sp",  ".cal", ".gam", ".cmf"};

// Files our reader rejects, with the result code and the reason.
struct Rejection {
    const char* file;
    int code;
    const char* reason;
};
const Rejection kRejected[] = {
    // NUMBER_OF_FIELDS says 9, but the data format names 8 fields: the count
    // of distinct field names must match a non-zero NUMBER_OF_FIELDS.
    // (Little CMS refuses these two files as well.)
    {"ColorChecker.ti2", 5, "NUMBER_OF_FIELDS 9 against 8 field names"},
    {"FograStrip3.ti1", 5, "NUMBER_OF_FIELDS 9 against 8 field names"},
    // Files of several tables. A second data format adds its names to those
    // of the first (a chart holds one table), so the distinct names of both
    // outnumber the second table's NUMBER_OF_FIELDS: SAMPLE_ID and INDEX plus
    // six colour fields make 8 against 7 (RGB charts) or 9 against 8 (CMYK);
    // the gamut file's 4 vertex fields and 3 triangle fields make 7 against 3.
    {"FograStrip2.ti1", 5, "second table: 9 distinct names against NUMBER_OF_FIELDS 8"},
    {"display-long.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"display-normal.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"display-short.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"printer-long.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"printer-normal.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"printer-short.ti1", 5, "second table: 8 distinct names against NUMBER_OF_FIELDS 7"},
    {"RefMediumGamut.gam", 5, "second table: 7 distinct names against NUMBER_OF_FIELDS 3"},
};

const Rejection* FindRejection(const std::string& file) {
    for (const Rejection& r : kRejected) {
        if (file == r.file) {
            return &r;
        }
    }
    return nullptr;
}

std::vector<fs::path> PackagedCharts() {
    std::vector<fs::path> files;
    for (const char* folder : kPackageFolders) {
        std::error_code ec;
        if (!fs::is_directory(folder, ec)) {
            continue;
        }
        for (const auto& entry : fs::recursive_directory_iterator(folder, ec)) {
            const std::string ext = entry.path().extension().string();
            if (entry.is_regular_file() &&
                std::find(std::begin(kChartExtensions), std::end(kChartExtensions), ext) !=
                    std::end(kChartExtensions)) {
                files.push_back(entry.path());
            }
        }
    }
    std::sort(files.begin(), files.end());
    return files;
}

std::string Upper(std::string text) {
    for (char& c : text) {
        c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
    }
    return text;
}

std::string Unquoted(std::string text) {
    text.erase(std::remove(text.begin(), text.end(), '"'), text.end());
    return text;
}

void ExpectSame(double ours, double theirs, const std::string& what) {
    EXPECT_NEAR(ours, theirs, 1e-12 * std::max(1.0, std::fabs(theirs))) << what;
}

// The value of field `name` in patch `patch` as our reader exposes it; false
// for fields whose values the reader does not keep (SAMPLE_ID, and every
// field outside the colour groups, such as SPEC_380 or VERTEX_NO).
bool OurValue(CIT8ReaderWriter& chart, const std::vector<std::map<std::string, double>>& spectra,
              const std::vector<std::map<int, tagNCLR>>& ncolors, int patch,
              const std::string& name, double& value) {
    const int sample = patch + 1;
    if (name.find("SPECTRAL") != std::string::npos || name.find("NM") != std::string::npos) {
        const auto it = spectra.at(patch).find(name);
        if (it == spectra.at(patch).end()) {
            return false;
        }
        value = it->second;
        return true;
    }
    if (name.find("CLR") != std::string::npos || name.find("PC") != std::string::npos) {
        for (const auto& channel : ncolors.at(patch)) {
            if (channel.second.name == name) {
                value = channel.second.value;
                return true;
            }
        }
        return false;
    }
    const std::map<std::string, int> cmykIndex = {
        {"CMYK_C", 0}, {"CMYK_M", 1}, {"CMYK_Y", 2}, {"CMYK_K", 3}};
    if (cmykIndex.count(name) != 0) {
        tagCMYK cmyk;
        EXPECT_EQ(chart.GetPatchCMYK(sample, cmyk), 0);
        const double values[] = {cmyk.c, cmyk.m, cmyk.y, cmyk.k};
        value = values[cmykIndex.at(name)];
        return true;
    }
    if (name == "XYZ_X" || name == "XYZ_Y" || name == "XYZ_Z") {
        tagXYZ xyz;
        EXPECT_EQ(chart.GetPatchXYZ(sample, xyz), 0);
        value = name == "XYZ_X" ? xyz.x : name == "XYZ_Y" ? xyz.y : xyz.z;
        return true;
    }
    if (name == "LAB_L" || name == "LAB_A" || name == "LAB_B") {
        tagLAB lab;
        EXPECT_EQ(chart.GetPatchLAB(sample, lab), 0);
        value = name == "LAB_L" ? lab.l : name == "LAB_A" ? lab.a : lab.b;
        return true;
    }
    if (name == "D_RED" || name == "D_GREEN" || name == "D_BLUE" || name == "D_VIS") {
        tagDENSITY d;
        EXPECT_EQ(chart.GetPatchDensity(sample, d), 0);
        value = name == "D_RED"     ? d.red
                : name == "D_GREEN" ? d.green
                : name == "D_BLUE"  ? d.blue
                                    : d.visual;
        return true;
    }
    return false;
}

// RGB is kept as whole numbers, truncated toward zero.
bool OurRgb(CIT8ReaderWriter& chart, int patch, const std::string& name, int& value) {
    if (name != "RGB_R" && name != "RGB_G" && name != "RGB_B") {
        return false;
    }
    tagRGB rgb;
    EXPECT_EQ(chart.GetPatchRGB(patch + 1, rgb), 0);
    value = name == "RGB_R" ? rgb.r : name == "RGB_G" ? rgb.g : rgb.b;
    return true;
}

// Answers the number of cells compared.
int CompareWithLcms(CIT8ReaderWriter& chart, const LcmsTable& table) {
    EXPECT_EQ(chart.GetPatchCount(), table.numberOfSets);
    if (chart.GetPatchCount() != table.numberOfSets) {
        return 0;
    }
    // Charts without spectral or n-colour fields answer empty lists.
    auto spectra = chart.GetSpectralDataList();
    std::vector<std::map<int, tagNCLR>> ncolors;
    chart.CollectNColorMaps(ncolors);
    spectra.resize(static_cast<std::size_t>(table.numberOfSets));
    ncolors.resize(static_cast<std::size_t>(table.numberOfSets));
    std::vector<std::string> names;
    for (const std::string& field : table.fields) {
        names.push_back(Upper(field));
    }
    const int labelField =
        table.Field("SAMPLE_NAME") >= 0 ? table.Field("SAMPLE_NAME") : table.Field("SAMPLE_LOC");
    int compared = 0;
    for (int patch = 0; patch < table.numberOfSets; ++patch) {
        int result = -1;
        const CColorPatch ours = chart.GetPatch(patch + 1, result);
        EXPECT_EQ(result, 0);
        // The reader keeps a label's double quotes; Little CMS takes them off.
        if (labelField >= 0) {
            EXPECT_EQ(Unquoted(ours.GetLabel()), table.text[patch][labelField]);
        }
        for (std::size_t col = 0; col < names.size(); ++col) {
            const double theirs = table.numbers[patch][col];
            const std::string what = names[col] + " of patch " + std::to_string(patch + 1);
            double value = 0.0;
            int whole = 0;
            if (OurRgb(chart, patch, names[col], whole)) {
                EXPECT_EQ(whole, static_cast<int>(theirs)) << what;
                ++compared;
            } else if (OurValue(chart, spectra, ncolors, patch, names[col], value)) {
                ExpectSame(value, theirs, what);
                ++compared;
            }
        }
    }
    return compared;
}

TEST(PackagedCharts, ReadAlikeWithLcmsOrAreRejectedForAListedReason) {
    const std::vector<fs::path> files = PackagedCharts();
    ASSERT_GE(files.size(), 40u) << "the CGATS files of Debian's argyll-ref and colord-data "
                                    "packages are missing; install both packages";
    int accepted = 0;
    int cells = 0;
    for (const fs::path& file : files) {
        SCOPED_TRACE(file.string());
        const std::string name = file.filename().string();
        CIT8ReaderWriter chart;
        int code = -1;
        try {
            code = chart.ReadChartFile(test_support::Wide(file));
        } catch (const std::exception& e) {
            ADD_FAILURE() << "reading threw " << e.what();
            continue;
        }
        if (const Rejection* rejection = FindRejection(name)) {
            EXPECT_EQ(code, rejection->code) << rejection->reason;
            continue;
        }
        EXPECT_EQ(code, 0);
        if (code != 0) {
            continue;
        }
        ++accepted;
        const LcmsTable table = interop::LoadWithLcms(file);
        EXPECT_TRUE(table.loaded) << table.error;
        if (table.loaded) {
            cells += CompareWithLcms(chart, table);
        }
    }
    std::printf("%d packaged charts read alike, %d cells compared\n", accepted, cells);
    EXPECT_GE(accepted, 30);
    EXPECT_GE(cells, 20000);
}

} // namespace
