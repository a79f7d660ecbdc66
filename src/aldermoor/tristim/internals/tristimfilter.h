#ifndef ALDERMOOR_TRISTIM_INTERNALS_TRISTIMFILTER_H
#define ALDERMOOR_TRISTIM_INTERNALS_TRISTIMFILTER_H

#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/internals/standardfilter.h"
#include "aldermoor/tristim/internals/weightfactors.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Tristim::Internals {

/// Hands out the standard tables, and keeps the weights of the current conditions, so that one
/// spectrum after the other can be computed under the same illuminant and observer.
///
/// Shared state: Get() is the one object of the process that all calculators use.  They call
/// SetMeasuringConditions and then read; whoever calls it in between changes what they read.
class TristimFilter {
 public:
  /// The object of the process; never destroyed.
  static TristimFilter& Get();

  /// Builds the weights, unless illumination, observer and user-defined curve (the object, not its
  /// values) are those of the last time.
  /// Throws: what building the weights throws, std::bad_alloc; the old ones then stay, with the
  /// conditions that are theirs.
  void SetMeasuringConditions(const HXMeasureConditions& conditions);

  /// White point: X, 100, Z for axis 0, 1, 2.  0 for other axes, and before the first conditions.
  float GetFilterSum(unsigned short axis) const;
  /// The 36 weights of axis 0, 1, 2.
  /// Throws: TristimException for another axis, NullPointerException before the first conditions.
  const float* operator[](unsigned short axis) const;

  /// The table of an illuminant, also of the daylight components (types 14 to 16).
  /// Throws: TristimException for a type without a table, and for a fluorescent number outside
  /// 1..12.
  static StandardFilter GetIlluFilter(const HXIllumination& illumination);
  /// A colour-matching function: observer 0 or 1, axis 0..2.
  /// Throws: TristimException for any other.
  static StandardFilter GetObserverFilter(const int& observer, unsigned short axis);

 private:
  Utilities::Tools::SmartPointer<Weightfactors> weightfactors_;
  Utilities::Tools::SmartPointer<HXMeasureConditions> conditions_;  // of the weights
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_TRISTIMFILTER_H
