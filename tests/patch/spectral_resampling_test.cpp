// Measured points brought onto the colour engine's 10 nm grid within 380..780 nm
// (how closely the values between points follow real spectra is measured
// against an independent tool in spectral_reference_test.cpp).
#include <gtest/gtest.h>

#include <cmath>
#include <vector>

#include "patch/engine_spectrum.h"

namespace {

using engine_spectrum::EngineSpectrum;
using engine_spectrum::Sample;

// `count` points from `first` nm every `step` nm, on a smooth curve.
std::vector<Sample> Points(int first, int step, int count) {
    std::vector<Sample> points;
    for (int nm = first; static_cast<int>(points.size()) < count; nm += step) {
        points.push_back(Sample{nm, 0.4 + 0.3 * std::sin(nm / 37.0)});
    }
    return points;
}

TEST(SpectralResampling, GridAndRangeFollowThePointsAndMeasuredValuesStay) {
    const struct {
        std::vector<Sample> points;
        int startNm;
        int count;
    } cases[] = {
        {Points(380, 10, 41), 380, 41},  {Points(400, 10, 31), 400, 31}, // as they are
        {Points(360, 10, 43), 380, 41},                                  // 360, 370 nm left out
        {Points(380, 20, 18), 380, 35},                                  // 380..720 nm
        {Points(375, 10, 42), 380, 41},                                  // all between points
        {Points(780, -10, 41), 380, 41},                                 // descending
        {Points(300, 20, 27), 380, 41},                                  // 300..820 nm
    };
    for (const auto& c : cases) {
        EngineSpectrum out;
        ASSERT_TRUE(engine_spectrum::Resample(c.points, out)) << c.points.front().nm;
        EXPECT_EQ(out.startNm, c.startNm);
        ASSERT_EQ(out.count, c.count);
        for (const Sample& point : c.points) {
            const int offset = point.nm - out.startNm;
            if (offset >= 0 && offset % 10 == 0 && offset / 10 < out.count) {
                EXPECT_EQ(out.values[static_cast<std::size_t>(offset / 10)],
                          static_cast<float>(point.value));
            }
        }
    }
}

} // namespace
