// Fuzz target: the input bytes are a source or template chart file for the
// writers that start from an existing file (measurement merge, appended
// columns, template columns with and without white point, keyword insertion,
// target file). The first two bytes choose which value lists a small fixed
// store holds and how long they are; the rest is the file.
#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "fuzz_support.h"
#include "it8/it8_reader_writer.h"

namespace {

// Paper white, three clean cyan steps, one clean magenta and a mixed patch.
const char kStoreChart[] =
    "CGATS.17\n"
    "NUMBER_OF_COLS\t3\n"
    "NUMBER_OF_SETS\t6\n"
    "BEGIN_DATA_FORMAT\n"
    "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\n"
    "END_DATA_FORMAT\n"
    "BEGIN_DATA\n"
    "1\tW\t0\t0\t0\t0\t95\t0\t-2\n"
    "2\tC1\t100\t0\t0\t0\t55\t-37\t-50\n"
    "3\tC2\t50\t0\t0\t0\t75\t-20\t-28\n"
    "4\tC3\t25\t0\t0\t0\t85\t-10\t-14\n"
    "5\tM1\t0\t100\t0\t0\t48\t74\t-3\n"
    "6\tX\t40\t40\t40\t40\t30\t1\t1\n"
    "END_DATA\n";

enum ListBit : unsigned {
    kNames = 1u << 0,
    kCMYK = 1u << 1,
    kXYZ = 1u << 2,
    kLab = 1u << 3,
    kRGB = 1u << 4,
    kSpectral = 1u << 5,
    kNColor = 1u << 6,
    kKeywords = 1u << 7,
};

std::map<std::string, double> Spectrum(std::size_t i) {
    std::map<std::string, double> spectrum;
    for (int nm = 380; nm <= 730; nm += 10) {
        spectrum["SPECTRAL_NM_" + std::to_string(nm)] =
            0.05 + 0.01 * static_cast<double>(i) + 0.001 * static_cast<double>(nm - 380);
    }
    return spectrum;
}

std::map<int, tagNCLR> NColors(std::size_t i) {
    std::map<int, tagNCLR> channels;
    for (int k = 0; k < 3; ++k) {
        channels[k] =
            tagNCLR{3, k, "3CLR_" + std::to_string(k + 1), 10.0 * static_cast<double>(i + k)};
    }
    return channels;
}

// Fills the value lists chosen by `lists`; every list has `length` entries
// except the one chosen by `longer`, which has one more.
void FillLists(CIT8ReaderWriter& store, unsigned lists, std::size_t length, unsigned longer) {
    auto size = [&](unsigned bit) { return length + ((lists & bit) && bit == longer ? 1 : 0); };
    std::vector<std::string> names;
    std::vector<tagCMYK> cmyk;
    std::vector<tagXYZ> xyz;
    std::vector<tagLAB> lab;
    std::vector<tagRGB> rgb;
    std::vector<std::map<std::string, double>> spectra;
    std::vector<std::map<int, tagNCLR>> ncolor;
    for (std::size_t i = 0; i < size(kNames); ++i) {
        names.push_back("N" + std::to_string(i));
    }
    for (std::size_t i = 0; i < size(kCMYK); ++i) {
        const double v = 10.0 * static_cast<double>(i);
        cmyk.push_back(tagCMYK{v, 100.0 - v, 0.5 * v, 0.0});
    }
    for (std::size_t i = 0; i < size(kXYZ); ++i) {
        xyz.push_back(tagXYZ{41.25, 21.5 + static_cast<double>(i), 1.75});
    }
    for (std::size_t i = 0; i < size(kLab); ++i) {
        lab.push_back(tagLAB{50.0 + static_cast<double>(i), -12.5, 33.25});
    }
    for (std::size_t i = 0; i < size(kRGB); ++i) {
        rgb.push_back(tagRGB{static_cast<int>(i), 128, 255});
    }
    for (std::size_t i = 0; i < size(kSpectral); ++i) {
        spectra.push_back(Spectrum(i));
    }
    for (std::size_t i = 0; i < size(kNColor); ++i) {
        ncolor.push_back(NColors(i));
    }
    if (lists & kNames) {
        store.SetSampleNameList(names);
    }
    if (lists & kCMYK) {
        store.SetCMYKList(cmyk);
    }
    if (lists & kXYZ) {
        store.SetXYZList(xyz);
    }
    if (lists & kLab) {
        store.SetLABList(lab);
    }
    if (lists & kRGB) {
        store.SetRGBList(rgb);
    }
    if (lists & kSpectral) {
        store.SetSpectralDataList(spectra, true);
    }
    if (lists & kNColor) {
        store.SetNColorList(ncolor);
    }
    if (lists & kKeywords) {
        store.SetKeywordList({{"ORIGINATOR", "\"fuzz\""}, {"CREATED", "\"today\""}});
    }
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    fuzz::SilenceStandardOutput();
    const auto chart = fuzz::Scratch().File("store.it8");
    fuzz::WriteFile(chart, reinterpret_cast<const std::uint8_t*>(kStoreChart),
                    sizeof(kStoreChart) - 1);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 2) {
        return 0;
    }
    const unsigned lists = data[0];
    const std::size_t length = data[1] & 7u;
    const unsigned longer = 1u << ((data[1] >> 3) & 7u);
    const auto source = fuzz::Scratch().File("source.it8");
    const auto target = fuzz::Scratch().File("target.it8");
    fuzz::WriteFile(source, data + 2, size - 2);
    const std::wstring sourcePath = fuzz::Wide(source);
    const std::wstring targetPath = fuzz::Wide(target);

    CIT8ReaderWriter store;
    int readCode = -1;
    fuzz::Guarded("ReadChartFile (store)", [&] {
        readCode = store.ReadChartFile(fuzz::Wide(fuzz::Scratch().File("store.it8")));
    });
    if (readCode != 0) {
        fuzz::Fail("ReadChartFile (store)", "the fixed store chart did not read");
    }
    FillLists(store, lists, length, longer);

    const int mergeCodes[] = {0, 21, 22, 23, 24};
    fuzz::Guarded("WriteMeasurementFile", [&] {
        fuzz::ExpectCode("WriteMeasurementFile", store.WriteMeasurementFile(sourcePath, targetPath),
                         mergeCodes);
    });
    for (bool exact : {true, false}) {
        fuzz::Guarded("AppendMissingColumns", [&] {
            fuzz::ExpectCode("AppendMissingColumns",
                             store.AppendMissingColumns(sourcePath, targetPath, exact), mergeCodes);
        });
    }
    // The template and keyword writers read the source as plain lines only:
    // they throw nothing. The others read it with a reader-writer, and the white
    // point writer converts NUMBER_OF_FIELDS strictly.
    const int templateCodes[] = {0, 21, 23, 24};
    fuzz::ExpectCode("WriteChartFile (append)", store.WriteChartFile(sourcePath, targetPath, true),
                     templateCodes);
    int patchResult = 0;
    const CColorPatch measuredWhite = store.GetPatch(1, patchResult);
    const CColorPatch profileWhite = store.GetPatch(2, patchResult);
    fuzz::Guarded("AppendColumnsWithWhitePoint", [&] {
        fuzz::ExpectCode(
            "AppendColumnsWithWhitePoint",
            store.AppendColumnsWithWhitePoint(sourcePath, targetPath, measuredWhite, profileWhite),
            templateCodes);
    });
    const int keywordCodes[] = {0, 21, 23};
    const std::vector<std::pair<std::string, std::string>> keywords = {{"KEYWORD", "\"FUZZ\""},
                                                                       {"FUZZ", "\"a b\""}};
    fuzz::ExpectCode("InsertKeywords", store.InsertKeywords(sourcePath, targetPath, keywords),
                     keywordCodes);
    const int targetCodes[] = {0, 1, 21, 22, 23, 24};
    fuzz::Guarded("WriteTargetFile", [&] {
        fuzz::ExpectCode("WriteTargetFile", store.WriteTargetFile(sourcePath, targetPath),
                         targetCodes);
    });
    return 0;
}
