#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_DENSITYDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_DENSITYDATA_H

#include <array>

/// Filter curves of the density standards; a band outside a curve is 0.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<float, 34> kDensityVisual;        // 400..730 nm, 10 nm
extern const std::array<float, 7> kDensityDin;            // 10 nm, around the centre of the filter
extern const std::array<float, 16> kDensityAnsiaCyan;     // 580..730 nm, 10 nm
extern const std::array<float, 14> kDensityAnsiaMagenta;  // 480..610 nm, 10 nm
extern const std::array<float, 12> kDensityAnsiaYellow;   // 400..510 nm, 10 nm
extern const std::array<float, 20> kDensityAnsieCyan;     // 540..730 nm, 10 nm
extern const std::array<float, 18> kDensityAnsieMagenta;  // 460..630 nm, 10 nm
extern const std::array<float, 17> kDensityAnsieYellow;   // 380..540 nm, 10 nm
extern const std::array<float, 6> kDensityAnsiiCyan;      // 600..650 nm, 10 nm
extern const std::array<float, 6> kDensityAnsiiMagenta;   // 510..560 nm, 10 nm
extern const std::array<float, 7> kDensityAnsiiYellow;    // 400..460 nm, 10 nm
extern const std::array<float, 18> kDensityAnsitMagenta;  // 460..630 nm, 10 nm
extern const std::array<float, 20> kDensityAnsitYellow;   // 380..570 nm, 10 nm
extern const std::array<float, 8> kDensitySpiCyan;        // 590..660 nm, 10 nm
extern const std::array<float, 8> kDensitySpiMagenta;     // 500..570 nm, 10 nm
extern const std::array<float, 9> kDensitySpiYellow;      // 390..470 nm, 10 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_DENSITYDATA_H
