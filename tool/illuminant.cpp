#include "illuminant.h"

#include <fmt/format.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/vex.h"

#include "documents.h"
#include "exitstatus.h"

namespace Aldermoor::Tool {
namespace {

// 380 to 730 nm in steps of 10 nm.
constexpr std::size_t kBands = 36;

using Utilities::Tools::SmartPointer;

SmartPointer<Vexdoc::Sample> Find(const Vexdoc::VEX& document, const SpectrumPath& path) {
  try {
    return document.FindSample(path.set, path.sample);
  } catch (const Utilities::Exceptions::OutOfRangeException&) {
    throw UsageError(fmt::format("--illuminant: {} has no sample '{}' in a set '{}'", path.file,
                                 path.sample, path.set));
  }
}

}  // namespace

SpectrumPath SpectrumPath::Parse(std::string_view text) {
  const std::string_view rest = text.substr(1);
  const std::size_t last_slash = rest.rfind('/');
  const std::size_t colon =
      last_slash == std::string_view::npos ? last_slash : rest.rfind(':', last_slash);
  const std::size_t slash = colon == std::string_view::npos ? colon : rest.find('/', colon);
  if (slash == std::string_view::npos || colon == 0) {
    throw UsageError(fmt::format("--illuminant: '{}' is not of the form @FILE:SET/SAMPLE", text));
  }
  return {std::string(rest.substr(0, colon)),
          std::string(rest.substr(colon + 1, slash - colon - 1)),
          std::string(rest.substr(slash + 1))};
}

Vexdoc::Spectrum SpectrumPath::Load() const {
  Vexdoc::VEX document;
  LoadDocument(file, document);
  for (const auto& [name, attribute] : Find(document, *this)->GetElements()) {
    if (const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(attribute.Get())) {
      if (spectrum->GetData().size() != kBands) {
        throw UsageError(fmt::format("--illuminant: '{}/{}' of {} has {} values instead of {}", set,
                                     sample, file, spectrum->GetData().size(), kBands));
      }
      return *spectrum;
    }
  }
  throw UsageError(fmt::format("--illuminant: '{}/{}' of {} holds no spectrum", set, sample, file));
}

}  // namespace Aldermoor::Tool
