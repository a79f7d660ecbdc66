#ifndef ALDERMOOR_VEXDOC_INTERNALS_CUSTOMILLUMINATION_H
#define ALDERMOOR_VEXDOC_INTERNALS_CUSTOMILLUMINATION_H

#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/conditions.h"

namespace Aldermoor::Vexdoc::Internals {

/// The conditions under which a custom illumination is read from a file, whatever its block says.
inline Conditions CustomIlluminationConditions() {
  Conditions conditions;
  conditions.AddAttribute(ConditionKeys::kWavelengthMin, "380nm");
  conditions.AddAttribute(ConditionKeys::kWavelengthMax, "730nm");
  conditions.AddAttribute(ConditionKeys::kPointCount, "36");
  conditions.AddAttribute(ConditionKeys::kSpectrumType, "AmbientLight");
  return conditions;
}

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CUSTOMILLUMINATION_H
