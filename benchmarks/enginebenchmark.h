#ifndef ALDERMOOR_BENCHMARKS_ENGINEBENCHMARK_H
#define ALDERMOOR_BENCHMARKS_ENGINEBENCHMARK_H

#include "benchmarks/figures.h"
#include "benchmarks/timings.h"

namespace Aldermoor::Benchmarks {

/// Registers what the colour engine computes beyond a colour, and Lab and CIEDE2000 beside those of
/// Little CMS.
void RegisterEngineBenchmarks();

/// Times 1,000 reconstructions one by one for their median; the rest comes from `timings`.
Figures EngineResults(const Timings& timings);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_ENGINEBENCHMARK_H
