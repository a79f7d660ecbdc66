#ifndef ALDERMOOR_PYTHON_ERRORS_H
#define ALDERMOOR_PYTHON_ERRORS_H

#include "aldermoor/utilities/exceptions/traceableexception.h"

namespace Aldermoor::Python {

/// Throws `failure` on as the class `name` of aldermoor._errors, with its message and trace.
[[noreturn]] void ThrowAs(const char* name,
                          const Utilities::Exceptions::TraceableException& failure);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_ERRORS_H
