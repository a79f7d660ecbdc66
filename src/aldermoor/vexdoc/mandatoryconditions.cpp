#include "aldermoor/vexdoc/mandatoryconditions.h"

#include "aldermoor/vexdoc/conditionkeys.h"

namespace Aldermoor::Vexdoc {

const std::vector<std::string>& MandatoryConditionsOfSpectra() {
  static const auto& keys =
      *new std::vector<std::string>{ConditionKeys::kWavelengthMin, ConditionKeys::kWavelengthMax,
                                    ConditionKeys::kPointCount, ConditionKeys::kSpectrumType};
  return keys;
}

const std::vector<std::string>& MandatoryConditionsOfColors(const std::string& color_space) {
  static const auto& all = *new std::vector<std::string>{
      ConditionKeys::kColorSpace, ConditionKeys::kIllumination, ConditionKeys::kObserver};
  static const auto& type_only = *new std::vector<std::string>{ConditionKeys::kColorSpace};
  return color_space == "RGB" || color_space == "CMYK" ? type_only : all;
}

}  // namespace Aldermoor::Vexdoc
