#ifndef ALDERMOOR_TRISTIM_INTERNALS_LAB2SPEC_H
#define ALDERMOOR_TRISTIM_INTERNALS_LAB2SPEC_H

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {

/// Makes a reflectance spectrum for a colour: 36 values from 0 to 1 whose colour under the
/// conditions of the colour is as near to it as is asked for.  Of the many that fit, it is the one
/// to which a greedy iteration leads from a grey of 0.5, moving one band at a time.
///
/// Shared state: TristimFilter::Get() and the paper white.
class Lab2Spec {
 public:
  /// Whether a colour difference below `maxDeltaE` was reached in at most `maxIterations` steps.
  /// `spectrum` is written in any case but for a missing paper white.
  [[nodiscard]] bool GetSpectrum(const HXColorVector& lab, HXSpectrum& spectrum, double maxDeltaE,
                                 bool useDeltaE94, int maxIterations) const;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_LAB2SPEC_H
