#ifndef ALDERMOOR_TRISTIM_INTERNALS_COLORTEMPERATURE_H
#define ALDERMOOR_TRISTIM_INTERNALS_COLORTEMPERATURE_H

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {

/// Correlated colour temperature of a light, and the black-body radiator of a temperature.
///
/// The temperature is where the line from the Planckian locus to the light stands at a right angle
/// to the locus in the CIE 1960 u, v diagram, found by bisection between 250 K and 999,950 K to
/// 0.5 K.  There is no limit on the distance from the locus.
/// Shared state: TristimFilter::Get().  Precision: radiators and angles double, colours single.
/// Source: CIE 15:2004, 9.5; constants of the radiator h 6.6262e-34, k 1.3806e-23, c 2.9979e8.
class ColorTemperature {
 public:
  /// In whole kelvin; -1 if the light is not between the ends of the search, stands exactly on the
  /// locus, or has no chromaticity.  Black has that of equal energy, and so about 5456 K.
  [[nodiscard]] float GetColorTemperature(const HXSpectrum& spectrum) const;
  /// The same, but a light on which the search comes to stand exactly has the temperature of that
  /// point of the locus in place of -1, and one for which it ended far from the nearest point -1:
  /// a black body of 985 K would have 500,108 K.
  [[nodiscard]] float FindColorTemperature(const HXSpectrum& spectrum) const;

  /// Spectral radiance in W per m3 and sr; `temperature` in kelvin.
  HXSpectrum GetPlanckRadiator(float temperature, const HXMeasureConditions& conditions) const;
  /// Its XYZ as emission, Y = 100.
  HXColorVector GetPlanckRadiatorXYZ(float temperature,
                                     const HXMeasureConditions& conditions) const;
  /// Cosine of the angle between the locus at `temperature` and the line from there to the u and v
  /// that `sample` holds in its first two channels.  False if there is none.
  [[nodiscard]] bool GetPlanckianCosine(float temperature, const HXColorVector& sample,
                                        const HXMeasureConditions& conditions,
                                        double& cosine) const;

 private:
  struct Found {
    float temperature;  // -1 for none
    float on_locus;     // of the point where the search ended since the light stands on it, or -1
  };
  Found Search(const HXSpectrum& spectrum) const;

  float minimum_ = 200.0F;      // kelvin
  float maximum_ = 1000000.0F;  // kelvin
  float tolerance_ = 0.5F;      // kelvin
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_COLORTEMPERATURE_H
