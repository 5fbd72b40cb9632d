// delta_e: the tool's colour differences over NumPy arrays of L*a*b* colours.
#pragma once

#include <pybind11/pybind11.h>

#include <string>

namespace redavudeva_python {

namespace py = pybind11;

/// Colour differences between `lab1` and `lab2` (array-likes whose last axis
/// holds L*, a*, b*, broadcast against each other) by `method` "CIE2000" or
/// "CIE1976": an array of the broadcast shape without the last axis, or a
/// float for two single colours.
py::object DeltaE(const py::object& lab1, const py::object& lab2, const std::string& method);

} // namespace redavudeva_python
