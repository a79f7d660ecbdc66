#include "requestedcolor.h"

#include <stdexcept>
#include <string>

#include <fmt/format.h>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

const std::string kColorVectorType = "VEXColorVector";

void CheckHoldsFor(const Vexdoc::Conditions& request, const Vexdoc::ColorVector& color) {
  const Vexdoc::Conditions& own = *color.GetConditions();
  const std::string space = own.GetAttribute(kTypeKey, "");
  if (space == "RGB" || space == "CMYK") {
    return;
  }
  for (const std::string* const key : {&kIlluminationKey, &kObserverKey, &kWhiteBaseKey}) {
    const auto wanted = request.GetAttributes().find(*key);
    if (wanted == request.GetAttributes().end()) {
      continue;
    }
    const auto found = own.GetAttributes().find(*key);
    if (key == &kIlluminationKey && found != own.GetAttributes().end() &&
        found->second == kEmission) {
      continue;
    }
    if (found == own.GetAttributes().end() || found->second != wanted->second) {
      throw std::runtime_error(
          fmt::format("the colour holds for {} '{}' and cannot be computed for '{}'", *key,
                      found == own.GetAttributes().end() ? "" : found->second, wanted->second));
    }
    if (found->second == kUserdefined &&
        (!own.HasCustomIllumination() ||
         own.GetCustomIllumination().GetData() != request.GetCustomIllumination().GetData())) {
      throw std::runtime_error("the colour holds for another user-defined illuminant");
    }
  }
}

}  // namespace

Vexdoc::ColorVector RequestedColor(const Vexdoc::Sample& sample,
                                   const Vexdoc::Conditions& request) {
  if (const std::string fault = Vexdoc::GridFault(sample, request); !fault.empty()) {
    throw std::runtime_error(fault);
  }
  const auto result = sample.GetSampleAttribute(kColorVectorType, request, false);
  const auto& color = dynamic_cast<const Vexdoc::ColorVector&>(*result);
  CheckHoldsFor(request, color);
  return color;
}

}  // namespace Aldermoor::Tool
