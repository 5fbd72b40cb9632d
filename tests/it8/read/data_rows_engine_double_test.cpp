// What the rows read hand on to the colour engine, and reads with a failing engine.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "chart_text.h"
#include "recording_engine.h"

using namespace reader_test;
using test_support::TempDir;

TEST(DataRowsEngine, LabAndSpectralRowsAndAFailingEngine) {
    TempDir dir;
    CIT8ReaderWriter reader;
    engine_double::Reset();
    ASSERT_EQ(ReadText(reader, dir,
                       Chart("SAMPLE_ID LAB_L LAB_A LAB_B", {"1 95,5 -1.25 2.5", "2 50 20 -30"})),
              0);
    auto calls = engine_double::Calls();
    ASSERT_EQ(calls.size(), 2u); // once per patch
    EXPECT_EQ(calls[0].call, engine_double::Call::LabToXYZ);
    EXPECT_EQ(calls[0].input, (std::vector<float>{95.5f, -1.25f, 2.5f}));
    EXPECT_TRUE(reader.IsColorSpacePresent(COLORSPACE_XYZ));

    // 36 spectral fields with the "nm" lead-in in lower case (upper-cased on reading).
    std::string fields = "SAMPLE_ID";
    std::string row;
    for (int nm = 380; nm <= 730; nm += 10) {
        fields += " nm" + std::to_string(nm);
        row += " 0," + std::to_string(nm / 10); // 0,38 ... 0,73
    }
    const std::string chart = Chart(fields, {"1" + row, "2" + row, "3" + row});
    engine_double::Reset();
    ASSERT_EQ(ReadText(reader, dir, chart), 0);
    const auto spectrum = PatchOf(reader, 1).GetSpectralData();
    ASSERT_EQ(spectrum.size(), 36u);
    EXPECT_EQ(spectrum.at("NM380"), 0.38);
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
    EXPECT_TRUE(PatchOf(reader, 1).IsSpectralPresent());
    EXPECT_FALSE(PatchOf(reader, 1).IsXYZPresent());
    engine_double::Reset();
}
