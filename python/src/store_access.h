// The one place where the module reads a chart object's patches in place.
//
// The library hands patches to a host only as copies (GetPatchList, GetPatch);
// copying 10,000 patches with their spectral maps, and freeing the copies,
// costs about as much as a third of reading the file. The patches are a
// protected member of CSwatchlogBase, so a class derived from it may name
// that member: StoreAccess is never made, it only lends its access to a
// pointer to the member, through which the module reads the patches of a
// chart object by const reference. Nothing is changed through it.
#pragma once

#include <map>

#include <redavudeva/redavudeva.h>

namespace redavudeva_python {

struct StoreAccess : CSwatchlogBase {
    using CSwatchlogBase::patches;
};

/// The chart object's patches by sample number (1 ... N), read in place.
inline const std::map<int, CColorPatch>& PatchesInPlace(const CSwatchlogBase& store) {
    return store.*(&StoreAccess::patches);
}

} // namespace redavudeva_python
