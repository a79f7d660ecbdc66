#ifndef ALDERMOOR_TRISTIM_INTERNALS_DENSITYMATH_H
#define ALDERMOOR_TRISTIM_INTERNALS_DENSITYMATH_H

#include <array>
#include <span>

#include "aldermoor/tristim/internals/colormath.h"

/// The formulas of density and print control.  Every input stands in the signature, nothing is
/// remembered.
///
/// Channels: 0 black (visual), 1 cyan, 2 magenta, 3 yellow.  Units: density; dot area, contrast,
/// trapping, greyness and hue error as fractions, 1 = 100 %.
/// Precision: single; powers of 10 in double.
namespace Aldermoor::Tristim::Internals {

/// In the place of the density of a reflectance of 0 or below.
inline constexpr float kGreatestDensity = 9.99F;

/// The 36 weights of the four channels.
using DensityWeights = std::array<const float*, 4>;

[[nodiscard]] float DensityOf(float reflectance) noexcept;

/// The visual weights add up to 100 and not to 1, which 2 on the density makes up for.
[[nodiscard]] Quadruple DensitiesOfSums(const Quadruple& sums) noexcept;
/// Each channel summed from band 0 upward.
[[nodiscard]] Quadruple DensitiesOf(const DensityWeights& weights, const float* spectrum) noexcept;

/// Cyan, magenta and yellow in descending order.
[[nodiscard]] Triple SortedColors(const Quadruple& densities) noexcept;
/// The channel to report: the strongest one, or black for a measurement that is nearly white or
/// nearly neutral.
[[nodiscard]] int StrongestChannel(const Quadruple& densities) noexcept;

/// Murray-Davies with the Yule-Nielsen factor `n`; 0 for a solid of next to no density.
/// Source: ISO 12647-1.
[[nodiscard]] float DotArea(float solid, float tint, float n) noexcept;
/// Print contrast; 0 for a solid of next to no density.  Source: ISO 12647-1.
[[nodiscard]] float Contrast(float solid, float tint) noexcept;
/// Preucil's formula; 1 for a second ink of next to no density.
/// Source: F. Preucil, TAGA Proceedings 1958.
[[nodiscard]] float Trapping(float first, float second, float overprint) noexcept;
/// Preucil's greyness of an ink from its sorted densities; 1 for one of next to no density.
[[nodiscard]] float Greyness(const Triple& sorted) noexcept;
/// Preucil's hue error; 0 for an ink of next to no density, no number for equal densities.
[[nodiscard]] float HueError(const Triple& sorted) noexcept;

/// Tone value in percent of a density against that of its solid, as Murray and Davies have it; 100
/// for a solid of next to no density.
[[nodiscard]] float ToneValue(float solid, float density) noexcept;

/// A nominal tone value in percent and its number.
struct Tone {
  float value = 0.0F;
  int number = 0;
};

/// The three nominal tones in ascending order; a value of 100 and above becomes 0.
[[nodiscard]] std::array<Tone, 3> SortedTones(const std::array<Tone, 3>& tones) noexcept;
/// The number of the one among the sorted tones to which a measured tone value belongs, after the
/// usual gain was put on the nominal ones: 0 for none, -1 for the solid.
[[nodiscard]] int MatchTone(const std::array<Tone, 3>& sorted, float measured) noexcept;

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DENSITYMATH_H
