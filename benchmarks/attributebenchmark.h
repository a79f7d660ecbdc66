#ifndef ALDERMOOR_BENCHMARKS_ATTRIBUTEBENCHMARK_H
#define ALDERMOOR_BENCHMARKS_ATTRIBUTEBENCHMARK_H

#include "benchmarks/figures.h"
#include "benchmarks/timings.h"

namespace Aldermoor::Benchmarks {

/// Registers the request for a colour that must be computed from a spectrum, and each of its steps.
void RegisterAttributeBenchmarks();

Figures AttributeResults(const Timings& timings);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_ATTRIBUTEBENCHMARK_H
