// Objects of Python that let go of themselves, and errors of Python as exceptions.
#pragma once

#include <Python.h>

#include <memory>
#include <string_view>

namespace vantrel::python {

struct Drop {
    void operator()(PyObject *object) const { Py_XDECREF(object); }
};
using Object = std::unique_ptr<PyObject, Drop>;

/// Something that Python has already set an error for.
struct PythonError {};

inline Object checked(PyObject *object)
{
    if (!object)
        throw PythonError{};
    return Object(object);
}

inline Object text(std::string_view value)
{
    return checked(
        PyUnicode_DecodeUTF8(value.data(), static_cast<Py_ssize_t>(value.size()), "replace"));
}

} // namespace vantrel::python
