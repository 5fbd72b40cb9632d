// A host program: reads a chart, prints a few of its patches, and writes a new
// chart holding their names, CMYK values and L*a*b* (derived where the file
// carried spectra only).
//
//   read_write_chart IN.it8 OUT.it8
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include <redavudeva/redavudeva.h>

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fprintf(stderr, "usage: read_write_chart IN OUT\n");
        return 2;
    }
    const std::string in = argv[1];
    const std::string out = argv[2];

    std::unique_ptr<CSwatchlogBase> chart(
        CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    if (int code = chart->ReadChartFile(std::wstring(in.begin(), in.end())); code != 0) {
        std::fprintf(stderr, "%s: cannot read chart (code %d)\n", in.c_str(), code);
        return 1;
    }

    std::vector<std::string> names;
    std::vector<tagCMYK> cmyk;
    std::vector<tagLAB> lab;
    for (CColorPatch& patch : chart->GetPatchList()) {
        names.push_back(patch.GetLabel());
        cmyk.push_back(patch.GetCMYK());
        lab.push_back(patch.GetLAB());
    }
    std::printf("%d patches; the first ones:\n", chart->GetPatchCount());
    for (std::size_t i = 0; i < names.size() && i < 3; ++i) {
        std::printf("  %-10s CMYK %5.1f %5.1f %5.1f %5.1f  L*a*b* %6.2f %6.2f %6.2f\n",
                    names[i].c_str(), cmyk[i].c, cmyk[i].m, cmyk[i].y, cmyk[i].k, lab[i].l,
                    lab[i].a, lab[i].b);
    }

    chart->SetKeywordList({{"CGATS.17", ""}, {"ORIGINATOR", "\"read_write_chart\""}});
    chart->SetSampleNameList(names);
    chart->SetCMYKList(cmyk);
    chart->SetLABList(lab);
    if (int code = chart->WriteChartFile(L"", std::wstring(out.begin(), out.end()), false);
        code != 0) {
        std::fprintf(stderr, "%s: cannot write chart (code %d)\n", out.c_str(), code);
        return 1;
    }
    std::printf("wrote %s\n", out.c_str());
    return 0;
}
