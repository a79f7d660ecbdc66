#include "xmldocument.h"

#include <exception>
#include <filesystem>
#include <sstream>

#include <fmt/format.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "diagnostics.h"
#include "documentdiff.h"
#include "documents.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"
#include "settings.h"

namespace Aldermoor::Tool {
namespace {

using Vexdoc::Header;

// Why XML of `spectrum` would not be read again; empty if it would.
std::string SpectrumFault(const Vexdoc::Spectrum& spectrum) {
  const Vexdoc::Conditions& conditions = *spectrum.GetConditions();
  const std::size_t points = spectrum.GetData().size();
  const std::string count = conditions.GetAttribute(kPointCountKey, "36");
  const std::string first = conditions.GetAttribute(kWavelengthMinKey, "380nm");
  const std::string last = conditions.GetAttribute(kWavelengthMaxKey, "730nm");
  if (count != std::to_string(points)) {
    return fmt::format("a spectrum of {} values under conditions that name {}", points, count);
  }
  if (!Vexdoc::NanometresOf(first) || !Vexdoc::NanometresOf(last)) {
    return fmt::format("a spectrum from '{}' to '{}', no whole wavelengths", first, last);
  }
  const int range = *Vexdoc::NanometresOf(last) - *Vexdoc::NanometresOf(first);
  if (points > 1 && range < static_cast<int>(points) - 1) {
    return fmt::format("{} values from {} to {} would get equal or falling wavelengths", points,
                       first, last);
  }
  return "";
}

// What the library's message does not say.
void ReportFaultySpectra(const Vexdoc::VEX& document) {
  for (const auto& [set_key, set] : document.GetSampleSets()) {
    for (const auto& [sample_key, sample] : set->GetSamples()) {
      for (const auto& [key, attribute] : sample->GetElements()) {
        const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(attribute.Get());
        const std::string fault = spectrum == nullptr ? "" : SpectrumFault(*spectrum);
        if (!fault.empty()) {
          Report(
              fmt::format("set '{}', sample '{}': {}", set->GetName(), sample->GetName(), fault));
        }
      }
    }
  }
}

// The text, if it gives the same document again; else empty, and everything was told.
std::string CheckedText(const Vexdoc::VEX& document, const std::string& shown, bool tell_digits) {
  std::ostringstream out;
  Vexdoc::VEX again;
  try {
    document.Store(out);
    std::istringstream in(out.str());
    again.Load(in);
  } catch (const std::exception& e) {
    ReportFaultySpectra(document);
    Report(
        fmt::format("{}: XML cannot carry the document: {}; nothing is written", shown, e.what()));
    return "";
  }
  const DocumentDiff diff(document, again);
  for (const std::string& difference : diff.GetDifferences()) {
    Report(difference);
  }
  if (!diff.GetDifferences().empty()) {
    Report(fmt::format("{}: XML cannot carry the document; nothing is written", shown));
    return "";
  }
  if (const std::string digits = diff.DigitsText(); tell_digits && !digits.empty()) {
    Report(digits);
  }
  return out.str();
}

}  // namespace

void ForgetDates(Header& element) {
  element.RemoveAttribute(Header::kCreatedKey);
  element.RemoveAttribute(Header::kModifiedKey);
}

Vexdoc::LoadReport LoadStored(const std::string& path, Vexdoc::VEX& document,
                              const Vexdoc::LoadOptions& options) {
  return LoadStored(path, ReadBytes(path), document, options);
}

Vexdoc::LoadReport LoadStored(const std::string& path, const std::string& text,
                              Vexdoc::VEX& document, const Vexdoc::LoadOptions& options) {
  std::istringstream in(text);
  return TryLoad(path, [&] { return document.Load(in, options); });
}

void CompleteOption::AddTo(CLI::App& app) {
  AddFlag(app, "--complete", is_set,
          "Where the wavelengths of a spectrum are not those of its conditions, take minimum, "
          "maximum and number from its points, if they have one step");
}

Vexdoc::WavelengthUse CompleteOption::GetUse() const {
  return is_set ? Vexdoc::WavelengthUse::kComplete : Vexdoc::WavelengthUse::kRefuse;
}

void ReportRanges(const std::string& path, const Vexdoc::LoadReport& report) {
  for (const auto& [range, spectra] : report.ranges_taken) {
    Report(fmt::format("{}: the range {} taken from the points of {} {}", ShownPath(path), range,
                       spectra, spectra == 1 ? "spectrum" : "spectra"));
  }
}

ExitStatus SaveChecked(const Vexdoc::VEX& document, const std::string& path, bool cache,
                       bool tell_digits) {
  const bool standard = path == kStandardStream;
  const std::string text =
      CheckedText(document, standard ? "<standard output>" : path, tell_digits);
  if (text.empty()) {
    return ExitStatus::kSomeFailed;
  }
  if (standard) {
    Output output(path, Output::Content::kDocument);
    output.Write(text);
    output.Commit();
    return ExitStatus::kDone;
  }
  try {
    Utilities::FileSystem::File file(path);
    // Beside a device there is no place for a cache.
    const bool is_file = std::filesystem::is_regular_file(path) || !std::filesystem::exists(path);
    ReportReplacedInput(path);
    document.SaveXML(file, cache && is_file);
    return ExitStatus::kDone;
  } catch (const Utilities::Exceptions::ResourceException& e) {
    Report(e.what());
    return ExitStatus::kNotWritten;
  }
}

}  // namespace Aldermoor::Tool
