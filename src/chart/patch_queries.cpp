// Patch queries: single patches and records by sample number, every patch's
// record of one colour space, the patch list and the reference-sample map.
#include "redavudeva/swatchlog_base.h"

namespace {

using PatchMap = std::map<int, CColorPatch>;

// The patch's getter of one record, and the presence test of that record
// (none for the five-colour record, which no patch flags).
template <typename Record> using RecordGetter = Record (CColorPatch::*)() const;
using PresenceTest = bool (CColorPatch::*)() const;

bool Holds(const CColorPatch& patch, PresenceTest holds) {
    return holds == nullptr || (patch.*holds)();
}

// One patch's record, checked in the order: no patches (11), colour space not
// carried by the chart (12), no such sample (10), colour space not held by that
// patch (12: a spectrum that gave no colour, say). The out-parameter changes only
// on success.
template <typename Record>
int GetPatchRecord(const PatchMap& patches, bool present, int sampleNumber, Record& out,
                   RecordGetter<Record> get, PresenceTest holds) {
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
    if (!Holds(found->second, holds)) {
        return 12;
    }
    out = (found->second.*get)();
    return 0;
}

// Every patch's record in ascending sample number: 11 without patches, 12 when
// the chart does not carry the colour space or one of its patches does not hold
// it (the list is untouched in these cases).
template <typename Record>
int CollectRecords(const PatchMap& patches, bool present, std::vector<Record>& list,
                   RecordGetter<Record> get, PresenceTest holds) {
    if (patches.empty()) {
        return 11;
    }
    if (!present) {
        return 12;
    }
    for (const auto& entry : patches) {
        if (!Holds(entry.second, holds)) {
            return 12;
        }
    }
    list.clear();
    list.reserve(patches.size());
    for (const auto& entry : patches) {
        list.push_back((entry.second.*get)());
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
    return GetPatchRecord(patches, hasCMYK, sampleNumber, cmyk, &CColorPatch::GetCMYK,
                          &CColorPatch::IsCMYKPresent);
}

int CSwatchlogBase::GetPatchCMYKOG(int sampleNumber, tagCMYKOG& cmykog) {
    return GetPatchRecord(patches, hasCMYKOG, sampleNumber, cmykog, &CColorPatch::GetCMYKOG,
                          &CColorPatch::IsCMYKOGPresent);
}

int CSwatchlogBase::GetPatchCMYKRGB(int sampleNumber, tagCMYKRGB& cmykrgb) {
    return GetPatchRecord(patches, hasCMYKRGB, sampleNumber, cmykrgb, &CColorPatch::GetCMYKRGB,
                          &CColorPatch::IsCMYKRGBPresent);
}

int CSwatchlogBase::GetPatchXYZ(int sampleNumber, tagXYZ& xyz) {
    return GetPatchRecord(patches, hasXYZ, sampleNumber, xyz, &CColorPatch::GetXYZ,
                          &CColorPatch::IsXYZPresent);
}

int CSwatchlogBase::GetPatchLAB(int sampleNumber, tagLAB& lab) {
    return GetPatchRecord(patches, hasLAB, sampleNumber, lab, &CColorPatch::GetLAB,
                          &CColorPatch::IsLABPresent);
}

int CSwatchlogBase::GetPatchRGB(int sampleNumber, tagRGB& rgb) {
    return GetPatchRecord(patches, hasRGB, sampleNumber, rgb, &CColorPatch::GetRGB,
                          &CColorPatch::IsRGBPresent);
}

int CSwatchlogBase::GetPatchDensity(int sampleNumber, tagDENSITY& density) {
    return GetPatchRecord(patches, hasDensity, sampleNumber, density, &CColorPatch::GetDensity,
                          &CColorPatch::IsDensityAvailable);
}

int CSwatchlogBase::CollectCMYK(std::vector<tagCMYK>& list) {
    return CollectRecords(patches, hasCMYK, list, &CColorPatch::GetCMYK,
                          &CColorPatch::IsCMYKPresent);
}

int CSwatchlogBase::CollectCMYKOG(std::vector<tagCMYKOG>& list) {
    return CollectRecords(patches, hasCMYKOG, list, &CColorPatch::GetCMYKOG,
                          &CColorPatch::IsCMYKOGPresent);
}

int CSwatchlogBase::CollectCMYKO(std::vector<SWL_CMYKO>& list) {
    return CollectRecords(patches, hasCMYKO, list, &CColorPatch::GetCMYKO, nullptr);
}

int CSwatchlogBase::CollectCMYKOGV(std::vector<tagCMYKOGV>& list) {
    return CollectRecords(patches, hasCMYKOGV, list, &CColorPatch::GetCMYKOGV,
                          &CColorPatch::IsCMYKOGVPresent);
}

int CSwatchlogBase::CollectCMYKRGB(std::vector<tagCMYKRGB>& list) {
    return CollectRecords(patches, hasCMYKRGB, list, &CColorPatch::GetCMYKRGB,
                          &CColorPatch::IsCMYKRGBPresent);
}

int CSwatchlogBase::CollectXYZ(std::vector<tagXYZ>& list) {
    return CollectRecords(patches, hasXYZ, list, &CColorPatch::GetXYZ, &CColorPatch::IsXYZPresent);
}

int CSwatchlogBase::CollectLAB(std::vector<tagLAB>& list) {
    return CollectRecords(patches, hasLAB, list, &CColorPatch::GetLAB, &CColorPatch::IsLABPresent);
}

int CSwatchlogBase::CollectRGB(std::vector<tagRGB>& list) {
    return CollectRecords(patches, hasRGB, list, &CColorPatch::GetRGB, &CColorPatch::IsRGBPresent);
}

int CSwatchlogBase::CollectHTMLCOLOR(std::vector<tagHTMLCOLOR>& list) {
    return CollectRecords(patches, hasHTMLCOLOR, list, &CColorPatch::GetHTMLCOLOR,
                          &CColorPatch::IsHTMLCOLORPresent);
}

// Densities are held per patch, so they are collected like every other record.
int CSwatchlogBase::CollectDensities(std::vector<tagDENSITY>& list) {
    return CollectRecords(patches, hasDensity, list, &CColorPatch::GetDensity,
                          &CColorPatch::IsDensityAvailable);
}

// No test for an empty store: an n-colour chart without patches answers an
// empty list. A patch without n-colour channels answers 12, as for the records.
int CSwatchlogBase::CollectNColorMaps(std::vector<std::map<int, tagNCLR>>& list) {
    if (!hasNColor) {
        return 12;
    }
    for (const auto& entry : patches) {
        if (!entry.second.IsNColorPresent()) {
            return 12;
        }
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
