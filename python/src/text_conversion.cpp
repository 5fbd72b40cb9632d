#include "text_conversion.h"

namespace redavudeva_python {

py::str TextFromBytes(const std::string& bytes) {
    PyObject* text = PyUnicode_DecodeUTF8(bytes.data(), static_cast<Py_ssize_t>(bytes.size()),
                                          "surrogateescape");
    if (text == nullptr) {
        throw py::error_already_set();
    }
    return py::reinterpret_steal<py::str>(text);
}

std::string BytesFromText(py::handle text, const char* what) {
    if (!PyUnicode_Check(text.ptr())) {
        throw py::type_error(std::string(what) + " must be a str, not " +
                             std::string(py::str(py::type::of(text).attr("__name__"))));
    }
    PyObject* encoded = PyUnicode_AsEncodedString(text.ptr(), "utf-8", "surrogateescape");
    if (encoded == nullptr) {
        throw py::error_already_set();
    }
    const auto bytes = py::reinterpret_steal<py::bytes>(encoded);
    return std::string(bytes);
}

std::string PathArgument(py::handle path) {
    const py::object fspath = py::module_::import("os").attr("fspath")(path);
    if (PyBytes_Check(fspath.ptr())) {
        return std::string(py::reinterpret_borrow<py::bytes>(fspath));
    }
    return BytesFromText(fspath, "path");
}

} // namespace redavudeva_python
