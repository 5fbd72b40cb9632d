// The Python Chart: a chart's patches as NumPy arrays, one row per patch in
// sample-number order, NaN where a patch lacks a value.
#pragma once

#include <pybind11/numpy.h>
#include <pybind11/pybind11.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>

namespace swatchlog {
class Chart;
}

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
    py::array_t<std::int64_t> sampleIds;
    py::list names;
    py::dict keywords;
    std::string device = "none";
    py::dict fixed; ///< "cmyk", "rgb", "xyz", "lab", "density" -> (patches, channels)
    FloatArray ncolor;
    py::list ncolorNames;
    FloatArray wavelengths;
    FloatArray spectra;
    py::dict derived; ///< space name -> bool array (patches,)

    std::size_t Size() const { return static_cast<std::size_t>(sampleIds.size()); }
    FloatArray Fixed(const char* key) const { return fixed[key].cast<FloatArray>(); }
};

/// An array of `rows` x `columns` NaN.
FloatArray NanArray(std::size_t rows, std::size_t columns);

/// The Python chart of a chart the tool has read (one table of a file).
ChartObject ChartFromToolChart(const swatchlog::Chart& chart);
/// Reads the chart file at `utf8Path`; the tool's ChartError when it cannot.
ChartObject ReadChart(const std::string& utf8Path);

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
