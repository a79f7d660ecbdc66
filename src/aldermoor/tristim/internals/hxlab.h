#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXLAB_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXLAB_H

#include "aldermoor/tristim/hxcolorvector.h"

namespace Aldermoor::Tristim::Internals {

/// A colour vector that holds L*, a*, b* (or another rectangular triple of that kind).
class HXLab : public HXColorVector {
 public:
  HXLab() = default;
  HXLab(const HXLab&) = default;
  HXLab& operator=(const HXLab&) = default;
  // NOLINTNEXTLINE(google-explicit-constructor)
  HXLab(const HXColorVector& vector) : HXColorVector(vector) {}
  HXLab& operator=(const HXColorVector& vector) {
    HXColorVector::operator=(vector);
    return *this;
  }
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXLAB_H
