#ifndef ALDERMOOR_TRISTIM_INTERNALS_STANDARDFILTER_H
#define ALDERMOOR_TRISTIM_INTERNALS_STANDARDFILTER_H

#include <vector>

#include "aldermoor/tristim/hxmeasureconditions.h"

namespace Aldermoor::Tristim::Internals {

/// Chromaticity and component factors of a CIE daylight illuminant.
struct Daylight {
  double x, y;    ///< CIE 1931
  double m1, m2;  ///< factors of S1 and S2, rounded to three decimals
};

/// The daylight of `temperature` (kelvin, on the scale of c2 = 1.4388e-2 m·K).
/// Defined from 4000 K to 25000 K; outside the curve is extrapolated.
/// Precision: double.  Source: CIE 15:2004, clause 3.
Daylight DaylightOf(double temperature) noexcept;

/// A curve on any regular grid: an illuminant or one observer function.
///
/// Grid: value i is at min + i·step, nm.  Scale: illuminants are relative, 100 at 560 nm;
/// observers are dimensionless.
/// Ownership: value; the curve is copied.
class StandardFilter {
 public:
  /// Empty: no values, and all three numbers are 0.
  StandardFilter() = default;
  /// `values` holds (max - min) / step + 1 of them.
  StandardFilter(unsigned short step, unsigned short max_wavelength, unsigned short min_wavelength,
                 std::vector<float> values);

  const float* GetFilter() const { return values_.data(); }
  unsigned short GetMinWavelength() const { return min_wavelength_; }
  unsigned short GetMaxWavelength() const { return max_wavelength_; }
  unsigned short GetStepSize() const { return step_; }

  /// Becomes the user-defined illuminant of `conditions`.
  /// Throws: NullPointerException if they have none.
  void SetUserIllumination(const HXMeasureConditions& conditions);

  /// Becomes the CIE daylight illuminant of the colour temperature in `conditions`, 100 at 560 nm,
  /// 300..830 nm, 5 nm.  The nominal temperature belongs to c2 = 1.438e-2 m·K.
  /// Throws: TristimException for a temperature of 0 or below.
  /// Precision: double, the values rounded to single.  Source: CIE 15:2004, clause 3.
  void SetDxxIllumination(const HXMeasureConditions& conditions);

 private:
  unsigned short step_ = 0;
  unsigned short max_wavelength_ = 0;
  unsigned short min_wavelength_ = 0;
  std::vector<float> values_;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_STANDARDFILTER_H
