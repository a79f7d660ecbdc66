#ifndef ALDERMOOR_TRISTIM_INTERNALS_COLORRENDERINGCALCULATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_COLORRENDERINGCALCULATOR_H

#include <string>

#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {

/// General colour rendering index Ra of a light.
///
/// Reference: below 5000 K the Planckian radiator of the light's temperature, from there on the
/// nearest of D50, D55, D65 and D75.  Always for the two-degree observer.
/// Shared state: TristimFilter::Get().  Precision: colours single, adaptation and differences
/// double.  Source: CIE 13.3-1995, with bands of 10 nm and the four daylights as said.
class ColorRenderingCalculator {
 public:
  /// A whole number, at most 100; it can be negative.
  ///
  /// `valid`: whether the light is near enough to its reference, 0.0054 in u, v, to mean anything.
  /// `reference`: the name of the daylight, empty for a radiator.  Without a colour temperature or
  /// a reference the index is 0, not valid, the name empty.
  double GetColorRenderingIndex(const HXSpectrum& source, bool& valid,
                                std::string& reference) const;
  /// The same for a source whose colour temperature is `kelvin`; 0 or below for none.
  double GetColorRenderingIndex(const HXSpectrum& source, float kelvin, bool& valid,
                                std::string& reference) const;

 private:
  double tolerance_ = 0.0054;
  int samples_ = 8;
  int daylights_ = 4;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_COLORRENDERINGCALCULATOR_H
