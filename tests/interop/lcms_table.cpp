#include "lcms_table.h"

#include <lcms2.h>

#include <memory>
#include <type_traits>

namespace interop {

namespace {

// Little CMS reports errors through a per-context handler; the context's user
// data points at the string that collects them.
void CollectError(cmsContext context, cmsUInt32Number, const char* text) {
    auto* error = static_cast<std::string*>(cmsGetContextUserData(context));
    if (error != nullptr && text != nullptr) {
        *error += text;
    }
}

using Context = std::unique_ptr<std::remove_pointer_t<cmsContext>, decltype(&cmsDeleteContext)>;
using Handle = std::unique_ptr<void, decltype(&cmsIT8Free)>;

Context MakeContext(std::string& error) {
    Context context(cmsCreateContext(nullptr, &error), cmsDeleteContext);
    cmsSetLogErrorHandlerTHR(context.get(), CollectError);
    return context;
}

} // namespace

LcmsTable LoadWithLcms(const std::filesystem::path& path) {
    LcmsTable table;
    Context context = MakeContext(table.error);
    Handle handle(cmsIT8LoadFromFile(context.get(), path.string().c_str()), cmsIT8Free);
    cmsHANDLE it8 = handle.get();
    if (it8 == nullptr) {
        return table;
    }
    table.loaded = true;
    cmsIT8SetTable(it8, 0);
    table.sheetType = cmsIT8GetSheetType(it8);
    table.numberOfSets = static_cast<int>(cmsIT8GetPropertyDbl(it8, "NUMBER_OF_SETS"));
    table.numberOfFields = static_cast<int>(cmsIT8GetPropertyDbl(it8, "NUMBER_OF_FIELDS"));
    char** names = nullptr;
    const int fieldCount = cmsIT8EnumDataFormat(it8, &names);
    for (int i = 0; i < fieldCount; ++i) {
        table.fields.emplace_back(names[i] != nullptr ? names[i] : "");
    }
    char** keys = nullptr;
    for (cmsUInt32Number i = 0, n = cmsIT8EnumProperties(it8, &keys); i < n; ++i) {
        const char* value = cmsIT8GetProperty(it8, keys[i]);
        table.properties[keys[i]] = value != nullptr ? value : "";
    }
    for (int row = 0; row < table.numberOfSets; ++row) {
        table.text.emplace_back();
        table.numbers.emplace_back();
        for (int col = 0; col < fieldCount; ++col) {
            const char* cell = cmsIT8GetDataRowCol(it8, row, col);
            table.text.back().emplace_back(cell != nullptr ? cell : "");
            table.numbers.back().push_back(cmsIT8GetDataRowColDbl(it8, row, col));
        }
    }
    return table;
}

bool SaveWithLcms(const std::filesystem::path& path, const std::vector<std::string>& fields,
                  const std::vector<std::vector<LcmsCell>>& rows) {
    std::string error;
    Context context = MakeContext(error);
    Handle handle(cmsIT8Alloc(context.get()), cmsIT8Free);
    cmsHANDLE it8 = handle.get();
    bool ok = it8 != nullptr && cmsIT8SetSheetType(it8, "CGATS.17") &&
              cmsIT8SetPropertyDbl(it8, "NUMBER_OF_FIELDS", static_cast<double>(fields.size())) &&
              cmsIT8SetPropertyDbl(it8, "NUMBER_OF_SETS", static_cast<double>(rows.size()));
    for (std::size_t col = 0; ok && col < fields.size(); ++col) {
        ok = cmsIT8SetDataFormat(it8, static_cast<int>(col), fields[col].c_str());
    }
    for (int row = 0; ok && row < static_cast<int>(rows.size()); ++row) {
        for (int col = 0; ok && col < static_cast<int>(rows[row].size()); ++col) {
            const LcmsCell& cell = rows[row][col];
            ok = std::holds_alternative<std::string>(cell)
                     ? cmsIT8SetDataRowCol(it8, row, col, std::get<std::string>(cell).c_str())
                     : cmsIT8SetDataRowColDbl(it8, row, col, std::get<double>(cell));
        }
    }
    return ok && cmsIT8SaveToFile(it8, path.string().c_str()) && error.empty();
}

std::map<std::string, double> OurValues(CIT8ReaderWriter& chart, int sample) {
    int result = -1;
    const CColorPatch patch = chart.GetPatch(sample, result);
    const tagCMYK c = patch.GetCMYK();
    const tagXYZ x = patch.GetXYZ();
    const tagLAB l = patch.GetLAB();
    const tagRGB r = patch.GetRGB();
    const tagDENSITY d = patch.GetDensity();
    std::map<std::string, double> values = {
        {"CMYK_C", c.c},      {"CMYK_M", c.m},  {"CMYK_Y", c.y},      {"CMYK_K", c.k},
        {"XYZ_X", x.x},       {"XYZ_Y", x.y},   {"XYZ_Z", x.z},       {"LAB_L", l.l},
        {"LAB_A", l.a},       {"LAB_B", l.b},   {"RGB_R", 1.0 * r.r}, {"RGB_G", 1.0 * r.g},
        {"RGB_B", 1.0 * r.b}, {"D_RED", d.red}, {"D_GREEN", d.green}, {"D_BLUE", d.blue},
        {"D_VIS", d.visual}};
    values.merge(patch.GetSpectralData());
    for (const auto& channel : patch.GetNColorMap()) {
        values.emplace(channel.second.name, channel.second.value);
    }
    return values;
}

} // namespace interop
