// The new-file writer: field order, number formats, set counts, refusals and
// a read back through the reader.
#include <gtest/gtest.h>

#include <clocale>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "write_test_support.h"

using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using test_support::WriteBytes;
using write_test::FileText;
using write_test::Source;

namespace {

int WriteNew(CIT8ReaderWriter& chart, const std::filesystem::path& target) {
    // The template path is not used by the new-file mode.
    return chart.WriteChartFile(L"no such template", Wide(target), false);
}

} // namespace

TEST(NewChartFile, WritesTheTwoSetExampleByteForByte) {
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetSampleNameList({"A", "B"});
    chart.SetCMYKList({tagCMYK{100, 0, 0, 0}, tagCMYK{0, 100, 0, 0}});
    chart.SetLABList({tagLAB{55, -37, -50}, tagLAB{48, 74, -3}});
    ASSERT_EQ(WriteNew(chart, dir.file("out.txt")), 0);
    // Fields: SAMPLE_NAME 1 + CMYK 4 + Lab 3 + SAMPLE_ID 1 = 9. The CMYK block
    // ends with its own tab, so LAB_L follows two tabs.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"IT8", "NUMBER_OF_FIELDS\t9", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t\tLAB_L\tLAB_A\tLAB_B",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00",
                  "2\tB\t0.00\t100.00\t0.00\t0.00\t48.00\t74.00\t-3.00", "END_DATA"}));
}

TEST(NewChartFile, EmptyStoreWritesSevenLines) {
    TempDir dir;
    CIT8ReaderWriter chart;
    ASSERT_EQ(WriteNew(chart, dir.file("out.txt")), 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"IT8", "NUMBER_OF_FIELDS\t0", "BEGIN_DATA_FORMAT", "END_DATA_FORMAT",
                        "NUMBER_OF_SETS\t0", "BEGIN_DATA", "END_DATA"}));
}

TEST(NewChartFile, KeywordsAndMeasurementBlocksInTheirFixedOrder) {
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetKeywordList({{"ORIGINATOR", "\"Redavudeva test\""}, {"CREATED", "\"2026-12-06\""}});
    chart.SetNColorList(
        {{{0, tagNCLR{5, 0, "5CLR_1", 10.5}}, {1, tagNCLR{5, 1, "5CLR_2", 0}}},
         {{0, tagNCLR{5, 0, "5CLR_1", 99.994}}, {1, tagNCLR{5, 1, "5CLR_2", 100}}}});
    chart.SetSpectralDataList({{{"SPECTRAL_NM_390", 1.0}, {"SPECTRAL_NM_380", 0.123456}},
                               {{"SPECTRAL_NM_390", 0.5}, {"SPECTRAL_NM_380", 0.0000149}}},
                              false);
    chart.SetXYZList({tagXYZ{41.25, 50, 8.5}, tagXYZ{0, -0.5, 1234.5678}});
    chart.SetRGBList({tagRGB{255, 0, 12}, tagRGB{0, 128, 255}});
    ASSERT_EQ(WriteNew(chart, dir.file("out.txt")), 0);
    // Fields 2 + 2 + 3 + 3 + 1 = 11; no device list, so XYZ decides 2 sets.
    // n-colour and spectral blocks each stand after an empty position; spectral
    // values carry five decimals (0.123456 -> 0.12346, 0.0000149 -> 0.00001),
    // RGB none.
    EXPECT_EQ(
        ReadBytes(dir.file("out.txt")),
        FileText({"ORIGINATOR\t\"Redavudeva test\"", "CREATED\t\"2026-12-06\"",
                  "NUMBER_OF_FIELDS\t11", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\t\t5CLR_1\t5CLR_2\t\tSPECTRAL_NM_380\tSPECTRAL_NM_390\tXYZ_X\tXYZ_"
                  "Y\tXYZ_Z\tRGB_R\tRGB_G\tRGB_B",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\t\t10.50\t0.00\t\t0.12346\t1.00000\t41.25\t50.00\t8.50\t255\t0\t12",
                  "2\t\t99.99\t100.00\t\t0.00001\t0.50000\t0.00\t-0.50\t1234.57\t0\t128\t255",
                  "END_DATA"}));
}

TEST(NewChartFile, DeviceListsDecideTheSetCount) {
    TempDir dir;
    CIT8ReaderWriter cmykOnly;
    cmykOnly.SetCMYKList({tagCMYK{1, 2, 3, 4}});
    ASSERT_EQ(WriteNew(cmykOnly, dir.file("cmyk.txt")), 0);
    // CMYK as the last block leaves a trailing tab on the format line.
    EXPECT_EQ(
        ReadBytes(dir.file("cmyk.txt")),
        FileText({"IT8", "NUMBER_OF_FIELDS\t5", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t", "END_DATA_FORMAT",
                  "NUMBER_OF_SETS\t1", "BEGIN_DATA", "1\t1.00\t2.00\t3.00\t4.00", "END_DATA"}));

    CIT8ReaderWriter sixColour;
    sixColour.SetCMYKList({tagCMYK{1, 0, 0, 0}, tagCMYK{2, 0, 0, 0}, tagCMYK{3, 0, 0, 0}});
    tagCMYKOG six;
    six.o = 40;
    sixColour.SetCMYKOGList({six, six});
    ASSERT_EQ(WriteNew(sixColour, dir.file("six.txt")), 0);
    // The later device list (two six-colour entries) wins over three CMYK entries.
    EXPECT_EQ(
        ReadBytes(dir.file("six.txt")),
        FileText({"IT8", "NUMBER_OF_FIELDS\t11", "BEGIN_DATA_FORMAT",
                  "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t\t6CLR_1\t6CLR_2\t6CLR_3\t6CLR_"
                  "4\t6CLR_5\t6CLR_6",
                  "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
                  "1\t1.00\t0.00\t0.00\t0.00\t0.00\t0.00\t0.00\t0.00\t40.00\t0.00",
                  "2\t2.00\t0.00\t0.00\t0.00\t0.00\t0.00\t0.00\t0.00\t40.00\t0.00", "END_DATA"}));
}

TEST(NewChartFile, ListsThatCannotFillEverySetAnswer24AndWriteNothing) {
    TempDir dir;
    const auto target = dir.write("out.txt", "old content");

    CIT8ReaderWriter shortLab;
    shortLab.SetCMYKList({tagCMYK{1, 0, 0, 0}, tagCMYK{2, 0, 0, 0}});
    shortLab.SetLABList({tagLAB{50, 0, 0}});
    EXPECT_EQ(WriteNew(shortLab, target), 24);

    CIT8ReaderWriter otherWavelengths;
    otherWavelengths.SetSpectralDataList({{{"SPECTRAL_NM_380", 0.1}, {"SPECTRAL_NM_390", 0.2}},
                                          {{"SPECTRAL_NM_390", 0.2}, {"SPECTRAL_NM_400", 0.3}}},
                                         false);
    EXPECT_EQ(WriteNew(otherWavelengths, target), 24);

    EXPECT_EQ(ReadBytes(target), "old content");
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(dir.path()), {}), 1);
}

TEST(NewChartFile, TargetThatCannotBeWrittenAnswers23) {
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetCMYKList({tagCMYK{1, 0, 0, 0}});
    EXPECT_EQ(WriteNew(chart, dir.file("missing folder") / "out.txt"), 23);
    EXPECT_FALSE(std::filesystem::exists(dir.file("missing folder")));

    std::filesystem::create_directory(dir.file("folder"));
    EXPECT_EQ(WriteNew(chart, dir.file("folder")), 23);
    EXPECT_TRUE(std::filesystem::is_directory(dir.file("folder")));
    // No temporary file is left behind.
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(dir.path()), {}), 1);

    // A read-only target stays as it is; a writable one keeps its permissions.
    namespace fs = std::filesystem;
    const auto readOnly = dir.write("read-only.txt", "keep");
    fs::permissions(readOnly, fs::perms::owner_read);
    EXPECT_EQ(WriteNew(chart, readOnly), 23);
    EXPECT_EQ(ReadBytes(readOnly), "keep");
    fs::permissions(readOnly, fs::perms::owner_all); // so that the folder can be removed
#if !defined(_WIN32)                                 // Windows keeps only a read-only attribute
    const auto shared = dir.write("shared.txt", "old");
    fs::permissions(shared, fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read);
    EXPECT_EQ(WriteNew(chart, shared), 0);
    EXPECT_EQ(fs::status(shared).permissions(),
              fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read);
#endif

#if defined(__linux__)
    // A device that accepts the open but fails every write.
    if (std::filesystem::exists("/dev/full")) {
        EXPECT_EQ(WriteNew(chart, "/dev/full"), 23);
    }
#endif
}

TEST(NewChartFile, TargetNameNearTheFileSystemLimitIsWritten) {
    // 244 characters: a valid file name (at most 255 on the usual file systems),
    // which a writer must create or replace like any other.
#if defined(_WIN32)
    GTEST_SKIP() << "the folder and the name together pass the classic Windows path limit";
#endif
    TempDir dir;
    const std::string longName = std::string(240, 'n') + ".txt";
    const std::string sevenLines =
        FileText({"IT8", "NUMBER_OF_FIELDS\t0", "BEGIN_DATA_FORMAT", "END_DATA_FORMAT",
                  "NUMBER_OF_SETS\t0", "BEGIN_DATA", "END_DATA"});
    CIT8ReaderWriter chart;
    ASSERT_EQ(WriteNew(chart, dir.file(longName)), 0);
    EXPECT_EQ(ReadBytes(dir.file(longName)), sevenLines);
    WriteBytes(dir.file(longName), "old");
    ASSERT_EQ(WriteNew(chart, dir.file(longName)), 0);
    EXPECT_EQ(ReadBytes(dir.file(longName)), sevenLines);

    // The other writers share the way out: InsertKeywords on a one-line source.
    const auto source = dir.write("source.txt", "CGATS.17\n");
    ASSERT_EQ(chart.InsertKeywords(Wide(source), Wide(dir.file(longName)), {{"K", "v"}}), 0);
    EXPECT_EQ(ReadBytes(dir.file(longName)), FileText({"CGATS.17", "K\tv"}));
    // Nothing but the source and the target remains in the folder.
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(dir.path()), {}), 2);
}

TEST(NewChartFile, WrittenChartReadsBackWithTheSameValues) {
    TempDir dir;
    std::map<std::string, double> first;
    std::map<std::string, double> second;
    for (int nm = 380; nm <= 730; nm += 10) {
        first["SPECTRAL_NM_" + std::to_string(nm)] = (nm - 300) / 1000.0; // 0.08 .. 0.43
        second["SPECTRAL_NM_" + std::to_string(nm)] = 0.90125;
    }
    CIT8ReaderWriter chart;
    chart.SetSampleNameList({"paper", "cyan"});
    chart.SetCMYKList({tagCMYK{0, 0, 0, 0}, tagCMYK{100, 12.5, 0, 3.25}});
    chart.SetLABList({tagLAB{95.5, -0.25, 2.75}, tagLAB{55, -37, -50}});
    chart.SetSpectralDataList({first, second}, false);
    ASSERT_EQ(WriteNew(chart, dir.file("chart.txt")), 0);

    CIT8ReaderWriter reader;
    ASSERT_EQ(reader.ReadChartFile(Wide(dir.file("chart.txt"))), 0);
    ASSERT_EQ(reader.GetPatchCount(), 2);
    tagCMYK cmyk;
    ASSERT_EQ(reader.GetPatchCMYK(2, cmyk), 0);
    EXPECT_DOUBLE_EQ(cmyk.c, 100);
    EXPECT_DOUBLE_EQ(cmyk.m, 12.5);
    EXPECT_DOUBLE_EQ(cmyk.y, 0);
    EXPECT_DOUBLE_EQ(cmyk.k, 3.25);
    tagLAB lab;
    ASSERT_EQ(reader.GetPatchLAB(1, lab), 0);
    EXPECT_DOUBLE_EQ(lab.l, 95.5);
    EXPECT_DOUBLE_EQ(lab.a, -0.25);
    EXPECT_DOUBLE_EQ(lab.b, 2.75);
    const std::vector<std::map<std::string, double>> spectra = reader.GetSpectralDataList();
    ASSERT_EQ(spectra.size(), 2u);
    ASSERT_EQ(spectra[0].size(), 36u);
    for (const auto& field : first) {
        EXPECT_NEAR(spectra[0].at(field.first), field.second, 1e-12) << field.first;
        EXPECT_NEAR(spectra[1].at(field.first), 0.90125, 1e-12) << field.first;
    }
}

TEST(NewChartFile, DecimalCommaLocaleStillWritesPoints) {
    const char* names[] = {"de_DE.UTF-8",        "de_DE.utf8", "de_DE",
                           "fr_FR.UTF-8",        "fr_FR.utf8", "nl_NL.UTF-8",
                           "German_Germany.1252"};
    const std::string previous = std::setlocale(LC_ALL, nullptr);
    const char* found = nullptr;
    for (const char* name : names) {
        if (std::setlocale(LC_ALL, name) != nullptr) {
            found = name;
            break;
        }
    }
    if (found == nullptr) {
        GTEST_SKIP() << "no locale with a decimal comma is installed";
    }
    TempDir dir;
    CIT8ReaderWriter chart;
    chart.SetLABList({tagLAB{55.5, -37.25, 0.126}});
    const int result = WriteNew(chart, dir.file("out.txt"));
    std::setlocale(LC_ALL, previous.c_str());
    ASSERT_EQ(result, 0);
    EXPECT_EQ(ReadBytes(dir.file("out.txt")),
              FileText({"IT8", "NUMBER_OF_FIELDS\t4", "BEGIN_DATA_FORMAT",
                        "SAMPLE_ID\tLAB_L\tLAB_A\tLAB_B", "END_DATA_FORMAT", "NUMBER_OF_SETS\t1",
                        "BEGIN_DATA", "1\t55.50\t-37.25\t0.13", "END_DATA"}));
}
