#ifndef ALDERMOOR_TRISTIM_INTERNALS_DATA_TESTCOLORDATA_H
#define ALDERMOOR_TRISTIM_INTERNALS_DATA_TESTCOLORDATA_H

#include <array>

/// The test colours of the colour rendering index.
namespace Aldermoor::Tristim::Internals::Data {

extern const std::array<std::array<float, 36>, 8> kTestColors;  // 380..730 nm, 10 nm

}  // namespace Aldermoor::Tristim::Internals::Data

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DATA_TESTCOLORDATA_H
