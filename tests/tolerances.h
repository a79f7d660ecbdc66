#ifndef ALDERMOOR_TESTS_TOLERANCES_H
#define ALDERMOOR_TESTS_TOLERANCES_H

#include <cmath>

#include <gtest/gtest.h>

/// How far a result may be from an outside figure, each with its reason.
namespace Aldermoor::Tests {

/// A table entry is the float nearest to the published decimal: half a unit of the last of 24 bits.
inline constexpr double kFloatRounding = 1.0 / (1 << 24);

/// White points are published to three decimals: half a unit, and 1e-4 for a sum in single
/// precision.
inline constexpr double kWhitePoint = 0.0006;

/// White points cited from ASTM E308 are sums of weights rounded to three decimals one by one,
/// which may add up to some units of the third decimal.  Set after the worst row here, Z of F7 with
/// 0.0074; all others are within 0.005.
inline constexpr double kPublishedWhitePoint = 0.008;

/// Weights of Y add up to 100 but for 36 roundings in single precision.
inline constexpr double kWeightSum = 0.0002;

/// Chromaticities of A to D75 come from sums at 5 nm.  Publications differ by up to 3 in the fifth
/// decimal; this system interpolates to 1 nm.
inline constexpr double kChromaticityFiveDigits = 3e-5;

/// Chromaticities of F1 to F12 are published to four decimals: half a unit, and 1e-5 for the
/// interpolation from 5 nm to 1 nm between emission lines.
inline constexpr double kChromaticityFourDigits = 6e-5;

/// Half a unit of the last decimal of a daylight table, and as much again since the published
/// factors of S1 and S2 come from chromaticities with fewer digits.
inline constexpr double kDaylightTable = 0.01;

/// Mean chromaticities of the chart are published to four decimals; the spectra of the mean carry
/// five.  One unit of the last decimal.
inline constexpr double kChartChromaticity = 1e-4;
/// Y is published to two decimals; half a unit, and 0.003 for weights from 1 nm in place of a sum
/// over 10 nm.
inline constexpr double kChartLuminance = 0.008;
/// The same in CIELAB, where dark patches magnify the rounding of the published figures.
inline constexpr double kChartLab = 0.04;

/// Formulas in single precision against the same figures in double: a few units of the seventh
/// digit of intermediate values around 500.
inline constexpr double kSinglePrecisionFormula = 1e-4;

/// Whether `actual` is `expected`; the text of a failure tells the difference in units of the
/// tolerance.
inline ::testing::AssertionResult Within(double actual, double expected, double tolerance) {
  const double difference = std::abs(actual - expected);
  if (difference <= tolerance) {
    return ::testing::AssertionSuccess();
  }
  return ::testing::AssertionFailure()
         << "value " << actual << ", expected " << expected << ", difference " << difference
         << ", that is " << difference / tolerance << " times the tolerance";
}

}  // namespace Aldermoor::Tests

#endif  // ALDERMOOR_TESTS_TOLERANCES_H
