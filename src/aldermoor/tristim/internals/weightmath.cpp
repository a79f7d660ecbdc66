#include "aldermoor/tristim/internals/weightmath.h"

#include <algorithm>

#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr char kTooFew[] = "Measure conditions: Too few measure data";
constexpr char kBandwidth[] = "Measure conditions: Check bandwidth of measure data";
constexpr char kStepNotInteger[] =
    "Measure conditions: measure data bandwith conflicts Step size is not a integer.";
constexpr char kOffGrid[] =
    "Measure conditions: measure data bandwith conflicts with internal calculation bandwith.";

// Fewer leave no interval in which all four nodes of a cubic lie.
constexpr int kLeastIntervals = 4;
constexpr int kLeastCount = 4;

float Quotient(int numerator, int denominator) {
  return static_cast<float>(numerator) / static_cast<float>(denominator);
}

std::size_t Index(int value) {
  return static_cast<std::size_t>(value);
}

}  // namespace

MeasureGrid MakeMeasureGrid(int count, int max, int min) try {
  const auto check = [](bool good, const char* text) {
    if (!good) {
      throw TristimException(text, ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MakeMeasureGrid));
    }
  };
  check(count >= kLeastCount, kTooFew);
  check(max > min, kBandwidth);
  check(max > kInternalMin, kBandwidth);
  check(min < kInternalMax, kBandwidth);
  const MeasureGrid grid = {count, max, min, (max - min) / (count - 1)};
  check(grid.step != 0, kBandwidth);
  check((kInternalMax - kInternalMin) % grid.step == 0, kStepNotInteger);
  check((kInternalMin - min) % grid.step == 0, kOffGrid);
  check((kInternalMin - max) % grid.step == 0, kOffGrid);
  check(grid.Intervals() >= kLeastIntervals, kTooFew);
  return grid;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MakeMeasureGrid)

QuadraticCoefficients LagrangeQuadratic(int step, int offset) {
  const int s = step;
  QuadraticCoefficients c;
  c.fill(std::vector<float>(Index(s)));
  for (int j = 0; j < s; ++j) {
    const int x = j + offset;
    const std::size_t i = Index(j);
    c[0][i] = Quotient((x - s) * (x - 2 * s), 2 * s * s);
    c[1][i] = Quotient(x * (x - 2 * s), s * (s - 2 * s));
    c[2][i] = Quotient(x * (x - s), 2 * s * (2 * s - s));
  }
  return c;
}

CubicCoefficients LagrangeCubic(int step, int offset) {
  const int s = step;
  CubicCoefficients c;
  c.fill(std::vector<float>(Index(s)));
  for (int j = 0; j < s; ++j) {
    const int x = j + offset;
    const std::size_t i = Index(j);
    c[0][i] = Quotient((x - s) * (x - 2 * s) * (x - 3 * s), 2 * s * -s * 3 * s);
    c[1][i] = Quotient(x * (x - 2 * s) * (x - 3 * s), s * (s - 2 * s) * (s - 3 * s));
    c[2][i] = Quotient(x * (x - s) * (x - 3 * s), 2 * s * (2 * s - s) * (2 * s - 3 * s));
    c[3][i] = Quotient(x * (x - s) * (x - 2 * s), 3 * s * (3 * s - s) * (3 * s - 2 * s));
  }
  return c;
}

std::vector<float> InterpolateTo1nm(std::span<const float> nodes, int step) {
  const std::size_t s = Index(step);
  const std::size_t n = nodes.size();
  const QuadraticCoefficients first = LagrangeQuadratic(step, 0);
  const CubicCoefficients middle = LagrangeCubic(step, step);
  const QuadraticCoefficients last = LagrangeQuadratic(step, step);
  std::vector<float> curve(kInternalCount);
  for (std::size_t j = 0; j < s; ++j) {
    curve[j] = first[0][j] * nodes[0] + first[1][j] * nodes[1] + first[2][j] * nodes[2];
  }
  for (std::size_t k = 0; k + 3 < n; ++k) {
    for (std::size_t j = 0; j < s; ++j) {
      curve[s * (k + 1) + j] = middle[0][j] * nodes[k] + middle[1][j] * nodes[k + 1] +
                               middle[2][j] * nodes[k + 2] + middle[3][j] * nodes[k + 3];
    }
  }
  for (std::size_t j = 0; j < s; ++j) {
    curve[s * (n - 2) + j] =
        last[0][j] * nodes[n - 3] + last[1][j] * nodes[n - 2] + last[2][j] * nodes[n - 1];
  }
  curve[s * (n - 1)] = nodes[n - 1];
  return curve;
}

std::vector<float> FoldOntoNodes(std::span<const float> curve, int step) {
  const std::size_t s = Index(step);
  const std::size_t n = Index((kInternalMax - kInternalMin) / step);
  const QuadraticCoefficients a = LagrangeQuadratic(step, 0);
  const CubicCoefficients c = LagrangeCubic(step, step);
  const QuadraticCoefficients b = LagrangeQuadratic(step, step);
  const auto part = [curve, s](const std::vector<float>& coefficients, std::size_t interval) {
    return DotProduct(coefficients, curve.subspan(interval * s, s));
  };
  std::vector<float> w(n + 1);
  w[0] = part(a[0], 0) + part(c[0], 1);
  w[1] = part(a[1], 0) + part(c[1], 1) + part(c[0], 2);
  w[2] = part(a[2], 0) + part(c[2], 1) + part(c[1], 2) + part(c[0], 3);
  for (std::size_t i = 3; i + 3 <= n; ++i) {
    w[i] = part(c[3], i - 2) + part(c[2], i - 1) + part(c[1], i) + part(c[0], i + 1);
  }
  // With four or five intervals these write over nodes from above.
  w[n - 2] = part(c[3], n - 4) + part(c[2], n - 3) + part(c[1], n - 2) + part(b[0], n - 1);
  w[n - 1] = part(c[3], n - 3) + part(c[2], n - 2) + part(b[1], n - 1);
  return w;
}

std::vector<float> TransferToBands(std::span<const float> nodes, const MeasureGrid& grid) {
  const int n = grid.Intervals();
  const int first = (grid.min - kInternalMin) / grid.step;
  const int end_band = grid.count - 1;
  // All bands start at 0, so those outside the internal range need no further care.
  std::vector<float> bands(Index(grid.count));
  for (int i = 0; i < n; ++i) {
    const int band = std::clamp(i - first, 0, end_band);
    const float node = nodes[Index(i)];
    const bool gathers = band == 0 || band == end_band;
    bands[Index(band)] = gathers ? bands[Index(band)] + node : node;
  }
  return bands;
}

}  // namespace Aldermoor::Tristim::Internals
