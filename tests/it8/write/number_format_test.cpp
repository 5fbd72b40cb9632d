// Number texts against the C library's printf in the "C" locale, over many
// generated values: the writers' quick formatting must give the same bytes.
#include <gtest/gtest.h>

#include <algorithm>

#include <clocale>
#include <cmath>
#include <cstdio>
#include <filesystem>
#include <limits>
#include <map>
#include <random>
#include <string>
#include <vector>

#include "it8/write/number_format.h"
#include "write_test_support.h"

namespace {

// printf reads the decimal point from the C library's locale; it is set to
// "C" while a test runs, and put back afterwards.
class CLocale {
public:
    CLocale() : saved_(std::setlocale(LC_ALL, nullptr)) { std::setlocale(LC_ALL, "C"); }
    ~CLocale() { std::setlocale(LC_ALL, saved_.c_str()); }

private:
    std::string saved_;
};

std::string Printf(const char* format, double value) {
    char text[512]; // the longest, -DBL_MAX with 12 decimals, takes 322 characters
    std::snprintf(text, sizeof text, format, value);
    return text;
}

std::string PrintfFixed(double value, int decimals) {
    return Printf(("%." + std::to_string(decimals) + "f").c_str(), value);
}

// Counts mismatches and keeps the first for the failure message.
struct Mismatches {
    long count = 0;
    std::string first;
    void Check(double value, int decimals) {
        const std::string expected = PrintfFixed(value, decimals);
        if (it8::FormatFixed(value, decimals) != expected && count++ == 0) {
            first = Printf("%.17g", value) + " should give " + expected;
        }
    }
};

} // namespace

TEST(NumberFormat, MatchesPrintfOnGeneratedAndEdgeValues) {
    const CLocale locale;
    Mismatches mismatches;
    std::mt19937_64 random(20261206);
    std::uniform_real_distribution<double> unit(0.0, 1.0);

    // Random values from 1e-9 to 1e15, either sign, with the decimals the
    // writers use and the ones around the quick way's limits.
    for (int i = 0; i < 250000; ++i) {
        const double magnitude = std::pow(10.0, static_cast<int>(random() % 25) - 9);
        const double value = (random() % 2 ? -1.0 : 1.0) * unit(random) * magnitude;
        mismatches.Check(value, 2);
        mismatches.Check(value, static_cast<int>(random() % 12));
    }
    // Next to the halves where rounding turns: (k + 1/2) / 10^d and the doubles
    // one step of the last binary digit either side.
    for (int decimals : {0, 1, 2, 5, 9}) {
        for (int i = 0; i < 30000; ++i) {
            const double half =
                (static_cast<double>(random() % 2000000000) + 0.5) / std::pow(10.0, decimals);
            for (const double value :
                 {std::nextafter(half, 0.0), half, std::nextafter(half, 1e300)}) {
                mismatches.Check(value, decimals);
                mismatches.Check(-value, decimals);
            }
        }
    }
    const double infinity = std::numeric_limits<double>::infinity();
    const double cases[] = {0.0,        -0.0,       -0.001,
                            0.005,      4.125,      4.135,
                            2.675,      1e-320,     0.995,
                            99.995,     999999.999, 1099511627776.0,
                            1e15 + 0.3, -1e22,      -1.7976931348623157e308,
                            infinity,   -infinity,  std::numeric_limits<double>::quiet_NaN()};
    for (const double value : cases) {
        for (int decimals = 0; decimals <= 12; ++decimals) {
            mismatches.Check(value, decimals);
        }
        EXPECT_EQ(it8::FormatFixedWidth(value, 9, 2), Printf("%9.2f", value));
        EXPECT_EQ(it8::FormatGeneral(value), Printf("%g", value));
    }
    EXPECT_EQ(it8::FormatInteger(-9223372036854775807LL - 1), "-9223372036854775808");
    EXPECT_EQ(mismatches.count, 0) << mismatches.first;
}

// The new-file writer builds its rows in blocks of several sets; charts of 1 to
// 20 sets cross every block boundary. Each expected row is put together with
// printf from the same values.
TEST(NewChartFileRows, ManySetsMatchRowsBuiltWithPrintf) {
    const CLocale locale;
    test_support::TempDir dir;
    for (std::size_t sets = 1; sets <= 20; ++sets) {
        std::vector<std::map<int, tagNCLR>> channels;
        std::vector<std::map<std::string, double>> spectra;
        std::vector<tagLAB> lab;
        std::string rows;
        for (std::size_t i = 0; i < sets; ++i) {
            const double v = static_cast<double>(i);
            channels.push_back(
                {{0, tagNCLR{2, 0, "2CLR_1", v * 1.005}}, {1, tagNCLR{2, 1, "2CLR_2", -v / 8}}});
            spectra.push_back({{"SPECTRAL_NM_380", v / 3}, {"SPECTRAL_NM_390", 1e-6 * v}});
            lab.push_back(tagLAB{v * 5.125, -v, 1e6 + v});
            rows += std::to_string(i + 1) + "\t\t" + PrintfFixed(v * 1.005, 2) + '\t' +
                    PrintfFixed(-v / 8, 2) + "\t\t" + PrintfFixed(v / 3, 5) + '\t' +
                    PrintfFixed(1e-6 * v, 5) + '\t' + PrintfFixed(v * 5.125, 2) + '\t' +
                    PrintfFixed(-v, 2) + '\t' + PrintfFixed(1e6 + v, 2) + '\n';
        }
        CIT8ReaderWriter chart;
        chart.SetNColorList(channels);
        chart.SetSpectralDataList(spectra, false);
        chart.SetLABList(lab);
        const std::filesystem::path out = dir.file("out" + std::to_string(sets) + ".txt");
        ASSERT_EQ(write_test::WriteNew(chart, out), 0);
        std::string text = test_support::ReadBytes(out);
        // Read the platform's CR LF line ends as LF.
        text.erase(std::remove(text.begin(), text.end(), '\r'), text.end());
        const std::size_t begin = text.find("BEGIN_DATA\n");
        ASSERT_NE(begin, std::string::npos);
        EXPECT_EQ(text.substr(begin + 11), rows + "END_DATA\n") << sets << " sets";
    }
}
