#ifndef ALDERMOOR_TRISTIM_INTERNALS_BASECALCULATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_BASECALCULATOR_H

#include "aldermoor/tristim/internals/hxsample.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Tristim::Internals {

/// Holds the paper white, to which values of the white base "Paper" refer, and divides by it.
///
/// Shared state: the paper white, one for the process, empty at load.  While there is none, a
/// division ends in false and the spectrum stays as it was.
class BaseCalculator {
 public:
  static void SetPaperWhitePointer(Utilities::Tools::SmartPointer<HXSample> sample);
  /// Empty if there is none.
  static Utilities::Tools::SmartPointer<HXSample> GetPaperWhitePointer();
  /// Throws: NullPointerException without a paper white.
  static HXSample& GetPaperWhite();

  /// Whether there is a paper white with any value above 0.
  [[nodiscard]] static bool IsPaperWhiteValid(const HXMeasureConditions& conditions);

  /// The spectrum of the paper white; false if there is none.
  [[nodiscard]] static bool GetPaperSpectrum(const HXMeasureConditions& conditions,
                                             HXSpectrum& paper);

  /// Divides by the paper white band by band.  A band in which that is 0 becomes an infinity or
  /// a NaN.
  [[nodiscard]] static bool GetSpecBasedToPapWhite(HXSpectrum& spectrum);
  /// The same for 36 values.
  [[nodiscard]] static bool GetSpecBasedToPapWhite(const HXMeasureConditions& conditions,
                                                   float* values);
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_BASECALCULATOR_H
