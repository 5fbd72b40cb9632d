// Text crossing between Python and the library. Chart files hold byte strings
// in no declared encoding; they reach Python as UTF-8 with the bytes that are
// not UTF-8 kept as lone surrogates (the "surrogateescape" rule Python uses
// for file names), so that every byte of a name or keyword survives a read and
// a write unchanged.
#pragma once

#include <pybind11/pybind11.h>

#include <string>

namespace redavudeva_python {

namespace py = pybind11;

/// The bytes as a Python str (UTF-8, other bytes escaped).
py::str TextFromBytes(const std::string& bytes);
/// A Python str back to the bytes it stands for; TypeError for other objects.
std::string BytesFromText(py::handle text, const char* what);
/// A path given as str, bytes or os.PathLike, as the UTF-8 path the tool's
/// functions take.
std::string PathArgument(py::handle path);

} // namespace redavudeva_python
