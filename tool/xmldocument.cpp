#include "xmldocument.h"

#include <exception>
#include <filesystem>
#include <map>
#include <sstream>

#include <fcntl.h>
#include <fmt/format.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/tools/datetime.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "diagnostics.h"
#include "documentdiff.h"
#include "inputfile.h"
#include "output.h"
#include "settings.h"

namespace Aldermoor::Tool {
namespace {

using Utilities::Tools::DateTime;
using Vexdoc::Header;

/// Removes the dates that a load has put in: those of its own time that are not in the text.
class DateFilter {
 public:
  DateFilter(const std::string& text, std::string begin, std::string end)
      : text_(text), begin_(std::move(begin)), end_(std::move(end)) {}

  void Apply(Header& element) {
    for (const char* const key : {Header::kCreatedKey, Header::kModifiedKey}) {
      const std::string date = element.GetAttribute(key);
      if (date >= begin_ && date <= end_ && !IsInText(date)) {
        element.RemoveAttribute(key);
      }
    }
  }

 private:
  bool IsInText(const std::string& date) {
    const auto [place, is_new] = known_.try_emplace(date, false);
    if (is_new) {
      place->second = text_.find(date) != std::string::npos;
    }
    return place->second;
  }

  const std::string& text_;
  std::string begin_;
  std::string end_;
  std::map<std::string, bool> known_;
};

void Parse(const std::string& path, const std::string& text, Vexdoc::VEX& document) {
  std::istringstream in(text);
  try {
    document.Load(in);
  } catch (const Vexdoc::VexXMLParseException& e) {
    throw InputError(
        fmt::format("{}:{}:{}: {}", ShownPath(path), e.GetLine(), e.GetColumn(), e.what()));
  } catch (const std::exception& e) {
    throw InputError(fmt::format("{}: {}", ShownPath(path), e.what()));
  }
}

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
  if (!Wavelength(first) || !Wavelength(last)) {
    return fmt::format("a spectrum from '{}' to '{}', no whole wavelengths", first, last);
  }
  const int range = *Wavelength(last) - *Wavelength(first);
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

// Not beside a device, nor in a folder that takes no more files; the XML file is saved all the
// same.
bool HasPlaceForCache(const std::string& path) {
  namespace fs = std::filesystem;
  const fs::path file = path;
  if (fs::exists(file) && !fs::is_regular_file(file)) {
    return false;
  }
  const fs::path folder = file.has_parent_path() ? file.parent_path() : ".";
  const fs::path caches = folder / "Cache";
  const bool is_there = fs::exists(caches);
  return faccessat(AT_FDCWD, (is_there ? caches : folder).c_str(), W_OK, AT_EACCESS) == 0;
}

}  // namespace

void ForgetDates(Header& element) {
  element.RemoveAttribute(Header::kCreatedKey);
  element.RemoveAttribute(Header::kModifiedKey);
}

void LoadStored(const std::string& path, Vexdoc::VEX& document) {
  const std::string text = ReadBytes(path);
  const std::string begin = DateTime().GetDateTime();
  Parse(path, text, document);
  DateFilter dates(text, begin, DateTime().GetDateTime());
  dates.Apply(document);
  for (const auto& [set_name, set] : document.GetSampleSets()) {
    dates.Apply(*set);
    for (const auto& [sample_name, sample] : set->GetSamples()) {
      dates.Apply(*sample);
      for (const auto& [name, attribute] : sample->GetElements()) {
        dates.Apply(*attribute);
      }
    }
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
    Output output(path);
    output.Write(text);
    output.Commit();
    return ExitStatus::kDone;
  }
  try {
    Utilities::FileSystem::File file(path);
    document.SaveXML(file, cache && HasPlaceForCache(path));
    return ExitStatus::kDone;
  } catch (const Utilities::Exceptions::ResourceException& e) {
    Report(e.what());
    return ExitStatus::kNotWritten;
  }
}

}  // namespace Aldermoor::Tool
