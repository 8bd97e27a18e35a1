#include "measurement.h"

#include "read/doubts.h"
#include "read/text.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <limits>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::python {
namespace {

using namespace sheets;

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

/// The members of Source and of Origin with their names, for both ways.
template <class SomeSource, class Each> void each_of_source(SomeSource &source, Each each)
{
    each("first_nm", source.first_nm);
    each("last_nm", source.last_nm);
    each("step_nm", source.step_nm);
    each("bands", source.bands);
    each("averaged", source.averaged);
    each("interpolated", source.interpolated);
    each("held", source.held);
    each("scaled", source.scaled);
    each("scale_by", source.scale_by);
    each("condition", source.condition);
}

template <class SomeOrigin, class Each> void each_of_origin(SomeOrigin &origin, Each each)
{
    each("originator", origin.originator);
    each("descriptor", origin.descriptor);
    each("created", origin.created);
    each("instrument", origin.instrument);
    each("job", origin.job);
}

constexpr std::pair<Kind, const char *> kinds[] = {{Kind::reflectance, "reflectance"},
                                                   {Kind::transmission, "transmission"},
                                                   {Kind::colours, "colours"}};

/// The value of a key; throws PythonError.
Object item(PyObject *fields, const char *key)
{
    PyObject *found = PyMapping_GetItemString(fields, key);
    return checked(found);
}

void take(PyObject *value, double &out)
{
    out = PyFloat_AsDouble(value);
    if (PyErr_Occurred())
        throw PythonError{};
}

void take(PyObject *value, std::size_t &out)
{
    out = PyLong_AsSize_t(value);
    if (PyErr_Occurred())
        throw PythonError{};
}

void take(PyObject *value, bool &out)
{
    const int truth = PyObject_IsTrue(value);
    if (truth < 0)
        throw PythonError{};
    out = truth != 0;
}

/// Text, safe to print as that of a file.
void take(PyObject *value, std::string &out)
{
    const Object bytes = checked(PyUnicode_AsEncodedString(value, "utf-8", "replace"));
    out = printable(
        {PyBytes_AS_STRING(bytes.get()), static_cast<std::size_t>(PyBytes_GET_SIZE(bytes.get()))});
}

/// So many doubles of a buffer.
void take(PyObject *value, std::size_t count, std::vector<double> &out)
{
    Py_buffer buffer{};
    if (PyObject_GetBuffer(value, &buffer, PyBUF_SIMPLE) < 0)
        throw PythonError{};
    const bool fits = static_cast<std::size_t>(buffer.len) == count * sizeof(double);
    if (fits) {
        out.resize(count);
        std::memcpy(out.data(), buffer.buf, count * sizeof(double));
    }
    PyBuffer_Release(&buffer);
    if (!fits) {
        PyErr_Format(PyExc_ValueError, "%zu numbers are needed", count);
        throw PythonError{};
    }
}

std::vector<std::string> texts(const Object &sequence)
{
    const Object items = checked(PySequence_Fast(sequence.get(), "a list is needed"));
    std::vector<std::string> out(static_cast<std::size_t>(PySequence_Fast_GET_SIZE(items.get())));
    for (std::size_t i = 0; i < out.size(); ++i)
        take(PySequence_Fast_GET_ITEM(items.get(), static_cast<Py_ssize_t>(i)), out[i]);
    return out;
}

/// Gives patches their device values; a NaN is none.
void add_device(std::vector<Patch> &patches, PyObject *device)
{
    PyObject *field = nullptr, *column = nullptr;
    std::vector<double> values;
    for (Py_ssize_t at = 0; PyDict_Next(device, &at, &field, &column);) {
        std::string name;
        take(field, name);
        take(column, patches.size(), values);
        for (std::size_t i = 0; i < patches.size(); ++i)
            if (!std::isnan(values[i]))
                patches[i].device.emplace_back(name, values[i]);
    }
}

void add_colours(Measurement &sheet, PyObject *fields)
{
    std::vector<double> values;
    if (const Object lab = item(fields, "lab"); lab.get() != Py_None) {
        take(lab.get(), sheet.patches.size() * 3, values);
        for (std::size_t i = 0; i < sheet.patches.size(); ++i)
            if (const double *own = &values[3 * i]; !std::isnan(own[0]))
                sheet.patches[i].lab = CIELABCOORD{own[0], own[1], own[2]};
    }
    if (const Object illuminant = item(fields, "lab_illuminant"); illuminant.get() != Py_None) {
        std::size_t number = 0;
        take(illuminant.get(), number);
        sheet.colours.illuminant = static_cast<ILLUM_OBS>(number);
    }
}

/// Adds what the reader would doubt of the numbers, where it has not said so of them.
void doubt(Measurement &sheet)
{
    for (const Doubt &doubt : doubts_about(sheet.patches, sheet.kind, sheet.source.held)) {
        const std::string line = doubt.line ? std::to_string(doubt.line) + ":" : "";
        const std::string text = line + " " + doubt.text;
        if (std::find(sheet.warnings.begin(), sheet.warnings.end(), text) == sheet.warnings.end())
            sheet.warnings.push_back(text);
    }
}

} // namespace

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
    Dictionary result, source, origin;
    for (const auto &[kind, name] : kinds)
        if (kind == sheet.kind)
            result.add("kind", std::string_view(name));
    result.add("named", sheet.named);
    result.add("has_ids", sheet.has_ids);
    result.add("collection", sheet.collection);
    result.add("ids", list(sheet.patches, [](const Patch &patch) { return text(patch.id); }));
    result.add("names", list(sheet.patches, [](const Patch &patch) { return text(patch.name); }));
    result.add("lines", list(sheet.patches, [](const Patch &patch) {
                   return checked(PyLong_FromSize_t(patch.line));
               }));
    if (sheet.kind != Kind::colours)
        result.add("spectra", doubles(spectra));
    if (has_lab)
        result.add("lab", doubles(lab));
    if (sheet.colours.illuminant)
        result.add("lab_illuminant", checked(PyLong_FromLong(*sheet.colours.illuminant)));
    result.add("lab_stated", sheet.colours.stated);
    result.add("device", device_of(sheet.patches));
    each_of_source(sheet.source, [&](auto name, const auto &value) { source.add(name, value); });
    each_of_origin(sheet.origin, [&](auto name, const auto &value) { origin.add(name, value); });
    result.add("source", source.take());
    result.add("origin", origin.take());
    result.add("warnings",
               list(sheet.warnings, [](const std::string &line) { return text(line); }));
    return result.take();
}

Measurement measurement_of(PyObject *fields)
{
    Measurement sheet;
    const auto taken = [](PyObject *object) {
        return [object](const char *name, auto &value) { take(item(object, name).get(), value); };
    };
    const auto field = taken(fields);
    field("file", sheet.file);
    field("named", sheet.named);
    field("has_ids", sheet.has_ids);
    field("collection", sheet.collection);
    field("lab_stated", sheet.colours.stated);
    std::string kind_name;
    field("kind", kind_name);
    for (const auto &[kind, name] : kinds)
        if (kind_name == name)
            sheet.kind = kind;
    sheet.warnings = texts(item(fields, "warnings"));

    const std::vector<std::string> names = texts(item(fields, "names"));
    const std::vector<std::string> ids = texts(item(fields, "ids"));
    std::vector<double> spectra, lines;
    take(item(fields, "lines").get(), names.size(), lines);
    if (sheet.kind != Kind::colours)
        take(item(fields, "spectra").get(), names.size() * VANTREL_BANDS, spectra);
    sheet.patches.resize(names.size());
    for (std::size_t i = 0; i < names.size(); ++i) {
        Patch &patch = sheet.patches[i];
        patch.name = names[i];
        patch.id = ids.at(i);
        patch.line = static_cast<std::size_t>(lines[i]);
        if (sheet.kind != Kind::colours)
            std::memcpy(patch.refl.data(), &spectra[i * VANTREL_BANDS], sizeof(Spectrum));
    }
    add_device(sheet.patches, item(fields, "device").get());
    add_colours(sheet, fields);
    each_of_source(sheet.source, taken(item(fields, "source").get()));
    each_of_origin(sheet.origin, taken(item(fields, "origin").get()));
    bool changed = false;
    field("changed", changed);
    if (changed)
        doubt(sheet);
    return sheet;
}

} // namespace vantrel::python
