#ifndef ALDERMOOR_PYTHON_MODULE_H
#define ALDERMOOR_PYTHON_MODULE_H

#include <pybind11/pybind11.h>

namespace Aldermoor::Python {

/// What each file adds to the module.
void AddErrors();
void AddDocuments(pybind11::module_& module);
void AddArrays(pybind11::module_& module);
void AddSingles(pybind11::module_& module);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_MODULE_H
