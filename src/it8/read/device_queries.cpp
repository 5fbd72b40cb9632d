// Device colour space, channel count, device values and process colour names of
// the chart read.
#include <string>
#include <vector>

#include "it8/it8_reader_writer.h"

int CIT8ReaderWriter::GetDeviceColorSpace() {
    // An HTML colour stands for a device CMYK chart.
    if (IsColorSpacePresent(COLORSPACE_HTMLCOLOR)) {
        return COLORSPACE_CMYK;
    }
    const int order[] = {COLORSPACE_NCOLOR, COLORSPACE_CMYKRGB, COLORSPACE_CMYKOG,
                         COLORSPACE_RGB,    COLORSPACE_CMYK,    COLORSPACE_LAB};
    for (const int space : order) {
        if (IsColorSpacePresent(space)) {
            return space;
        }
    }
    return -1;
}

int CIT8ReaderWriter::GetDeviceChannelCount() {
    if (IsColorSpacePresent(COLORSPACE_NCOLOR)) {
        return static_cast<int>(nColorColumns.size());
    }
    if (IsColorSpacePresent(COLORSPACE_CMYKRGB)) {
        return 7;
    }
    if (IsColorSpacePresent(COLORSPACE_CMYKOG)) {
        return 6;
    }
    if (IsColorSpacePresent(COLORSPACE_RGB)) {
        return 3;
    }
    if (IsColorSpacePresent(COLORSPACE_CMYK)) {
        return 4;
    }
    if (IsColorSpacePresent(COLORSPACE_LAB)) {
        return 3;
    }
    return 4;
}

int CIT8ReaderWriter::GetDeviceValueLists(std::vector<std::vector<double>>& lists) {
    lists.clear();
    const std::vector<CColorPatch> patchList = GetPatchList();
    if (IsColorSpacePresent(COLORSPACE_NCOLOR)) {
        for (const CColorPatch& patch : patchList) {
            std::vector<double> values;
            for (const auto& [channel, color] : patch.GetNColorMap()) {
                values.push_back(color.value);
            }
            lists.push_back(std::move(values));
        }
        return 0;
    }
    if (IsColorSpacePresent(COLORSPACE_CMYKRGB) || IsColorSpacePresent(COLORSPACE_CMYKOG)) {
        return 12;
    }
    if (IsColorSpacePresent(COLORSPACE_CMYK)) {
        for (const CColorPatch& patch : patchList) {
            const tagCMYK cmyk = patch.GetCMYK();
            lists.push_back({cmyk.c, cmyk.m, cmyk.y, cmyk.k});
        }
        return 0;
    }
    return 12;
}

int CIT8ReaderWriter::GetProcessColorNames(std::vector<std::string>& names) {
    names.clear();
    if (processColorIds.empty()) {
        return 1;
    }
    for (const std::string& entry : processColorIds) {
        const std::vector<std::string> words = SplitLine(entry, " ");
        // An entry from a PROCESSCOLOR_ID line without a value has no word to give.
        if (!words.empty()) {
            names.push_back(words.back());
        }
    }
    return names.empty() ? 1 : 0;
}
