#ifndef ALDERMOOR_TOOL_XMLDOCUMENT_H
#define ALDERMOOR_TOOL_XMLDOCUMENT_H

#include <string>

#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vex.h"

#include "exitstatus.h"

/// Documents on their way through a command that writes one.
namespace Aldermoor::Tool {

/// Removes "Created" and "Modified" of an element.
void ForgetDates(Vexdoc::Header& element);

/// Reads the XML file `path`, "-" for standard input, and not its cache.  What has no dates in the
/// file has none afterwards.
/// Throws: as TryLoad does.
void LoadStored(const std::string& path, Vexdoc::VEX& document);
/// The same from `text`, which is that of the file, for a command that has "--complete".
Vexdoc::LoadReport LoadStored(const std::string& path, const std::string& text,
                              Vexdoc::VEX& document, const Vexdoc::LoadOptions& options);

/// Writes `document` as XML to `path`, "-" for standard output, and with `cache` its cache, if that
/// text read again gives the same document up to six digits of its numbers, and none of its
/// attributes lacks mandatory conditions; otherwise reports what is at fault and touches nothing.
///
/// With `tell_digits`, reports how many values lose digits.  Throws: OutputError.
ExitStatus SaveChecked(const Vexdoc::VEX& document, const std::string& path, bool cache,
                       bool tell_digits);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_XMLDOCUMENT_H
