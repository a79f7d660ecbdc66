#ifndef ALDERMOOR_BENCHMARKS_OUTSIDE_H
#define ALDERMOOR_BENCHMARKS_OUTSIDE_H

#include "benchmarks/figures.h"

namespace Aldermoor::Benchmarks {

/// The figures of outside.py: the Python package beside NumPy, start and import.
/// Throws: std::runtime_error if the script fails.
Figures OutsideResults();

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_OUTSIDE_H
