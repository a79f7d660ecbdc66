#ifndef ALDERMOOR_TESTS_API_MEASURESUPPORT_H
#define ALDERMOOR_TESTS_API_MEASURESUPPORT_H

#include <algorithm>
#include <exception>
#include <string>
#include <utility>
#include <vector>

#include "aldermoor/measure/density.h"
#include "aldermoor/measure/measureexception.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace MeasureTests {

using namespace Aldermoor::Measure;
using namespace Aldermoor::Vexdoc;

inline Conditions Of(const std::vector<std::pair<std::string, std::string>>& words) {
  Conditions conditions;
  conditions.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
  conditions.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", "36");
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  conditions.AddAttribute("Colorimetric.Observer", "TwoDegree");
  for (const auto& [key, value] : words) {
    conditions.AddAttribute(key, value);
  }
  return conditions;
}

inline const std::string kLight = "Colorimetric.Illumination";
inline const std::string kBase = "Colorimetric.WhiteBase";
inline const std::string kSpace = "ColorSpaceDescription.Type";
inline const std::string kFormula = "ColorSpaceDescription.DeltaEFormula";

inline Spectrum Flat(float value, const Conditions& conditions = Of({})) {
  return {conditions, std::vector<float>(36, value)};
}

/// 36 values, `value` from band 20 (580 nm) on and 1 before: a cyan of that reflectance.
inline Spectrum Cyan(float value) {
  std::vector<float> values(36, 1.0F);
  std::fill(values.begin() + 20, values.end(), value);
  return {Of({}), values};
}

inline ColorVector Lab(float l, float a, float b, const std::string& formula = "CIELab",
                       const std::string& space = "CIELab") {
  return {Of({{kLight, "D50"}, {kSpace, space}, {kFormula, formula}}), {l, a, b}};
}

/// The message of the MeasureException of `action`.
template <class Action>
std::string ReasonOf(Action action) {
  try {
    action();
  } catch (const MeasureException& e) {
    return e.what();
  } catch (const std::exception& e) {
    return std::string("no MeasureException: ") + e.what();
  }
  return "nothing was thrown";
}

inline constexpr DensityStandard kDin = DensityStandard::DIN;

}  // namespace MeasureTests

#endif  // ALDERMOOR_TESTS_API_MEASURESUPPORT_H
