#include "aldermoor/vexdoc/wavelengthrange.h"

#include <algorithm>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/wavelengths.h"

namespace Aldermoor::Vexdoc {

namespace {

constexpr std::size_t kBands = 36;
constexpr int kFirstBand = 380;
constexpr int kLastBand = 730;

bool Names(const Conditions& conditions, const char* key, int expected) {
  const auto named = Internals::ReadWavelength(conditions.GetAttribute(key, ""));
  return !named || *named == expected;
}

}  // namespace

std::optional<int> NanometresOf(const std::string& value) try {
  return Internals::ReadWavelength(value);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::NanometresOf)

bool HoldsColor(const Sample& sample, const Conditions& request) try {
  const auto& elements = sample.GetElements();
  return std::any_of(elements.begin(), elements.end(), [&](const auto& element) {
    return dynamic_cast<const ColorVector*>(element.second.Get()) != nullptr &&
           request.IsSubsetOf(*element.second->GetConditions());
  });
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::HoldsColor)

bool IsOnMeasuringGrid(const Spectrum& spectrum) try {
  if (spectrum.GetData().size() != kBands) {
    return false;
  }
  const auto conditions = spectrum.GetConditions();
  return conditions.IsNull() || (Names(*conditions, ConditionKeys::kWavelengthMin, kFirstBand) &&
                                 Names(*conditions, ConditionKeys::kWavelengthMax, kLastBand));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::IsOnMeasuringGrid)

std::string GridFault(const Spectrum& spectrum) try {
  if (spectrum.GetData().size() != kBands || IsOnMeasuringGrid(spectrum)) {
    return "";
  }
  const auto conditions = spectrum.GetConditions();
  return "the spectrum is from " +
         conditions->GetAttribute(ConditionKeys::kWavelengthMin, "380nm") + " to " +
         conditions->GetAttribute(ConditionKeys::kWavelengthMax, "730nm") +
         ", and its values would be taken for those from 380nm to 730nm";
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::GridFault)

std::string GridFault(const Sample& sample, const Conditions& request) try {
  if (HoldsColor(sample, request)) {
    return "";
  }
  for (const auto& [name, attribute] : sample.GetElements()) {
    if (const auto* const spectrum = dynamic_cast<const Spectrum*>(attribute.Get())) {
      return GridFault(*spectrum);
    }
  }
  return "";
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::GridFault)

}  // namespace Aldermoor::Vexdoc
