#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_DAYLIGHTDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_DAYLIGHTDATA_H

#include <array>

/// Components of CIE daylight, relative spectral power: S0 is the mean, 100 at 560 nm; S1 and S2
/// are 0 there.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 107> kDaylightS0;  // 300..830 nm, 5 nm
extern const std::array<float, 107> kDaylightS1;  // 300..830 nm, 5 nm
extern const std::array<float, 107> kDaylightS2;  // 300..830 nm, 5 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_DAYLIGHTDATA_H
