// Hosts call the reader-writer's operations by their vtable position, so every
// operation must sit in its fixed slot. Under the Itanium C++ ABI a pointer to
// a virtual member function holds 1 + the byte offset of its vtable entry; the
// virtual destructor takes slots 0 and 1, so the operations start at slot 2.
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <iterator>
#include <utility>

#include "redavudeva/swatchlog_base.h"

namespace {

template <typename MemberPointer> long VtableSlot(MemberPointer member) {
    std::uintptr_t rep[2]; // Itanium: pointer or 1 + vtable offset, then this-adjustment
    static_assert(sizeof(MemberPointer) == sizeof rep, "Itanium member pointer");
    std::memcpy(rep, &member, sizeof rep);
    return (rep[0] & 1u) == 0 ? -1 : static_cast<long>((rep[0] - 1) / sizeof(void*));
}

using B = CSwatchlogBase;
using StringPairs = std::vector<std::pair<std::string, std::string>>;
using Slot = std::pair<long, const char*>;
// clang-format off
#define SLOT(member) Slot{VtableSlot(member), #member}
#define S(name) SLOT(&B::name)
// clang-format on

TEST(VirtualOrder, EveryOperationSitsInItsDeclaredSlot) {
    // In declared order: entry i must be slot i + 2.
    // clang-format off
    const Slot slots[] = {
        S(ReadChartFile), S(AppendColumnsWithWhitePoint), S(WriteChartFile),
        S(WriteMeasurementFile), S(AppendMissingColumns), S(InsertKeywords), S(CanReadFile),
        S(WriteTargetFile), S(GetPatchCount), S(GetNumberOfCols), S(GetNumberOfStrips),
        S(GetNumberOfPages), S(GetDevice), S(GetPatchesPerPage), S(GetKeywords), S(GetKeywordValue),
        S(GetPatch),
        SLOT(static_cast<int (B::*)(const tagCMYK&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYK&)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKOG&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKOG&)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKRGB&, double)>(&B::FindClosestPatch)),
        SLOT(static_cast<int (B::*)(const tagCMYKRGB&)>(&B::FindClosestPatch)),
        S(GetPatchCMYK), S(GetPatchCMYKOG), S(GetPatchCMYKRGB), S(GetPatchXYZ), S(GetPatchLAB),
        S(GetPatchRGB), S(GetPatchDensity), S(CollectCMYK), S(CollectCMYKOG), S(CollectCMYKO),
        S(CollectCMYKOGV), S(CollectCMYKRGB), S(CollectXYZ), S(CollectLAB), S(CollectRGB),
        S(CollectHTMLCOLOR), S(CollectNColorMaps), S(GetDeviceValueLists), S(CollectDensities),
        S(SetLayout), S(SetNumberOfPages), S(CollectStripRGB), S(CollectStripLAB),
        S(CollectStripXYZ), S(CollectStripCMYKOGV), S(CollectStripCMYKRGB), S(CollectStripCMYKO),
        S(CollectStripCMYKOG), S(CollectStripCMYK), S(GetPatchList), S(GetSpectralDataList),
        S(GetSpectralRange), S(IsColorSpacePresent), S(GetDeviceColorSpace),
        S(GetDeviceChannelCount), S(GetChartType), S(SetChartType), S(WriteDeviceControlSequence),
        S(SelectCMYKRGBGradient), S(SelectCMYKOGGradient), S(SelectCMYKGradient),
        S(SelectCleanAndWhitePatches), S(SelectCleanColorPatches), S(GroupCleanColorPatches),
        S(GetChannelRamps), S(SetChartNormLight),
        SLOT(static_cast<void (B::*)(const StringPairs&)>(&B::SetKeywordList)),
        S(SetSampleNameList), S(SetCMYKList), S(SetCMYKOGList), S(SetCMYKRGBList),
        S(SetCMYKOGVList), S(SetXYZList), S(SetLABList), S(SetRGBList), S(SetSpectralDataList),
        S(SetNColorList), S(AddKeyword), S(GetDataFormatLine), S(SetDataFormatLine), S(ClearLists),
        S(GetReferenceSampleMap), S(GetProcessColorNames),
    };
    // clang-format on
    ASSERT_EQ(std::size(slots), 86u); // 87 operations less the destructor
    for (std::size_t i = 0; i < std::size(slots); ++i) {
        EXPECT_EQ(slots[i].first, static_cast<long>(i) + 2) << slots[i].second;
    }
}

} // namespace
