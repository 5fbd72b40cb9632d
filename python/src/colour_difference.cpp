#include "colour_difference.h"

#include <pybind11/numpy.h>

#include <algorithm>
#include <cctype>

#include "color_difference.h"

namespace redavudeva_python {
namespace {

using FloatArray = py::array_t<double, py::array::c_style | py::array::forcecast>;

std::string Upper(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::toupper(c)); });
    return text;
}

} // namespace

py::object DeltaE(const py::object& lab1, const py::object& lab2, const std::string& method) {
    const std::string name = Upper(method);
    const bool de2000 = name == "CIE2000" || name == "CIEDE2000";
    if (!de2000 && name != "CIE1976" && name != "CIE76") {
        throw py::value_error("method must be \"CIE2000\" or \"CIE1976\", not \"" + method + "\"");
    }
    const py::module_ numpy = py::module_::import("numpy");
    py::object first;
    py::object second;
    try {
        first = numpy.attr("asarray")(lab1, "float64");
        second = numpy.attr("asarray")(lab2, "float64");
    } catch (const py::error_already_set&) {
        throw py::type_error("lab1 and lab2 must be arrays of numbers");
    }
    for (const py::object* lab : {&first, &second}) {
        const auto array = lab->cast<py::array>();
        if (array.ndim() < 1 || array.shape(array.ndim() - 1) != 3) {
            throw py::value_error("the last axis of lab1 and lab2 must hold L*, a*, b* (length 3)");
        }
    }
    py::tuple both;
    try {
        both = numpy.attr("broadcast_arrays")(first, second);
    } catch (const py::error_already_set&) {
        throw py::value_error("lab1 and lab2 do not broadcast to one shape");
    }
    const auto a = numpy.attr("ascontiguousarray")(both[0]).cast<FloatArray>();
    const auto b = numpy.attr("ascontiguousarray")(both[1]).cast<FloatArray>();
    std::vector<py::ssize_t> shape(a.shape(), a.shape() + a.ndim() - 1);
    FloatArray result(shape);
    const double* p = a.data();
    const double* q = b.data();
    double* out = result.mutable_data();
    const py::ssize_t count = result.size();
    {
        py::gil_scoped_release unlocked;
        for (py::ssize_t i = 0; i < count; ++i, p += 3, q += 3) {
            const swatchlog::LabColor x{p[0], p[1], p[2]};
            const swatchlog::LabColor y{q[0], q[1], q[2]};
            out[i] = de2000 ? swatchlog::DeltaE2000(x, y) : swatchlog::DeltaE76(x, y);
        }
    }
    if (result.ndim() == 0) {
        return py::float_(out[0]);
    }
    return std::move(result);
}

} // namespace redavudeva_python
