#include "aldermoor/tristim/internals/hxsample.h"

#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {

int HXSample::AddSample(const HXSample& other) try {
  std::list<HXSpectrum> added = other.spectra_;  // a copy first: `other` may be this sample
  spectra_.splice(spectra_.end(), added);
  return static_cast<int>(spectra_.size());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::HXSample::AddSample)

bool HXSample::GetSpectrum(const HXMeasureConditions&, HXSpectrum& spectrum) const try {
  if (spectra_.empty()) {
    return false;
  }
  spectrum = spectra_.front();
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::HXSample::GetSpectrum)

void HXSample::SetSpectrum(const HXSpectrum& spectrum) try { spectra_.push_back(spectrum); }
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::HXSample::SetSpectrum)

bool HXSample::operator==(const HXSample& other) const try {
  return spectra_.front() == other.spectra_.front();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::HXSample::operator==)

}  // namespace Aldermoor::Tristim::Internals
