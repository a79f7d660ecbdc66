#ifndef ALDERMOOR_VEXDOC_INTERNALS_LOADNOTES_H
#define ALDERMOOR_VEXDOC_INTERNALS_LOADNOTES_H

#include <set>
#include <string>
#include <unordered_map>
#include <vector>

#include "aldermoor/vexdoc/internals/wavelengths.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc::Internals {

/// How a loader reads what the document model does not hold.
struct LoadRules {
  /// Elements keep the time of their making where the file has no dates; else they have none.
  bool gives_dates = true;
  /// Spectra may have another number of points than their conditions say.
  bool takes_any_count = false;
};

/// What a loader noticed and the document does not hold.
class LoadNotes {
 public:
  void AddSpectrum(const Spectrum& spectrum, Ruler ruler);
  /// `conditions` are those of the block that holds the illuminant.
  void AddIllumination(const std::string& id, const Ruler& ruler, const Conditions& conditions);
  void AddGivenDate() { gave_dates_ = true; }

  /// Whether a document that was read so says what its file says: no wavelengths other than those
  /// of the conditions, no dates of the load.
  bool IsExact(const VEX& document) const;

  /// Does with `document`, from which these notes are, as `options` say.
  /// Throws: WavelengthException.
  void Settle(VEX& document, const LoadOptions& options, LoadReport& report) const;

 private:
  void TakeRanges(const VEX& document, LoadReport& report) const;
  // Returns whether the points of all that it finds could give the range.
  bool FindContradictions(const VEX& document, const LoadOptions& options,
                          LoadReport& report) const;
  // Calls `visit(set, sample, spectrum, points)`.
  template <class Visit>
  void ForEachSpectrum(const VEX& document, Visit visit) const;

  std::set<Wavelengths> rulers_;  // the few that are different
  std::unordered_map<const SampleAttribute*, const Wavelengths*> points_;
  const Wavelengths* last_ = nullptr;
  std::unordered_map<const SampleAttribute*, std::string> misread_;
  std::vector<LoadReport::Contradiction> illuminations_;
  bool gave_dates_ = false;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_LOADNOTES_H
