#include "aldermoor/tristim/internals/hxdensity.h"

#include <algorithm>
#include <utility>

#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {

HXDensity::HXDensity(float black, float cyan, float magenta, float yellow,
                     const HXMeasureConditions& conditions, int standard, UserFilter userFilter) try
    : densities_{black, cyan, magenta, yellow},
      is_valid_(true),
      user_filter_(std::move(userFilter)),
      standard_(standard),
      conditions_(conditions) {}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::HXDensity::HXDensity)

float HXDensity::operator[](int mode) const {
  switch (static_cast<DensityFilterMode>(mode)) {
    case DensityFilterMode::Auto:
      return ByChannel(DensityCalculator::GetDensityFilter(*this));
    case DensityFilterMode::Max:
      return 0.0F;
    default:
      return ByChannel(mode);
  }
}

void HXDensity::SetAllDensities(const std::vector<float>& values) {
  std::copy_n(values.begin(), std::min(values.size(), densities_.size()), densities_.begin());
  is_valid_ = true;
}

}  // namespace Aldermoor::Tristim::Internals
