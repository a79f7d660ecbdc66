#include "aldermoor/measure/support.h"

#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

std::string ReasonOfFailure(const Vexdoc::Conditions& conditions, const std::string& what) {
  const Tristim::HXMeasureConditions typed = Vexdoc::ToMeasureConditions(conditions);
  if (typed.GetWhiteBase() == Tristim::WhiteBase::Paper &&
      Tristim::Internals::BaseCalculator::GetPaperWhitePointer().IsNull()) {
    return what + " cannot be computed: " + NoPaperWhite();
  }
  return what + " cannot be computed";
}

}  // namespace Aldermoor::Measure
