#include "aldermoor/measure/colordifference.h"

#include <string>
#include <utility>
#include <vector>

#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

namespace Words = Tristim::Vocabulary;

using Tristim::TristimService;
using Vexdoc::ColorVector;
using Vexdoc::Conditions;
using Vexdoc::Spectrum;

namespace {

std::string WhatFailed(const Tristim::HXMeasureConditions& conditions) {
  return "the colour difference \"" + conditions.GetDeltaEFormula() + "\"";
}

/// With the conditions and the labels of differences: hue is told apart from a difference of hues.
ColorVector Labelled(const Tristim::HXColorVector& difference) {
  Tristim::HXMeasureConditions conditions = difference.GetMeasureConditions();
  conditions.SetMeasureCondition(Words::kVectorKindKey, Words::kDeltaVector);
  std::vector<std::pair<std::string, float>> channels;
  for (unsigned short i = 0; i < 3; ++i) {
    channels.emplace_back(conditions.GetElementName(i), difference[static_cast<short>(i)]);
  }
  return {Vexdoc::ToConditions(conditions), channels};
}

}  // namespace

float ColorDifference(const Spectrum& first, const Spectrum& second, const Conditions& conditions,
                      const DifferenceWeights& weights) try {
  CheckViewing(conditions);
  CheckWords(conditions, {Words::kDeltaEFormulaKey});
  CheckKind(first);
  CheckKind(second);
  const Tristim::HXMeasureConditions typed = Vexdoc::ToMeasureConditions(conditions);
  return Computed(
      [&] {
        return TristimService::GetDeltaE(Vexdoc::ToHXSpectrum(first), Vexdoc::ToHXSpectrum(second),
                                         typed, weights.first, weights.second, weights.third);
      },
      [&] { return ReasonOfFailure(conditions, WhatFailed(typed)); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorDifference)

float ColorDifference(const ColorVector& first, const ColorVector& second,
                      const DifferenceWeights& weights) try {
  CheckColor(first);
  CheckColor(second);
  CheckWords(*first.GetConditions(), {Words::kDeltaEFormulaKey});
  const Tristim::HXColorVector reference = Vexdoc::ToHXColorVector(first);
  return Computed(
      [&] {
        return TristimService::GetDeltaE(reference, Vexdoc::ToHXColorVector(second), weights.first,
                                         weights.second, weights.third);
      },
      [&] {
        return WhatFailed(reference.GetMeasureConditions()) + " of two colours cannot be computed";
      });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorDifference)

ColorVector DifferenceVector(const ColorVector& first, const ColorVector& second) try {
  CheckColor(first);
  CheckColor(second);
  const Tristim::HXColorVector reference = Vexdoc::ToHXColorVector(first);
  const Tristim::HXColorVector other = Vexdoc::ToHXColorVector(second);
  const std::string& space = reference.GetMeasureConditions().GetColorSpace();
  const std::string& other_space = other.GetMeasureConditions().GetColorSpace();
  if (space != other_space) {
    throw MeasureException("there is no difference vector of a colour in \"" + space +
                               "\" and one in \"" + other_space + "\"",
                           ALDERMOOR_HERE(Aldermoor::Measure::DifferenceVector));
  }
  return Computed(
      [&] { return Labelled(TristimService::GetDeltaVector(reference, other)); },
      [&] { return "there is no difference vector in the colour space \"" + space + "\""; });
}
ALDERMOOR_FRAME(Aldermoor::Measure::DifferenceVector)

}  // namespace Aldermoor::Measure
