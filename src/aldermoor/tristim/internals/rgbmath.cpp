#include <algorithm>
#include <cmath>
#include <cstddef>

#include "aldermoor/tristim/internals/colormath.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr std::size_t kGammaCount = 512;
using GammaTable = std::array<float, kGammaCount>;

/// Linear light of the channel values in steps of a half; entry i belongs to i / 2.
GammaTable MakeGammaTable() noexcept {
  GammaTable table{};
  for (std::size_t i = 1; i < table.size(); ++i) {
    table[i] =
        static_cast<float>(std::pow(static_cast<double>(i) * 0.5 / 255.0, 2.2222222810910086));
  }
  return table;
}

/// Built by the first call, which may come before the static objects of this file.
const GammaTable& Gamma() noexcept {
  static const GammaTable table = MakeGammaTable();
  return table;
}

/// The greatest channel value, 0..255, whose linear light is not above `linear`.
float ChannelFromLinear(float linear, const GammaTable& gamma) noexcept {
  int low = 0;
  int high = kGammaCount - 1;
  int middle = kGammaCount / 2;
  while (low != middle) {
    if (gamma[static_cast<std::size_t>(middle)] > linear) {
      high = middle;
    } else {
      low = middle;
    }
    middle = (high - low) / 2 + low;
  }
  const int index = gamma[static_cast<std::size_t>(low)] > linear ? low - 1 : low;
  return static_cast<float>(index / 2);
}

}  // namespace

Triple RgbFromXyz(const Triple& xyz) noexcept {
  constexpr std::array<Triple, 3> kMatrix = {{{0.03065F, -0.01394F, -0.00476F},
                                              {-0.00969F, 0.01876F, 0.00042F},
                                              {0.00068F, -0.00229F, 0.0107F}}};
  const GammaTable& gamma = Gamma();
  Triple rgb;
  for (std::size_t i = 0; i < rgb.size(); ++i) {
    const Triple& row = kMatrix[i];
    rgb[i] = ChannelFromLinear(row[0] * xyz[0] + row[1] * xyz[1] + row[2] * xyz[2], gamma);
  }
  return rgb;
}

Triple XyzFromRgb(const Triple& rgb) noexcept {
  constexpr std::array<double, 3> kWhite = {96.42, 100.0, 82.49};
  constexpr std::array<std::array<double, 3>, 3> kMatrix = {{{0.40130692, 0.33720568, 0.2614874},
                                                             {0.2073, 0.6805, 0.1122},
                                                             {0.01515519, 0.10160039, 0.88324442}}};
  std::array<double, 3> c{};
  for (std::size_t i = 0; i < c.size(); ++i) {
    c[i] = static_cast<double>(rgb[i]) / 255.0;
    c[i] = c[i] > 0.0 ? c[i] * c[i] : c[i];
  }
  Triple xyz;
  for (std::size_t i = 0; i < xyz.size(); ++i) {
    const auto& row = kMatrix[i];
    xyz[i] = static_cast<float>(kWhite[i] * (row[0] * c[0] + row[1] * c[1] + row[2] * c[2]));
  }
  return xyz;
}

Triple RgbFromCmyk(const Quadruple& cmyk) noexcept {
  std::array<double, 4> ink{};
  for (std::size_t i = 0; i < ink.size(); ++i) {
    ink[i] = static_cast<double>(cmyk[i]) / 100.0;
  }
  const double k = ink[3];
  const double g = std::min({ink[0], ink[1], ink[2]});
  Triple rgb;
  for (std::size_t i = 0; i < rgb.size(); ++i) {
    const double x = ink[i];
    const double covered = (0.8 * k + x - 0.2 * g - 0.8 * x * k + 0.2 * g * k) * 100.0;
    rgb[i] = static_cast<float>(255.0 - 2.55 * std::clamp(covered, 0.0, 100.0));
  }
  return rgb;
}

}  // namespace Aldermoor::Tristim::Internals
