// The reader of measurement files, for Python.
#include <Python.h>

#include "read/reader.h"

#include <limits>
#include <map>
#include <memory>
#include <new>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using namespace vantrel::sheets;

struct Drop {
    void operator()(PyObject *object) const { Py_XDECREF(object); }
};
using Object = std::unique_ptr<PyObject, Drop>;

/// Something that Python has already set an error for.
struct PythonError {};

Object checked(PyObject *object)
{
    if (!object)
        throw PythonError{};
    return Object(object);
}

Object text(std::string_view value)
{
    return checked(
        PyUnicode_DecodeUTF8(value.data(), static_cast<Py_ssize_t>(value.size()), "replace"));
}

template <class Items, class Make> Object list(const Items &items, Make make)
{
    Object result = checked(PyList_New(0));
    for (const auto &item : items)
        if (PyList_Append(result.get(), make(item).get()) < 0)
            throw PythonError{};
    return result;
}

/// Doubles as bytes that NumPy can lie over and write to.
Object doubles(const std::vector<double> &values)
{
    return checked(
        PyByteArray_FromStringAndSize(reinterpret_cast<const char *>(values.data()),
                                      static_cast<Py_ssize_t>(values.size() * sizeof(double))));
}

class Dictionary {
public:
    void add(const char *key, const Object &value)
    {
        if (PyDict_SetItemString(made.get(), key, value.get()) < 0)
            throw PythonError{};
    }
    void add(const char *key, std::string_view value) { add(key, text(value)); }
    void add(const char *key, bool value) { add(key, checked(PyBool_FromLong(value))); }
    void add(const char *key, double value) { add(key, checked(PyFloat_FromDouble(value))); }
    void add(const char *key, std::size_t value) { add(key, checked(PyLong_FromSize_t(value))); }
    Object take() { return std::move(made); }

private:
    Object made = checked(PyDict_New());
};

constexpr double kNone = std::numeric_limits<double>::quiet_NaN();

/// The device values by field, in the order in which the fields first come; NaN where a patch does
/// not have one.
Object device_of(const std::vector<Patch> &patches)
{
    std::vector<std::string> fields;
    std::map<std::string, std::vector<double>, std::less<>> columns;
    for (std::size_t i = 0; i < patches.size(); ++i)
        for (const auto &[field, value] : patches[i].device) {
            const auto [column, is_new] = columns.try_emplace(field, patches.size(), kNone);
            if (is_new)
                fields.push_back(field);
            column->second[i] = value;
        }
    Dictionary result;
    for (const std::string &field : fields)
        result.add(field.c_str(), doubles(columns[field]));
    return result.take();
}

Object source_of(const Measurement &sheet)
{
    const Source &source = sheet.source;
    Dictionary result;
    result.add("first_nm", source.first_nm);
    result.add("last_nm", source.last_nm);
    result.add("step_nm", source.step_nm);
    result.add("bands", source.bands);
    result.add("averaged", source.averaged);
    result.add("scaled", source.scaled);
    result.add("scale_by", source.scale_by);
    result.add("condition", source.condition);
    return result.take();
}

Object origin_of(const Measurement &sheet)
{
    const Origin &origin = sheet.origin;
    Dictionary result;
    result.add("originator", origin.originator);
    result.add("descriptor", origin.descriptor);
    result.add("created", origin.created);
    result.add("instrument", origin.instrument);
    result.add("job", origin.job);
    return result.take();
}

const char *name_of(Kind kind)
{
    switch (kind) {
    case Kind::reflectance:
        return "reflectance";
    case Kind::transmission:
        return "transmission";
    case Kind::colours:
        break;
    }
    return "colours";
}

Object object_of(const Measurement &sheet)
{
    std::vector<double> spectra, lab;
    bool has_lab = false;
    for (const Patch &patch : sheet.patches) {
        spectra.insert(spectra.end(), patch.refl.begin(), patch.refl.end());
        const CIELABCOORD own = patch.lab.value_or(CIELABCOORD{kNone, kNone, kNone});
        lab.insert(lab.end(), {own.L, own.a, own.b});
        has_lab = has_lab || patch.lab.has_value();
    }
    Dictionary result;
    result.add("kind", std::string_view(name_of(sheet.kind)));
    result.add("named", sheet.named);
    result.add("ids", list(sheet.patches, [](const Patch &patch) { return text(patch.id); }));
    result.add("names", list(sheet.patches, [](const Patch &patch) { return text(patch.name); }));
    if (sheet.kind != Kind::colours)
        result.add("spectra", doubles(spectra));
    if (has_lab)
        result.add("lab", doubles(lab));
    if (has_lab && sheet.colours.illuminant)
        result.add("lab_illuminant", checked(PyLong_FromLong(*sheet.colours.illuminant)));
    result.add("lab_stated", sheet.colours.stated);
    result.add("device", device_of(sheet.patches));
    result.add("source", source_of(sheet));
    result.add("origin", origin_of(sheet));
    result.add("warnings",
               list(sheet.warnings, [](const std::string &line) { return text(line); }));
    return result.take();
}

/// A file that cannot be read, as a sentence.
std::string sentence_of(const InputError &error)
{
    return error.line ? "line " + std::to_string(error.line) + ": " + error.reason : error.reason;
}

/// Without the interpreter lock; the reason where the file cannot be read.
std::optional<std::string> read_into(Measurement &sheet, std::string_view bytes,
                                     const Reading &reading)
{
    std::optional<std::string> reason;
    Py_BEGIN_ALLOW_THREADS;
    try {
        sheet = read_measurement(bytes, reading);
    } catch (const InputError &error) {
        reason = sentence_of(error);
    } catch (const std::bad_alloc &) {
        reason = "not enough memory";
    } catch (const std::exception &error) {
        reason = error.what();
    }
    Py_END_ALLOW_THREADS;
    return reason;
}

/// read(bytes, scale, condition): a dictionary. ValueError where the file cannot be read.
PyObject *read(PyObject *, PyObject *arguments)
{
    Py_buffer bytes{};
    int scale = 0;
    const char *condition = "";
    if (!PyArg_ParseTuple(arguments, "y*is", &bytes, &scale, &condition))
        return nullptr;
    Reading reading;
    reading.scale = static_cast<Scale>(scale);
    reading.condition = condition;
    reading.colours = true;
    Measurement sheet;
    const auto reason =
        read_into(sheet, {static_cast<const char *>(bytes.buf), size_t(bytes.len)}, reading);
    PyBuffer_Release(&bytes);
    if (reason) {
        PyErr_SetString(PyExc_ValueError, reason->c_str());
        return nullptr;
    }
    try {
        return object_of(sheet).release();
    } catch (const PythonError &) {
        return nullptr;
    } catch (const std::bad_alloc &) {
        return PyErr_NoMemory();
    }
}

PyMethodDef methods[] = {
    {"read", read, METH_VARARGS, "read(bytes, scale, condition): what a measurement file holds."},
    {nullptr, nullptr, 0, nullptr},
};

} // namespace

PyMODINIT_FUNC PyInit__sheets() // NOLINT(bugprone-reserved-identifier,cert-*)
{
    static PyModuleDef definition = {
        PyModuleDef_HEAD_INIT, "_sheets", nullptr, -1, methods, nullptr, nullptr, nullptr, nullptr};
    PyObject *module = PyModule_Create(&definition);
#ifdef Py_GIL_DISABLED
    if (module)
        PyUnstable_Module_SetGIL(module, Py_MOD_GIL_NOT_USED);
#endif
    return module;
}
