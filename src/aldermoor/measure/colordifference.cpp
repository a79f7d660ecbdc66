#include "aldermoor/measure/colordifference.h"

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
  return Computed(
      [&] {
        return *Vexdoc::ToColorVector(
            TristimService::GetDeltaVector(reference, Vexdoc::ToHXColorVector(second)));
      },
      [&] {
        return "there is no difference vector in the colour space \"" +
               reference.GetMeasureConditions().GetColorSpace() + "\"";
      });
}
ALDERMOOR_FRAME(Aldermoor::Measure::DifferenceVector)

}  // namespace Aldermoor::Measure
