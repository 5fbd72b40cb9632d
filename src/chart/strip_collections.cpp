// Records of one strip of the chart's physical layout: strip s holds the
// sample numbers (s - 1) * columns + 1 to s * columns.
#include <algorithm>
#include <cstdint>

#include "redavudeva/swatchlog_base.h"

namespace {

struct StripLayout {
    int strips = 0;
    int columns = 0;
};

template <typename Record> using RecordGetter = Record (CColorPatch::*)() const;
using PresenceTest = bool (CColorPatch::*)() const;

// 12 when the colour space is not carried, 16 when no layout is set, 15 for an
// unusable layout, 17 for a strip outside 1 to the strip count, 12 when a patch
// of the strip does not hold the colour space (`holds` null: every patch does);
// else the list receives the strip's records and 0 is answered. A strip that
// reaches past the last patch yields the patches it has.
template <typename Record>
int CollectStrip(const std::map<int, CColorPatch>& patches, bool present, StripLayout layout,
                 int strip, std::vector<Record>& list, RecordGetter<Record> get,
                 PresenceTest holds) {
    if (!present) {
        return 12;
    }
    if (layout.strips == 0) {
        return layout.columns == 0 ? 16 : 15;
    }
    if (layout.strips < 1 || layout.columns < 1) {
        return 15;
    }
    if (strip < 1 || strip > layout.strips) {
        return 17;
    }
    // 64-bit arithmetic: strip and column counts set by the host may be large.
    const std::int64_t first = std::int64_t{strip - 1} * layout.columns + 1;
    const std::int64_t last =
        std::min(std::int64_t{strip} * layout.columns, static_cast<std::int64_t>(patches.size()));
    std::vector<const CColorPatch*> members;
    for (std::int64_t n = first; n <= last; ++n) {
        const auto found = patches.find(static_cast<int>(n));
        if (found != patches.end()) {
            if (holds != nullptr && !(found->second.*holds)()) {
                return 12;
            }
            members.push_back(&found->second);
        }
    }
    list.clear();
    for (const CColorPatch* patch : members) {
        list.push_back((patch->*get)());
    }
    return 0;
}

} // namespace

int CSwatchlogBase::CollectStripRGB(int strip, std::vector<tagRGB>& list) {
    return CollectStrip(patches, hasRGB, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetRGB, &CColorPatch::IsRGBPresent);
}

int CSwatchlogBase::CollectStripLAB(int strip, std::vector<tagLAB>& list) {
    return CollectStrip(patches, hasLAB, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetLAB, &CColorPatch::IsLABPresent);
}

int CSwatchlogBase::CollectStripXYZ(int strip, std::vector<tagXYZ>& list) {
    return CollectStrip(patches, hasXYZ, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetXYZ, &CColorPatch::IsXYZPresent);
}

int CSwatchlogBase::CollectStripCMYKOGV(int strip, std::vector<tagCMYKOGV>& list) {
    return CollectStrip(patches, hasCMYKOGV, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetCMYKOGV, &CColorPatch::IsCMYKOGVPresent);
}

int CSwatchlogBase::CollectStripCMYKRGB(int strip, std::vector<tagCMYKRGB>& list) {
    return CollectStrip(patches, hasCMYKRGB, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetCMYKRGB, &CColorPatch::IsCMYKRGBPresent);
}

int CSwatchlogBase::CollectStripCMYKO(int strip, std::vector<SWL_CMYKO>& list) {
    return CollectStrip(patches, hasCMYKO, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetCMYKO, nullptr);
}

int CSwatchlogBase::CollectStripCMYKOG(int strip, std::vector<tagCMYKOG>& list) {
    return CollectStrip(patches, hasCMYKOG, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetCMYKOG, &CColorPatch::IsCMYKOGPresent);
}

int CSwatchlogBase::CollectStripCMYK(int strip, std::vector<tagCMYK>& list) {
    return CollectStrip(patches, hasCMYK, {numberOfStrips, numberOfCols}, strip, list,
                        &CColorPatch::GetCMYK, &CColorPatch::IsCMYKPresent);
}
