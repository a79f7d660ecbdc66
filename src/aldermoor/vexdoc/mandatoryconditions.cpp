#include "aldermoor/vexdoc/mandatoryconditions.h"

#include "aldermoor/vexdoc/conditionkeys.h"

namespace Aldermoor::Vexdoc {

const std::vector<std::string>& MandatoryConditionsOfSpectra() {
  static const std::vector<std::string> keys = {
      ConditionKeys::kWavelengthMin, ConditionKeys::kWavelengthMax, ConditionKeys::kPointCount,
      ConditionKeys::kSpectrumType};
  return keys;
}

const std::vector<std::string>& MandatoryConditionsOfColors(const std::string& color_space) {
  static const std::vector<std::string> all = {
      ConditionKeys::kColorSpace, ConditionKeys::kIllumination, ConditionKeys::kObserver};
  static const std::vector<std::string> type_only = {ConditionKeys::kColorSpace};
  return color_space == "RGB" || color_space == "CMYK" ? type_only : all;
}

}  // namespace Aldermoor::Vexdoc
