#include "faults.h"

#include <fmt/format.h>

#include "inputfile.h"
#include "text.h"

namespace Aldermoor::Tool {
namespace {

std::string Text(const std::string& path, const std::string& place, const Vexdoc::Fault& fault) {
  std::string text =
      fmt::format("{}{}: {}{}", OnOneLine(ShownPath(path)), place,
                  fault.severity == Vexdoc::Fault::Severity::kWarning ? "warning: " : "",
                  OnOneLine(fault.text));
  if (fault.repeats > 0) {
    text += fmt::format("; and {} more like it", fault.repeats);
  }
  return text;
}

}  // namespace

std::string FaultText(const std::string& path, const Vexdoc::Fault& fault) {
  return Text(path, fault.line == 0 ? "" : fmt::format(":{}:{}", fault.line, fault.column), fault);
}

std::string CacheFaultText(const std::string& path, const Vexdoc::Fault& fault) {
  return Text(path, fmt::format(":0x{:08x}", fault.offset), fault);
}

}  // namespace Aldermoor::Tool
