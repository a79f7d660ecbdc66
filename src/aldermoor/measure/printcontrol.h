#ifndef ALDERMOOR_MEASURE_PRINTCONTROL_H
#define ALDERMOOR_MEASURE_PRINTCONTROL_H

#include <array>

#include "aldermoor/export.h"
#include "aldermoor/measure/density.h"
#include "aldermoor/vexdoc/spectrum.h"

/// Print control from reflectance spectra of 36 values.  Results are fractions, 1 = 100 %, where
/// nothing else is said.
/// Throws: MeasureException for another length, without a paper white where one is needed, for a
/// value that its enumeration does not have, and, where the calibration is put on, for an unknown
/// word under "Physical.Filter".
namespace Aldermoor::Measure {

/// Dot area by Murray and Davies, with a Yule-Nielsen factor other than 1 by Yule and Nielsen.
/// Needs a paper white; uncalibrated.  0 for a solid of next to no density.
/// Throws: MeasureException also for a factor that is not above 0 or not finite.
/// Source: ISO 12647-1.
ALDERMOOR_EXPORT float DotArea(const Vexdoc::Spectrum& solid, const Vexdoc::Spectrum& tint,
                               DensityMode mode, DensityStandard standard,
                               float yule_nielsen = 1.0F);

/// Print contrast; calibrated.  Mode "Max" needs a paper white.  0 for a solid of next to no
/// density.  Source: ISO 12647-1.
ALDERMOOR_EXPORT float PrintContrast(const Vexdoc::Spectrum& solid, const Vexdoc::Spectrum& tint,
                                     DensityMode mode, const DensityOptions& options);

/// Apparent trapping by Preucil; `first` is printed first.  Needs a paper white; uncalibrated.
/// 1 for a second ink of next to no density.
ALDERMOOR_EXPORT float Trapping(const Vexdoc::Spectrum& first, const Vexdoc::Spectrum& second,
                                const Vexdoc::Spectrum& overprint, DensityMode mode,
                                DensityStandard standard);

/// Preucil's greyness and hue error of an ink, calibrated.  Greyness is 1 and hue error 0 for an
/// ink of next to no density; the hue error of three equal densities is no number.
ALDERMOOR_EXPORT float Greyness(const Vexdoc::Spectrum& spectrum, const DensityOptions& options);
ALDERMOOR_EXPORT float HueError(const Vexdoc::Spectrum& spectrum, const DensityOptions& options);

/// What a printed field is.
enum class FieldKind {
  None,       ///< no nominal tone fits
  Tint,       ///< of a channel, at a nominal tone
  Solid,      ///< of a channel
  Overprint,  ///< of two or three inks
};

struct ColorField {
  FieldKind kind = FieldKind::None;
  /// Of a tint or solid; of an overprint the one with the lowest density among cyan and magenta,
  /// else yellow.
  DensityChannel channel = DensityChannel::Black;
  int tone = 0;           ///< of a tint: 1 to 3
  float dot_gain = 0.0F;  ///< of a tint: measured minus nominal tone value, percent points
  Densities densities;    ///< of the field, relative to paper, uncalibrated
};

/// Recognises a field of a control strip.
///
/// `solids`: the densities of the solids, in the order of the channels.  `tones`: the nominal tone
/// values in percent; one of 100 or above takes no part.  Needs a paper white.
ALDERMOOR_EXPORT ColorField RecognizeField(const Vexdoc::Spectrum& spectrum,
                                           const std::array<Densities, 4>& solids,
                                           const std::array<float, 3>& tones,
                                           DensityStandard standard);

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_PRINTCONTROL_H
