#include "aldermoor/vexdoc/wavelengthrange.h"

#include "aldermoor/utilities/exceptions/frame.h"
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

bool IsOnMeasuringGrid(const Spectrum& spectrum) try {
  if (spectrum.GetData().size() != kBands) {
    return false;
  }
  const auto conditions = spectrum.GetConditions();
  return conditions.IsNull() || (Names(*conditions, ConditionKeys::kWavelengthMin, kFirstBand) &&
                                 Names(*conditions, ConditionKeys::kWavelengthMax, kLastBand));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::IsOnMeasuringGrid)

}  // namespace Aldermoor::Vexdoc
