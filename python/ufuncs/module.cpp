// The extension module: makes the ufuncs, and carries what is not one.
#include "guard.h"
#include "rows.h"
#include "settings.h"

#include <numpy/arrayobject.h>
#include <numpy/ufuncobject.h>

#include <cstring>
#include <string>

namespace {

/// The library's setters and getters take arrays of doubles alone, of which some may be null.
template <auto function> struct Constants;
template <class... P, void (*function)(P...)> struct Constants<function> {
    template <std::size_t... I>
    static void call(PyArrayObject *const (&arrays)[sizeof...(P)], std::index_sequence<I...>)
    {
        const Exclusive exclusive;
        function(arrays[I] ? static_cast<P>(PyArray_DATA(arrays[I])) : nullptr...);
    }

    /// Arguments: for each parameter an array of doubles that is large enough, or None.
    static PyObject *method(PyObject *, PyObject *arguments)
    {
        PyArrayObject *arrays[sizeof...(P)] = {};
        for (std::size_t i = 0; i < sizeof...(P); ++i) {
            PyObject *item = PyTuple_GetItem(arguments, static_cast<Py_ssize_t>(i));
            if (!item)
                return nullptr;
            if (item == Py_None)
                continue;
            arrays[i] = reinterpret_cast<PyArrayObject *>(item);
            if (!PyArray_Check(item) || PyArray_TYPE(arrays[i]) != NPY_DOUBLE ||
                !PyArray_ISCARRAY(arrays[i])) {
                PyErr_SetString(PyExc_TypeError, "an array of doubles is needed");
                return nullptr;
            }
        }
        call(arrays, std::index_sequence_for<P...>());
        Py_RETURN_NONE;
    }
};

template <int (*function)()> PyObject *number(PyObject *, PyObject *)
{
    return PyLong_FromLong(function());
}

PyObject *get_settings(PyObject *, PyObject *)
{
    const Settings settings = process_settings();
    return PyBytes_FromStringAndSize(reinterpret_cast<const char *>(&settings), sizeof settings);
}

/// Takes what get_settings() gave, here or in another process.
bool settings_of(PyObject *bytes, Settings &settings)
{
    if (!PyBytes_Check(bytes) || PyBytes_GET_SIZE(bytes) != sizeof settings) {
        PyErr_SetString(PyExc_ValueError, "these are settings of another version of Vantrel");
        return false;
    }
    std::memcpy(&settings, PyBytes_AS_STRING(bytes), sizeof settings);
    return true;
}

PyObject *set_settings(PyObject *, PyObject *bytes)
{
    Settings settings;
    if (!settings_of(bytes, settings))
        return nullptr;
    set_process_settings(settings);
    Py_RETURN_NONE;
}

PyObject *use_settings(PyObject *, PyObject *bytes)
{
    Settings settings;
    if (bytes != Py_None && !settings_of(bytes, settings))
        return nullptr;
    use_settings(bytes == Py_None ? nullptr : &settings);
    Py_RETURN_NONE;
}

PyMethodDef methods[] = {
    {"get_num_illuminant_observers", number<GetNumIlluminantObservers>, METH_NOARGS,
     "get_num_illuminant_observers()\n--\n\nThe number of illuminant/observer combinations, 18."},
    {"get_num_statuses", number<GetNumStatuses>, METH_NOARGS,
     "get_num_statuses()\n--\n\nThe number of density statuses, 10."},
    {"get_num_responses", number<GetNumResponses>, METH_NOARGS,
     "get_num_responses()\n--\n\nThe number of density responses, 9."},
    {"set_hifi_constants", Constants<SetHiFiConstants>::method, METH_VARARGS, nullptr},
    {"get_hifi_constants", Constants<GetHiFiConstants>::method, METH_VARARGS, nullptr},
    {"set_hexachrome_constants", Constants<SetHexachromeConstants>::method, METH_VARARGS, nullptr},
    {"get_hexachrome_constants", Constants<GetHexachromeConstants>::method, METH_VARARGS, nullptr},
    {"set_spectralx_constants", Constants<SetSpectralXConstants>::method, METH_VARARGS, nullptr},
    {"get_spectralx_constants", Constants<GetSpectralXConstants>::method, METH_VARARGS, nullptr},
    {"set_achromatic_constants", Constants<SetAChromaticConstants>::method, METH_VARARGS, nullptr},
    {"get_achromatic_constants", Constants<GetAChromaticConstants>::method, METH_VARARGS, nullptr},
    {"get_settings", get_settings, METH_NOARGS, "All that can be set, as bytes."},
    {"set_settings", set_settings, METH_O, "Sets what get_settings() gave."},
    {"use_settings", use_settings, METH_O,
     "Lets this thread compute under what get_settings() gave, or as all (None)."},
    {nullptr, nullptr, 0, nullptr},
};

/// Everything that NumPy keeps pointers to; lives as long as the process.
struct Ufunc {
    std::string name, signature;
    Guard guard = {};
    PyUFuncGenericFunction loop = guarded;
    void *data = &guard;
};

/// Adds the ufunc of a row, or its second one, whose last output tells which rows succeeded.
bool add_ufunc(PyObject *module, const Row &row, bool flags, const LaneLoops &lanes)
{
    auto *kept = new Ufunc{row.name, row.signature};
    Guard &guard = kept->guard;
    guard.loop = row.loop;
    guard.all_finite = lanes.all_finite;
    for (const LaneLoop &loop : lanes.loops)
        if (std::strcmp(loop.name, row.name) == 0)
            guard.lanes = &loop;
    guard.inputs = row.inputs;
    guard.types = {row.types, size_t(row.inputs + row.outputs)};
    if (flags) {
        kept->name += "_ok";
        kept->signature += ",()";
        guard.types += static_cast<char>(NPY_BOOL);
    }
    PyObject *object = PyUFunc_FromFuncAndDataAndSignature(
        &kept->loop, &kept->data, guard.types.data(), 1, row.inputs, row.outputs + flags,
        PyUFunc_None, kept->name.c_str(), row.c_name, 0, kept->signature.c_str());
    if (!object)
        return false;
    const auto *ufunc = reinterpret_cast<const PyUFuncObject *>(object);
    guard.layout.flags = flags;
    guard.core_dimensions = ufunc->core_enabled ? ufunc->core_num_dim_ix : 0;
    int stride = ufunc->nargs;
    for (int i = 0; ufunc->core_enabled && i < ufunc->nargs; ++i) {
        Layout::Core &core = guard.layout.cores[i];
        core.dimensions = ufunc->core_num_dims[i];
        core.stride = stride;
        stride += core.dimensions;
        std::copy_n(ufunc->core_dim_ixs + ufunc->core_offsets[i], core.dimensions, core.index);
    }
    return PyModule_AddObject(module, kept->name.c_str(), object) == 0;
}

bool add_rows(PyObject *module, PyObject *c_names, std::span<const Row> rows,
              const LaneLoops &lanes)
{
    for (const Row &row : rows) {
        PyObject *c_name = PyUnicode_FromString(row.c_name);
        if (!c_name || PyDict_SetItemString(c_names, row.name, c_name) < 0 ||
            !add_ufunc(module, row, false, lanes) ||
            (row.refuses && !add_ufunc(module, row, true, lanes)))
            return false;
        Py_DECREF(c_name);
    }
    return true;
}

bool add_words(PyObject *module)
{
    const auto words = difference_words();
    PyObject *tuple = PyTuple_New(static_cast<Py_ssize_t>(words.size()));
    for (std::size_t i = 0; tuple && i < words.size(); ++i)
        PyTuple_SET_ITEM(tuple, static_cast<Py_ssize_t>(i), PyUnicode_FromWideChar(words[i], -1));
    return tuple && PyModule_AddObject(module, "difference_words", tuple) == 0;
}

bool add_den_weight(PyObject *module)
{
    npy_intp shape[] = {NUM_STATUSES, NUM_RESPONSES, VANTREL_BANDS};
    PyObject *view = PyArray_SimpleNewFromData(3, shape, NPY_INT64, den_weight);
    return view && PyModule_AddObject(module, "den_weight", view) == 0;
}

} // namespace

PyMODINIT_FUNC PyInit__ufuncs() // NOLINT(bugprone-reserved-identifier,cert-*)
{
    import_array();
    import_umath();
    const char *fault = nullptr;
    const LaneLoops lanes = lane_loops(fault);
    if (fault) {
        PyErr_SetString(PyExc_ImportError, fault);
        return nullptr;
    }
    static PyModuleDef definition = {
        PyModuleDef_HEAD_INIT, "_ufuncs", nullptr, -1, methods, nullptr, nullptr, nullptr, nullptr};
    PyObject *module = PyModule_Create(&definition);
    PyObject *c_names = PyDict_New();
    if (module && c_names && add_rows(module, c_names, colour_rows(), lanes) &&
        add_rows(module, c_names, density_rows(), lanes) && add_words(module) &&
        add_den_weight(module) && PyModule_AddObject(module, "c_names", c_names) == 0 &&
        PyModule_AddStringConstant(module, "version", VANTREL_VERSION) == 0) {
#ifdef Py_GIL_DISABLED
        PyUnstable_Module_SetGIL(module, Py_MOD_GIL_NOT_USED);
#endif
        return module;
    }
    Py_XDECREF(c_names);
    Py_XDECREF(module);
    return nullptr;
}
