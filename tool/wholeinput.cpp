#include "wholeinput.h"

#include <sstream>

#include <fmt/format.h>

#include "aldermoor/vexdoc/inspection.h"

#include "completion.h"
#include "diagnostics.h"
#include "exitstatus.h"
#include "faults.h"
#include "inputfile.h"
#include "options.h"
#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

// Tells what ranges of wavelengths were taken from the points of `path`.
void ReportRanges(const std::string& path, const Vexdoc::LoadReport& report) {
  for (const auto& [range, spectra] : report.ranges_taken) {
    Report(fmt::format("{}: the range {} taken from the points of {} {}", ShownPath(path), range,
                       spectra, spectra == 1 ? "spectrum" : "spectra"));
  }
}

// Tells what stands in XML and does not come into the document, or counts for something else;
// returns whether there is any.  Wavelengths are left to the load, which refuses or completes them.
bool ReportLosses(const std::string& path, const std::string& text) {
  using Loss = Vexdoc::Fault::Loss;
  std::istringstream in(text);
  bool has_losses = false;
  for (const Vexdoc::Fault& fault : Vexdoc::CheckXML(in)) {
    if (fault.loss == Loss::kContent || fault.loss == Loss::kLabels) {
      has_losses = true;
      Report(FaultText(path, fault));
    }
  }
  return has_losses;
}

}  // namespace

void WholeInput::AddTo(CLI::App& app) {
  AddFlag(app, "--complete", completes_,
          "Where the wavelengths of a spectrum are not those of its conditions, take minimum, "
          "maximum and number from its points, if they have one step");
  AddFlag(app, "--strict", is_strict_, "Write nothing if something in an XML file is not read");
}

void WholeInput::Load(const std::string& path, Vexdoc::VEX& document,
                      const KindConditions* given) const {
  Vexdoc::LoadOptions options;
  options.wavelengths =
      completes_ ? Vexdoc::WavelengthUse::kComplete : Vexdoc::WavelengthUse::kRefuse;
  if (given != nullptr) {
    options.completion = Vexdoc::Completion{given->spectrum, given->color};
  }
  const std::string text = ReadBytes(path);
  const Vexdoc::LoadReport report = LoadStored(path, text, document, options);
  ReportRanges(path, report);
  if (given != nullptr && !ReportCompletion(report.completion, *given)) {
    throw RefusedError(
        fmt::format("{}: conditions are missing; nothing is written", ShownPath(path)));
  }
  if (ReportLosses(path, text) && is_strict_) {
    throw RefusedError(fmt::format("{}: --strict; nothing is written", ShownPath(path)));
  }
}

}  // namespace Aldermoor::Tool
