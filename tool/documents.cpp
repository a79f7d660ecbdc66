#include "documents.h"

#include <algorithm>
#include <cerrno>
#include <exception>
#include <filesystem>
#include <sstream>
#include <system_error>

#include <fmt/format.h>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "diagnostics.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

// The library would say no more than that it is not accessible.
void CheckIsFile(const std::string& path) {
  std::error_code error;
  const auto status = std::filesystem::status(path, error);
  if (!std::filesystem::exists(status)) {
    throw std::system_error(error ? error.value() : ENOENT, std::generic_category());
  }
  if (std::filesystem::is_directory(status)) {
    throw std::system_error(EISDIR, std::generic_category());
  }
}

bool& NoCacheFlag() {
  static bool is_set = false;
  return is_set;
}

// Messages of the library may be of several lines, each one the reason of the line above.
std::string Reason(const std::exception& e) {
  std::string text;
  for (const char* c = e.what(); *c != '\0'; ++c) {
    if (*c != '\n') {
      text += *c;
    } else {
      text += text.ends_with(':') ? " " : ": ";
    }
  }
  return text;
}

}  // namespace

Vexdoc::LoadReport TryLoad(const std::string& path, const std::function<Vexdoc::LoadReport()>& load,
                           const std::string& completer) {
  const std::string shown = ShownPath(path);
  try {
    return load();
  } catch (const Vexdoc::WavelengthException& e) {
    throw RefusedError(
        fmt::format("{}: {}{}", shown, Reason(e),
                    e.CanComplete() ? "; " + completer + " takes the range from the points" : ""));
  } catch (const Vexdoc::VexXMLParseException& e) {
    throw InputError(fmt::format("{}:{}:{}: {}", shown, e.GetLine(), e.GetColumn(), Reason(e)));
  } catch (const std::exception& e) {
    throw InputError(fmt::format("{}: {}", shown, Reason(e)));
  }
}

Vexdoc::LoadReport LoadDocument(const std::string& path, Vexdoc::VEX& document,
                                Vexdoc::WavelengthUse wavelengths) {
  Vexdoc::LoadOptions options;
  options.wavelengths = wavelengths;
  options.cache = IgnoresCaches() ? Vexdoc::CacheUse::kNone : Vexdoc::CacheUse::kRead;
  const bool standard = path == kStandardStream;
  std::istringstream in(standard ? ReadBytes(path) : "");
  NoteInput(path);
  try {
    return TryLoad(path, [&] {
      if (standard) {
        return document.Load(in, options);
      }
      CheckIsFile(path);
      return document.LoadXML(Utilities::FileSystem::File(path), options);
    });
  } catch (const RefusedError& e) {
    throw InputError(e.what());  // one of several inputs, of which the others may be good
  }
}

void AddNoCacheFlag(CLI::App& app) {
  AddFlag(app, "--no-cache", NoCacheFlag(), "Read XML files themselves, not their caches");
}

bool IgnoresCaches() {
  return NoCacheFlag();
}

void InputOptions::AddTo(CLI::App& app) {
  AddArguments(app, "FILE", paths, "Documents to read; - is standard input");
}

std::optional<Vexdoc::LoadReport> InputOptions::LoadOrReport(const std::string& path,
                                                             Vexdoc::VEX& document,
                                                             Vexdoc::WavelengthUse wavelengths) {
  try {
    return LoadDocument(path, document, wavelengths);
  } catch (const InputError& e) {
    Report(e.what());
    return std::nullopt;
  }
}

void InputOptions::CheckStandardInput(const std::string& other) const {
  for (const std::string& path : paths) {
    NoteInput(path);
  }
  NoteInput(other);
  const auto count =
      std::count(paths.begin(), paths.end(), kStandardStream) + (other == kStandardStream ? 1 : 0);
  if (count > 1) {
    throw UsageError("standard input (-) can be read only once");
  }
}

void SampleFilter::AddTo(CLI::App& app) {
  AddOption(app, "--set", set, "NAME", "Only the sample set of this name");
  AddOption(app, "--sample", sample, "NAME", "Only samples of this name");
}

std::string SampleFilter::NoMatchText() const {
  if (!sample) {
    return fmt::format("no samples in a set '{}'", set.value_or(""));
  }
  return set ? fmt::format("no sample '{}' in a set '{}'", *sample, *set)
             : fmt::format("no sample '{}'", *sample);
}

std::string DescribeAttributes(const Vexdoc::Sample& sample) {
  std::string text;
  for (const auto& [name, attribute] : sample.GetElements()) {
    text += text.empty() ? "" : ", ";
    if (const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(attribute.Get())) {
      text += fmt::format("a spectrum of {} values", spectrum->GetData().size());
    } else if (const auto* const color = dynamic_cast<const Vexdoc::ColorVector*>(attribute.Get());
               color != nullptr && !color->GetConditions().IsNull()) {
      text += fmt::format("a colour in {}", color->GetConditions()->GetAttribute(
                                                "ColorSpaceDescription.Type", "no colour space"));
    } else {
      text += fmt::format("a {}", attribute->GetType().substr(3));  // without "VEX"
    }
  }
  return text;
}

}  // namespace Aldermoor::Tool
