#ifndef ALDERMOOR_BENCHMARKS_ARRAYBENCHMARK_H
#define ALDERMOOR_BENCHMARKS_ARRAYBENCHMARK_H

#include "benchmarks/figures.h"
#include "benchmarks/timings.h"

namespace Aldermoor::Benchmarks {

/// Whole arrays through a context, beside a bare reading loop and beside Little CMS.
void RegisterArrayBenchmarks();
/// Figures of them, and of two threads beside one, which are timed here.
Figures ArrayResults(const Timings& timings);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_ARRAYBENCHMARK_H
