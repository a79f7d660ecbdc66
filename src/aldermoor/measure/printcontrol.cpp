#include "aldermoor/measure/printcontrol.h"

#include <cmath>
#include <cstddef>
#include <string>

#include "aldermoor/measure/densitysupport.h"

namespace Aldermoor::Measure {

using Tristim::Internals::ColorFieldResult;
using Tristim::Internals::DensityCalculator;
using Tristim::Internals::HXDensity;
using Vexdoc::Spectrum;
using Vexdoc::ToHXSpectrum;

float DotArea(const Spectrum& solid, const Spectrum& tint, DensityMode mode,
              DensityStandard standard, float yule_nielsen) try {
  if (!(yule_nielsen > 0.0F) || !std::isfinite(yule_nielsen)) {
    throw MeasureException("the Yule-Nielsen factor is " + std::to_string(yule_nielsen) +
                               " and has to be a number above 0",
                           ALDERMOOR_HERE(Aldermoor::Measure::DotArea));
  }
  float result = 0.0F;
  Require([&] {
    return DensityCalculator::GetDotArea(ToHXSpectrum(solid), ToHXSpectrum(tint),
                                         NumberOf(standard), NumberOf(mode), yule_nielsen, result);
  });
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::DotArea)

float PrintContrast(const Spectrum& solid, const Spectrum& tint, DensityMode mode,
                    const DensityOptions& options) try {
  CheckFilter(solid);
  CheckFilter(tint);
  float result = 0.0F;
  Require([&] {
    return DensityCalculator::GetContrast(ToHXSpectrum(solid), ToHXSpectrum(tint),
                                          NumberOf(options.standard), options.paper_relative,
                                          NumberOf(mode), result);
  });
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::PrintContrast)

float Trapping(const Spectrum& first, const Spectrum& second, const Spectrum& overprint,
               DensityMode mode, DensityStandard standard) try {
  float result = 0.0F;
  Require([&] {
    return DensityCalculator::GetTrapping(ToHXSpectrum(first), ToHXSpectrum(second),
                                          ToHXSpectrum(overprint), NumberOf(standard),
                                          NumberOf(mode), result);
  });
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::Trapping)

float Greyness(const Spectrum& spectrum, const DensityOptions& options) try {
  CheckFilter(spectrum);
  float result = 0.0F;
  Require([&] {
    return DensityCalculator::GetGreyness(ToHXSpectrum(spectrum), NumberOf(options.standard),
                                          options.paper_relative, result, true);
  });
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::Greyness)

float HueError(const Spectrum& spectrum, const DensityOptions& options) try {
  CheckFilter(spectrum);
  float result = 0.0F;
  Require([&] {
    return DensityCalculator::GetHueError(ToHXSpectrum(spectrum), NumberOf(options.standard),
                                          options.paper_relative, result, true);
  });
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::HueError)

ColorField RecognizeField(const Spectrum& spectrum, const std::array<Densities, 4>& solids,
                          const std::array<float, 3>& tones, DensityStandard standard) try {
  constexpr int kFirstOverprint = 13;
  constexpr int kFirstSolid = 16;
  std::array<HXDensity, 4> references;
  for (std::size_t i = 0; i < references.size(); ++i) {
    references[i].SetAll({solids[i].black, solids[i].cyan, solids[i].magenta, solids[i].yellow});
  }
  const std::array<float, 4> nominal = {0.0F, tones[0], tones[1], tones[2]};
  std::array<ColorFieldResult, 12> results{};
  int field = 0;
  int color = 0;
  HXDensity density;
  Require([&] {
    return DensityCalculator::RecognizeColorField(references.data(), ToHXSpectrum(spectrum),
                                                  NumberOf(standard), nominal.data(), field, color,
                                                  density, results.data());
  });
  ColorField result;
  const auto& all = density.GetAll();
  result.densities = {all[0], all[1], all[2], all[3]};
  if (field >= kFirstSolid) {
    result.kind = FieldKind::Solid;
    result.channel = static_cast<DensityChannel>(color);
  } else if (field >= kFirstOverprint) {
    result.kind = FieldKind::Overprint;
    result.channel = static_cast<DensityChannel>(field - kFirstOverprint + 1);
  } else if (field > 0) {
    result.kind = FieldKind::Tint;
    result.channel = static_cast<DensityChannel>(color);
    result.tone = (field + 3 - color) / 4;
    result.dot_gain = results[static_cast<std::size_t>(field - 1)].dotGain;
  } else {
    result.channel = static_cast<DensityChannel>(color);
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::RecognizeField)

}  // namespace Aldermoor::Measure
