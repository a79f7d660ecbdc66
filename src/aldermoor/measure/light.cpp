#include "aldermoor/measure/light.h"

#include <algorithm>
#include <cmath>

#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/colorrenderingcalculator.h"
#include "aldermoor/tristim/internals/colortemperature.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

using Tristim::HXSpectrum;
using Vexdoc::Spectrum;

namespace {

[[noreturn]] void Fail(const std::string& reason) {
  throw MeasureException(reason, ALDERMOOR_HERE(Aldermoor::Measure));
}

std::optional<float> TemperatureOf(const HXSpectrum& light) {
  // Darkness would have the chromaticity of equal energy, and so its temperature.
  if (!light.IsValid() ||
      std::ranges::any_of(light.GetBands(), [](float v) { return std::isnan(v); })) {
    return std::nullopt;
  }
  // Not by the service, for which a light that stands on the locus has none.
  const float kelvin = Tristim::Internals::ColorTemperature().FindColorTemperature(light);
  if (kelvin > 0.0F) {
    return kelvin;
  }
  if (light.GetMeasureConditions().GetObserver() == Tristim::Observer::TenDegree) {
    Fail(
        "under the observer \"TenDegree\" the search for the colour temperature does not find the "
        "upper end of the black-body locus; ask for \"TwoDegree\"");
  }
  return std::nullopt;
}

}  // namespace

std::optional<float> ColorTemperature(const Spectrum& light) try {
  CheckViewing(*light.GetConditions());
  return Computed(
      [&] { return TemperatureOf(Vexdoc::ToHXSpectrum(light)); },
      [&] { return ReasonOfFailure(*light.GetConditions(), "the colour temperature"); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorTemperature)

ColorRendering ColorRenderingOf(const Spectrum& light) try {
  CheckViewing(*light.GetConditions());
  return Computed(
      [&] {
        const HXSpectrum spectrum = Vexdoc::ToHXSpectrum(light);
        if (spectrum.GetMeasureConditions().GetIllumination().GetIlluminationType() !=
            Tristim::IlluminationType::kEmission) {
          Fail(
              "the colour rendering index is that of a light, and the conditions of this spectrum "
              "do not say \"Emission\" under \"Colorimetric.Illumination\"");
        }
        ColorRendering result;
        const std::optional<float> kelvin = TemperatureOf(spectrum);
        result.index = static_cast<float>(
            Tristim::Internals::ColorRenderingCalculator().GetColorRenderingIndex(
                spectrum, kelvin.value_or(0.0F), result.valid, result.reference));
        return result;
      },
      [&] { return ReasonOfFailure(*light.GetConditions(), "the colour rendering index"); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorRenderingOf)

}  // namespace Aldermoor::Measure
