// Hosts call the reader-writer's operations by their vtable position, so every
// operation must sit in its fixed slot. Under the Itanium C++ ABI a pointer to
// a virtual member function holds 1 + the byte offset of its vtable entry; the
// virtual destructor takes slots 0 and 1, so the operations start at slot 2.
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <iterator>

#include "redavudeva/swatchlog_base.h"

namespace {

template <typename MemberPointer> long VtableSlot(MemberPointer member) {
    struct Representation {
        std::uintptr_t pointer;
        std::ptrdiff_t adjustment;
    };
    static_assert(sizeof(MemberPointer) == sizeof(Representation), "Itanium member pointer");
    Representation rep;
    std::memcpy(&rep, &member, sizeof rep);
    if ((rep.pointer & 1u) == 0) {
        return -1; // not a virtual function
    }
    return static_cast<long>((rep.pointer - 1) / sizeof(void*));
}

using B = CSwatchlogBase;
using StringPairs = std::vector<std::pair<std::string, std::string>>;

struct Slot {
    long slot;
    const char* name;
};
// clang-format off
#define SLOT(member) Slot{VtableSlot(member), #member}
// clang-format on

TEST(VirtualOrder, EveryOperationSitsInItsDeclaredSlot) {
    // In declared order: entry i must be slot i + 2.
    // clang-format off
    const Slot slots[] = {
        SLOT(&B::ReadChartFile), SLOT(&B::AppendColumnsWithWhitePoint), SLOT(&B::WriteChartFile),
        SLOT(&B::WriteMeasurementFile), SLOT(&B::AppendMissingColumns), SLOT(&B::InsertKeywords),
        SLOT(&B::CanReadFile), SLOT(&B::WriteTargetFile), SLOT(&B::GetPatchCount),
        SLOT(&B::GetNumberOfCols), SLOT(&B::GetNumberOfStrips), SLOT(&B::GetNumberOfPages),
        SLOT(&B::GetDevice), SLOT(&B::GetPatchesPerPage), SLOT(&B::GetKeywords),
        SLOT(&B::GetKeywordValue), SLOT(&B::GetPatch),
        SLOT(static_cast<int (B::*)(const tagCMYK&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYK&)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKOG&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKOG&)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKRGB&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKRGB&)>(&B::FindClosestPatch)),
        SLOT(&B::GetPatchCMYK), SLOT(&B::GetPatchCMYKOG), SLOT(&B::GetPatchCMYKRGB),
        SLOT(&B::GetPatchXYZ), SLOT(&B::GetPatchLAB), SLOT(&B::GetPatchRGB),
        SLOT(&B::GetPatchDensity), SLOT(&B::CollectCMYK), SLOT(&B::CollectCMYKOG),
        SLOT(&B::CollectCMYKO), SLOT(&B::CollectCMYKOGV), SLOT(&B::CollectCMYKRGB),
        SLOT(&B::CollectXYZ), SLOT(&B::CollectLAB), SLOT(&B::CollectRGB),
        SLOT(&B::CollectHTMLCOLOR), SLOT(&B::CollectNColorMaps), SLOT(&B::GetDeviceValueLists),
        SLOT(&B::CollectDensities), SLOT(&B::SetLayout), SLOT(&B::SetNumberOfPages),
        SLOT(&B::CollectStripRGB), SLOT(&B::CollectStripLAB), SLOT(&B::CollectStripXYZ),
        SLOT(&B::CollectStripCMYKOGV), SLOT(&B::CollectStripCMYKRGB), SLOT(&B::CollectStripCMYKO),
        SLOT(&B::CollectStripCMYKOG), SLOT(&B::CollectStripCMYK), SLOT(&B::GetPatchList),
        SLOT(&B::GetSpectralDataList), SLOT(&B::GetSpectralRange), SLOT(&B::IsColorSpacePresent),
        SLOT(&B::GetDeviceColorSpace), SLOT(&B::GetDeviceChannelCount), SLOT(&B::GetChartType),
        SLOT(&B::SetChartType), SLOT(&B::WriteDeviceControlSequence),
        SLOT(&B::SelectCMYKRGBGradient), SLOT(&B::SelectCMYKOGGradient),
        SLOT(&B::SelectCMYKGradient), SLOT(&B::SelectCleanAndWhitePatches),
        SLOT(&B::SelectCleanColorPatches), SLOT(&B::GroupCleanColorPatches),
        SLOT(&B::GetChannelRamps), SLOT(&B::SetChartNormLight),
        SLOT(static_cast<void (B::*)(const StringPairs&)>(&B::SetKeywordList)),
        SLOT(&B::SetSampleNameList), SLOT(&B::SetCMYKList), SLOT(&B::SetCMYKOGList),
        SLOT(&B::SetCMYKRGBList), SLOT(&B::SetCMYKOGVList), SLOT(&B::SetXYZList),
        SLOT(&B::SetLABList), SLOT(&B::SetRGBList), SLOT(&B::SetSpectralDataList),
        SLOT(&B::SetNColorList), SLOT(&B::AddKeyword), SLOT(&B::GetDataFormatLine),
        SLOT(&B::SetDataFormatLine), SLOT(&B::ClearLists), SLOT(&B::GetReferenceSampleMap),
        SLOT(&B::GetProcessColorNames),
    };
    // clang-format on
    ASSERT_EQ(std::size(slots), 86u); // 87 operations less the destructor
    for (std::size_t i = 0; i < std::size(slots); ++i) {
        EXPECT_EQ(slots[i].slot, static_cast<long>(i) + 2) << slots[i].name;
    }
}

} // namespace
