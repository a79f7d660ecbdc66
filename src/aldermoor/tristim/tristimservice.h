#ifndef ALDERMOOR_TRISTIM_TRISTIMSERVICE_H
#define ALDERMOOR_TRISTIM_TRISTIMSERVICE_H

#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim {

/// The front of the colorimetry: picks the calculation by its word and turns a failure into an
/// exception.  What the caller gives stays as it is.
///
/// Shared state: every calculation changes the current weights of the process; one thread at a
/// time.
class TristimService {
 public:
  /// The colour of `spectrum` in the colour space that `conditions` name.  An RGB result carries
  /// default conditions: it belongs to no illuminant of the request.
  /// Throws: TristimException if no way leads from a spectrum to that colour space ("CMYK"), if a
  /// table is missing, or if the white base is "Paper" and there is no paper white.
  static HXColorVector GetVector(const HXSpectrum& spectrum, const HXMeasureConditions& conditions);

  /// The same colour in another colour space, under the conditions of `vector`; a colour cannot be
  /// recalculated for another illuminant.  An RGB result has the conditions that its calculation
  /// set.
  /// Throws: TristimException for a pair of colour spaces without a way between them.
  static HXColorVector GetVector(const HXColorVector& vector, const std::string& colorSpace);

  /// Differences of lightness, chroma and hue, `first` minus `second`, for two vectors in the
  /// colour space of `first`: "CIELab", "CIELuv" or "LABhx".  The result is in its polar form.
  /// Throws: TristimException for any other colour space.
  static HXColorVector GetDeltaVector(const HXColorVector& first, const HXColorVector& second);

  /// Colour difference by the formula that `conditions` name.  A weight of 0 stands for the usual
  /// one: l = 2 and c = 1 for "CMC", 1 for each of "94" and "2000"; the others have none.  Where a
  /// formula is not symmetric, `first` is the reference.
  /// Throws: TristimException for an unknown formula, or if there is no result.
  static float GetDeltaE(const HXSpectrum& first, const HXSpectrum& second,
                         const HXMeasureConditions& conditions, float weight1, float weight2,
                         float weight3);
  /// The same for two colours that can be taken to CIELab, by the formula of the first; of the
  /// formulas only "CIELab", "CMC", "94" and "2000".
  static float GetDeltaE(const HXColorVector& first, const HXColorVector& second, float weight1,
                         float weight2, float weight3);

  /// The colour family under the conditions of the spectrum, such as "Olive"; "Undefined" for
  /// violets, which have no word, and without a result.
  static std::string GetColorType(const HXSpectrum& spectrum);

  /// CIELab difference under the illumination of `testConditions` of two samples that are made to
  /// match under `conditions`.  Throws: TristimException if there is no result.
  static float GetMetamery(const HXSpectrum& first, const HXSpectrum& second,
                           const HXMeasureConditions& conditions,
                           const HXMeasureConditions& testConditions);

  /// Correlated colour temperature of a light in whole kelvin; -1 if there is none.
  static float GetColorTemperature(const HXSpectrum& spectrum);

  /// A reflectance spectrum for a colour that can be taken to CIELab, to a difference below 0.1.
  /// Throws: TristimException if none is found.
  static HXSpectrum GetSpectrum(const HXColorVector& vector);

  /// General colour rendering index of a light, and the name of the reference daylight, empty for a
  /// black body.  Returns whether the index means anything.
  static bool GetColorRenderingIndex(const HXSpectrum& source, float& index,
                                     std::string& reference);

  /// As HXMeasureConditions::GetSupportedValues.
  static const std::vector<std::string>& GetSupportedValues(std::string_view key);
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_TRISTIMSERVICE_H
