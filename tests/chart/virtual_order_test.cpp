// Hosts call the reader-writer's operations by their vtable position, so every
// operation must sit in its fixed slot. Under the Itanium C++ ABI a pointer to
// a virtual member function holds 1 + the byte offset of its vtable entry; the
// virtual destructor takes slots 0 and 1.
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>

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

#define EXPECT_SLOT(member, slot) EXPECT_EQ(VtableSlot(member), slot) << #member

TEST(VirtualOrder, FileOperationsFollowTheDestructor) {
    EXPECT_SLOT(&B::ReadChartFile, 2);
    EXPECT_SLOT(&B::AppendColumnsWithWhitePoint, 3);
    EXPECT_SLOT(&B::WriteChartFile, 4);
    EXPECT_SLOT(&B::WriteMeasurementFile, 5);
    EXPECT_SLOT(&B::AppendMissingColumns, 6);
    EXPECT_SLOT(&B::InsertKeywords, 7);
    EXPECT_SLOT(&B::CanReadFile, 8);
    EXPECT_SLOT(&B::WriteTargetFile, 9);
}

TEST(VirtualOrder, CountsKeywordsAndPatches) {
    EXPECT_SLOT(&B::GetPatchCount, 10);
    EXPECT_SLOT(&B::GetNumberOfCols, 11);
    EXPECT_SLOT(&B::GetNumberOfStrips, 12);
    EXPECT_SLOT(&B::GetNumberOfPages, 13);
    EXPECT_SLOT(&B::GetDevice, 14);
    EXPECT_SLOT(&B::GetPatchesPerPage, 15);
    EXPECT_SLOT(&B::GetKeywords, 16);
    EXPECT_SLOT(&B::GetKeywordValue, 17);
    EXPECT_SLOT(&B::GetPatch, 18);
}

TEST(VirtualOrder, ClosestPatchOverloadsInDeclaredOrder) {
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYK&, double)>(&B::FindClosestPatch), 19);
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYK&)>(&B::FindClosestPatch), 20);
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYKOG&, double)>(&B::FindClosestPatch), 21);
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYKOG&)>(&B::FindClosestPatch), 22);
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYKRGB&, double)>(&B::FindClosestPatch), 23);
    EXPECT_SLOT(static_cast<int (B::*)(const tagCMYKRGB&)>(&B::FindClosestPatch), 24);
}

TEST(VirtualOrder, RecordGettersAndCollections) {
    EXPECT_SLOT(&B::GetPatchCMYK, 25);
    EXPECT_SLOT(&B::GetPatchCMYKOG, 26);
    EXPECT_SLOT(&B::GetPatchCMYKRGB, 27);
    EXPECT_SLOT(&B::GetPatchXYZ, 28);
    EXPECT_SLOT(&B::GetPatchLAB, 29);
    EXPECT_SLOT(&B::GetPatchRGB, 30);
    EXPECT_SLOT(&B::GetPatchDensity, 31);
    EXPECT_SLOT(&B::CollectCMYK, 32);
    EXPECT_SLOT(&B::CollectCMYKOG, 33);
    EXPECT_SLOT(&B::CollectCMYKO, 34);
    EXPECT_SLOT(&B::CollectCMYKOGV, 35);
    EXPECT_SLOT(&B::CollectCMYKRGB, 36);
    EXPECT_SLOT(&B::CollectXYZ, 37);
    EXPECT_SLOT(&B::CollectLAB, 38);
    EXPECT_SLOT(&B::CollectRGB, 39);
    EXPECT_SLOT(&B::CollectHTMLCOLOR, 40);
    EXPECT_SLOT(&B::CollectNColorMaps, 41);
    EXPECT_SLOT(&B::GetDeviceValueLists, 42);
    EXPECT_SLOT(&B::CollectDensities, 43);
}

TEST(VirtualOrder, LayoutAndStrips) {
    EXPECT_SLOT(&B::SetLayout, 44);
    EXPECT_SLOT(&B::SetNumberOfPages, 45);
    EXPECT_SLOT(&B::CollectStripRGB, 46);
    EXPECT_SLOT(&B::CollectStripLAB, 47);
    EXPECT_SLOT(&B::CollectStripXYZ, 48);
    EXPECT_SLOT(&B::CollectStripCMYKOGV, 49);
    EXPECT_SLOT(&B::CollectStripCMYKRGB, 50);
    EXPECT_SLOT(&B::CollectStripCMYKO, 51);
    EXPECT_SLOT(&B::CollectStripCMYKOG, 52);
    EXPECT_SLOT(&B::CollectStripCMYK, 53);
}

TEST(VirtualOrder, ListsSpectraAndDeviceQueries) {
    EXPECT_SLOT(&B::GetPatchList, 54);
    EXPECT_SLOT(&B::GetSpectralDataList, 55);
    EXPECT_SLOT(&B::GetSpectralRange, 56);
    EXPECT_SLOT(&B::IsColorSpacePresent, 57);
    EXPECT_SLOT(&B::GetDeviceColorSpace, 58);
    EXPECT_SLOT(&B::GetDeviceChannelCount, 59);
    EXPECT_SLOT(&B::GetChartType, 60);
    EXPECT_SLOT(&B::SetChartType, 61);
    EXPECT_SLOT(&B::WriteDeviceControlSequence, 62);
}

TEST(VirtualOrder, SelectionsAndRamps) {
    EXPECT_SLOT(&B::SelectCMYKRGBGradient, 63);
    EXPECT_SLOT(&B::SelectCMYKOGGradient, 64);
    EXPECT_SLOT(&B::SelectCMYKGradient, 65);
    EXPECT_SLOT(&B::SelectCleanAndWhitePatches, 66);
    EXPECT_SLOT(&B::SelectCleanColorPatches, 67);
    EXPECT_SLOT(&B::GroupCleanColorPatches, 68);
    EXPECT_SLOT(&B::GetChannelRamps, 69);
}

TEST(VirtualOrder, SettersAndTheLastOperations) {
    EXPECT_SLOT(&B::SetChartNormLight, 70);
    EXPECT_SLOT(static_cast<void (B::*)(const StringPairs&)>(&B::SetKeywordList), 71);
    EXPECT_SLOT(&B::SetSampleNameList, 72);
    EXPECT_SLOT(&B::SetCMYKList, 73);
    EXPECT_SLOT(&B::SetCMYKOGList, 74);
    EXPECT_SLOT(&B::SetCMYKRGBList, 75);
    EXPECT_SLOT(&B::SetCMYKOGVList, 76);
    EXPECT_SLOT(&B::SetXYZList, 77);
    EXPECT_SLOT(&B::SetLABList, 78);
    EXPECT_SLOT(&B::SetRGBList, 79);
    EXPECT_SLOT(&B::SetSpectralDataList, 80);
    EXPECT_SLOT(&B::SetNColorList, 81);
    EXPECT_SLOT(&B::AddKeyword, 82);
    EXPECT_SLOT(&B::GetDataFormatLine, 83);
    EXPECT_SLOT(&B::SetDataFormatLine, 84);
    EXPECT_SLOT(&B::ClearLists, 85);
    EXPECT_SLOT(&B::GetReferenceSampleMap, 86);
    EXPECT_SLOT(&B::GetProcessColorNames, 87);
}

} // namespace
