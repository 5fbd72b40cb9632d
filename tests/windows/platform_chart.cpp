#include "platform_chart.h"

namespace platform_test {

std::string ChartText(const std::string& lineEnd) {
    std::string text;
    for (const char* line :
         {"CGATS.17", "COMMENT\tstop\x1Ahere", "ORIGINATOR\t\"Platform test\"", "NUMBER_OF_COLS\t3",
          "NUMBER_OF_STRIPS\t10", "BEGIN_DEVICE_CONTROL_SEQUENCE", "\tSET SPEED 2",
          "MOVE  TO 10 20", "END_DEVICE_CONTROL_SEQUENCE", "NUMBER_OF_FIELDS\t8",
          "BEGIN_DATA_FORMAT", "SAMPLE_ID\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B",
          "END_DATA_FORMAT", "NUMBER_OF_SETS\t30", "BEGIN_DATA", "1\t0\t0\t0\t0\t95.5\t-0.5\t2.25",
          "2\t100\t0\t0\t0\t55\t-37\t-50"}) {
        text += line + lineEnd;
    }
    // Mixed patches 3 to 30: every channel printing, values in 5 % steps.
    const auto field = [](int value) { return "\t" + std::to_string(value); };
    for (int id = 3; id <= kChartSets; ++id) {
        text += std::to_string(id) + field(5 + id % 19 * 5) + field(5 + id % 17 * 5) +
                field(5 + id % 13 * 5) + field(5 + id % 7 * 5) + field(20 + id) + ".5" + field(id) +
                field(-id) + lineEnd;
    }
    return text + "END_DATA" + lineEnd;
}

} // namespace platform_test
