// Measurement files for Python: read, and what the program's commands say of them.
#include "measurement.h"

#include "boundary/calls.h"
#include "judge/colour.h"
#include "read/bands.h"
#include "read/reader.h"

#include <cstdint>
#include <exception>
#include <memory>
#include <new>
#include <string>
#include <vector>

namespace vantrel::python {
namespace {

using namespace sheets;

/// A file that cannot be read, as a sentence.
std::string sentence_of(const InputError &error)
{
    return error.line ? "line " + std::to_string(error.line) + ": " + error.reason : error.reason;
}

/// Does the work without the interpreter lock. Throws PythonError, a ValueError, where it cannot.
template <class Work> void unlocked(const Work &work)
{
    std::string reason;
    Py_BEGIN_ALLOW_THREADS;
    try {
        work();
    } catch (const InputError &error) {
        reason = sentence_of(error);
    } catch (const RequestError &error) {
        reason = error.message;
    } catch (const std::bad_alloc &) {
        reason = "not enough memory";
    } catch (const std::exception &error) {
        reason = error.what();
    }
    Py_END_ALLOW_THREADS;
    if (reason.empty())
        return;
    PyErr_SetObject(PyExc_ValueError, text(reason).get());
    throw PythonError{};
}

/// read(bytes, scale, condition): a dictionary. ValueError where the file cannot be read.
Object read(PyObject *arguments)
{
    Py_buffer bytes{};
    int scale = 0;
    const char *condition = "";
    if (!PyArg_ParseTuple(arguments, "y*is", &bytes, &scale, &condition))
        throw PythonError{};
    const std::unique_ptr<Py_buffer, void (*)(Py_buffer *)> held(&bytes, PyBuffer_Release);
    Reading reading;
    reading.scale = static_cast<Scale>(scale);
    reading.condition = condition;
    reading.colours = true;
    Measurement sheet;
    unlocked([&] {
        sheet =
            read_measurement({static_cast<const char *>(bytes.buf), size_t(bytes.len)}, reading);
    });
    return object_of(sheet);
}

/// What a command answers to sheets under options; all is text.
std::string answer_of(std::string_view command, const std::vector<Measurement> &sheets,
                      const std::string &options)
{
    if (command == "compare")
        return compare(sheets.at(0), sheets.at(1), options);
    if (command == "run") {
        std::vector<const Measurement *> of_run;
        for (std::size_t i = 1; i < sheets.size(); ++i)
            of_run.push_back(&sheets[i]);
        return run(of_run, sheets.at(0), options);
    }
    if (command == "predict")
        return predict(sheets.at(0), options);
    if (command == "ink")
        return ink(sheets.at(0), options);
    const bool advised = command == "advice"; // a report, with aims after the sheet
    const std::size_t second = advised ? 2 : 1;
    return report({&sheets.at(0)}, sheets.size() > second ? &sheets[second] : nullptr, options, {},
                  advised ? &sheets.at(1) : nullptr);
}

/// answer(command, [fields of a Sheet, ...], options in JSON): text. ValueError where it is
/// refused.
Object answer(PyObject *arguments)
{
    const char *command = nullptr, *options = nullptr;
    PyObject *all = nullptr;
    if (!PyArg_ParseTuple(arguments, "sO!s", &command, &PyList_Type, &all, &options))
        throw PythonError{};
    std::vector<Measurement> sheets;
    for (Py_ssize_t i = 0; i < PyList_GET_SIZE(all); ++i)
        sheets.push_back(measurement_of(PyList_GET_ITEM(all, i)));
    std::string said;
    unlocked([&] { said = answer_of(command, sheets, options); });
    return text(said);
}

/// srgb(L*a*b*): red, green and blue from 0 to 255 of each triple of doubles, as in the program.
Object srgb(PyObject *arguments)
{
    Py_buffer buffer{};
    if (!PyArg_ParseTuple(arguments, "y*", &buffer))
        throw PythonError{};
    const std::unique_ptr<Py_buffer, void (*)(Py_buffer *)> held(&buffer, PyBuffer_Release);
    const auto *lab = static_cast<const double *>(buffer.buf);
    std::string levels;
    for (std::size_t i = 0; i < size_t(buffer.len) / (3 * sizeof(double)); ++i, lab += 3) {
        const Rgb rgb = colour_of(CIELABCOORD{lab[0], lab[1], lab[2]}).rgb;
        for (const std::uint8_t level : {rgb.red, rgb.green, rgb.blue})
            levels += static_cast<char>(level);
    }
    return checked(PyBytes_FromStringAndSize(levels.data(), Py_ssize_t(levels.size())));
}

/// bands(wavelengths): what each of 31 bands takes of the value at each wavelength, as the reader
/// of files does; the wavelengths are doubles, the answer 31 doubles for each.
Object bands(PyObject *arguments)
{
    Py_buffer buffer{};
    if (!PyArg_ParseTuple(arguments, "y*", &buffer))
        throw PythonError{};
    const std::unique_ptr<Py_buffer, void (*)(Py_buffer *)> held(&buffer, PyBuffer_Release);
    const auto *nm = static_cast<const double *>(buffer.buf);
    const std::size_t count = size_t(buffer.len) / sizeof(double);
    std::string weights;
    unlocked([&] {
        const Bands taken({nm, nm + count}, 0);
        for (std::size_t i = 0; i < count; ++i) {
            std::vector<double> one(count);
            one[i] = 1;
            const Spectrum shares = taken.of(one);
            weights.append(reinterpret_cast<const char *>(shares.data()), sizeof shares);
        }
    });
    return checked(PyBytes_FromStringAndSize(weights.data(), Py_ssize_t(weights.size())));
}

/// A function of the module; what Python has set an error for leaves it as null.
template <Object (*function)(PyObject *)> PyObject *method(PyObject *, PyObject *arguments) noexcept
{
    try {
        return function(arguments).release();
    } catch (const PythonError &) {
        return nullptr;
    } catch (const std::bad_alloc &) {
        return PyErr_NoMemory();
    } catch (const std::exception &error) {
        PyErr_SetString(PyExc_ValueError, error.what());
        return nullptr;
    }
}

PyMethodDef methods[] = {
    {"read", method<read>, METH_VARARGS, "What a measurement file holds."},
    {"answer", method<answer>, METH_VARARGS, "What a command of the program says of sheets."},
    {"bands", method<bands>, METH_VARARGS, "How values at wavelengths make the bands."},
    {"srgb", method<srgb>, METH_VARARGS, "The colours of a display for L*a*b*."},
    {nullptr, nullptr, 0, nullptr},
};

} // namespace
} // namespace vantrel::python

PyMODINIT_FUNC PyInit__sheets() // NOLINT(bugprone-reserved-identifier,cert-*)
{
    static PyModuleDef definition = {PyModuleDef_HEAD_INIT,
                                     "_sheets",
                                     nullptr,
                                     -1,
                                     vantrel::python::methods,
                                     nullptr,
                                     nullptr,
                                     nullptr,
                                     nullptr};
    PyObject *module = PyModule_Create(&definition);
#ifdef Py_GIL_DISABLED
    if (module)
        PyUnstable_Module_SetGIL(module, Py_MOD_GIL_NOT_USED);
#endif
    return module;
}
