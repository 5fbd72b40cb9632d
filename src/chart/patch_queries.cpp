// Patch queries: single patches and records by sample number, every patch's
// record of one colour space, the patch list and the reference-sample map.
#include "redavudeva/swatchlog_base.h"

namespace {

using PatchMap = std::map<int, CColorPatch>;

// One patch's record, checked in the order: no patches (11), colour space not
// carried (12), no such sample (10). The out-parameter changes only on success.
template <typename Record, typename Getter>
int GetPatchRecord(const PatchMap& patches, bool present, int sampleNumber, Record& out,
                   Getter getter) {
    if (patches.empty()) {
        return 11;
    }
    if (!present) {
        return 12;
    }
    const auto found = patches.find(sampleNumber);
    if (found == patches.end()) {
        return 10;
    }
    out = getter(found->second);
    return 0;
}

// Every patch's record in ascending sample number: 11 without patches, 12 when
// the chart does not carry the colour space (list untouched in both cases).
template <typename Record, typename Getter>
int CollectRecords(const PatchMap& patches, bool present, std::vector<Record>& list,
                   Getter getter) {
    if (patches.empty()) {
        return 11;
    }
    if (!present) {
        return 12;
    }
    list.clear();
    list.reserve(patches.size());
    for (const auto& entry : patches) {
        list.push_back(getter(entry.second));
    }
    return 0;
}

} // namespace

int CSwatchlogBase::GetPatchCount() {
    return static_cast<int>(patches.size());
}

CColorPatch CSwatchlogBase::GetPatch(int sampleNumber, int& result) {
    if (patches.empty()) {
        result = 11;
        return CColorPatch();
    }
    const auto found = patches.find(sampleNumber);
    if (found == patches.end()) {
        result = 10;
        return CColorPatch();
    }
    result = 0;
    return found->second;
}

std::vector<CColorPatch> CSwatchlogBase::GetPatchList() {
    std::vector<CColorPatch> list;
    list.reserve(patches.size());
    for (const auto& entry : patches) {
        list.push_back(entry.second);
    }
    return list;
}

int CSwatchlogBase::GetPatchCMYK(int sampleNumber, tagCMYK& cmyk) {
    return GetPatchRecord(patches, hasCMYK, sampleNumber, cmyk,
                          [](const CColorPatch& p) { return p.GetCMYK(); });
}

int CSwatchlogBase::GetPatchCMYKOG(int sampleNumber, tagCMYKOG& cmykog) {
    return GetPatchRecord(patches, hasCMYKOG, sampleNumber, cmykog,
                          [](const CColorPatch& p) { return p.GetCMYKOG(); });
}

int CSwatchlogBase::GetPatchCMYKRGB(int sampleNumber, tagCMYKRGB& cmykrgb) {
    return GetPatchRecord(patches, hasCMYKRGB, sampleNumber, cmykrgb,
                          [](const CColorPatch& p) { return p.GetCMYKRGB(); });
}

int CSwatchlogBase::GetPatchXYZ(int sampleNumber, tagXYZ& xyz) {
    return GetPatchRecord(patches, hasXYZ, sampleNumber, xyz,
                          [](const CColorPatch& p) { return p.GetXYZ(); });
}

int CSwatchlogBase::GetPatchLAB(int sampleNumber, tagLAB& lab) {
    return GetPatchRecord(patches, hasLAB, sampleNumber, lab,
                          [](const CColorPatch& p) { return p.GetLAB(); });
}

int CSwatchlogBase::GetPatchRGB(int sampleNumber, tagRGB& rgb) {
    return GetPatchRecord(patches, hasRGB, sampleNumber, rgb,
                          [](const CColorPatch& p) { return p.GetRGB(); });
}

int CSwatchlogBase::GetPatchDensity(int sampleNumber, tagDENSITY& density) {
    return GetPatchRecord(patches, hasDensity, sampleNumber, density,
                          [](const CColorPatch& p) { return p.GetDensity(); });
}

int CSwatchlogBase::CollectCMYK(std::vector<tagCMYK>& list) {
    return CollectRecords(patches, hasCMYK, list, [](const CColorPatch& p) { return p.GetCMYK(); });
}

int CSwatchlogBase::CollectCMYKOG(std::vector<tagCMYKOG>& list) {
    return CollectRecords(patches, hasCMYKOG, list,
                          [](const CColorPatch& p) { return p.GetCMYKOG(); });
}

int CSwatchlogBase::CollectCMYKO(std::vector<SWL_CMYKO>& list) {
    return CollectRecords(patches, hasCMYKO, list,
                          [](const CColorPatch& p) { return p.GetCMYKO(); });
}

int CSwatchlogBase::CollectCMYKOGV(std::vector<tagCMYKOGV>& list) {
    return CollectRecords(patches, hasCMYKOGV, list,
                          [](const CColorPatch& p) { return p.GetCMYKOGV(); });
}

int CSwatchlogBase::CollectCMYKRGB(std::vector<tagCMYKRGB>& list) {
    return CollectRecords(patches, hasCMYKRGB, list,
                          [](const CColorPatch& p) { return p.GetCMYKRGB(); });
}

int CSwatchlogBase::CollectXYZ(std::vector<tagXYZ>& list) {
    return CollectRecords(patches, hasXYZ, list, [](const CColorPatch& p) { return p.GetXYZ(); });
}

int CSwatchlogBase::CollectLAB(std::vector<tagLAB>& list) {
    return CollectRecords(patches, hasLAB, list, [](const CColorPatch& p) { return p.GetLAB(); });
}

int CSwatchlogBase::CollectRGB(std::vector<tagRGB>& list) {
    return CollectRecords(patches, hasRGB, list, [](const CColorPatch& p) { return p.GetRGB(); });
}

int CSwatchlogBase::CollectHTMLCOLOR(std::vector<tagHTMLCOLOR>& list) {
    return CollectRecords(patches, hasHTMLCOLOR, list,
                          [](const CColorPatch& p) { return p.GetHTMLCOLOR(); });
}

// Densities are held per patch, so they are collected like every other record.
int CSwatchlogBase::CollectDensities(std::vector<tagDENSITY>& list) {
    return CollectRecords(patches, hasDensity, list,
                          [](const CColorPatch& p) { return p.GetDensity(); });
}

// Only the flag is tested: an n-colour chart without patches answers an empty list.
int CSwatchlogBase::CollectNColorMaps(std::vector<std::map<int, tagNCLR>>& list) {
    if (!hasNColor) {
        return 12;
    }
    list.clear();
    list.reserve(patches.size());
    for (const auto& entry : patches) {
        list.push_back(entry.second.GetNColorMap());
    }
    return 0;
}

int CSwatchlogBase::GetReferenceSampleMap(std::map<int, int>& map) {
    if (referenceSampleMap.empty()) {
        return 25;
    }
    map = referenceSampleMap;
    return 0;
}
