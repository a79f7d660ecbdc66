#ifndef ALDERMOOR_MEASURE_LIGHT_H
#define ALDERMOOR_MEASURE_LIGHT_H

#include <optional>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Measure {

/// Correlated colour temperature of a light in whole kelvin, for the observer of its own
/// conditions, which must say "Emission" under "Colorimetric.Illumination" for a lamp to be read as
/// one. Nothing if there is none: no band is above 0, the light stands beyond the ends of the
/// search (250 K to 999,950 K), or the search does not end at the nearest point of the locus, as
/// for deep reds.
///
/// From 36 bands and in single precision the results of the two-degree observer differ from those
/// of 5 nm tables by a few kelvin, for lamps with emission lines by far more; above about 40,000 K,
/// and below about 1000 K, where the ends of the locus are too short for it, there may be none.
/// Throws: MeasureException for a spectrum without 36 values, and for a light without a temperature
/// under the ten-degree observer, for which the search misses the upper end of the locus: white
/// lights have none.
ALDERMOOR_EXPORT std::optional<float> ColorTemperature(const Vexdoc::Spectrum& light);

/// The general colour rendering index Ra of CIE 13.3-1995 and what it was taken against.
struct ColorRendering {
  float index = 0.0F;     ///< Ra, a whole number, at most 100
  bool valid = false;     ///< whether the light is near enough to its reference to mean anything
  std::string reference;  ///< "D50", "D55", "D65" or "D75"; empty for a black body
};

/// Always for the two-degree observer but for the colour temperature, which uses that of the light.
/// Index 0, not valid, for a light without a colour temperature.
/// Throws: MeasureException for a spectrum without 36 values or whose conditions do not say
/// "Emission" under "Colorimetric.Illumination", and as ColorTemperature.
ALDERMOOR_EXPORT ColorRendering ColorRenderingOf(const Vexdoc::Spectrum& light);

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_LIGHT_H
