#ifndef ALDERMOOR_PYTHON_ERRORS_H
#define ALDERMOOR_PYTHON_ERRORS_H

#include <pybind11/pybind11.h>

#include "aldermoor/utilities/exceptions/traceableexception.h"

namespace Aldermoor::Python {

/// Throws `failure` on as the class `name` of aldermoor._errors, with its message and trace, and
/// the place in the text, but not the name of a file.
[[noreturn]] void ThrowAs(const char* name,
                          const Utilities::Exceptions::TraceableException& failure);

/// Throws FileError for the file `path` of Python with the reason `error` of the system, and the
/// trace of `failure`, if there is one.
[[noreturn]] void ThrowFileError(int error, const pybind11::object& path,
                                 const Utilities::Exceptions::TraceableException* failure);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_ERRORS_H
