#ifndef ALDERMOOR_MEASURE_DENSITYSUPPORT_H
#define ALDERMOOR_MEASURE_DENSITYSUPPORT_H

#include "aldermoor/measure/density.h"
#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

/// What the functions on densities share; not installed.
namespace Aldermoor::Measure {

/// The numbers of colorimetry, which does not check them.
/// Throws: MeasureException for a value that the enumeration does not have.
int NumberOf(DensityStandard standard);
int NumberOf(DensityMode mode);
int NumberOf(DensityChannel channel);

/// Throws: MeasureException if the physical filter, whose calibration is put on, is none.
inline void CheckFilter(const Vexdoc::Spectrum& spectrum) {
  CheckWords(*spectrum.GetConditions(), {Tristim::Vocabulary::kFilterKey});
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
