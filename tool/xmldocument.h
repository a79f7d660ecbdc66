#ifndef ALDERMOOR_TOOL_XMLDOCUMENT_H
#define ALDERMOOR_TOOL_XMLDOCUMENT_H

#include <string>

#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vex.h"

#include "exitstatus.h"

namespace CLI {
class App;
}

/// Documents on their way through a command that writes one.
namespace Aldermoor::Tool {

/// Removes "Created" and "Modified" of an element.
void ForgetDates(Vexdoc::Header& element);

/// Reads the XML file `path`, "-" for standard input, and not its cache.  What has no dates in the
/// file has none afterwards.
/// Throws: InputError with the place of the fault in front, as far as it is known; RefusedError for
/// spectra whose wavelengths are not those of their conditions.
Vexdoc::LoadReport LoadStored(const std::string& path, Vexdoc::VEX& document,
                              const Vexdoc::LoadOptions& options = {});
/// The same from `text`, which is that of the file.
Vexdoc::LoadReport LoadStored(const std::string& path, const std::string& text,
                              Vexdoc::VEX& document, const Vexdoc::LoadOptions& options);

/// The option "--complete" of the commands that write documents.
struct CompleteOption {
  bool is_set = false;

  void AddTo(CLI::App& app);
  Vexdoc::WavelengthUse GetUse() const;
};
/// Tells what ranges of wavelengths were taken from the points of `path`.
void ReportRanges(const std::string& path, const Vexdoc::LoadReport& report);

/// Writes `document` as XML to `path`, "-" for standard output, and with `cache` its cache, if that
/// text read again gives the same document up to six digits of its numbers; otherwise reports what
/// differs and touches nothing.
///
/// With `tell_digits`, reports how many values lose digits.  Throws: OutputError.
ExitStatus SaveChecked(const Vexdoc::VEX& document, const std::string& path, bool cache,
                       bool tell_digits);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_XMLDOCUMENT_H
