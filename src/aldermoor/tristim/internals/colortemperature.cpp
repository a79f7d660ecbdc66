#include "aldermoor/tristim/internals/colortemperature.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <optional>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

namespace Words = Vocabulary;

constexpr float kNoTemperature = -1.0F;
constexpr float kTangentHalf = 50.0F;  // kelvin to each side of the point of the locus

// 2hc² and hc/k in units of the metre, second, watt and kelvin.
constexpr double kC1 = 1.19104678203084e-16;
constexpr double kC2 = 0.014388443415906128;

struct Band {
  double wavelength;  // m
  double factor;      // kC1 / wavelength^5
};

const std::array<Band, HXSpectrum::kBands>& Bands() {
  static const auto bands = [] {
    constexpr double kNanometre = 1e-9;
    std::array<Band, HXSpectrum::kBands> result{};
    for (std::size_t i = 0; i < result.size(); ++i) {
      const double wavelength = static_cast<double>(380 + 10 * i) * kNanometre;
      result[i] = {wavelength, kC1 / std::pow(wavelength, 5)};
    }
    return result;
  }();
  return bands;
}

HXSpectrum::Bands Radiance(float temperature) {
  HXSpectrum::Bands values;
  const double kelvin = static_cast<double>(temperature);
  for (std::size_t i = 0; i < values.size(); ++i) {
    const auto [wavelength, factor] = Bands()[i];
    values[i] = static_cast<float>(factor / (std::exp(kC2 / (kelvin * wavelength)) - 1.0));
  }
  return values;
}

HXMeasureConditions AsEmission(const HXMeasureConditions& conditions) {
  HXMeasureConditions emission = conditions;
  emission.SetMeasureCondition(Words::kIlluminationKey, Words::kEmission);
  return emission;
}

Triple WithYOf100(const Triple& xyz) {
  return {100.0F * xyz[0] / xyz[1], 100.0F, 100.0F * xyz[2] / xyz[1]};
}

using Uv = std::array<float, 2>;

Uv Difference(const Uv& to, const Uv& from) {
  return {to[0] - from[0], to[1] - from[1]};
}

float Dot(const Uv& a, const Uv& b) {
  return a[0] * b[0] + a[1] * b[1];
}

/// The Planckian locus under an observer: what GetPlanckRadiatorXYZ and the conversion to u and v
/// give, without the objects in between.  Good until the weights of the process change.
class Locus {
 public:
  explicit Locus(const HXMeasureConditions& conditions) {
    TristimFilter& filter = TristimFilter::Get();
    filter.SetMeasuringConditions(AsEmission(conditions));
    weights_ = {filter[0], filter[1], filter[2]};
  }

  /// Whether `sample` is, to the last bit, the point of the locus.
  [[nodiscard]] bool IsAt(float temperature, const Uv& sample) const {
    return At(temperature) == sample;
  }

  /// Whether `temperature` is that of the nearest point, as far as some others tell.  Where the
  /// locus bends away or hardly moves, a right angle may be found at another place.
  [[nodiscard]] bool IsNearestAt(float temperature, const Uv& sample) const {
    constexpr float kOthers[] = {500.0F,  1000.0F, 1500.0F,  2000.0F,  3000.0F,
                                 5000.0F, 8000.0F, 20000.0F, 100000.0F};
    constexpr float kNextTo = 0.01F;  // of the temperature: differs by rounding alone
    constexpr float kNearer = 0.99F;  // of the squared distance: more than single precision errs
    const auto distance = [&](float kelvin) {
      const Uv to_sample = Difference(sample, At(kelvin));
      return Dot(to_sample, to_sample);
    };
    const float least = distance(temperature);
    return std::ranges::none_of(kOthers, [&](float other) {
      return std::abs(other - temperature) > kNextTo * temperature &&
             distance(other) < kNearer * least;
    });
  }

  [[nodiscard]] bool GetCosine(float temperature, const Uv& sample, double& cosine) const {
    const Uv to_sample = Difference(sample, At(temperature));
    const float distance = Dot(to_sample, to_sample);
    if (!(distance > 0.0F)) {
      return false;
    }
    const Uv tangent = Difference(At(temperature + kTangentHalf), At(temperature - kTangentHalf));
    const float length = Dot(tangent, tangent);
    if (!(length > 0.0F)) {
      return false;
    }
    cosine = static_cast<double>(Dot(to_sample, tangent)) /
             std::sqrt(static_cast<double>(distance)) / std::sqrt(static_cast<double>(length));
    return true;
  }

 private:
  Uv At(float temperature) const {
    const HXSpectrum::Bands radiance = Radiance(temperature);
    const Triple uvy =
        UvY1960FromUvY1976(UvY1976FromXyz(WithYOf100(XyzFromSpectrum(weights_, radiance.data()))));
    return {uvy[0], uvy[1]};
  }

  AxisWeights weights_;
};

/// The chromaticity of a light under its own conditions.
std::optional<Uv> UvOf(const HXSpectrum& spectrum) {
  HXMeasureConditions as_xyz = spectrum.GetMeasureConditions();
  as_xyz.SetMeasureCondition(Words::kColorSpaceKey, Words::kCIEXYZ);
  HXColorVector xyz;
  HXColorVector uvy;
  if (!TristimCalculator::GetVector_CIEXYZ(spectrum, as_xyz, xyz) ||
      !TristimCalculator::GetVector_CIEuvY1960(xyz, uvy)) {
    return std::nullopt;
  }
  return Uv{uvy[0], uvy[1]};
}

float Rounded(float kelvin) {
  return std::floor(kelvin + 0.5F);
}

// 0 counts as positive.
bool IsNegative(double cosine) {
  return cosine < 0.0;
}

}  // namespace

HXSpectrum ColorTemperature::GetPlanckRadiator(float temperature,
                                               const HXMeasureConditions& conditions) const try {
  return HXSpectrum(Radiance(temperature).data(), AsEmission(conditions));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorTemperature::GetPlanckRadiator)

HXColorVector ColorTemperature::GetPlanckRadiatorXYZ(float temperature,
                                                     const HXMeasureConditions& conditions) const
    try {
  HXMeasureConditions as_xyz = AsEmission(conditions);
  as_xyz.SetMeasureCondition(Words::kColorSpaceKey, Words::kCIEXYZ);
  HXColorVector xyz;
  if (TristimCalculator::GetVector_CIEXYZ(GetPlanckRadiator(temperature, conditions), as_xyz,
                                          xyz)) {
    const Triple scaled = WithYOf100({xyz[0], xyz[1], xyz[2]});
    xyz[0] = scaled[0];
    xyz[1] = scaled[1];
    xyz[2] = scaled[2];
  }
  return xyz;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorTemperature::GetPlanckRadiatorXYZ)

bool ColorTemperature::GetPlanckianCosine(float temperature, const HXColorVector& sample,
                                          const HXMeasureConditions& conditions,
                                          double& cosine) const try {
  return Locus(conditions).GetCosine(temperature, {sample[0], sample[1]}, cosine);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorTemperature::GetPlanckianCosine)

float ColorTemperature::GetColorTemperature(const HXSpectrum& spectrum) const try {
  return Search(spectrum).temperature;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorTemperature::GetColorTemperature)

float ColorTemperature::FindColorTemperature(const HXSpectrum& spectrum) const try {
  const Found found = Search(spectrum);
  const float kelvin = found.temperature > 0.0F ? found.temperature : found.on_locus;
  const std::optional<Uv> sample = UvOf(spectrum);
  const bool is_good = kelvin > 0.0F && sample &&
                       Locus(spectrum.GetMeasureConditions()).IsNearestAt(kelvin, *sample);
  return is_good ? kelvin : kNoTemperature;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::ColorTemperature::FindColorTemperature)

ColorTemperature::Found ColorTemperature::Search(const HXSpectrum& spectrum) const {
  const auto none = [](float on_locus = kNoTemperature) {
    return Found{kNoTemperature, on_locus};
  };
  const std::optional<Uv> uv = UvOf(spectrum);
  if (!uv) {
    return none();
  }
  const Uv sample = *uv;
  const Locus locus(spectrum.GetMeasureConditions());
  float high = maximum_ - kTangentHalf;
  float low = minimum_ + kTangentHalf;
  double at_high = 0.0;
  double at_low = 0.0;
  if (!locus.GetCosine(high, sample, at_high) || !locus.GetCosine(low, sample, at_low) ||
      IsNegative(at_high) == IsNegative(at_low)) {
    return none(locus.IsAt(high, sample) ? high : kNoTemperature);
  }
  while (std::abs(high - low) > tolerance_) {
    const float middle = (high + low) / 2.0F;
    double at_middle = 0.0;
    if (!locus.GetCosine(middle, sample, at_middle)) {
      return none(locus.IsAt(middle, sample) ? Rounded(middle) : kNoTemperature);
    }
    if (IsNegative(at_middle) != IsNegative(at_high)) {
      low = middle;
    } else {
      high = middle;
      at_high = at_middle;
    }
  }
  return {Rounded((high + low) / 2.0F), kNoTemperature};
}

}  // namespace Aldermoor::Tristim::Internals
