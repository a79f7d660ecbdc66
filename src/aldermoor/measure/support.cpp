#include "aldermoor/measure/support.h"

#include "aldermoor/measure/words.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

namespace Words = Tristim::Vocabulary;

void CheckWords(const Vexdoc::Conditions& conditions,
                std::initializer_list<std::string_view> keys) {
  const auto& attributes = conditions.GetAttributes();
  for (const std::string_view key : keys) {
    const auto found = attributes.find(std::string(key));
    if (found != attributes.end()) {
      CheckWord(key, found->second);
    }
  }
}

void CheckViewing(const Vexdoc::Conditions& conditions) {
  CheckWords(conditions, {Words::kIlluminationKey, Words::kObserverKey, Words::kWhiteBaseKey});
  if (conditions.GetAttribute(Words::kIlluminationKey, "") != Words::kUserdefined) {
    return;
  }
  const std::string what =
      std::string(Words::kIlluminationKey) + " is \"" + Words::kUserdefined + "\" and ";
  if (!conditions.HasCustomIllumination()) {
    throw MeasureException(what + "there is no custom illumination",
                           ALDERMOOR_HERE(Aldermoor::Measure));
  }
  const std::size_t size = conditions.GetCustomIllumination().GetData().size();
  if (size != Tristim::HXSpectrum::kBands) {
    throw MeasureException(
        what + "the custom illumination has " + std::to_string(size) + " values instead of 36",
        ALDERMOOR_HERE(Aldermoor::Measure));
  }
}

void CheckKind(const Vexdoc::Spectrum& spectrum) {
  CheckWords(*spectrum.GetConditions(), {Words::kIlluminationKey});
}

void CheckColor(const Vexdoc::ColorVector& color) {
  CheckViewing(*color.GetConditions());
  CheckWords(*color.GetConditions(), {Words::kColorSpaceKey});
}

std::string ReasonOfFailure(const Vexdoc::Conditions& conditions, const std::string& what) {
  const Tristim::HXMeasureConditions typed = Vexdoc::ToMeasureConditions(conditions);
  if (typed.GetWhiteBase() == Tristim::WhiteBase::Paper &&
      Tristim::Internals::BaseCalculator::GetPaperWhitePointer().IsNull()) {
    return what + " cannot be computed: " + NoPaperWhite();
  }
  return what + " cannot be computed";
}

}  // namespace Aldermoor::Measure
