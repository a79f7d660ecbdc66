#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXLUV_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXLUV_H

#include "aldermoor/tristim/hxcolorvector.h"

namespace Aldermoor::Tristim::Internals {

/// A colour vector that holds L, u, v.
class HXLuv : public HXColorVector {
 public:
  HXLuv() = default;
  HXLuv(const HXLuv&) = default;
  HXLuv& operator=(const HXLuv&) = default;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXLUV_H
