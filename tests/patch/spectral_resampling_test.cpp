// Measured points brought onto the colour engine's 10 nm grid within 380..780 nm.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "patch/engine_spectrum.h"

namespace {

using engine_spectrum::EngineSpectrum;
using engine_spectrum::Resample;
using engine_spectrum::Sample;

// `count` points from `first` nm every `step` nm, valued by `f`.
template <typename F> std::vector<Sample> Points(int first, int step, int count, F f) {
    std::vector<Sample> points;
    for (int i = 0; i < count; ++i) {
        points.push_back(Sample{first + step * i, f(first + step * i)});
    }
    return points;
}

double Wavy(int nm) {
    return 0.4 + 0.3 * std::sin(nm / 37.0);
}

TEST(SpectralResampling, GridRangeAndMeasuredValuesKept) {
    struct Case {
        std::vector<Sample> points;
        int startNm;
        int count;
    };
    const Case cases[] = {
        {Points(380, 10, 41, Wavy), 380, 41},
        {Points(400, 10, 31, Wavy), 400, 31},  // stops short: the engine holds its ends
        {Points(360, 10, 43, Wavy), 380, 41},  // 360 and 370 nm left out
        {Points(380, 20, 18, Wavy), 380, 35},  // 380..720 nm every 20 nm
        {Points(375, 10, 42, Wavy), 380, 41},  // 380..780 nm, all between points
        {Points(780, -10, 41, Wavy), 380, 41}, // given in descending order
        {Points(300, 20, 27, Wavy), 380, 41},  // 300..820 nm
    };
    for (const Case& c : cases) {
        EngineSpectrum out;
        ASSERT_TRUE(Resample(c.points, out)) << c.points.front().nm;
        EXPECT_EQ(out.startNm, c.startNm);
        ASSERT_EQ(out.count, c.count);
        // Wherever a point was measured, its value reaches the engine as it is.
        for (const Sample& point : c.points) {
            const int index = (point.nm - out.startNm) / 10;
            if (point.nm >= out.startNm && (point.nm - out.startNm) % 10 == 0 &&
                index < out.count) {
                EXPECT_EQ(out.values[static_cast<std::size_t>(index)],
                          static_cast<float>(point.value))
                    << point.nm;
            }
        }
    }
}

TEST(SpectralResampling, UnevenPointsFollowAParabolaExactlyAwayFromTheEnds) {
    // The slope at an inner point is that of the parabola through it and its two
    // neighbours, which for points on a parabola is the parabola's own slope; a
    // cubic Hermite curve with exact slopes at both ends of an interval is exact
    // for every polynomial up to degree 3. So between 400 and 700 nm each 10 nm
    // value is the parabola's (the two end intervals take the engine's flatter
    // end slope instead).
    const auto parabola = [](int nm) { return 0.2 + 1e-5 * (nm - 500.0) * (nm - 500.0); };
    std::vector<Sample> points;
    for (int nm : {380, 400, 430, 450, 480, 520, 560, 600, 640, 700, 730}) {
        points.push_back(Sample{nm, parabola(nm)});
    }
    EngineSpectrum out;
    ASSERT_TRUE(Resample(points, out));
    ASSERT_EQ(out.startNm, 380);
    ASSERT_EQ(out.count, 36);
    for (int nm = 400; nm <= 700; nm += 10) {
        EXPECT_FLOAT_EQ(out.values[static_cast<std::size_t>((nm - 380) / 10)], parabola(nm)) << nm;
    }
}

TEST(SpectralResampling, PointsCloserThanTenNanometresAreFittedByLeastSquares) {
    // Points 3 and 4 nm apart (at 0, 3 and 7 nm past each 10 nm value) that lie
    // exactly on the Catmull-Rom curve through 10 nm values v, the end values
    // standing in beyond the ends. With t the fraction of the interval and v0..v3
    // the four values around it, the curve is
    //   v1 + t/2 (v2 - v0 + t (2 v0 - 5 v1 + 4 v2 - v3 + t (3 (v1 - v2) + v3 - v0))).
    // The least-squares fit then has a zero residual, so it must give v back.
    std::vector<double> v;
    for (int i = 0; i < 41; ++i) {
        v.push_back(Wavy(380 + 10 * i) + (i % 3 == 0 ? 0.05 : 0.0));
    }
    const auto knot = [&](int k) { return v[static_cast<std::size_t>(std::clamp(k, 0, 40))]; };
    std::vector<Sample> points;
    for (int i = 0; i <= 40; ++i) {
        for (int offset : {0, 3, 7}) {
            if (i == 40 && offset > 0) {
                break;
            }
            const double t = offset / 10.0;
            const double v0 = knot(i - 1), v1 = knot(i), v2 = knot(i + 1), v3 = knot(i + 2);
            points.push_back(Sample{
                380 + 10 * i + offset,
                v1 + t / 2 *
                         (v2 - v0 +
                          t * (2 * v0 - 5 * v1 + 4 * v2 - v3 + t * (3 * (v1 - v2) + v3 - v0)))});
        }
    }
    EngineSpectrum out;
    ASSERT_TRUE(Resample(points, out));
    ASSERT_EQ(out.count, 41);
    for (std::size_t i = 0; i < 41; ++i) {
        EXPECT_NEAR(out.values[i], v[i], 1e-6) << 380 + 10 * i;
    }
}

TEST(SpectralResampling, PointsThatCannotGiveColourAreRefused) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const std::vector<Sample> cases[] = {
        {},
        {{550, 0.5}},                                    // one value
        {{380, 0.5}, {390, nan}, {400, 0.5}},            // not a number
        {{380, 0.5}, {390, INFINITY}},                   // infinite
        {{380, 0.5}, {390, 1e39}},                       // beyond a float
        {{500, 0.5}, {500, 0.6}, {510, 0.5}},            // one wavelength twice
        {{300, 0.5}, {370, 0.5}},                        // all below 380 nm
        {{790, 0.5}, {830, 0.5}},                        // all above 780 nm
        {{370, 0.5}, {790, 0.5}},                        // nothing measured in between
        {{380, 0.5}, {390, nan}, {800, 0.5}, {810, nan}} // non-finite outside the range too
    };
    for (const auto& points : cases) {
        EngineSpectrum out;
        EXPECT_FALSE(Resample(points, out)) << points.size() << " points";
    }
}

} // namespace
