#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER2DEGDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER2DEGDATA_H

#include <array>

/// Colour-matching functions of the CIE 1931 standard observer (2 degrees), dimensionless.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 471> kTwoDegreeX;  // 360..830 nm, 1 nm
extern const std::array<float, 471> kTwoDegreeY;  // 360..830 nm, 1 nm
extern const std::array<float, 291> kTwoDegreeZ;  // 360..650 nm, 1 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER2DEGDATA_H
