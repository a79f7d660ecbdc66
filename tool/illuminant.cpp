#include "illuminant.h"

#include <exception>

#include <fmt/format.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/sample.h"

#include "documents.h"
#include "exitstatus.h"
#include "samplerun.h"

namespace Aldermoor::Tool {
namespace {

using Utilities::Tools::SmartPointer;

SmartPointer<Vexdoc::Sample> Find(const Vexdoc::VEX& document, const SpectrumPath& path,
                                  const std::string& shown) {
  try {
    return document.FindSample(path.set, path.sample);
  } catch (const Utilities::Exceptions::OutOfRangeException&) {
    throw UsageError(fmt::format("{}: {} has no sample '{}' in a set '{}'", path.option, shown,
                                 path.sample, path.set));
  }
}

}  // namespace

SpectrumPath SpectrumPath::Parse(std::string_view text, const std::string& option) {
  const std::string_view rest = text.substr(1);
  const std::size_t last_slash = rest.rfind('/');
  const std::size_t colon =
      last_slash == std::string_view::npos ? last_slash : rest.rfind(':', last_slash);
  const std::size_t slash = colon == std::string_view::npos ? colon : rest.find('/', colon);
  if (slash == std::string_view::npos || colon == 0) {
    throw UsageError(fmt::format("{}: '{}' is not of the form @FILE:SET/SAMPLE", option, text));
  }
  return {option, std::string(rest.substr(0, colon)),
          std::string(rest.substr(colon + 1, slash - colon - 1)),
          std::string(rest.substr(slash + 1))};
}

SpectrumPath SpectrumPath::ParseWithin(std::string_view text, const std::string& option) {
  const std::size_t slash = text.find('/');
  if (slash == std::string_view::npos) {
    throw UsageError(fmt::format("{}: '{}' is not of the form SET/SAMPLE", option, text));
  }
  return {option, "", std::string(text.substr(0, slash)), std::string(text.substr(slash + 1))};
}

Vexdoc::Spectrum SpectrumPath::Load() const {
  Vexdoc::VEX document;
  LoadDocument(file, document);
  return FindIn(document, file);
}

Vexdoc::Spectrum SpectrumPath::FindIn(const Vexdoc::VEX& document, const std::string& shown) const {
  const auto found = Find(document, *this, shown);
  try {
    return SpectrumOf(*found);
  } catch (const std::exception& e) {
    throw UsageError(fmt::format("{}: '{}/{}' of {}: {}", option, set, sample, shown, e.what()));
  }
}

}  // namespace Aldermoor::Tool
