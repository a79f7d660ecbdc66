#ifndef ALDERMOOR_TESTS_TRISTIM_SUPPORT_H
#define ALDERMOOR_TESTS_TRISTIM_SUPPORT_H

#include <string>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/vocabulary.h"

namespace Aldermoor::Tristim::Tests {

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

/// The message of the exception of type `E` that `action` throws; other types pass through.
template <class E, class Action>
std::string MessageOf(Action action) {
  try {
    action();
  } catch (const E& e) {
    return e.what();
  }
  return "nothing was thrown";
}

}  // namespace Aldermoor::Tristim::Tests

#endif  // ALDERMOOR_TESTS_TRISTIM_SUPPORT_H
