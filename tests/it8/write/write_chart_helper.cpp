// Writes a small chart to the path given and exits with the writer's result
// code. The permission tests run it as another user.
#include <string>

#include "it8/it8_reader_writer.h"
#include "it8_write_helper_chart.h"

int main(int argc, char** argv) {
    if (argc != 2) {
        return 2;
    }
    CIT8ReaderWriter chart;
    write_test::FillHelperChart(chart);
    const std::string path = argv[1];
    return chart.WriteChartFile(L"", std::wstring(path.begin(), path.end()), false);
}
