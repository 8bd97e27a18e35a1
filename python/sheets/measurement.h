// A measurement as the fields of vantrel.Sheet, there and back.
#pragma once

#include "object.h"

#include "read/measurement.h"

namespace vantrel::python {

/// A dictionary of the fields; doubles are bytes that NumPy can lie over.
Object object_of(const sheets::Measurement &sheet);

/// What such a dictionary says; throws PythonError. Doubles may be in any contiguous buffer.
sheets::Measurement measurement_of(PyObject *fields);

} // namespace vantrel::python
