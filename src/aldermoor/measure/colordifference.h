#ifndef ALDERMOOR_MEASURE_COLORDIFFERENCE_H
#define ALDERMOOR_MEASURE_COLORDIFFERENCE_H

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

/// Colorimetry on document classes, for what stands behind no request of a sample.
///
/// Nothing here keeps or changes a document.  Like all colorimetry of the library, the functions
/// use state of the process: one thread at a time.
///
/// A word that colorimetry does not know, in conditions that decide a result, is a MeasureException
/// with the words that would do (words.h), and so is an illumination "Userdefined" without a curve
/// of 36 values.  Requests of a sample put their default in the place of such a word.  A daylight
/// outside 4000 K to 25000 K is extrapolated without a warning (words.h).
namespace Aldermoor::Measure {

/// Weights of a difference formula, in its own order: l and c of "CMC", kL, kC and kH of "94" and
/// "2000".  0 stands for the usual one: 2:1 and 1:1:1.
struct DifferenceWeights {
  float first = 0.0F;
  float second = 0.0F;
  float third = 0.0F;
};

/// Difference of the colours of two spectra under `conditions`, by the formula that they name under
/// "ColorSpaceDescription.DeltaEFormula" ("CIELab" without one).  `first` is the reference where
/// the formula has one: "94", "CMC", "FMCII". Throws: MeasureException with the reason.
ALDERMOOR_EXPORT float ColorDifference(const Vexdoc::Spectrum& first,
                                       const Vexdoc::Spectrum& second,
                                       const Vexdoc::Conditions& conditions,
                                       const DifferenceWeights& weights = {});

/// Difference of two colours that can be taken to CIELab, by the formula that the conditions of the
/// first name: "CIELab", "CMC", "94" or "2000".
/// Throws: MeasureException with the reason.
ALDERMOOR_EXPORT float ColorDifference(const Vexdoc::ColorVector& first,
                                       const Vexdoc::ColorVector& second,
                                       const DifferenceWeights& weights = {});

/// Differences of lightness, chroma and hue, `first` minus `second`, of two colours in "CIELab",
/// "CIELuv" or "LABhx", in the polar form of that space, as a "DeltaVector" with the labels of
/// differences, such as "delta H*".
/// Throws: MeasureException for other colour spaces, and for colours in two.
ALDERMOOR_EXPORT Vexdoc::ColorVector DifferenceVector(const Vexdoc::ColorVector& first,
                                                      const Vexdoc::ColorVector& second);

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_COLORDIFFERENCE_H
