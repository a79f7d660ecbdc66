#include "aldermoor/measure/light.h"

#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

using Tristim::TristimService;
using Vexdoc::Spectrum;

std::optional<float> ColorTemperature(const Spectrum& light) try {
  CheckViewing(*light.GetConditions());
  return Computed(
      [&]() -> std::optional<float> {
        const Tristim::HXSpectrum spectrum = Vexdoc::ToHXSpectrum(light);
        // Darkness would have the chromaticity of equal energy, and so its temperature.
        const float kelvin =
            spectrum.IsValid() ? TristimService::GetColorTemperature(spectrum) : -1.0F;
        return kelvin > 0.0F ? std::optional<float>(kelvin) : std::nullopt;
      },
      [&] { return ReasonOfFailure(*light.GetConditions(), "the colour temperature"); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorTemperature)

ColorRendering ColorRenderingOf(const Spectrum& light) try {
  CheckViewing(*light.GetConditions());
  return Computed(
      [&] {
        ColorRendering result;
        result.valid = TristimService::GetColorRenderingIndex(Vexdoc::ToHXSpectrum(light),
                                                              result.index, result.reference);
        return result;
      },
      [&] { return ReasonOfFailure(*light.GetConditions(), "the colour rendering index"); });
}
ALDERMOOR_FRAME(Aldermoor::Measure::ColorRenderingOf)

}  // namespace Aldermoor::Measure
