#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_ILLUMINANTDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_ILLUMINANTDATA_H

#include <array>

/// CIE illuminants, relative spectral power, scaled as published: 100 at 560 nm for A and the D
/// series, 102.80 for B and 105.30 for C.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 531> kIlluminantA;    // 300..830 nm, 1 nm
extern const std::array<float, 91> kIlluminantB;     // 320..770 nm, 5 nm
extern const std::array<float, 97> kIlluminantC;     // 300..780 nm, 5 nm
extern const std::array<float, 107> kIlluminantD50;  // 300..830 nm, 5 nm
extern const std::array<float, 107> kIlluminantD55;  // 300..830 nm, 5 nm
extern const std::array<float, 531> kIlluminantD65;  // 300..830 nm, 1 nm
extern const std::array<float, 107> kIlluminantD75;  // 300..830 nm, 5 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_ILLUMINANTDATA_H
