#ifndef ALDERMOOR_TRISTIM_INTERNALS_WEIGHTFACTORS_H
#define ALDERMOOR_TRISTIM_INTERNALS_WEIGHTFACTORS_H

#include <array>
#include <vector>

#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/internals/standardfilter.h"
#include "aldermoor/tristim/internals/weightmath.h"

namespace Aldermoor::Tristim::Internals {

/// Three tables of weights from an illuminant and an observer: each tristimulus value of a measured
/// spectrum is one dot product with them.
///
/// Grid: one weight a band, 36 from 380 nm.  Scale: Y of the perfect reflector is 100; under
/// emission the weights are the observer times 0.683.
/// Axes: 0, 1, 2 for X, Y, Z.  Ownership: value.  Complete after construction.
/// Precision: single, in the order of weightmath.h.  Source of the method: ASTM E2022.
class Weightfactors {
 public:
  /// No tables, all numbers 0.
  Weightfactors() = default;
  /// Throws: TristimException for an illuminant or observer without a table or for bands that do
  /// not fit; NullPointerException for a user-defined illuminant without a curve.
  explicit Weightfactors(const HXMeasureConditions& conditions);

  /// The weights of an axis.  Throws: TristimException for an axis of 3 or more.
  const float* operator[](unsigned short axis) const;
  /// White point: the sum of the weights for axis 0 and 2, and 100 for axis 1.  0 for other axes.
  float GetFilterSum(unsigned short axis) const;
  /// What brings Y of the perfect reflector to 100.
  float GetKFactor() const { return k_factor_; }

  /// The steps of the construction, in their order; each reads the results of those before.
  void SetInstrumentData(const HXMeasureConditions& conditions);
  void SetObserver(const int& observer);
  void InterpolateIllumination(const HXMeasureConditions& conditions);
  void SetKFactor();
  void CalculateWeightfactors();
  void CalculateSum();

  static QuadraticCoefficients GetLagrange2Coeff(unsigned short step, unsigned short offset);
  static CubicCoefficients GetLagrange3Coeff(unsigned short step, unsigned short offset);
  /// Values at 360 nm, 360 nm + step, ... 780 nm; the curve goes on flat beyond its ends.
  static std::vector<float> AdjustIlluminationVector(const StandardFilter& filter);
  /// Values at 360..780 nm, 1 nm, of a 1 nm curve; 0 beyond its ends.
  static std::vector<float> AdjustObserverVector(const StandardFilter& filter);

  /// These two work on finished weights, on request only; the sums stay.
  /// Source: ASTM E308, spectral bandpass correction.
  void BandpassCorrection();
  /// To three decimals.
  Weightfactors& Round();

 private:
  static constexpr std::size_t kAxes = 3;

  std::vector<float> illumination_;  // empty under emission
  std::array<std::vector<float>, kAxes> observer_;
  float k_factor_ = 0.0F;
  std::array<std::vector<float>, kAxes> weights_;
  MeasureGrid grid_{};
  std::array<float, kAxes> filter_sum_{};
  bool emission_ = false;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_WEIGHTFACTORS_H
