#include "lcms_table.h"

#include <lcms2.h>

#include <memory>

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

struct ContextDeleter {
    void operator()(void* context) const { cmsDeleteContext(static_cast<cmsContext>(context)); }
};
struct HandleDeleter {
    void operator()(void* handle) const { cmsIT8Free(handle); }
};
using Context = std::unique_ptr<void, ContextDeleter>;
using Handle = std::unique_ptr<void, HandleDeleter>;

Context MakeContext(std::string& error) {
    Context context(cmsCreateContext(nullptr, &error));
    cmsSetLogErrorHandlerTHR(static_cast<cmsContext>(context.get()), CollectError);
    return context;
}

} // namespace

int LcmsTable::Field(const std::string& name) const {
    for (std::size_t i = 0; i < fields.size(); ++i) {
        if (fields[i] == name) {
            return static_cast<int>(i);
        }
    }
    return -1;
}

std::string LcmsTable::Property(const std::string& name) const {
    for (const auto& property : properties) {
        if (property.first == name) {
            return property.second;
        }
    }
    return std::string();
}

LcmsTable LoadWithLcms(const std::filesystem::path& path) {
    LcmsTable table;
    Context context = MakeContext(table.error);
    Handle handle(
        cmsIT8LoadFromFile(static_cast<cmsContext>(context.get()), path.string().c_str()));
    if (!handle) {
        return table;
    }
    cmsHANDLE it8 = handle.get();
    table.loaded = true;
    table.tableCount = static_cast<int>(cmsIT8TableCount(it8));
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
    const cmsUInt32Number keyCount = cmsIT8EnumProperties(it8, &keys);
    for (cmsUInt32Number i = 0; i < keyCount; ++i) {
        const char* value = cmsIT8GetProperty(it8, keys[i]);
        table.properties.emplace_back(keys[i], value != nullptr ? value : "");
    }
    for (int row = 0; row < table.numberOfSets; ++row) {
        std::vector<std::string> text;
        std::vector<double> numbers;
        for (int col = 0; col < fieldCount; ++col) {
            const char* cell = cmsIT8GetDataRowCol(it8, row, col);
            text.emplace_back(cell != nullptr ? cell : "");
            numbers.push_back(cmsIT8GetDataRowColDbl(it8, row, col));
        }
        table.text.push_back(std::move(text));
        table.numbers.push_back(std::move(numbers));
    }
    return table;
}

bool SaveWithLcms(const std::filesystem::path& path, const std::vector<std::string>& fields,
                  const std::vector<std::vector<LcmsCell>>& rows) {
    std::string error;
    Context context = MakeContext(error);
    Handle handle(cmsIT8Alloc(static_cast<cmsContext>(context.get())));
    cmsHANDLE it8 = handle.get();
    bool ok = it8 != nullptr && cmsIT8SetSheetType(it8, "CGATS.17") &&
              cmsIT8SetPropertyDbl(it8, "NUMBER_OF_FIELDS", static_cast<double>(fields.size())) &&
              cmsIT8SetPropertyDbl(it8, "NUMBER_OF_SETS", static_cast<double>(rows.size()));
    for (std::size_t col = 0; ok && col < fields.size(); ++col) {
        ok = cmsIT8SetDataFormat(it8, static_cast<int>(col), fields[col].c_str());
    }
    for (std::size_t row = 0; ok && row < rows.size(); ++row) {
        for (std::size_t col = 0; ok && col < rows[row].size(); ++col) {
            const LcmsCell& cell = rows[row][col];
            ok = cell.isText ? cmsIT8SetDataRowCol(it8, static_cast<int>(row),
                                                   static_cast<int>(col), cell.text.c_str())
                             : cmsIT8SetDataRowColDbl(it8, static_cast<int>(row),
                                                      static_cast<int>(col), cell.number);
        }
    }
    return ok && cmsIT8SaveToFile(it8, path.string().c_str()) && error.empty();
}

} // namespace interop
