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

  /// As HXMeasureConditions::GetSupportedValues.
  static const std::vector<std::string>& GetSupportedValues(std::string_view key);
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_TRISTIMSERVICE_H
