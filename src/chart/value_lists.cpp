// Value lists the host hands in for writing, and the chart's norm light.
#include "redavudeva/swatchlog_base.h"

void CSwatchlogBase::SetChartNormLight(tagXYZ normLightValue) {
    normLight = normLightValue;
    for (auto& entry : patches) {
        entry.second.SetNormLight(normLightValue);
    }
}

void CSwatchlogBase::SetSampleNameList(const std::vector<std::string>& names) {
    sampleNameList = names;
}

void CSwatchlogBase::SetCMYKList(const std::vector<tagCMYK>& list) {
    cmykList = list;
}

void CSwatchlogBase::SetCMYKOGList(const std::vector<tagCMYKOG>& list) {
    cmykogList = list;
}

void CSwatchlogBase::SetCMYKRGBList(const std::vector<tagCMYKRGB>& list) {
    cmykrgbList = list;
}

void CSwatchlogBase::SetCMYKOGVList(const std::vector<tagCMYKOGV>& list) {
    cmykogvList = list;
}

void CSwatchlogBase::SetXYZList(const std::vector<tagXYZ>& list) {
    xyzList = list;
}

void CSwatchlogBase::SetLABList(const std::vector<tagLAB>& list) {
    labList = list;
}

void CSwatchlogBase::SetRGBList(const std::vector<tagRGB>& list) {
    rgbList = list;
}

void CSwatchlogBase::SetNColorList(const std::vector<std::map<int, tagNCLR>>& list) {
    nColorList = list;
}

// Sample names and computed densities are kept: they belong to the chart being
// prepared rather than to one set of values.
void CSwatchlogBase::ClearLists() {
    cmykList.clear();
    cmykogList.clear();
    cmykogvList.clear();
    cmykrgbList.clear();
    xyzList.clear();
    labList.clear();
    rgbList.clear();
    spectralList.clear();
    nColorList.clear();
    keywordList.clear();
}
