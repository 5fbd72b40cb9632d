// A host program built against the installed library: reads a chart and prints
// its patch count and the last patch's label and L*a*b*.
#include <cstdio>
#include <memory>
#include <string>

#include <redavudeva/redavudeva.h>

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: host CHART\n");
        return 2;
    }
    std::unique_ptr<CSwatchlogBase> chart(
        CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    const std::string narrow = argv[1];
    const int code = chart->ReadChartFile(std::wstring(narrow.begin(), narrow.end()));
    if (code != 0) {
        std::fprintf(stderr, "read failed with %d\n", code);
        return 1;
    }
    const int count = chart->GetPatchCount();
    tagLAB lab;
    if (chart->GetPatchLAB(count, lab) != 0) {
        return 1;
    }
    int result = 0;
    const CColorPatch patch = chart->GetPatch(count, result);
    std::printf("patches: %d\nsample %d: %s L*=%.2f a*=%.2f b*=%.2f\n", count, count,
                patch.GetLabel().c_str(), lab.l, lab.a, lab.b);
    return 0;
}
