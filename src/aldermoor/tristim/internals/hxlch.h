#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXLCH_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXLCH_H

#include "aldermoor/tristim/hxcolorvector.h"

namespace Aldermoor::Tristim::Internals {

/// A colour vector that holds L, C, h; hue, degrees, (0, 360].
class HXLCh : public HXColorVector {
 public:
  HXLCh() = default;
  HXLCh(const HXLCh&) = default;
  HXLCh& operator=(const HXLCh&) = default;
  // NOLINTNEXTLINE(google-explicit-constructor)
  HXLCh(const HXColorVector& vector) : HXColorVector(vector) {}
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXLCH_H
