#include "aldermoor/tristim/internals/basecalculator.h"

#include <utility>

#include "aldermoor/tristim/internals/neverdestroyed.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

using PaperWhite = Utilities::Tools::SmartPointer<HXSample>;

PaperWhite& CurrentPaperWhite() {
  static NeverDestroyed<PaperWhite> paper_white;
  return paper_white.Get();
}

}  // namespace

bool BaseCalculator::GetPaperSpectrum(const HXMeasureConditions& conditions,
                                      HXSpectrum& paper) try {
  return CurrentPaperWhite() && CurrentPaperWhite()->GetSpectrum(conditions, paper);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::GetPaperSpectrum)

void BaseCalculator::SetPaperWhitePointer(PaperWhite sample) try {
  CurrentPaperWhite() = std::move(sample);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::SetPaperWhitePointer)

PaperWhite BaseCalculator::GetPaperWhitePointer() try { return CurrentPaperWhite(); }
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::GetPaperWhitePointer)

HXSample& BaseCalculator::GetPaperWhite() try { return *CurrentPaperWhite(); }
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::GetPaperWhite)

bool BaseCalculator::IsPaperWhiteValid(const HXMeasureConditions& conditions) try {
  HXSpectrum paper;
  return GetPaperSpectrum(conditions, paper) && paper.IsValid();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::IsPaperWhiteValid)

bool BaseCalculator::GetSpecBasedToPapWhite(HXSpectrum& spectrum) try {
  return GetSpecBasedToPapWhite(spectrum.GetMeasureConditions(), &spectrum[0]);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::GetSpecBasedToPapWhite)

bool BaseCalculator::GetSpecBasedToPapWhite(const HXMeasureConditions& conditions,
                                            float* values) try {
  HXSpectrum paper;
  if (!GetPaperSpectrum(conditions, paper)) {
    return false;
  }
  for (unsigned i = 0; i < HXSpectrum::kBands; ++i) {
    values[i] = values[i] / paper[i];
  }
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::BaseCalculator::GetSpecBasedToPapWhite)

}  // namespace Aldermoor::Tristim::Internals
