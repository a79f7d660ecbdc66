#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXXYZ_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXXYZ_H

#include "aldermoor/tristim/hxcolorvector.h"

namespace Aldermoor::Tristim::Internals {

/// A colour vector that holds X, Y, Z, 0..about 100.
class HXXYZ : public HXColorVector {
 public:
  HXXYZ() = default;
  HXXYZ(const HXXYZ&) = default;
  HXXYZ& operator=(const HXXYZ&) = default;
  // NOLINTNEXTLINE(google-explicit-constructor)
  HXXYZ(const HXColorVector& vector) : HXColorVector(vector) {}
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXXYZ_H
