#include "aldermoor/tristim/internals/densitymath.h"

#include <cmath>
#include <cstddef>
#include <utility>

#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {
namespace {

// Below this a density is no base for a quotient.
constexpr float kLeastDensity = 0.01F;
constexpr float kNeutralRatio = 0.7F;

double Widen(float value) {
  return static_cast<double>(value);
}

bool IsBase(float density) {
  return std::abs(density) >= kLeastDensity;
}

// The light that a density takes away.
double Absorptance(float density) {
  return 1.0 - std::pow(10.0, -Widen(density));
}

}  // namespace

float DensityOf(float reflectance) noexcept {
  return reflectance > 0.0F ? -std::log10(reflectance) : kGreatestDensity;
}

Quadruple DensitiesOfSums(const Quadruple& sums) noexcept {
  return {DensityOf(sums[0]) + 2.0F, DensityOf(sums[1]), DensityOf(sums[2]), DensityOf(sums[3])};
}

Quadruple DensitiesOf(const DensityWeights& weights, const float* spectrum) noexcept {
  Quadruple sums{};
  for (std::size_t j = 0; j < HXSpectrum::kBands; ++j) {
    sums[0] += spectrum[j] * weights[0][j];
    sums[1] += spectrum[j] * weights[1][j];
    sums[2] += spectrum[j] * weights[2][j];
    sums[3] += spectrum[j] * weights[3][j];
  }
  return DensitiesOfSums(sums);
}

Triple SortedColors(const Quadruple& densities) noexcept {
  Triple sorted = densities[2] > densities[1] ? Triple{densities[2], densities[1], densities[3]}
                                              : Triple{densities[1], densities[2], densities[3]};
  if (sorted[2] > sorted[0]) {
    return {sorted[2], sorted[0], sorted[1]};
  }
  if (sorted[2] > sorted[1]) {
    std::swap(sorted[1], sorted[2]);
  }
  return sorted;
}

int StrongestChannel(const Quadruple& densities) noexcept {
  constexpr float kBelowAll = -100.0F;
  int best = -1;
  float highest = kBelowAll;
  for (int channel = 0; channel < 4; ++channel) {
    const float density = densities[static_cast<std::size_t>(channel)];
    if (density > highest) {
      highest = density;
      best = channel;
    }
  }
  const Triple sorted = SortedColors(densities);
  const float ratio = IsBase(sorted[0]) ? sorted[2] / sorted[0] : 1.0F;
  return best < 0 || highest < kLeastDensity || ratio > kNeutralRatio ? 0 : best;
}

float DotArea(float solid, float tint, float n) noexcept {
  const auto base = static_cast<float>(Absorptance(solid / n));
  return IsBase(base) ? static_cast<float>(Absorptance(tint / n) / Widen(base)) : 0.0F;
}

float Contrast(float solid, float tint) noexcept {
  return IsBase(solid) ? (solid - tint) / solid : 0.0F;
}

float Trapping(float first, float second, float overprint) noexcept {
  return IsBase(second) ? (overprint - first) / second : 1.0F;
}

float Greyness(const Triple& sorted) noexcept {
  return IsBase(sorted[0]) ? sorted[2] / sorted[0] : 1.0F;
}

float HueError(const Triple& sorted) noexcept {
  return IsBase(sorted[0]) ? (sorted[1] - sorted[2]) / (sorted[0] - sorted[2]) : 0.0F;
}

float ToneValue(float solid, float density) noexcept {
  const auto base = static_cast<float>(Absorptance(solid));
  return base > kLeastDensity ? static_cast<float>(Absorptance(density) / Widen(base) * 100.0)
                              : 100.0F;
}

std::array<Tone, 3> SortedTones(const std::array<Tone, 3>& tones) noexcept {
  std::array<Tone, 3> list = tones;
  for (Tone& tone : list) {
    tone.value = tone.value >= 100.0F ? 0.0F : tone.value;
  }
  const auto [first, second, third] = std::array<std::size_t, 3>{0, 1, 2};
  if (list[second].value > list[third].value) {
    std::swap(list[second], list[third]);
  }
  if (list[first].value > list[second].value) {
    std::swap(list[first], list[second]);
    if (list[second].value > list[third].value) {
      std::swap(list[second], list[third]);
    }
  }
  return list;
}

int MatchTone(const std::array<Tone, 3>& sorted, float measured) noexcept {
  constexpr int kNone = 0;
  constexpr int kSolid = -1;
  std::array<Tone, 4> list = {Tone{}, sorted[0], sorted[1], sorted[2]};
  for (std::size_t i = 1; i < list.size(); ++i) {
    const double v = Widen(list[i].value);
    list[i].value = static_cast<float>(v * ((1.0 - v / 100.0) * Widen(0.72F) + 1.0));
  }
  float bound = (100.0F + list[3].value) / 2.0F;
  if (measured > bound) {
    return kSolid;
  }
  for (std::size_t i = 3; i >= 1; --i) {
    const float upper = bound;
    bound = (list[i].value + list[i - 1].value) / 2.0F;
    if (upper >= measured && measured > bound && list[i].value != 0.0F) {
      return list[i].number;
    }
  }
  return kNone;
}

}  // namespace Aldermoor::Tristim::Internals
