#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXSAMPLE_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXSAMPLE_H

#include <list>

#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {

/// A list of spectra, used for the paper white.  The first one stands for the sample under all
/// conditions.
///
/// Ownership: value.
class HXSample {
 public:
  /// Appends the spectra of `other`; returns the new count.
  int AddSample(const HXSample& other);

  /// The first spectrum, whatever the conditions; false if there is none.
  [[nodiscard]] bool GetSpectrum(const HXMeasureConditions& conditions, HXSpectrum& spectrum) const;
  /// Appends a copy; it does not take the place of anything.
  void SetSpectrum(const HXSpectrum& spectrum);

  /// Compares the first spectra; neither sample is empty.
  bool operator==(const HXSample& other) const;

 private:
  std::list<HXSpectrum> spectra_;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXSAMPLE_H
