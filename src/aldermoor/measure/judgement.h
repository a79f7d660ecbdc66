#ifndef ALDERMOOR_MEASURE_JUDGEMENT_H
#define ALDERMOOR_MEASURE_JUDGEMENT_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Measure {

/// The colour family of a sample under the illuminant and observer of its own conditions:
/// "Magenta", "Blue", "Cyan", "Turquo", "Green", "Olive", "YellowGreen", "Beige", "Brown",
/// "Yellow", "Orange", "Red", "White", "Gray" or "Black"; "Undefined" for violets, which have no
/// word. Throws: MeasureException with the reason.
ALDERMOOR_EXPORT std::string ColorFamily(const Vexdoc::Spectrum& spectrum);

/// How far two samples drift apart under the illumination of `testConditions` that match under
/// `conditions`, as CIELab difference.  A difference that is there under `conditions` already is
/// divided out of XYZ, so it need not be 0.
/// Throws: MeasureException with the reason, also for a test light "Userdefined".
/// Source: CIE 15:2004, 9.2.
ALDERMOOR_EXPORT float MetamerismIndex(const Vexdoc::Spectrum& first,
                                       const Vexdoc::Spectrum& second,
                                       const Vexdoc::Conditions& conditions,
                                       const Vexdoc::Conditions& testConditions);

/// A reflectance spectrum of 36 values from 0 to 1 for a colour that can be taken to CIELab; its
/// CIELab under the conditions of the colour differs from it by less than 0.1.
///
/// It is one of the many with that colour, not that of any real surface: jagged, since a search
/// moves one band after the other away from a grey of 0.5, and a match under these conditions only.
/// Throws: MeasureException for a colour that no such spectrum has.
ALDERMOOR_EXPORT Vexdoc::Spectrum SpectrumOfColor(const Vexdoc::ColorVector& color);

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_JUDGEMENT_H
