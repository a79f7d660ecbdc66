#ifndef ALDERMOOR_TRISTIM_INTERNALS_DENSITYFILTER_H
#define ALDERMOOR_TRISTIM_INTERNALS_DENSITYFILTER_H

#include <array>

#include "aldermoor/tristim/internals/densitymath.h"
#include "aldermoor/tristim/internals/filter.h"

namespace Aldermoor::Tristim::Internals {

/// The four filter curves of a density standard: black (visual), cyan, magenta, yellow.
///
/// Standards: the numbers of DensityStandard; -1, and any other number, has four zero curves.
/// Shared state: the user-defined curves of the process, zero at load, without a lock.
class DensityFilter {
 public:
  /// Standard -1.
  DensityFilter() = default;
  explicit DensityFilter(int standard) { SetDensityStandard(standard); }

  /// Rebuilds the curves if the standard is another one.  So user-defined curves that were changed
  /// while they are in force take effect after another standard was selected in between.
  void SetDensityStandard(int standard);
  int GetDensityStandard() const { return standard_; }
  /// Not checked; `channel` is 0..3.
  const Filter& operator[](unsigned short channel) const { return filters_[channel]; }
  DensityWeights GetWeights() const;

  /// Sets all user-defined values to 1.
  static void SetUserDensityStandardToDefault();
  /// The 36 user-defined values of a channel, 0..3.
  static const float* GetUserDefinedFilter(int channel);
  /// Copies 36 values.
  static void SetUserDefinedFilter(const float* values, int channel);

 private:
  void SetFilterTables(int standard);

  std::array<Filter, 4> filters_;
  int standard_ = -1;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DENSITYFILTER_H
