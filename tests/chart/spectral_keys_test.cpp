// Spectral ranges from spectral field names. The range of a read chart is
// tested with the reader.
#include <gtest/gtest.h>

#include <stdexcept>

#include "test_store.h"

namespace {

using test_patches::Spectrum;
using Spectral = std::map<std::string, double>;

std::vector<int> Range(const SpectralRangeStruct& range) {
    return {range.startNm, range.stepNm, range.count};
}

TEST(SpectralKeys, RangesFromTheFirstAndLastNames) {
    auto mixed = Spectrum("SPECTRAL_", 380, 730, 10);
    mixed["SPECTRAL_1000"] = 0.5;
    const struct {
        Spectral names;
        std::vector<int> range;
    } cases[] = {
        {Spectrum("SPECTRAL_NM_", 380, 730, 10), {380, 10, 36}},
        {Spectrum("SPECTRAL_", 400, 700, 10), {400, 10, 31}},
        {Spectrum("nm", 380, 730, 10), {380, 10, 36}},
        {Spectrum("NM", 380, 730, 10), {380, 10, 36}}, // as the reader upper-cases them
        {Spectrum("SPECTRAL_NM_", 400, 700, 20), {400, 20, 16}},
        {{}, {0, 0, 0}},
        {Spectrum("R", 380, 730, 10), {0, 0, 0}},
        {{{"SPECTRAL_500", 0.5}}, {500, 0, 1}}, // one name: no step
        // The last name in byte order has no lead-in: start and count only.
        {{{"SPECTRAL_400", 0.5}, {"ZZ", 0.5}}, {400, 0, 2}},
        // Byte order: "SPECTRAL_1000" comes first; (730 - 1000) / 36 = -7.5 -> -7.
        {mixed, {1000, -7, 37}},
        // 2147483647 - (-2147483648) does not fit in 32 bits: the step is clamped.
        {{{"nm-2147483648", 0.1}, {"nm2147483647", 0.2}}, {-2147483647 - 1, 2147483647, 2}},
    };
    TestStore store;
    for (const auto& c : cases) {
        EXPECT_EQ(Range(store.AnalyseSpectralKeys(c.names)), c.range)
            << (c.names.empty() ? std::string() : c.names.begin()->first);
    }
    try {
        store.AnalyseSpectralKeys({{"SPECTRAL_x", 0.5}});
        ADD_FAILURE() << "no exception";
    } catch (const std::invalid_argument& e) {
        EXPECT_STREQ(e.what(), "invalid stol argument");
    }
    EXPECT_THROW(store.AnalyseSpectralKeys({{"SPECTRAL_380", 0.5}, {"SPECTRAL_99999999999", 0.5}}),
                 std::out_of_range);
}

} // namespace
