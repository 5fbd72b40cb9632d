// Line ends and long lines (and the patches they give), splitting lines into
// tokens, and reading numbers with a point or a comma.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <cstring>
#include <sstream>
#include <string>
#include <vector>

#include "chart_text.h"
#include "color_patch_probe.h"

using namespace reader_test;
using test_support::TempDir;
using Strings = std::vector<std::string>;

namespace {

// The reading rule written straight from its description with the C library's
// strtod, in the "C" locale the test starts in.
// Text that converts to nothing reads as zero; some C libraries answer a
// negative zero for "-" alone, which the standard does not ask for.
double Strtod(const std::string& text, char** end) {
    const double value = std::strtod(text.c_str(), end);
    return *end == text.c_str() ? 0.0 : value;
}

double ReferenceParse(std::string& token) {
    char* end = nullptr;
    const double first = Strtod(token, &end);
    const char stop = *end;
    if (stop != '.' && stop != ',') {
        return first;
    }
    token[token.find(stop)] = stop == '.' ? ',' : '.';
    return Strtod(token, &end);
}

bool SameDouble(double a, double b) {
    return std::isnan(a) ? std::isnan(b) && std::signbit(a) == std::signbit(b)
                         : std::memcmp(&a, &b, sizeof a) == 0;
}

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

TEST(ParseNumber, PointCommaAndTheStrtodRule) {
    // Both decimal marks, white space, signs, overflow and underflow, hexadecimal,
    // infinity, NaN, junk and the empty token, against strtod in the "C" locale.
    std::istringstream list("12.5|12,5|-.5|+3.25|\v7|\f-8e2|1e400|-1e400|1e-400|-1e-400|"
                            "4.9e-324|2.4e-324|2.2250738585072011e-308|1234567890123456789012345|"
                            "0x1.8p3|0X1P-2|0x.8|0x|0xg|-0x|0x1p|0x1p99999|-0x1p-99999|inf|"
                            "-Infinity|infin|nan|-nan|nan(abc)|1,2,3|1,2.3|1.2.3|.|,|-,5|1,5e2|"
                            "1e|1e+|-0|+-5|abc||1.5e+3x|.e5|..5|1.,5");
    for (std::string token; std::getline(list, token, '|');) {
        const std::string original = token;
        std::string expectedToken = token;
        const double expected = ReferenceParse(expectedToken);
        EXPECT_TRUE(SameDouble(CIT8ReaderWriter::ParseNumber(token), expected)) << original;
        EXPECT_EQ(token, expectedToken) << original; // the mark swapped in place, too
    }
}

TEST(ReadChartFile, LfCrLfAndCrOnlyFilesAndLongLinesReadAlike) {
    TempDir dir;
    const std::string exact(1023 - 8, 'y'); // "COMMENT " + value: 1023 characters
    const std::string longValue(3000, 'x');
    const auto longLines = [&](const std::string& end) {
        return Lines({"COMMENT " + exact, "LONG " + longValue}, end) + CmykLabChart(end);
    };
    // The short CR-only text has no LF at all; in the long one the first CR comes
    // after 1023 characters.
    for (const std::string& text :
         {longLines("\n"), longLines("\r\n"), CmykLabChart("\r"), longLines("\r")}) {
        CIT8ReaderWriter reader;
        ASSERT_EQ(ReadText(reader, dir, text), 0);
        EXPECT_EQ(reader.GetKeywordValue("ORIGINATOR"), "\"Chart maker\" ");
        ASSERT_EQ(reader.GetPatchCount(), 2); // numbered 1 and 2, whatever the SAMPLE_IDs
        // Missing: XYZ 0x20 | RGB 0x80 | SPECTRAL 0x100 | CMYKOG 0x200 | CMYKRGB 0x400 |
        // HTMLCOLOR 0x800 | NCOLOR 0x1000 | CMYKOGV 0x2000 | DENSITY 0x4000 = 0x7FA0.
        EXPECT_EQ(ColorPatchProbe::missingMask(PatchOf(reader, 1)), 0x7FA0u);
        EXPECT_EQ(PatchOf(reader, 2).GetLAB().b, -50.0);
        if (text.size() > 1023) {
            EXPECT_EQ(reader.GetKeywordValue("COMMENT"), exact + " ");
            EXPECT_EQ(reader.GetKeywordValue("LONG"), longValue + " ");
        }
    }
}
