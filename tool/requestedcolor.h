#ifndef ALDERMOOR_TOOL_REQUESTEDCOLOR_H
#define ALDERMOOR_TOOL_REQUESTEDCOLOR_H

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/sample.h"

namespace Aldermoor::Tool {

/// The colour of `sample` under `request`: a stored one that meets it, else one computed from its
/// spectrum or converted from a stored one.
///
/// A stored colour can be converted to another colour space but not to another illuminant, and the
/// library hands it back under its own conditions; such a one is refused.  Results in RGB and CMYK
/// name no illuminant, and the colour of a light is its own whatever illuminant is asked for.
/// Throws: std::exception with the reason.
Vexdoc::ColorVector RequestedColor(const Vexdoc::Sample& sample, const Vexdoc::Conditions& request);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_REQUESTEDCOLOR_H
