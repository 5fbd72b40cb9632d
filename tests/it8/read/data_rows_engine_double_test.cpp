// What the rows read hand on to the colour engine, and reads with a failing engine.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_text.h"
#include "recording_engine.h"

using namespace reader_test;
using test_support::TempDir;

TEST(DataRowsEngine, LabRowsAreConvertedToXyzOncePerPatch) {
    TempDir dir;
    CIT8ReaderWriter reader;
    engine_double::Reset();
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("SAMPLE_ID LAB_L LAB_A LAB_B", {"1 95,5 -1.25 2.5", "2 50 20 -30"})),
              0);
    const auto& calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ(calls[0].call, engine_double::Call::LabToXYZ);
    EXPECT_EQ(calls[0].input, (std::vector<float>{95.5f, -1.25f, 2.5f}));
    EXPECT_EQ(calls[1].input, (std::vector<float>{50.0f, 20.0f, -30.0f}));
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_XYZ));
}

TEST(DataRowsEngine, SpectralRowsAndAFailingEngine) {
    TempDir dir;
    std::string fields = "SAMPLE_ID";
    std::string row;
    for (int nm = 380; nm <= 730; nm += 10) {
        fields += " SPECTRAL_NM_" + std::to_string(nm);
        row += " 0,5";
    }
    const std::string chart = Chart(fields, {"1" + row, "2" + row, "3" + row});

    CIT8ReaderWriter reader;
    engine_double::Reset();
    ASSERT_EQ(ReadText(reader, dir, chart), 0);
    int spectralToXyz = 0;
    for (const auto& call : engine_double::Calls()) {
        if (call.call == engine_double::Call::SpectralToXYZ) {
            ++spectralToXyz;
            EXPECT_EQ(call.startNm, 380);
            EXPECT_EQ(call.count, 36);
        }
    }
    EXPECT_EQ(spectralToXyz, 3);

    // The engine failing every conversion costs the derived spaces, not the read.
    engine_double::Reset();
    engine_double::FailAll(engine_double::Call::SpectralToXYZ);
    engine_double::FailAll(engine_double::Call::SpectralToDensity);
    ASSERT_EQ(ReadText(reader, dir, chart), 0);
    EXPECT_EQ(reader.GetPatchCount(), 3);
    EXPECT_TRUE(PatchOf(reader, 1).IsSpectralPresent());
    EXPECT_FALSE(PatchOf(reader, 1).IsXYZPresent());
    engine_double::Reset();
}
