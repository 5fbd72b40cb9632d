// The tool on charts nobody here wrote: the reference charts of Debian's
// argyll-ref and colord-data packages. Each case is skipped where the package
// is missing.
#include "tool_runner.h"

namespace tool_test {
namespace {

const std::string kRef = "/usr/share/color/argyll/ref/";

#define REQUIRE_FILE(path)                                                                         \
    if (!std::filesystem::exists(path))                                                            \
    GTEST_SKIP() << path << " is not installed"

TEST_F(ToolTest, PackagedChartInAnotherRowOrderPairsBySampleId) {
    REQUIRE_FILE(kRef + "ColorChecker.cie");
    // The 24 data rows (lines 14 to 37) in reverse order.
    const std::string text = Read(kRef + "ColorChecker.cie");
    std::vector<std::string> lines;
    for (std::size_t start = 0; start < text.size();) {
        const std::size_t end = text.find('\n', start);
        lines.push_back(text.substr(start, end - start));
        start = end == std::string::npos ? text.size() : end + 1;
    }
    std::reverse(lines.begin() + 13, lines.begin() + 37);
    std::string reversed;
    for (const auto& line : lines) {
        reversed += line + "\n";
    }
    dir.write("reversed.cie", reversed);
    ExpectIn(
        Ok({"compare", kRef + "ColorChecker.cie", "reversed.cie"}),
        {"paired     24 patches by SAMPLE_ID\n", "dE*ab      0.00  0.00  0.00\n", "  1/24  A01 "});
    // Paired by position the same measurements differ.
    const std::string byPosition =
        Ok({"compare", kRef + "ColorChecker.cie", "reversed.cie", "--by", "position"});
    ExpectIn(byPosition, {"paired     24 patches by position\n"});
    EXPECT_EQ(byPosition.find("dE*ab      0.00"), std::string::npos);
}

TEST_F(ToolTest, PackagedChartsRefuseWhatWouldMislead) {
    REQUIRE_FILE(kRef + "ECI2002.ti2");
    REQUIRE_FILE(kRef + "QPcard_201.cie");
    const struct {
        std::string message;
        std::vector<std::string> args;
    } cases[] = {
        // Its paper white K18 is sample 1, so the target writer would stop there.
        {"the target would keep 1 of the ", {"target", kRef + "ECI2002.ti2", "-o", "out.ti2"}},
        {"and leaves out", {"target", kRef + "ECI2002.ti2", "-o", "out.ti2"}},
        // Its patches have ids but no names.
        {"cannot pair by sample name: sample 1 of " + kRef + "QPcard_201.cie has no name",
         {"compare", kRef + "QPcard_201.cie", kRef + "QPcard_201.cie", "--by", "name"}},
    };
    for (const auto& c : cases) {
        const RunResult run = Tool(c.args);
        EXPECT_EQ(run.status, 1) << run.err;
        ExpectIn(run.err, {c.message});
        EXPECT_EQ(FileCount(), 0u);
    }
}

TEST_F(ToolTest, PackagedFileOfThreeTablesListsAndReadsEach) {
    const std::string file = "/usr/share/colord/ti1/display-short.ti1";
    REQUIRE_FILE(file);
    // The file's NUMBER_OF_SETS lines say 64, 8 and 9.
    ExpectIn(Ok({"info", file}), {"table            1 of 3, lines 1-90",
                                  "  1  lines 1-90     CTI1  64 rows  SAMPLE_ID RGB_R",
                                  "  2  lines 91-115   CTI1   8 rows  INDEX RGB_R",
                                  "  3  lines 116-141  CTI1   9 rows  INDEX RGB_R"});
    // Table 3's first row, line 132: "0 100.00 100.00 100.00 95.106 100.00 108.84".
    ExpectIn(Ok({"patches", file, "--table", "3", "--spaces", "xyz", "--format", "tsv"}),
             {"SAMPLE\tNAME\tXYZ_X\tXYZ_Y\tXYZ_Z\n1\t\t95.11\t100.00\t108.84\n"});
}

} // namespace
} // namespace tool_test
