#ifndef ALDERMOOR_MEASURE_DENSITYSUPPORT_H
#define ALDERMOOR_MEASURE_DENSITYSUPPORT_H

#include "aldermoor/measure/density.h"
#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

/// What the functions on densities share; not installed.
namespace Aldermoor::Measure {

template <class Enum>
int NumberOf(Enum value) {
  return static_cast<int>(value);
}

/// Runs `compute`, whose only cause of false is a missing paper white.
template <class Compute>
void Require(Compute compute) {
  const auto reason = [] {
    return std::string("densities relative to paper cannot be computed: ") + kNoPaperWhite;
  };
  if (!Computed(compute, reason)) {
    throw MeasureException(reason(), ALDERMOOR_HERE(Aldermoor::Measure));
  }
}

/// Makes the next density build its filter anew.
inline void ForgetActiveFilter() {
  Tristim::Internals::DensityCalculator::GetActDensityStdFilter().SetDensityStandard(-1);
}

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_DENSITYSUPPORT_H
