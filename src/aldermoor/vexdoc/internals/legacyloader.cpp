#include "aldermoor/vexdoc/internals/legacyloader.h"

#include <string>
#include <vector>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

constexpr const char* kUndefined = "Undefined";

void Complete(Conditions& conditions, const char* key, const std::string& value) {
  if (conditions.GetAttribute(key, "").empty()) {
    conditions.AddAttribute(key, value);
  }
}

}  // namespace

void LegacyLoader::LoadMembers(Spectrum& spectrum) try {
  const std::vector<float> data = ReadSpectrumValues(spectrum);
  Conditions conditions(*spectrum.GetConditions());
  Complete(conditions, ConditionKeys::kWavelengthMin, kUndefined);
  Complete(conditions, ConditionKeys::kWavelengthMax, kUndefined);
  Complete(conditions, ConditionKeys::kPointCount, std::to_string(data.size()));
  Complete(conditions, ConditionKeys::kSpectrumType, kUndefined);
  DocumentAccess::ReplaceContent(spectrum, Spectrum(conditions, data));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::LegacyLoader::LoadMembers)

void LegacyLoader::LoadMembers(ColorVector& vector) try {
  std::vector<float> values;
  for (const auto& channel : ReadChannels()) {
    values.push_back(channel.second);
  }
  Conditions conditions(*vector.GetConditions());
  Complete(conditions, ConditionKeys::kObserver, kUndefined);
  Complete(conditions, ConditionKeys::kIllumination, kUndefined);
  DocumentAccess::ReplaceContent(vector, ColorVector(conditions, values));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::LegacyLoader::LoadMembers)

}  // namespace Aldermoor::Vexdoc::Internals
