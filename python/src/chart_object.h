// The Python Chart: a chart's patches as NumPy arrays, one row per patch in
// sample-number order, NaN where a patch lacks a value.
#pragma once

#include <pybind11/numpy.h>
#include <pybind11/pybind11.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "chart_tables.h"

namespace redavudeva_python {

namespace py = pybind11;

using FloatArray = py::array_t<double, py::array::c_style | py::array::forcecast>;

/// One colour space with a fixed number of channels.
struct FixedSpace {
    const char* key; ///< attribute and keyword-argument name
    std::size_t channels;
};
/// The spaces of fixed width, in attribute order.
constexpr std::array<FixedSpace, 5> kFixedSpaces{
    {{"cmyk", 4}, {"rgb", 3}, {"xyz", 3}, {"lab", 3}, {"density", 4}}};

struct ChartObject {
    py::object path = py::none(); ///< the file read, None for a chart built from arrays
    std::vector<swatchlog::TableExtent>
        tables;    ///< every table of the file read; none for a built chart
    int table = 0; ///< the number of the table read, 0 for a built chart
    py::array_t<std::int64_t> sampleNumbers;
    py::array sampleIds; ///< str array
    py::list names;
    py::dict keywords;
    std::string device = "none";
    py::dict fixed; ///< "cmyk", "rgb", "xyz", "lab", "density" -> (patches, channels)
    FloatArray ncolor;
    py::list ncolorNames;
    FloatArray wavelengths;
    FloatArray spectra;
    py::dict derived; ///< space name -> bool array (patches,)

    std::size_t Size() const { return static_cast<std::size_t>(sampleNumbers.size()); }
    FloatArray Fixed(const char* key) const { return fixed[key].cast<FloatArray>(); }
};

/// An array of `rows` x `columns` NaN.
FloatArray NanArray(std::size_t rows, std::size_t columns);

/// Reads table `table` (1-based; 0: the first with data rows, as the tool
/// does) of the chart file at `utf8Path`; the tool's TableReadError when it
/// cannot.
ChartObject ReadChart(const std::string& utf8Path, int table);

/// Sample numbers 1 ... `count` (int64) and the same as text, the sample ids
/// of a chart whose file gives none.
py::array_t<std::int64_t> SampleNumbers(std::size_t count);
py::array NumbersAsIds(std::size_t count);
/// The texts as a NumPy str array (bytes that are not UTF-8 kept as lone
/// surrogates, as TextFromBytes does).
py::array TextArray(const std::vector<std::string>& texts);

/// A chart from arrays and lists (None for what is not given); ValueError or
/// TypeError when they do not fit together.
ChartObject ChartFromArrays(py::object names, py::object cmyk, py::object rgb, py::object xyz,
                            py::object lab, py::object ncolor, py::object ncolorNames,
                            py::object spectra, py::object wavelengths, py::object keywords);

/// ValueError unless every array has one row per patch and the widths agree
/// with the channel names and wavelengths.
void CheckShapes(const ChartObject& chart);

/// Writes the chart as a new chart file through the library's new-file writer;
/// ValueError when it holds something that file cannot carry, the tool's
/// ChartError when the file cannot be written.
void WriteChart(const ChartObject& chart, const std::string& utf8Path);

} // namespace redavudeva_python
