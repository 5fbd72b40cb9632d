// A chart written as a new chart file: its arrays handed to a fresh store as the
// value lists of the library's new-file writer.
#include <cmath>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <redavudeva/redavudeva.h>

#include "chart_object.h"
#include "command_support.h"
#include "keyword_names.h"
#include "text_conversion.h"

namespace redavudeva_python {
namespace {

using KeywordList = std::vector<std::pair<std::string, std::string>>;

// Whether the array holds any value; a space that is NaN throughout is not carried.
bool Carries(const FloatArray& values) {
    const double* data = values.data();
    for (py::ssize_t i = 0; i < values.size(); ++i) {
        if (!std::isnan(data[i])) {
            return true;
        }
    }
    return false;
}

// ValueError unless every value of a space to be written is a finite number:
// the file has a cell for every patch and no notation for a missing value.
void RequireComplete(const FloatArray& values, const char* name,
                     const py::array_t<std::int64_t>& sampleNumbers) {
    const auto rows = values.unchecked<2>();
    for (py::ssize_t i = 0; i < rows.shape(0); ++i) {
        for (py::ssize_t c = 0; c < rows.shape(1); ++c) {
            if (!std::isfinite(rows(i, c))) {
                throw py::value_error(std::string(name) + " of sample " +
                                      std::to_string(sampleNumbers.at(i)) +
                                      " is not a finite number; a written colour space needs a "
                                      "value for every patch (a space that is NaN throughout "
                                      "is left out)");
            }
        }
    }
}

// The names as written, or none when no patch has one. A data row is split at
// blanks and tabs, so a name may contain neither, and none may be empty.
std::vector<std::string> NamesToWrite(const ChartObject& chart) {
    std::vector<std::string> names;
    bool any = false;
    for (const auto name : chart.names) {
        names.push_back(BytesFromText(name, "every name"));
        any = any || !names.back().empty();
    }
    if (!any) {
        return {};
    }
    for (std::size_t i = 0; i < names.size(); ++i) {
        if (names[i].empty() || names[i].find_first_of(" \t\r\n") != std::string::npos) {
            throw py::value_error("the name of sample " + std::to_string(i + 1) +
                                  " is empty or holds blanks, tabs or line breaks, which a "
                                  "chart file cannot carry");
        }
    }
    return names;
}

KeywordList KeywordsToWrite(const ChartObject& chart) {
    KeywordList keywords;
    for (const auto item : chart.keywords) {
        const std::string key = BytesFromText(item.first, "a keyword name");
        if (key == "NUMBER_OF_FIELDS" || key == "NUMBER_OF_SETS") {
            continue; // the writer counts them itself
        }
        if (!swatchlog::IsValidKeywordName(key) || swatchlog::IsStructuralKeyword(key)) {
            throw py::value_error("\"" + key + "\" cannot be written as a keyword");
        }
        bool ok = false;
        const std::string value =
            swatchlog::KeywordValueText(BytesFromText(item.second, "a keyword value"), ok);
        if (!ok) {
            throw py::value_error("the value of keyword " + key +
                                  " cannot be written (line breaks, or double quotes inside)");
        }
        keywords.emplace_back(key, value);
    }
    return swatchlog::NewFileKeywordLines(std::move(keywords));
}

template <typename Record, typename Make>
std::vector<Record> Records(const FloatArray& values, Make make) {
    const auto rows = values.unchecked<2>();
    std::vector<Record> records;
    records.reserve(static_cast<std::size_t>(rows.shape(0)));
    for (py::ssize_t i = 0; i < rows.shape(0); ++i) {
        records.push_back(make([&rows, i](py::ssize_t c) { return rows(i, c); }));
    }
    return records;
}

int WholeNumber(double value, const char* what) {
    const double rounded = std::round(value);
    if (!(std::fabs(rounded) < 2147483647.0)) {
        throw py::value_error(std::string(what) + " " + std::to_string(value) + " is out of range");
    }
    return static_cast<int>(rounded);
}

std::vector<std::string> ChannelNames(const ChartObject& chart) {
    std::vector<std::string> names;
    for (const auto name : chart.ncolorNames) {
        names.push_back(BytesFromText(name, "every n-colour channel name"));
        if (names.back().empty() || names.back().find_first_of(" \t\r\n\"") != std::string::npos) {
            throw py::value_error("n-colour channel name \"" + names.back() +
                                  "\" is empty or holds blanks, tabs or quotes");
        }
    }
    return names;
}

// "SPECTRAL_NM_380" ... for whole, positive, distinct wavelengths.
std::vector<std::string> SpectralFields(const FloatArray& wavelengths) {
    std::vector<std::string> fields;
    std::map<long, bool> seen;
    for (py::ssize_t c = 0; c < wavelengths.size(); ++c) {
        const double nm = wavelengths.at(c);
        if (!(nm >= 1.0 && nm < 100000.0) || nm != std::floor(nm) || seen[static_cast<long>(nm)]) {
            throw py::value_error("wavelengths must be distinct whole numbers of nanometres; " +
                                  std::to_string(nm) + " is not");
        }
        seen[static_cast<long>(nm)] = true;
        fields.push_back("SPECTRAL_NM_" + std::to_string(static_cast<long>(nm)));
    }
    return fields;
}

// Hands every written space to the store; answers whether any was.
bool FillStore(const ChartObject& chart, CSwatchlogBase& store) {
    bool any = false;
    // The space's values when it is to be written.
    auto fixed = [&](const char* key) -> std::optional<FloatArray> {
        FloatArray values = chart.Fixed(key);
        if (!Carries(values)) {
            return std::nullopt;
        }
        RequireComplete(values, key, chart.sampleNumbers);
        any = true;
        return values;
    };
    if (const auto cmyk = fixed("cmyk")) {
        store.SetCMYKList(Records<tagCMYK>(*cmyk, [](auto v) {
            return tagCMYK{v(0), v(1), v(2), v(3)};
        }));
    }
    // RGB the library worked out from XYZ or CMYK is a display guess, not data.
    const bool rgbDerived = chart.derived["rgb"].attr("any")().cast<bool>();
    if (const auto rgb = rgbDerived ? std::nullopt : fixed("rgb")) {
        store.SetRGBList(Records<tagRGB>(*rgb, [](auto v) {
            tagRGB record;
            record.r = WholeNumber(v(0), "RGB value");
            record.g = WholeNumber(v(1), "RGB value");
            record.b = WholeNumber(v(2), "RGB value");
            return record;
        }));
    }
    if (const auto xyz = fixed("xyz")) {
        store.SetXYZList(Records<tagXYZ>(*xyz, [](auto v) { return tagXYZ{v(0), v(1), v(2)}; }));
    }
    if (const auto lab = fixed("lab")) {
        store.SetLABList(Records<tagLAB>(*lab, [](auto v) { return tagLAB{v(0), v(1), v(2)}; }));
    }
    const std::vector<std::string> channels = ChannelNames(chart);
    if (!channels.empty() && Carries(chart.ncolor)) {
        RequireComplete(chart.ncolor, "ncolor", chart.sampleNumbers);
        store.SetNColorList(Records<std::map<int, tagNCLR>>(chart.ncolor, [&](auto v) {
            std::map<int, tagNCLR> map;
            for (std::size_t c = 0; c < channels.size(); ++c) {
                tagNCLR& channel = map[static_cast<int>(c)];
                channel.colorantCount = std::atoi(channels[c].c_str());
                channel.channel = static_cast<int>(c);
                channel.name = channels[c];
                channel.value = v(static_cast<py::ssize_t>(c));
            }
            return map;
        }));
        any = true;
    }
    if (chart.wavelengths.size() > 0 && Carries(chart.spectra)) {
        RequireComplete(chart.spectra, "spectra", chart.sampleNumbers);
        const std::vector<std::string> fields = SpectralFields(chart.wavelengths);
        store.SetSpectralDataList(Records<std::map<std::string, double>>(
                                      chart.spectra,
                                      [&](auto v) {
                                          std::map<std::string, double> map;
                                          for (std::size_t c = 0; c < fields.size(); ++c) {
                                              map.emplace(fields[c],
                                                          v(static_cast<py::ssize_t>(c)));
                                          }
                                          return map;
                                      }),
                                  false);
        any = true;
    }
    return any;
}

} // namespace

void WriteChart(const ChartObject& chart, const std::string& utf8Path) {
    CheckShapes(chart);
    if (chart.Size() == 0) {
        throw py::value_error("the chart has no patches to write");
    }
    std::unique_ptr<CSwatchlogBase> store(
        CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    if (!FillStore(chart, *store)) {
        throw py::value_error("the chart carries no values to write (cmyk, rgb, xyz, lab, "
                              "ncolor or spectra)");
    }
    store->SetSampleNameList(NamesToWrite(chart));
    store->SetKeywordList(KeywordsToWrite(chart));
    py::gil_scoped_release unlocked;
    swatchlog::WriteOutputFile(utf8Path, swatchlog::DefaultFailureText(utf8Path),
                               [&store](const std::wstring& temporary) {
                                   return store->WriteChartFile(L"", temporary, false);
                               });
}

} // namespace redavudeva_python
