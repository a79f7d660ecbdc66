#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER10DEGDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER10DEGDATA_H

#include <array>

/// Colour-matching functions of the CIE 1964 standard observer (10 degrees), dimensionless.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 471> kTenDegreeX;  // 360..830 nm, 1 nm
extern const std::array<float, 471> kTenDegreeY;  // 360..830 nm, 1 nm
extern const std::array<float, 201> kTenDegreeZ;  // 360..560 nm, 1 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_OBSERVER10DEGDATA_H
