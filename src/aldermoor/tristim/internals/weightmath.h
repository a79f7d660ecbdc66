#ifndef ALDERMOOR_TRISTIM_INTERNALS_WEIGHTMATH_H
#define ALDERMOOR_TRISTIM_INTERNALS_WEIGHTMATH_H

#include <array>
#include <cstddef>
#include <span>
#include <vector>

/// The numbers behind Weightfactors: interpolation to 1 nm and the folding of a 1 nm curve onto
/// measured bands.  Precision: single, every sum from the lowest wavelength upward.
/// Source of the method: ASTM E2022.
namespace Aldermoor::Tristim::Internals {

/// The grid on which illuminant and observer are multiplied: 360..780 nm, 1 nm.
inline constexpr int kInternalMin = 360;
inline constexpr int kInternalMax = 780;
inline constexpr std::size_t kInternalCount = 421;

/// The measured bands: `count` of them, from `min` to `max`, `step` apart; all nm.
struct MeasureGrid {
  int count;
  int max;
  int min;
  int step;

  /// How many steps the internal grid has.
  int Intervals() const { return (kInternalMax - kInternalMin) / step; }
};

/// Brings count, max and min to a grid.
/// Throws: TristimException unless the step divides 420, there are at least four of them, the
/// bands lie on a grid through 360 nm and overlap the internal one.
MeasureGrid MakeMeasureGrid(int count, int max, int min);

/// Sum of products, from index 0 upward; as many terms as `first` has.
inline float DotProduct(std::span<const float> first, std::span<const float> second) noexcept {
  float sum = 0.0F;
  for (std::size_t i = 0; i < first.size(); ++i) {
    sum += first[i] * second[i];
  }
  return sum;
}

using QuadraticCoefficients = std::array<std::vector<float>, 3>;
using CubicCoefficients = std::array<std::vector<float>, 4>;

/// Lagrange polynomials through the nodes 0, s, 2s (and 3s) at offset + j, j = 0..s - 1.
/// Numerators and denominators are whole numbers; each quotient is rounded once.
QuadraticCoefficients LagrangeQuadratic(int step, int offset);
CubicCoefficients LagrangeCubic(int step, int offset);

/// Values at 1 nm (421 of them) from values at 360, 360 + step, ... 780 nm: cubic inside, quadratic
/// in the first and last interval.
std::vector<float> InterpolateTo1nm(std::span<const float> nodes, int step);

/// What each of the nodes 360, 360 + step, ... stands for in the sum of `curve`, of which it takes
/// 420 values; the point at 780 nm is left out.
std::vector<float> FoldOntoNodes(std::span<const float> curve, int step);

/// The nodes at the measured bands.  Nodes outside the measured range go to the nearest end band;
/// bands outside the internal range, and one at 780 nm, get 0.
std::vector<float> TransferToBands(std::span<const float> nodes, const MeasureGrid& grid);

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_WEIGHTMATH_H
