#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_FLUORESCENTDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_FLUORESCENTDATA_H

#include <array>

/// CIE fluorescent illuminants F1 to F12 (also FL1 to FL12), relative spectral power on the scale
/// of the publication.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 81> kIlluminantF1;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF2;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF3;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF4;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF5;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF6;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF7;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF8;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF9;   // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF10;  // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF11;  // 380..780 nm, 5 nm
extern const std::array<float, 81> kIlluminantF12;  // 380..780 nm, 5 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_FLUORESCENTDATA_H
