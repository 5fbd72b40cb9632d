// The patch whose device values lie closest to a given device colour.
#include "redavudeva/swatchlog_base.h"

namespace {

// Distances at or above these ceilings never qualify.
constexpr double kCeilingWithMaximum = 400.0;
constexpr double kCeilingWithoutMaximum = 10000.0;

// Sample number of the first patch (in ascending sample number) with the
// smallest distance below `ceiling` and not above `maximumDistance`, or -1.
template <typename Distance>
int FindClosest(std::map<int, CColorPatch>& patches, double ceiling, double maximumDistance,
                Distance distance) {
    double best = ceiling;
    int answer = -1;
    for (auto& entry : patches) {
        const double d = distance(entry.second);
        if (d < best && d <= maximumDistance) {
            best = d;
            answer = entry.first;
        }
    }
    return answer;
}

} // namespace

int CSwatchlogBase::FindClosestPatch(const tagCMYK& target, double maximumDistance) {
    return FindClosest(patches, kCeilingWithMaximum, maximumDistance,
                       [&target](CColorPatch& p) { return p.GetCMYKPatchDistanceTo(target); });
}

int CSwatchlogBase::FindClosestPatch(const tagCMYK& target) {
    return FindClosest(patches, kCeilingWithoutMaximum, kCeilingWithoutMaximum,
                       [&target](CColorPatch& p) { return p.GetCMYKPatchDistanceTo(target); });
}

int CSwatchlogBase::FindClosestPatch(const tagCMYKOG& target, double maximumDistance) {
    return FindClosest(patches, kCeilingWithMaximum, maximumDistance,
                       [&target](CColorPatch& p) { return p.GetCMYKOGPatchDistanceTo(target); });
}

int CSwatchlogBase::FindClosestPatch(const tagCMYKOG& target) {
    return FindClosest(patches, kCeilingWithoutMaximum, kCeilingWithoutMaximum,
                       [&target](CColorPatch& p) { return p.GetCMYKOGPatchDistanceTo(target); });
}

int CSwatchlogBase::FindClosestPatch(const tagCMYKRGB& target, double maximumDistance) {
    return FindClosest(patches, kCeilingWithMaximum, maximumDistance,
                       [&target](CColorPatch& p) { return p.GetCMYKRGBPatchDistanceTo(target); });
}

int CSwatchlogBase::FindClosestPatch(const tagCMYKRGB& target) {
    return FindClosest(patches, kCeilingWithoutMaximum, kCeilingWithoutMaximum,
                       [&target](CColorPatch& p) { return p.GetCMYKRGBPatchDistanceTo(target); });
}
