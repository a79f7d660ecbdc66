#ifndef ALDERMOOR_PYTHON_ERRORS_H
#define ALDERMOOR_PYTHON_ERRORS_H

#include <vector>

#include <pybind11/pybind11.h>

#include "aldermoor/utilities/exceptions/traceableexception.h"
#include "aldermoor/vexdoc/inspection.h"

namespace Aldermoor::Python {

/// Throws `failure` on as the class `name` of aldermoor._errors, with its message and trace, and
/// the place in the text, but not the name of a file.
[[noreturn]] void ThrowAs(const char* name,
                          const Utilities::Exceptions::TraceableException& failure);

/// Throws SaveError with the faults of the document.
[[noreturn]] void ThrowSaveError(const Vexdoc::UnsavableDocumentException& failure);

/// The faults as Fault of aldermoor._results.  Bytes that are no UTF-8 are replaced.
pybind11::list ToFaults(const std::vector<Vexdoc::DocumentFault>& faults);

/// Throws FileError for the file `path` of Python with the reason `error` of the system, and the
/// trace of `failure`, if there is one.
[[noreturn]] void ThrowFileError(int error, const pybind11::object& path,
                                 const Utilities::Exceptions::TraceableException* failure);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_ERRORS_H
