// Result codes of every writer's refusals and failed writes: none leaves a target
// behind or touches an existing one.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "write_test_support.h"

namespace fs = std::filesystem;
using test_support::ReadBytes;
using test_support::TempDir;
using test_support::Wide;
using write_test::Source;
using write_test::WriteNew;

TEST(WriterResultCodes, EachRefusalAnswersItsCodeAndLeavesNoTarget) {
    TempDir dir;
    const std::string cmyk =
        Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K", "END_DATA_FORMAT",
                "NUMBER_OF_SETS 2", "BEGIN_DATA", "1 100 0 0 0", "2 0 50.5 0 0", "END_DATA"});
    const std::wstring source = Wide(dir.write("source.txt", "CGATS.17\n" + cmyk));
    // Reads as a chart, but its lines end at the NUL for the writers' line reading.
    const std::wstring nul =
        Wide(dir.write("with-nul-byte.txt", std::string("CGATS.17\0x\n", 11) + cmyk));
    const std::wstring mixed = Wide(
        dir.write("mixed.txt", Source({"BEGIN_DATA_FORMAT", "SAMPLE_ID CMYK_C CMYK_M CMYK_Y CMYK_K",
                                       "END_DATA_FORMAT", "NUMBER_OF_SETS 3", "BEGIN_DATA",
                                       "1 50 50 0 0", "2 50 50 0 0", "3 50 50 0 0", "END_DATA"})));
    const std::wstring noData = Wide(dir.write(
        "no-data.txt", Source({"CGATS.17", "BEGIN_DATA_FORMAT", "SAMPLE_ID", "END_DATA_FORMAT"})));
    const std::wstring noFormat =
        Wide(dir.write("no-format.txt", Source({"CGATS.17", "BEGIN_DATA", "1", "END_DATA"})));
    const std::wstring missing = Wide(dir.file("missing.txt"));
    const fs::path out = dir.file("out.txt");
    const fs::path noFolder = dir.file("no folder") / "out.txt";
    fs::create_directory(dir.file("folder"));
    const CColorPatch white; // any patch will do for these calls
    const auto xyz = [](std::size_t n) { return std::vector<tagXYZ>(n, tagXYZ{1, 2, 3}); };
    const auto lab = [](std::size_t n) { return std::vector<tagLAB>(n, tagLAB{1, 2, 3}); };
    const long entries = write_test::EntryCount(dir.path());

    // Store lists that cannot fill every set, and targets that cannot be opened.
    CIT8ReaderWriter store;
    store.SetCMYKList({tagCMYK{1, 0, 0, 0}, tagCMYK{2, 0, 0, 0}});
    store.SetLABList(lab(1));
    EXPECT_EQ(WriteNew(store, out), 24);
    store.SetLABList({});
    store.SetSpectralDataList({{{"SPECTRAL_NM_380", 0.1}, {"SPECTRAL_NM_390", 0.2}},
                               {{"SPECTRAL_NM_390", 0.2}, {"SPECTRAL_NM_400", 0.3}}},
                              false);
    EXPECT_EQ(WriteNew(store, out), 24);
    store.SetSpectralDataList({}, false);
    EXPECT_EQ(WriteNew(store, noFolder), 23);
    EXPECT_EQ(WriteNew(store, dir.file("folder")), 23);
    // Template writers: XYZ for two of three rows, no data, no data format.
    EXPECT_EQ(store.WriteChartFile(missing, Wide(out), true), 21);
    EXPECT_EQ(store.WriteChartFile(Wide(dir.file("folder")), Wide(out), true), 21);
    EXPECT_EQ(store.WriteChartFile(noData, Wide(out), true), 24);
    EXPECT_EQ(store.WriteChartFile(noFormat, Wide(out), true), 24);
    store.SetCMYKList({});
    store.SetXYZList(xyz(2));
    EXPECT_EQ(store.WriteChartFile(mixed, Wide(out), true), 24);
    EXPECT_EQ(store.AppendColumnsWithWhitePoint(mixed, Wide(out), white, white), 24);
    EXPECT_EQ(store.AppendColumnsWithWhitePoint(missing, Wide(out), white, white), 21);
    store.SetXYZList({});
    EXPECT_EQ(store.AppendColumnsWithWhitePoint(mixed, Wide(noFolder), white, white), 23);
    EXPECT_EQ(store.InsertKeywords(missing, Wide(out), {{"K", "v"}}), 21);
    EXPECT_EQ(store.InsertKeywords(source, Wide(noFolder), {{"K", "v"}}), 23);
    // An empty store: no sets for the two rows, no clean or white patch.
    EXPECT_EQ(store.WriteMeasurementFile(source, Wide(out)), 24);
    EXPECT_EQ(store.WriteTargetFile(missing, Wide(out)), 22);
    EXPECT_EQ(store.WriteTargetFile(mixed, Wide(out)), 1);

    // From here on the target exists, and every refusal must leave it untouched.
    test_support::WriteBytes(out, "old");
    // A store of the two-set source.
    ASSERT_EQ(store.ReadChartFile(source), 0);
    EXPECT_EQ(store.WriteMeasurementFile(missing, Wide(out)), 22);
    EXPECT_EQ(store.WriteMeasurementFile(nul, Wide(out)), 24);
    EXPECT_EQ(store.WriteMeasurementFile(source, Wide(noFolder)), 23);
    EXPECT_EQ(store.AppendMissingColumns(missing, Wide(out), true), 22);
    EXPECT_EQ(store.WriteTargetFile(nul, Wide(out)), 24);
    store.SetXYZList(xyz(3));
    EXPECT_EQ(store.WriteMeasurementFile(source, Wide(out)), 24);
    store.SetXYZList({});
    store.SetLABList(lab(1));
    EXPECT_EQ(store.WriteMeasurementFile(source, Wide(out)), 24);
    store.SetLABList(lab(3));
    EXPECT_EQ(store.AppendMissingColumns(source, Wide(out), true), 24);
    // A store of three sets, none of them clean.
    store.SetLABList({});
    ASSERT_EQ(store.ReadChartFile(mixed), 0);
    EXPECT_EQ(store.AppendMissingColumns(source, Wide(out), true), 24);
    EXPECT_EQ(store.WriteTargetFile(mixed, Wide(out)), 1);
    // A read-only target (a privileged user may write it, and does), and a device
    // that accepts the open but fails every write.
    const auto readOnly = dir.write("read-only.txt", "keep");
    fs::permissions(readOnly, fs::perms::owner_read);
    if (!std::ofstream(readOnly, std::ios::app).is_open()) {
        EXPECT_EQ(WriteNew(store, readOnly), 23);
        EXPECT_EQ(ReadBytes(readOnly), "keep");
    }
    fs::permissions(readOnly, fs::perms::owner_all); // so that the folder can be removed
#if defined(__linux__)
    if (fs::exists("/dev/full")) {
        EXPECT_EQ(WriteNew(store, "/dev/full"), 23);
    }
#endif

    EXPECT_EQ(ReadBytes(out), "old");
    EXPECT_EQ(write_test::EntryCount(dir.path()), entries + 2); // the old target, read-only.txt
    EXPECT_TRUE(fs::is_directory(dir.file("folder")));
}
