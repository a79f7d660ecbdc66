#ifndef ALDERMOOR_TOOL_FAULTS_H
#define ALDERMOOR_TOOL_FAULTS_H

#include <string>

#include "aldermoor/vexdoc/inspection.h"

namespace Aldermoor::Tool {

/// "file:line:column: warning: text" of a fault in the XML of `path`, as far as its place is known,
/// on one line; with the number of further ones that are like it.
std::string FaultText(const std::string& path, const Vexdoc::Fault& fault);
/// The same in a cache: "file:offset: text".
std::string CacheFaultText(const std::string& path, const Vexdoc::Fault& fault);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_FAULTS_H
