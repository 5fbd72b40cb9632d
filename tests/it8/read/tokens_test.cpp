// Splitting lines into tokens and reading numbers with a point or a comma.
#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "it8/it8_reader_writer.h"

using Strings = std::vector<std::string>;

namespace {

// The reading rule written straight from its description with the C library's
// strtod, in the "C" locale the test runs in.
double ReferenceParse(std::string& token) {
    char* end = nullptr;
    const double first = std::strtod(token.c_str(), &end);
    const char stop = *end;
    if (stop != '.' && stop != ',') {
        return first;
    }
    token[token.find(stop)] = stop == '.' ? ',' : '.';
    return std::strtod(token.c_str(), nullptr);
}

bool SameDouble(double a, double b) {
    return std::isnan(a) ? std::isnan(b) && std::signbit(a) == std::signbit(b)
                         : std::memcmp(&a, &b, sizeof a) == 0;
}

// Tokens separated by '|' (the empty one included): both decimal marks, white
// space, signs, overflow and underflow, hexadecimal, infinity, NaN and junk.
Strings TrickyTokens() {
    const std::string list = "12.5|12,5|-.5|+3.25|\v7|\f-8e2|1e400|-1e400|1e-400|-1e-400|"
                             "4.9e-324|2.4e-324|2.2250738585072011e-308|1234567890123456789012345|"
                             "0x1.8p3|0X1P-2|0x.8|0x|0xg|-0x|0x1p|0x1p99999|-0x1p-99999|inf|"
                             "-Infinity|infin|nan|-nan|nan(abc)|1.2.3|1,2,3|1,2.3|.|,|-,5|1,5e2|"
                             "1e|1e+|-0|+-5|abc||1.5e+3x|.e5|..5|1.,5";
    Strings tokens(1);
    for (const char c : list) {
        if (c == '|') {
            tokens.emplace_back();
        } else {
            tokens.back() += c;
        }
    }
    return tokens;
}

const Strings kTokens = TrickyTokens();

} // namespace

TEST(SplitLine, RunsOfSeparatorsAndEdges) {
    const std::string fieldSeparators = "\t\n\r ";
    EXPECT_EQ(CIT8ReaderWriter::SplitLine("\tCMYK_C  ", fieldSeparators), Strings{"CMYK_C"});
    EXPECT_EQ(CIT8ReaderWriter::SplitLine(" \t \t", fieldSeparators), Strings{});
    // Double quotes are ordinary characters.
    EXPECT_EQ(CIT8ReaderWriter::SplitLine("K\t\t\"two words\"\r\n", fieldSeparators),
              (Strings{"K", "\"two", "words\""}));
    EXPECT_EQ(CIT8ReaderWriter::SplitLine("\t  move 10 ", "\n"), Strings{"\t  move 10 "});
}

TEST(ParseNumber, PointAndCommaAndTheRewrittenToken) {
    std::string comma = "12,5";
    EXPECT_EQ(CIT8ReaderWriter::ParseNumber(comma), 12.5);
    EXPECT_EQ(comma, "12.5");
    // "1.2.3" stops at its second '.', so the first becomes ',' and "1,2.3" reads
    // 1; read again, it stops at the ',' and reads "1.2.3" as 1.2.
    std::string twoPoints = "1.2.3";
    EXPECT_EQ(CIT8ReaderWriter::ParseNumber(twoPoints), 1.0);
    EXPECT_EQ(twoPoints, "1,2.3");
    EXPECT_EQ(CIT8ReaderWriter::ParseNumber(twoPoints), 1.2);

    for (const std::string& original : kTokens) {
        std::string expectedToken = original;
        std::string token = original;
        const double expected = ReferenceParse(expectedToken);
        EXPECT_TRUE(SameDouble(CIT8ReaderWriter::ParseNumber(token), expected)) << original;
        EXPECT_EQ(token, expectedToken) << original;
    }
}

TEST(ParseNumber, SameResultsUnderADecimalCommaLocale) {
    std::vector<double> inC;
    for (std::string token : kTokens) {
        inC.push_back(CIT8ReaderWriter::ParseNumber(token));
    }
    const std::string previous = std::setlocale(LC_NUMERIC, nullptr);
    bool switched = false;
    for (const char* name : {"de_DE.UTF-8", "de_DE.utf8", "fr_FR.UTF-8", "German_Germany.1252"}) {
        switched = switched || std::setlocale(LC_NUMERIC, name) != nullptr;
    }
    if (!switched) {
        GTEST_SKIP() << "no locale with a decimal comma is installed";
    }
    for (std::size_t i = 0; i < kTokens.size(); ++i) {
        std::string token = kTokens[i];
        EXPECT_TRUE(SameDouble(CIT8ReaderWriter::ParseNumber(token), inC[i])) << kTokens[i];
    }
    std::setlocale(LC_NUMERIC, previous.c_str());
}
