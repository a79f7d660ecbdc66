#ifndef ALDERMOOR_TESTS_TRISTIM_SUPPORT_H
#define ALDERMOOR_TESTS_TRISTIM_SUPPORT_H

#include <array>
#include <string>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/vocabulary.h"

#include "tests/tolerances.h"
#include "tests/utilities/messageof.h"

namespace Aldermoor::Tristim::Tests {

using Aldermoor::Tests::MessageOf;

inline HXMeasureConditions Conditions(const std::string& illumination,
                                      const std::string& observer = "TwoDegree",
                                      const std::string& color_space = "CIELab") {
  HXMeasureConditions conditions;
  conditions.SetMeasureCondition(Vocabulary::kIlluminationKey, illumination);
  conditions.SetMeasureCondition(Vocabulary::kObserverKey, observer);
  conditions.SetMeasureCondition(Vocabulary::kColorSpaceKey, color_space);
  return conditions;
}

inline HXMeasureConditions InSpace(const std::string& color_space) {
  return Conditions("D65", "TwoDegree", color_space);
}

inline HXSpectrum Flat(float value, const HXMeasureConditions& conditions = {}) {
  HXSpectrum::Bands bands;
  bands.fill(value);
  return HXSpectrum(bands.data(), conditions);
}

inline double Widen(float value) {
  return static_cast<double>(value);
}

inline ::testing::AssertionResult Near(float actual, double expected, double tolerance) {
  return Aldermoor::Tests::Within(Widen(actual), expected, tolerance);
}

/// Of the first three channels.
template <std::size_t N>
void ExpectNear(const std::array<float, N>& actual, const std::array<double, 3>& expected,
                double tolerance = Aldermoor::Tests::kSinglePrecisionFormula) {
  for (std::size_t i = 0; i < 3; ++i) {
    EXPECT_TRUE(Near(actual[i], expected[i], tolerance)) << "channel " << i;
  }
}

}  // namespace Aldermoor::Tristim::Tests

#endif  // ALDERMOOR_TESTS_TRISTIM_SUPPORT_H
