// Number texts against the C library's printf in the "C" locale, over many
// generated values: the writers' quick formatting must give the same bytes.
#include <gtest/gtest.h>

#include <algorithm>

#include <clocale>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <limits>
#include <map>
#include <random>
#include <string>
#include <vector>

#include "it8/write/number_format.h"
#include "it8/write/text_builder.h"
#include "write_test_support.h"

namespace {

// printf reads the decimal point from the C library's locale; it is set to
// "C" while a test runs, and put back afterwards.
class CLocale {
public:
    CLocale() : saved_(std::setlocale(LC_ALL, nullptr)) { std::setlocale(LC_ALL, "C"); }
    ~CLocale() { std::setlocale(LC_ALL, saved_.c_str()); }
    CLocale(const CLocale&) = delete;
    CLocale& operator=(const CLocale&) = delete;

private:
    std::string saved_;
};

std::string Printf(const char* format, double value) {
    const int size = std::snprintf(nullptr, 0, format, value);
    std::string text(static_cast<std::size_t>(size) + 1, '\0');
    std::snprintf(text.data(), text.size(), format, value);
    text.resize(static_cast<std::size_t>(size));
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
        const std::string actual = it8::FormatFixed(value, decimals);
        if (actual != expected && count++ == 0) {
            first = Printf("%.17g", value) + " with " + std::to_string(decimals) +
                    " decimals: " + actual + " instead of " + expected;
        }
    }
};

} // namespace

TEST(NumberFormat, FixedMatchesPrintfOnGeneratedValues) {
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
        mismatches.Check(value, 5);
        mismatches.Check(value, static_cast<int>(random() % 12));
    }
    // Next to the halves where rounding turns: (k + 1/2) / 10^d and its
    // neighbours a few steps of the last binary digit away.
    for (int decimals : {0, 1, 2, 5, 9}) {
        for (int i = 0; i < 10000; ++i) {
            const double k = static_cast<double>(random() % 2000000000);
            double value = (k + 0.5) / std::pow(10.0, decimals);
            for (int step = 0; step < 4; ++step) {
                value = std::nextafter(value, 0.0);
            }
            for (int step = 0; step < 9; ++step) {
                mismatches.Check(value, decimals);
                mismatches.Check(-value, decimals);
                value = std::nextafter(value, std::numeric_limits<double>::infinity());
            }
        }
    }
    // Exact halves k / 2^m: printf rounds them to even (4.125 gives "4.12").
    for (int m = 1; m <= 14; ++m) {
        for (std::int64_t k = 1; k < 4000; k += 2) {
            const double value = std::ldexp(static_cast<double>(k), -m);
            mismatches.Check(value, 2);
            mismatches.Check(-value, 5);
            mismatches.Check(value, m / 2);
        }
    }
    EXPECT_EQ(mismatches.count, 0) << mismatches.first;
}

TEST(NumberFormat, FixedEdgeCasesMatchPrintf) {
    const CLocale locale;
    const double infinity = std::numeric_limits<double>::infinity();
    const double cases[] = {0.0,
                            -0.0,
                            -0.001,
                            0.005,
                            4.125,
                            4.135,
                            2.675,
                            1e-320,
                            -1e-320,
                            0.995,
                            99.995,
                            999999.999,
                            1e12,
                            1099511627776.0,
                            1e15 + 0.3,
                            -1e22,
                            1e300,
                            -1.7976931348623157e308,
                            infinity,
                            -infinity,
                            std::numeric_limits<double>::quiet_NaN()};
    for (const double value : cases) {
        for (int decimals = 0; decimals <= 12; ++decimals) {
            EXPECT_EQ(it8::FormatFixed(value, decimals), PrintfFixed(value, decimals))
                << Printf("%.17g", value) << " with " << decimals << " decimals";
        }
        EXPECT_EQ(it8::FormatFixedWidth(value, 9, 2), Printf("%9.2f", value));
        EXPECT_EQ(it8::FormatGeneral(value), Printf("%g", value));
    }
    // Spot values worked by hand: -0.001 keeps its sign; 4.125 is exactly
    // halfway and goes to the even 2; 0.005 is slightly above 5/1000 as a
    // double (0.005000000000000000104...) and rounds up.
    EXPECT_EQ(it8::FormatFixed(-0.001, 2), "-0.00");
    EXPECT_EQ(it8::FormatFixed(4.125, 2), "4.12");
    EXPECT_EQ(it8::FormatFixed(0.005, 2), "0.01");
    EXPECT_EQ(it8::FormatInteger(-9223372036854775807LL - 1), "-9223372036854775808");
}

TEST(NumberFormat, IntoReportsTextsThatDoNotFit) {
    char buffer[8];
    // "-12.34" needs six characters.
    EXPECT_EQ(it8::FormatFixedInto(buffer, 5, -12.34, 2), nullptr);
    const char* end = it8::FormatFixedInto(buffer, 6, -12.34, 2);
    ASSERT_NE(end, nullptr);
    EXPECT_EQ(std::string(static_cast<const char*>(buffer), end), "-12.34");
    // The exact way too: 4.125 with two decimals, "4.12", in three characters.
    EXPECT_EQ(it8::FormatFixedInto(buffer, 3, 4.125, 2), nullptr);
    EXPECT_EQ(it8::FormatIntegerInto(buffer, 3, 1234), nullptr);
    end = it8::FormatIntegerInto(buffer, 4, 1234);
    ASSERT_NE(end, nullptr);
    EXPECT_EQ(std::string(static_cast<const char*>(buffer), end), "1234");
}

TEST(NumberFormat, TextBuilderCollectsPiecesAndGrows) {
    const CLocale locale;
    it8::TextBuilder builder;
    std::string expected;
    // A value of 301 digits before the point outgrows any early buffer.
    for (const double value : {1.5, -0.0, 1e300, 2.675, -1e-7}) {
        builder.Append('\t');
        builder.AppendFixed(value, 5);
        builder.Append(std::string(" name "));
        builder.AppendInteger(-42);
        expected += '\t' + PrintfFixed(value, 5) + " name -42";
    }
    EXPECT_EQ(builder.Size(), expected.size());
    EXPECT_EQ(builder.Take(), expected);
    EXPECT_EQ(builder.Size(), 0U);
    builder.AppendInteger(7);
    EXPECT_EQ(builder.Take(), "7");
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

// Spectral names or n-colour channels that differ from the first set's, in any
// set, refuse the chart before anything is written.
TEST(NewChartFileRows, DifferingNamesInALaterSetAreRefused) {
    test_support::TempDir dir;
    const std::filesystem::path out = dir.file("out.txt");
    for (const std::size_t odd : {std::size_t{8}, std::size_t{15}, std::size_t{18}}) {
        std::vector<std::map<std::string, double>> spectra(19, {{"SPECTRAL_NM_380", 0.5}});
        spectra[odd] = {{"SPECTRAL_NM_390", 0.5}};
        CIT8ReaderWriter chart;
        chart.SetSpectralDataList(spectra, false);
        EXPECT_EQ(write_test::WriteNew(chart, out), 24) << odd;

        std::vector<std::map<int, tagNCLR>> channels(19, {{0, tagNCLR{1, 0, "1CLR_1", 1}}});
        channels[odd] = {{0, tagNCLR{1, 0, "1CLR_1", 1}}, {1, tagNCLR{1, 1, "1CLR_2", 1}}};
        CIT8ReaderWriter other;
        other.SetNColorList(channels);
        EXPECT_EQ(write_test::WriteNew(other, out), 24) << odd;
    }
    EXPECT_FALSE(std::filesystem::exists(out));
}
