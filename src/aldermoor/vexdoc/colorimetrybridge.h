#ifndef ALDERMOOR_VEXDOC_COLORIMETRYBRIDGE_H
#define ALDERMOOR_VEXDOC_COLORIMETRYBRIDGE_H

#include <string>
#include <vector>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/colorscheme.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Tristim {
class HXColorVector;
class HXMeasureConditions;
class HXSpectrum;
}  // namespace Aldermoor::Tristim

/// The one place where document classes, which hold words, meet colorimetry, which holds types.
namespace Aldermoor::Vexdoc {

/// Whether `color_space` is a word that colorimetry takes: one of the 14 colour spaces, or the
/// word for none, "Undefined".
bool IsKnownColorSpace(const std::string& color_space);

/// The labels of its channels, those of absolute values first.
/// Throws: TristimException if it is not known.
const std::vector<std::string>& GetChannelLabels(const std::string& color_space);

/// The typed twin of `conditions`.  A key or value that colorimetry refuses leaves its default;
/// malformed numbers in an illumination do not (they are an InvalidArgumentException).
Tristim::HXMeasureConditions ToMeasureConditions(const Conditions& conditions);

/// The thirteen keys of the vocabulary, as far as they are defined, and the custom illumination.
Conditions ToConditions(const Tristim::HXMeasureConditions& conditions);

/// Value i stands for 380 + 10·i nm, whatever the conditions say.
/// Throws: TristimException for a length other than 36.
Tristim::HXSpectrum ToHXSpectrum(const Spectrum& spectrum);

Spectrum ToSpectrum(const Tristim::HXSpectrum& spectrum);

/// The first four channels of `vector` by position.
/// Throws: NullPointerException for one without conditions or channels.
Tristim::HXColorVector ToHXColorVector(const ColorVector& vector);

/// Throws: std::invalid_argument if the vector's conditions name no colour space.
Utilities::Tools::SmartPointer<ColorVector> ToColorVector(const Tristim::HXColorVector& vector);

/// The colour of `spectrum` under `conditions`, flagged as derived; empty if colorimetry gives up.
Utilities::Tools::SmartPointer<SampleAttribute> ComputeColorVector(const Spectrum& spectrum,
                                                                   const Conditions& conditions);

/// A colour measured under `own` in the colour space of `target`, flagged as derived; empty if
/// there is no way to it or `target` names none.
Utilities::Tools::SmartPointer<SampleAttribute> ComputeColorVector(
    const ColorScheme::Channels& channels, const Conditions& own, const Conditions& target);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_COLORIMETRYBRIDGE_H
