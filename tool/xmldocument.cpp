#include "xmldocument.h"

#include <algorithm>
#include <exception>
#include <filesystem>
#include <sstream>

#include <fcntl.h>
#include <fmt/format.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "completion.h"
#include "diagnostics.h"
#include "documentdiff.h"
#include "documents.h"
#include "inputfile.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

using Vexdoc::Header;

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
  // A load takes spectra without them, but what they are then nobody can tell.
  if (!ReportMissing(Vexdoc::CompleteConditions(again, {}),
                     "'aldermoor convert' with --condition")) {
    Report(fmt::format("{}: conditions are missing; nothing is written", shown));
    return "";
  }
  if (const std::string digits = diff.DigitsText(); tell_digits && !digits.empty()) {
    Report(digits);
  }
  return out.str();
}

// Not beside a device, nor over a document that was read, nor in a folder that takes no more files;
// the XML file is saved all the same.
bool HasPlaceForCache(const std::string& path) {
  namespace fs = std::filesystem;
  const fs::path file = path;
  if (fs::exists(file) && !fs::is_regular_file(file)) {
    return false;
  }
  if (const auto input = InputThatIs(CachePath(path)); input && input->form != FileForm::kOther) {
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
  std::istringstream in(ReadBytes(path));
  TryLoad(path, [&] { return document.Load(in, Vexdoc::LoadOptions()); });
}

Vexdoc::LoadReport LoadStored(const std::string& path, const std::string& text,
                              Vexdoc::VEX& document, const Vexdoc::LoadOptions& options) {
  std::istringstream in(text);
  return TryLoad(
      path, [&] { return document.Load(in, options); }, "--complete");
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
    Output output(path, FileForm::kXml);
    output.Write(text);
    output.Commit();
    return ExitStatus::kDone;
  }
  try {
    Utilities::FileSystem::File file(path);
    ReplaceInput(path, FileForm::kXml);
    document.SaveXML(file, cache && HasPlaceForCache(path));
    return ExitStatus::kDone;
  } catch (const Utilities::Exceptions::ResourceException& e) {
    Report(e.what());
    return ExitStatus::kNotWritten;
  }
}

}  // namespace Aldermoor::Tool
