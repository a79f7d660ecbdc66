#ifndef ALDERMOOR_TOOL_COMPLETION_H
#define ALDERMOOR_TOOL_COMPLETION_H

#include <string>

#include "aldermoor/vexdoc/completion.h"

#include "settings.h"

namespace Aldermoor::Tool {

/// Tells, sample by sample, what is still missing after a completion and that `remedy` gives it;
/// returns whether nothing is.
bool ReportMissing(const Vexdoc::CompletionReport& report, const std::string& remedy);

/// Tells what a completion with the conditions `given` set and, sample by sample, what is still
/// missing; returns whether nothing is.
bool ReportCompletion(const Vexdoc::CompletionReport& report, const KindConditions& given);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COMPLETION_H
