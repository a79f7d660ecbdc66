#include "aldermoor/measure/paperwhite.h"

#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

using Tristim::Internals::BaseCalculator;
using Tristim::Internals::HXSample;
using Utilities::Tools::SmartPointer;

struct PaperWhite::Former {
  SmartPointer<HXSample> sample;
};

namespace {

const Vexdoc::Spectrum& SpectrumOf(const Vexdoc::Sample& sample) {
  const auto attribute = sample.GetSampleAttribute("VEXSpectrum", Vexdoc::Conditions(), false);
  return dynamic_cast<const Vexdoc::Spectrum&>(*attribute);  // kept by the sample
}

}  // namespace

PaperWhite::PaperWhite(const Vexdoc::Spectrum& paper) try
    : former_(new Former{BaseCalculator::GetPaperWhitePointer()}) {
  const SmartPointer<HXSample> sample(new HXSample);
  Computed([&] { return sample->SetSpectrum(Vexdoc::ToHXSpectrum(paper)); },
           [] { return std::string("the paper white cannot be set"); });
  BaseCalculator::SetPaperWhitePointer(sample);
}
ALDERMOOR_FRAME(Aldermoor::Measure::PaperWhite::PaperWhite)

PaperWhite::PaperWhite(const Vexdoc::Sample& paper) try : PaperWhite(SpectrumOf(paper)) {}
ALDERMOOR_FRAME(Aldermoor::Measure::PaperWhite::PaperWhite)

PaperWhite::~PaperWhite() {
  BaseCalculator::SetPaperWhitePointer(former_->sample);
}

}  // namespace Aldermoor::Measure
