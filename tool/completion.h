#ifndef ALDERMOOR_TOOL_COMPLETION_H
#define ALDERMOOR_TOOL_COMPLETION_H

#include "aldermoor/vexdoc/vex.h"

#include "settings.h"

namespace Aldermoor::Tool {

/// Gives the spectra and colours of `document` the mandatory conditions that their file did not
/// give: the number of points from the data, everything else from `given`.  Reports what was set
/// and, sample by sample, what is still missing; returns whether nothing is.
bool CompleteConditions(Vexdoc::VEX& document, const KindConditions& given);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COMPLETION_H
