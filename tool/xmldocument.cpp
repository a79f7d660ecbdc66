#include "xmldocument.h"

#include <algorithm>
#include <exception>
#include <filesystem>
#include <map>
#include <sstream>

#include <fmt/format.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/tools/datetime.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "diagnostics.h"
#include "documentdiff.h"
#include "inputfile.h"
#include "output.h"

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

// Tells what a file would not bring back; whether there is nothing of the kind.
bool IsSavable(const Vexdoc::VEX& document, const std::string& shown) {
  constexpr std::size_t kMostReported = 100;
  const std::vector<Vexdoc::DocumentFault> faults = Vexdoc::CheckDocument(document);
  for (std::size_t i = 0; i < std::min(faults.size(), kMostReported); ++i) {
    Report(faults[i].GetText());
  }
  if (!faults.empty()) {
    Report(fmt::format("{}: XML cannot carry the document: {} fault{}; nothing is written", shown,
                       faults.size(), faults.size() == 1 ? "" : "s"));
  }
  return faults.empty();
}

// The text, if it gives the same document again; else empty, and everything was told.
std::string CheckedText(const Vexdoc::VEX& document, const std::string& shown, bool tell_digits) {
  if (!IsSavable(document, shown)) {
    return "";
  }
  // What is written is read again all the same: a second net, and it counts the digits.
  std::ostringstream out;
  Vexdoc::VEX again;
  try {
    document.Store(out);
    std::istringstream in(out.str());
    again.Load(in);
  } catch (const std::exception& e) {
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
    // Beside a device there is no place for a cache.
    const bool is_file = std::filesystem::is_regular_file(path) || !std::filesystem::exists(path);
    document.SaveXML(file, cache && is_file);
    return ExitStatus::kDone;
  } catch (const Utilities::Exceptions::ResourceException& e) {
    Report(e.what());
    return ExitStatus::kNotWritten;
  }
}

}  // namespace Aldermoor::Tool
