// Reading and writing the generated chart: our reader-writer against Little
// CMS in the same binary, on the same file and the same table.
#include <benchmark/benchmark.h>
#include <lcms2.h>

#include <memory>
#include <string>
#include <vector>

#include "generated_chart.h"
#include "it8/it8_reader_writer.h"

namespace {

struct It8Deleter {
    void operator()(void* handle) const { cmsIT8Free(handle); }
};
using It8Handle = std::unique_ptr<void, It8Deleter>;

std::wstring Wide(const std::filesystem::path& path) {
    const std::string narrow = path.string();
    return std::wstring(narrow.begin(), narrow.end());
}

// Our read: the whole file into the store, every patch with its derived
// colour spaces.
void BM_Read_Redavudeva(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const std::wstring path = Wide(bench::ChartFile(bench::ScratchFolder(), patches));
    for (auto _ : state) {
        CIT8ReaderWriter chart;
        const int code = chart.ReadChartFile(path);
        if (code != 0 || chart.GetPatchCount() != patches) {
            state.SkipWithError("the chart did not read");
            break;
        }
        benchmark::DoNotOptimize(chart.GetPatchCount());
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

// Little CMS's read: load the file and take every cell as a double.
void BM_Read_LittleCMS(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const std::string path = bench::ChartFile(bench::ScratchFolder(), patches).string();
    for (auto _ : state) {
        It8Handle it8(cmsIT8LoadFromFile(nullptr, path.c_str()));
        if (!it8) {
            state.SkipWithError("Little CMS did not load the chart");
            break;
        }
        char** names = nullptr;
        const int fields = cmsIT8EnumDataFormat(it8.get(), &names);
        const int sets = static_cast<int>(cmsIT8GetPropertyDbl(it8.get(), "NUMBER_OF_SETS"));
        double sum = 0.0;
        for (int row = 0; row < sets; ++row) {
            for (int col = 0; col < fields; ++col) {
                sum += cmsIT8GetDataRowColDbl(it8.get(), row, col);
            }
        }
        benchmark::DoNotOptimize(sum);
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

// Fills a store's value lists with the table.
void FillStore(CIT8ReaderWriter& store, const bench::ChartTable& table) {
    store.SetSampleNameList(table.names);
    store.SetCMYKList(table.cmyk);
    store.SetSpectralDataList(table.spectra, false);
    store.SetLABList(table.lab);
}

// Builds Little CMS's table from the same values.
It8Handle FillLittleCMS(const bench::ChartTable& table) {
    It8Handle it8(cmsIT8Alloc(nullptr));
    const std::vector<std::string> fields = bench::FieldNames();
    cmsIT8SetSheetType(it8.get(), "CGATS.17");
    cmsIT8SetPropertyDbl(it8.get(), "NUMBER_OF_FIELDS", static_cast<double>(fields.size()));
    cmsIT8SetPropertyDbl(it8.get(), "NUMBER_OF_SETS", static_cast<double>(table.names.size()));
    for (std::size_t col = 0; col < fields.size(); ++col) {
        cmsIT8SetDataFormat(it8.get(), static_cast<int>(col), fields[col].c_str());
    }
    for (std::size_t i = 0; i < table.names.size(); ++i) {
        const int row = static_cast<int>(i);
        int col = 0;
        cmsIT8SetDataRowColDbl(it8.get(), row, col++, static_cast<double>(i + 1));
        cmsIT8SetDataRowCol(it8.get(), row, col++, table.names[i].c_str());
        const tagCMYK& c = table.cmyk[i];
        for (double v : {c.c, c.m, c.y, c.k}) {
            cmsIT8SetDataRowColDbl(it8.get(), row, col++, v);
        }
        for (const auto& entry : table.spectra[i]) {
            cmsIT8SetDataRowColDbl(it8.get(), row, col++, entry.second);
        }
        const tagLAB& l = table.lab[i];
        for (double v : {l.l, l.a, l.b}) {
            cmsIT8SetDataRowColDbl(it8.get(), row, col++, v);
        }
    }
    return it8;
}

// Our new-file writer on a store that holds the table.
void BM_Write_Redavudeva(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const bench::ChartTable table = bench::GenerateTable(patches);
    CIT8ReaderWriter store;
    FillStore(store, table);
    const std::wstring path = Wide(bench::ScratchFolder() / "written_redavudeva.it8");
    for (auto _ : state) {
        if (store.WriteChartFile(L"", path, false) != 0) {
            state.SkipWithError("the chart was not written");
            break;
        }
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

// Little CMS saving a table that holds the same values.
void BM_Write_LittleCMS(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const It8Handle it8 = FillLittleCMS(bench::GenerateTable(patches));
    const std::string path = (bench::ScratchFolder() / "written_lcms.it8").string();
    for (auto _ : state) {
        if (!cmsIT8SaveToFile(it8.get(), path.c_str())) {
            state.SkipWithError("Little CMS did not save the chart");
            break;
        }
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

// The same two writes from the values in memory: filling the store or Little
// CMS's table is timed too (Little CMS formats each number when it is set).
void BM_FillAndWrite_Redavudeva(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const bench::ChartTable table = bench::GenerateTable(patches);
    const std::wstring path = Wide(bench::ScratchFolder() / "written_redavudeva.it8");
    for (auto _ : state) {
        CIT8ReaderWriter store;
        FillStore(store, table);
        if (store.WriteChartFile(L"", path, false) != 0) {
            state.SkipWithError("the chart was not written");
            break;
        }
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

void BM_FillAndWrite_LittleCMS(benchmark::State& state) {
    const int patches = static_cast<int>(state.range(0));
    const bench::ChartTable table = bench::GenerateTable(patches);
    const std::string path = (bench::ScratchFolder() / "written_lcms.it8").string();
    for (auto _ : state) {
        const It8Handle it8 = FillLittleCMS(table);
        if (!cmsIT8SaveToFile(it8.get(), path.c_str())) {
            state.SkipWithError("Little CMS did not save the chart");
            break;
        }
    }
    state.SetItemsProcessed(state.iterations() * patches);
}

} // namespace

BENCHMARK(BM_Read_Redavudeva)->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
// Little CMS refuses the 100,000-patch chart ("AllocateDataSet: too much data").
BENCHMARK(BM_Read_LittleCMS)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Write_Redavudeva)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Write_LittleCMS)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FillAndWrite_Redavudeva)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FillAndWrite_LittleCMS)->Arg(10000)->Unit(benchmark::kMillisecond);

BENCHMARK_MAIN();
