#include "aldermoor/measure/judgement.h"

#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

using Tristim::TristimService;
using Vexdoc::ColorVector;
using Vexdoc::Conditions;
using Vexdoc::Spectrum;

std::string ColorFamily(const Spectrum& spectrum) try {
  CheckViewing(*spectrum.GetConditions());
  const auto reason = [&] {
    return ReasonOfFailure(*spectrum.GetConditions(), "the colour family");
  };
  return Computed(
      [&]() -> std::string {
        // Not by the service, which has one word for violets and for a failure.
        const int family =
            Tristim::Internals::TristimCalculator::GetColorType(Vexdoc::ToHXSpectrum(spectrum));
        if (family < 0) {
          throw MeasureException(reason(), ALDERMOOR_HERE(Aldermoor::Measure::ColorFamily));
        }
        return Tristim::Internals::ColorFamilyName(family);
      },
      reason);
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorFamily)

float MetamerismIndex(const Spectrum& first, const Spectrum& second, const Conditions& conditions,
                      const Conditions& testConditions) try {
  CheckViewing(conditions);
  CheckWords(testConditions, {Tristim::Vocabulary::kIlluminationKey});
  CheckKind(first);
  CheckKind(second);
  const Tristim::HXMeasureConditions test = Vexdoc::ToMeasureConditions(testConditions);
  // Of the test light its name alone is looked at, so that a curve would be lost.
  if (test.GetIllumination().GetIlluminationType() == Tristim::IlluminationType::kUserdefined) {
    throw MeasureException("the metamerism index needs a test light that has a name",
                           ALDERMOOR_HERE(Aldermoor::Measure::MetamerismIndex));
  }
  return Computed(
      [&] {
        return TristimService::GetMetamery(Vexdoc::ToHXSpectrum(first),
                                           Vexdoc::ToHXSpectrum(second),
                                           Vexdoc::ToMeasureConditions(conditions), test);
      },
      [&] { return ReasonOfFailure(conditions, "the metamerism index"); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::MetamerismIndex)

Spectrum SpectrumOfColor(const ColorVector& color) try {
  CheckColor(color);
  return Computed(
      [&] {
        return Vexdoc::ToSpectrum(TristimService::GetSpectrum(Vexdoc::ToHXColorVector(color)));
      },
      [&] {
        return ReasonOfFailure(*color.GetConditions(), "a reflectance spectrum of this colour");
      });
}
ALDERMOOR_FRAME(Aldermoor::Measure::SpectrumOfColor)

}  // namespace Aldermoor::Measure
