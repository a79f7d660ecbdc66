#include "aldermoor/tristim/internals/colorrenderingcalculator.h"

#include <array>
#include <cmath>
#include <cstddef>
#include <optional>
#include <span>

#include "aldermoor/tristim/internals/colortemperature.h"
#include "aldermoor/tristim/internals/data/illuminantdata.h"
#include "aldermoor/tristim/internals/data/testcolordata.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

namespace Words = Vocabulary;

constexpr float kFirstDaylight = 5000.0F;  // kelvin
constexpr double kFar = 1000000.0;

double Widen(float value) {
  return static_cast<double>(value);
}

/// A colour in the CIE 1960 diagram.
struct UvY {
  float y = 0.0F;
  float u = 0.0F;
  float v = 0.0F;

  UvY WithYOf100() const { return {100.0F, u, v}; }
};

UvY UvYOf(const HXColorVector& xyz) {
  const double x = Widen(xyz[0]);
  const double y = Widen(xyz[1]);
  const double divisor = x + 15.0 * y + 3.0 * Widen(xyz[2]);
  return {xyz[1], static_cast<float>(4.0 * x / divisor), static_cast<float>(6.0 * y / divisor)};
}

double Distance(const UvY& first, const UvY& second) {
  const double u = Widen(first.u) - Widen(second.u);
  const double v = Widen(first.v) - Widen(second.v);
  return std::sqrt(u * u + v * v);
}

const HXMeasureConditions& BaseConditions() {
  static const HXMeasureConditions& conditions = *new HXMeasureConditions([] {
    HXMeasureConditions result;
    result.SetMeasureCondition(Words::kIlluminationKey, Words::kEmission);
    result.SetMeasureCondition(Words::kObserverKey, "TwoDegree");
    result.SetMeasureCondition(Words::kColorSpaceKey, Words::kCIEXYZ);
    result.SetMeasureCondition(Words::kDeltaEFormulaKey, Words::kCIELab);
    result.SetMeasureCondition(Words::kVectorKindKey, Words::kAbsoluteVector);
    return result;
  }());
  return conditions;
}

UvY UvYOfLamp(const HXSpectrum& lamp) {
  return UvYOf(TristimService::GetVector(lamp, BaseConditions()));
}

using SampleColors = std::array<UvY, Data::kTestColors.size()>;

// All samples under one lamp, one after the other: the weights are built once.
SampleColors UnderLamp(const HXSpectrum& lamp) {
  HXMeasureConditions conditions = BaseConditions();
  conditions.SetUserdefinedIllumination(lamp);
  SampleColors colors;
  for (std::size_t i = 0; i < colors.size(); ++i) {
    const HXSpectrum sample(Data::kTestColors[i].data(), conditions);
    colors[i] = UvYOf(TristimService::GetVector(sample, conditions));
  }
  return colors;
}

struct Cd {
  double c;
  double d;
};

Cd CdOf(const UvY& color) {
  const double u = Widen(color.u);
  const double v = Widen(color.v);
  return {(4.0 - u - 10.0 * v) / v, (1.708 * v + 0.404 - 1.481 * u) / v};
}

UvY Adapted(const UvY& color, const Cd& lamp, const Cd& reference) {
  const Cd own = CdOf(color);
  const double c = reference.c / lamp.c * own.c;
  const double d = reference.d / lamp.d * own.d;
  const double n = 16.518 + 1.481 * c - d;
  return {color.y, static_cast<float>((10.872 + 0.404 * c - 4.0 * d) / n),
          static_cast<float>(5.52 / n)};
}

using Wuv = std::array<double, 3>;

Wuv WuvOf(const UvY& color, const UvY& white) {
  const double w = 25.0 * std::pow(Widen(color.y), 1.0 / 3.0) - 17.0;
  return {w, 13.0 * w * (Widen(color.u) - Widen(white.u)),
          13.0 * w * (Widen(color.v) - Widen(white.v))};
}

double Distance(const Wuv& first, const Wuv& second) {
  double sum = 0.0;
  for (std::size_t i = 0; i < first.size(); ++i) {
    sum += (first[i] - second[i]) * (first[i] - second[i]);
  }
  return std::sqrt(sum);
}

/// A table of daylight from 300 nm on.
struct Daylight {
  const char* name;
  std::span<const float> values;
  std::size_t step;  // nm
};

constexpr Daylight kDaylights[] = {
    {"D50", Data::kIlluminantD50, 5},
    {"D55", Data::kIlluminantD55, 5},
    {"D65", Data::kIlluminantD65, 1},
    {"D75", Data::kIlluminantD75, 5},
};

HXSpectrum SpectrumOf(const Daylight& daylight) {
  HXSpectrum::Bands values;
  for (std::size_t i = 0; i < values.size(); ++i) {
    values[i] = daylight.values[(80 + 10 * i) / daylight.step];
  }
  return HXSpectrum(values.data(), BaseConditions());
}

std::optional<HXSpectrum> NearestDaylight(const UvY& source, std::size_t count, std::string& name) {
  std::optional<HXSpectrum> nearest;
  double least = kFar;
  for (const Daylight& daylight : std::span(kDaylights).first(count)) {
    const HXSpectrum spectrum = SpectrumOf(daylight);
    const double distance = Distance(UvYOfLamp(spectrum), source);
    if (distance < least) {
      least = distance;
      nearest = spectrum;
      name = daylight.name;
    }
  }
  return nearest;
}

// Sum of the special indices of the test colours.
double SumOfIndices(const HXSpectrum& source, const UvY& source_uvy, const HXSpectrum& reference,
                    const UvY& reference_uvy, std::size_t count) {
  const SampleColors under_reference = UnderLamp(reference);
  const SampleColors under_source = UnderLamp(source);
  const Cd from = CdOf(source_uvy);
  const Cd to = CdOf(reference_uvy);
  const UvY white = Adapted(source_uvy, from, to);
  double sum = 0.0;
  for (std::size_t i = 0; i < count; ++i) {
    const Wuv expected = WuvOf(under_reference[i], reference_uvy);
    const Wuv rendered = WuvOf(Adapted(under_source[i], from, to), white);
    sum += 100.0 - 4.6 * Distance(rendered, expected);
  }
  return sum;
}

}  // namespace

double ColorRenderingCalculator::GetColorRenderingIndex(const HXSpectrum& source, bool& valid,
                                                        std::string& reference) const try {
  return GetColorRenderingIndex(source, ColorTemperature().GetColorTemperature(source), valid,
                                reference);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorRenderingCalculator::GetColorRenderingIndex)

double ColorRenderingCalculator::GetColorRenderingIndex(const HXSpectrum& source, float kelvin,
                                                        bool& valid, std::string& reference) const
    try {
  valid = false;
  reference.clear();
  if (kelvin <= 0.0F) {
    return 0.0;
  }
  const UvY source_uvy = UvYOfLamp(source).WithYOf100();
  std::string name;
  const std::optional<HXSpectrum> light =
      kelvin < kFirstDaylight
          ? ColorTemperature().GetPlanckRadiator(kelvin, BaseConditions())
          : NearestDaylight(source_uvy, static_cast<std::size_t>(daylights_), name);
  if (!light) {
    return 0.0;
  }
  const UvY reference_uvy = UvYOfLamp(*light).WithYOf100();
  const double sum =
      SumOfIndices(source, source_uvy, *light, reference_uvy, static_cast<std::size_t>(samples_));
  if (std::isnan(sum)) {
    return 0.0;
  }
  valid = !(Distance(reference_uvy, source_uvy) > tolerance_);
  reference = name;
  return std::trunc(sum / samples_ + 0.5);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorRenderingCalculator::GetColorRenderingIndex)

}  // namespace Aldermoor::Tristim::Internals
