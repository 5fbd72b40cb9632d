// Fuzz target: the input bytes are a chart file. It is read with
// ReadChartFile; when the read succeeds every query runs on the chart, and the
// chart is handed to the new-file writer and the result read back.
#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include "fuzz_support.h"
#include "it8/it8_reader_writer.h"

namespace {

const int kReadCodes[] = {0, 5, 6, 7, 8, 9};
const int kPatchQueryCodes[] = {0, 10, 11, 12};
const int kCollectCodes[] = {0, 11, 12};
const int kStripCodes[] = {0, 12, 15, 16, 17};

// Every patch-level query, for the sample numbers around the chart's ends.
void QueryPatches(CIT8ReaderWriter& chart) {
    const int count = chart.GetPatchCount();
    const int samples[] = {-1, 0, 1, 2, count, count + 1};
    for (int sample : samples) {
        int result = -1;
        chart.GetPatch(sample, result);
        fuzz::ExpectCode("GetPatch", result, kPatchQueryCodes);
        if ((sample == 1 || sample == count) && result != 0) {
            fuzz::Fail("GetPatch", "a chart that was read lacks one of its sample numbers");
        }
        tagCMYK cmyk;
        tagCMYKOG cmykog;
        tagCMYKRGB cmykrgb;
        tagXYZ xyz;
        tagLAB lab;
        tagRGB rgb;
        tagDENSITY density;
        fuzz::ExpectCode("GetPatchCMYK", chart.GetPatchCMYK(sample, cmyk), kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchCMYKOG", chart.GetPatchCMYKOG(sample, cmykog), kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchCMYKRGB", chart.GetPatchCMYKRGB(sample, cmykrgb),
                         kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchXYZ", chart.GetPatchXYZ(sample, xyz), kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchLAB", chart.GetPatchLAB(sample, lab), kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchRGB", chart.GetPatchRGB(sample, rgb), kPatchQueryCodes);
        fuzz::ExpectCode("GetPatchDensity", chart.GetPatchDensity(sample, density),
                         kPatchQueryCodes);
    }
    const tagCMYK cmyk{50.0, 40.0, 30.0, 20.0};
    const tagCMYKOG cmykog{10.0, 20.0, 30.0, 40.0, 50.0, 60.0};
    const tagCMYKRGB cmykrgb{10.0, 20.0, 30.0, 40.0, 50.0, 60.0, 70.0};
    const int answers[] = {chart.FindClosestPatch(cmyk, 50.0),    chart.FindClosestPatch(cmyk),
                           chart.FindClosestPatch(cmykog, 50.0),  chart.FindClosestPatch(cmykog),
                           chart.FindClosestPatch(cmykrgb, 50.0), chart.FindClosestPatch(cmykrgb)};
    for (int answer : answers) {
        if (answer != -1 && (answer < 1 || answer > count)) {
            fuzz::Fail("FindClosestPatch", "answered a sample number outside the chart");
        }
    }
}

// Every whole-chart collection and the strip collections.
void CollectAll(CIT8ReaderWriter& chart) {
    std::vector<tagCMYK> cmyk;
    std::vector<tagCMYKOG> cmykog;
    std::vector<SWL_CMYKO> cmyko;
    std::vector<tagCMYKOGV> cmykogv;
    std::vector<tagCMYKRGB> cmykrgb;
    std::vector<tagXYZ> xyz;
    std::vector<tagLAB> lab;
    std::vector<tagRGB> rgb;
    std::vector<tagHTMLCOLOR> html;
    std::vector<std::map<int, tagNCLR>> ncolor;
    std::vector<tagDENSITY> density;
    std::vector<std::vector<double>> device;
    fuzz::ExpectCode("CollectCMYK", chart.CollectCMYK(cmyk), kCollectCodes);
    fuzz::ExpectCode("CollectCMYKOG", chart.CollectCMYKOG(cmykog), kCollectCodes);
    fuzz::ExpectCode("CollectCMYKO", chart.CollectCMYKO(cmyko), kCollectCodes);
    fuzz::ExpectCode("CollectCMYKOGV", chart.CollectCMYKOGV(cmykogv), kCollectCodes);
    fuzz::ExpectCode("CollectCMYKRGB", chart.CollectCMYKRGB(cmykrgb), kCollectCodes);
    fuzz::ExpectCode("CollectXYZ", chart.CollectXYZ(xyz), kCollectCodes);
    fuzz::ExpectCode("CollectLAB", chart.CollectLAB(lab), kCollectCodes);
    fuzz::ExpectCode("CollectRGB", chart.CollectRGB(rgb), kCollectCodes);
    fuzz::ExpectCode("CollectHTMLCOLOR", chart.CollectHTMLCOLOR(html), kCollectCodes);
    fuzz::ExpectCode("CollectNColorMaps", chart.CollectNColorMaps(ncolor), kCollectCodes);
    fuzz::ExpectCode("CollectDensities", chart.CollectDensities(density), kCollectCodes);
    const int deviceCodes[] = {0, 12, 24};
    fuzz::ExpectCode("GetDeviceValueLists", chart.GetDeviceValueLists(device), deviceCodes);

    const int strips = chart.GetNumberOfStrips();
    const int lastStrip = strips > 0 && strips < 64 ? strips + 1 : 2;
    for (int strip = 0; strip <= lastStrip; ++strip) {
        fuzz::ExpectCode("CollectStripRGB", chart.CollectStripRGB(strip, rgb), kStripCodes);
        fuzz::ExpectCode("CollectStripLAB", chart.CollectStripLAB(strip, lab), kStripCodes);
        fuzz::ExpectCode("CollectStripXYZ", chart.CollectStripXYZ(strip, xyz), kStripCodes);
        fuzz::ExpectCode("CollectStripCMYKOGV", chart.CollectStripCMYKOGV(strip, cmykogv),
                         kStripCodes);
        fuzz::ExpectCode("CollectStripCMYKRGB", chart.CollectStripCMYKRGB(strip, cmykrgb),
                         kStripCodes);
        fuzz::ExpectCode("CollectStripCMYKO", chart.CollectStripCMYKO(strip, cmyko), kStripCodes);
        fuzz::ExpectCode("CollectStripCMYKOG", chart.CollectStripCMYKOG(strip, cmykog),
                         kStripCodes);
        fuzz::ExpectCode("CollectStripCMYK", chart.CollectStripCMYK(strip, cmyk), kStripCodes);
    }
}

// Keywords, layout, spectral range, device queries and the selections.
void QueryChart(CIT8ReaderWriter& chart) {
    chart.GetNumberOfCols();
    chart.GetNumberOfPages();
    chart.GetDevice();
    chart.GetPatchesPerPage();
    chart.GetKeywords();
    chart.GetKeywordValue("NUMBER_OF_SETS");
    std::string chartType;
    chart.GetChartType(chartType);
    chart.GetDataFormatLine();
    fuzz::Guarded("GetSpectralRange", [&] { chart.GetSpectralRange(); });
    for (int space = -1; space <= 12; ++space) {
        chart.IsColorSpacePresent(space);
    }
    chart.GetDeviceColorSpace();
    const int channels = chart.GetDeviceChannelCount();
    std::vector<std::string> names;
    const int nameCodes[] = {0, 1};
    fuzz::ExpectCode("GetProcessColorNames", chart.GetProcessColorNames(names), nameCodes);
    std::map<int, int> references;
    const int referenceCodes[] = {0, 25};
    fuzz::ExpectCode("GetReferenceSampleMap", chart.GetReferenceSampleMap(references),
                     referenceCodes);

    chart.SelectCMYKGradient(tagCMYK{}, tagCMYK{100.0, 0.0, 0.0, 0.0}, 1.0);
    chart.SelectCMYKOGGradient(tagCMYKOG{}, tagCMYKOG{0.0, 100.0, 0.0, 0.0, 0.0, 0.0}, 1.0);
    chart.SelectCMYKRGBGradient(tagCMYKRGB{}, tagCMYKRGB{0.0, 0.0, 100.0, 0.0, 0.0, 0.0, 0.0}, 1.0);
    std::vector<CColorPatch> selected;
    chart.SelectCleanAndWhitePatches(selected, true);
    chart.SelectCleanAndWhitePatches(selected, false);
    chart.SelectCleanColorPatches();

    const int groupCodes[] = {0, 19};
    const int lastChannel = channels < 16 ? channels : 16;
    for (int channel = -2; channel <= lastChannel; ++channel) {
        std::map<int, std::vector<CColorPatch>> groups;
        fuzz::ExpectCode("GroupCleanColorPatches", chart.GroupCleanColorPatches(groups, channel),
                         groupCodes);
        std::vector<std::vector<double>> ramps;
        std::vector<tagXYZ> xyz;
        fuzz::Guarded("GetChannelRamps", [&] {
            fuzz::ExpectCode("GetChannelRamps", chart.GetChannelRamps(ramps, xyz, channel),
                             groupCodes);
        });
    }
    const int controlCodes[] = {0, 23};
    fuzz::ExpectCode("WriteDeviceControlSequence",
                     chart.WriteDeviceControlSequence(fuzz::Scratch().File("control.txt").string()),
                     controlCodes);
}

// Hands what was read to the value lists, writes a new file from them and
// reads that file back. Only the reading may throw (the documented
// exceptions); the lists and the writer throw nothing.
void WriteAndReread(CIT8ReaderWriter& chart) {
    std::vector<std::string> labels;
    for (const CColorPatch& patch : chart.GetPatchList()) {
        labels.push_back(patch.GetLabel());
    }
    chart.SetSampleNameList(labels);
    std::vector<tagCMYK> cmyk;
    if (chart.CollectCMYK(cmyk) == 0) {
        chart.SetCMYKList(cmyk);
    }
    std::vector<tagCMYKOG> cmykog;
    if (chart.CollectCMYKOG(cmykog) == 0) {
        chart.SetCMYKOGList(cmykog);
    }
    std::vector<tagCMYKRGB> cmykrgb;
    if (chart.CollectCMYKRGB(cmykrgb) == 0) {
        chart.SetCMYKRGBList(cmykrgb);
    }
    std::vector<tagXYZ> xyz;
    if (chart.CollectXYZ(xyz) == 0) {
        chart.SetXYZList(xyz);
    }
    std::vector<tagLAB> lab;
    if (chart.CollectLAB(lab) == 0) {
        chart.SetLABList(lab);
    }
    std::vector<tagRGB> rgb;
    if (chart.CollectRGB(rgb) == 0) {
        chart.SetRGBList(rgb);
    }
    std::vector<std::map<int, tagNCLR>> ncolor;
    if (chart.CollectNColorMaps(ncolor) == 0) {
        chart.SetNColorList(ncolor);
    }
    const std::vector<std::map<std::string, double>> spectra = chart.GetSpectralDataList();
    chart.SetSpectralDataList(spectra, true);
    chart.SetChartType("FUZZ");

    // Every list holds one entry per patch, except that the XYZ and Lab lists
    // computed from the spectra skip the spectra the engine refuses, and that
    // a second data block can leave patches with fewer spectral or n-colour
    // fields than others: only then may the writer refuse the lists with 24.
    const auto written = fuzz::Scratch().File("written.it8");
    const int evenCodes[] = {0};
    const int unevenCodes[] = {0, 24};
    const int code = chart.WriteChartFile(L"", fuzz::Wide(written), false);
    if (spectra.empty() && ncolor.empty()) {
        fuzz::ExpectCode("WriteChartFile", code, evenCodes);
    } else {
        fuzz::ExpectCode("WriteChartFile", code, unevenCodes);
    }
    if (code != 0) {
        return;
    }
    CIT8ReaderWriter reread;
    fuzz::Guarded("ReadChartFile (written chart)", [&] {
        fuzz::ExpectCode("ReadChartFile (written chart)", reread.ReadChartFile(fuzz::Wide(written)),
                         kReadCodes);
    });
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    fuzz::SilenceStandardOutput();
    fuzz::Scratch();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const auto input = fuzz::Scratch().File("input.it8");
    fuzz::WriteFile(input, data, size);

    CIT8ReaderWriter chart;
    int code = -1;
    if (!fuzz::Guarded("ReadChartFile", [&] { code = chart.ReadChartFile(fuzz::Wide(input)); })) {
        return 0;
    }
    fuzz::ExpectCode("ReadChartFile", code, kReadCodes);
    if (code == 0 && chart.GetPatchCount() < 1) {
        fuzz::Fail("ReadChartFile", "succeeded without a patch");
    }
    if (code != 0) {
        if (chart.GetPatchCount() != 0 || !chart.GetKeywords().empty()) {
            fuzz::Fail("ReadChartFile", "a failed read left patches or keywords in the store");
        }
        return 0;
    }
    QueryPatches(chart);
    CollectAll(chart);
    QueryChart(chart);
    WriteAndReread(chart);
    return 0;
}
