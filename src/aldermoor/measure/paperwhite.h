#ifndef ALDERMOOR_MEASURE_PAPERWHITE_H
#define ALDERMOOR_MEASURE_PAPERWHITE_H

#include <memory>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Measure {

/// The paper to which values of the white base "Paper" and densities relative to paper refer, from
/// construction to the end of the scope; then the former one is back.
///
/// Shared state: the paper white of the process.  Scopes nest and must not overlap otherwise.
class ALDERMOOR_EXPORT PaperWhite {
 public:
  /// Throws: MeasureException for a spectrum without 36 values.
  explicit PaperWhite(const Vexdoc::Spectrum& paper);
  /// The first spectrum of the sample.
  /// Throws: ResourceNotAvailableException if it has none; MeasureException.
  explicit PaperWhite(const Vexdoc::Sample& paper);
  PaperWhite(const PaperWhite&) = delete;
  PaperWhite& operator=(const PaperWhite&) = delete;
  ~PaperWhite();

 private:
  struct Former;
  std::unique_ptr<Former> former_;
};

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_PAPERWHITE_H
