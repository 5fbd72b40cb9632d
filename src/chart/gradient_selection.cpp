// Patches lying on a straight tone gradient origin + t * direction.
#include "redavudeva/swatchlog_base.h"

namespace {

// The gradient tests only read the patch (they are not declared const).
template <typename OnGradient>
std::vector<CColorPatch> SelectPatches(std::map<int, CColorPatch>& patches, OnGradient onGradient) {
    std::vector<CColorPatch> selected;
    for (auto& entry : patches) {
        if (onGradient(entry.second)) {
            selected.push_back(entry.second);
        }
    }
    return selected;
}

} // namespace

std::vector<CColorPatch> CSwatchlogBase::SelectCMYKRGBGradient(const tagCMYKRGB& origin,
                                                               const tagCMYKRGB& direction,
                                                               double tolerance) {
    return SelectPatches(patches, [&](CColorPatch& p) {
        return p.IsCMYKRGBOnGradient(origin, direction, tolerance);
    });
}

std::vector<CColorPatch> CSwatchlogBase::SelectCMYKOGGradient(const tagCMYKOG& origin,
                                                              const tagCMYKOG& direction,
                                                              double tolerance) {
    return SelectPatches(patches, [&](CColorPatch& p) {
        return p.IsCMYKOGOnGradient(origin, direction, tolerance);
    });
}

std::vector<CColorPatch> CSwatchlogBase::SelectCMYKGradient(const tagCMYK& origin,
                                                            const tagCMYK& direction,
                                                            double tolerance) {
    return SelectPatches(
        patches, [&](CColorPatch& p) { return p.IsCMYKOnGradient(origin, direction, tolerance); });
}
