#include "aldermoor/measure/support.h"

#include <algorithm>

#include "aldermoor/measure/words.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/conditionkeys.h"

namespace Aldermoor::Measure {

namespace Words = Tristim::Vocabulary;

void CheckWords(const Vexdoc::Conditions& conditions,
                std::initializer_list<std::string_view> keys) {
  // One walk over the few attributes is quicker than a string for each look-up.
  for (const auto& [key, word] : conditions.GetAttributes()) {
    if (std::ranges::find(keys, std::string_view(key)) != keys.end()) {
      CheckWord(key, word);
    }
  }
}

void CheckViewing(const Vexdoc::Conditions& conditions) {
  CheckWords(conditions, {Words::kIlluminationKey, Words::kObserverKey, Words::kWhiteBaseKey});
  const auto& attributes = conditions.GetAttributes();
  const auto illumination = attributes.find(Vexdoc::ConditionKeys::kIllumination);
  if (illumination == attributes.end() || illumination->second != Words::kUserdefined) {
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
