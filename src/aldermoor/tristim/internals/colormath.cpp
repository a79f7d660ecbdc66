#include "aldermoor/tristim/internals/colormath.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <numbers>

#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {
namespace {

using std::numbers::pi;

double Widen(float value) {
  return static_cast<double>(value);
}

}  // namespace

Triple XyzFromSpectrum(const AxisWeights& weights, const float* spectrum) noexcept {
  Triple xyz = {0.0F, 0.0F, 0.0F};
  for (std::size_t j = 0; j < HXSpectrum::kBands; ++j) {
    xyz[0] += weights[0][j] * spectrum[j];
    xyz[1] += weights[1][j] * spectrum[j];
    xyz[2] += weights[2][j] * spectrum[j];
  }
  return xyz;
}

Triple LabFromXyz(const Triple& xyz, const Triple& white) noexcept {
  Triple f;
  for (std::size_t i = 0; i < f.size(); ++i) {
    const float t = xyz[i] * white[1] / white[i] / 100.0F;
    f[i] = Widen(t) > 0.008856 ? std::pow(t, 0.33333334F) : 7.787F * t + 0.13793103F;
  }
  const float lightness = 116.0F * f[1] - 16.0F;
  return {lightness < 0.0F ? 0.0F : lightness, (f[0] - f[1]) * 500.0F, (f[1] - f[2]) * 200.0F};
}

Triple XyzFromLab(const Triple& lab, const Triple& white) noexcept {
  Triple f;
  f[1] = (lab[0] + 16.0F) / 116.0F;
  f[0] = lab[1] / 500.0F + f[1];
  f[2] = f[1] - lab[2] / 200.0F;
  Triple xyz;
  for (std::size_t i = 0; i < f.size(); ++i) {
    const float w = white[i] * 100.0F / white[1];
    xyz[i] =
        Widen(f[i]) > 0.206893034423 ? f[i] * f[i] * f[i] * w : (f[i] - 0.13793103F) * w / 7.787F;
  }
  return xyz;
}

float HueOf(float a, float b) noexcept {
  if (std::abs(a) < 1e-5F && std::abs(b) < 1e-5F) {
    return 360.0F;
  }
  const float hue = std::atan2(b, a) * 57.29577951308232F;
  return hue <= 0.0F ? hue + 360.0F : hue;
}

Triple PolarFromRectangular(const Triple& rectangular) noexcept {
  const float a = rectangular[1];
  const float b = rectangular[2];
  const float chroma = std::sqrt(a * a + b * b);
  return {rectangular[0], chroma, HueOf(a, b)};
}

Triple XyYFromXyz(const Triple& xyz) noexcept {
  const float sum = xyz[0] + xyz[1] + xyz[2];
  return {xyz[0] / sum, xyz[1] / sum, xyz[1]};
}

float UvDivisor(const Triple& xyz) noexcept {
  return xyz[0] + 15.0F * xyz[1] + 3.0F * xyz[2];
}

Triple LuvFromXyz(float lightness, const Triple& xyz) noexcept {
  const float d = UvDivisor(xyz);
  return {lightness, 4.0F * xyz[0] / d, 9.0F * xyz[1] / d};
}

// The chromaticity of the equal-energy light, 4/19 and 9/19.
constexpr float kEqualEnergyU = 0.21052632F;
constexpr float kEqualEnergyV = 0.47368422F;

Triple UvY1976FromXyz(const Triple& xyz) noexcept {
  const float sum = xyz[0] + xyz[1] + xyz[2];
  const bool black = sum == 0.0F;
  const float x = black ? 0.0F : xyz[0] / sum;
  const float y = black ? 0.0F : xyz[1] / sum;
  const float z = black ? 0.0F : xyz[2] / sum;
  const float d = 15.0F * y + x + 3.0F * z;
  if (d == 0.0F) {
    return {kEqualEnergyU, kEqualEnergyV, xyz[1]};
  }
  return {4.0F * x / d, 9.0F * y / d, xyz[1]};
}

Triple UvY1976FromXyY(const Triple& xyy) noexcept {
  if (xyy[2] == 0.0F) {
    return {kEqualEnergyU, kEqualEnergyV, xyy[2]};
  }
  const float d = -2.0F * xyy[0] + 12.0F * xyy[1] + 3.0F;
  return {4.0F * xyy[0] / d, 9.0F * xyy[1] / d, xyy[2]};
}

Triple UvY1960FromUvY1976(const Triple& uvy) noexcept {
  return {uvy[0], uvy[1] * 2.0F / 3.0F, uvy[2]};
}

Triple HunterLabFromXyz(const Triple& xyz, const Triple& white) noexcept {
  float root = std::sqrt(xyz[1]);
  if (Widen(root) < 0.0001) {
    root = 0.0001F;
  }
  return {10.0F * root, (100.0F / white[0] * xyz[0] - xyz[1]) * 17.5F / root,
          (xyz[1] - 100.0F / white[2] * xyz[2]) * 7.0F / root};
}

float ShortWaveShare(const float* x_weights) noexcept {
  constexpr std::size_t kBandsTo500nm = 13;
  float sum = 0.0F;
  for (std::size_t i = 0; i < kBandsTo500nm; ++i) {
    sum += x_weights[i];
  }
  return sum / 100.0F;
}

Triple RxRyRzFromXyz(const Triple& xyz, const Triple& white, float short_wave_share) noexcept {
  const float a = white[0] / 100.0F - short_wave_share;
  const float c = white[2] / 100.0F;
  return {xyz[0] / a - xyz[2] * short_wave_share / (a * c), xyz[1], xyz[2] / c};
}

Triple LchHxFromLch(const Triple& lch) noexcept {
  const float lightness =
      lch[0] >= 16.0F ? 0.01765F * lch[0] + std::log(0.040975F * lch[0]) / 0.040975F + 34.7231F
                      : lch[0] / 0.511F;
  const double c = Widen(lch[1]);
  const double chroma = std::log(0.072158 * c + 0.638) * 12.253 + 0.181547 * c + 5.506710052490234;

  constexpr std::array<float, 4> kCos = {-0.09622F, -0.06742F, -0.02137F, 0.00587F};
  constexpr std::array<float, 4> kSin = {0.13893F, -0.0539F, -0.04029F, -0.01043F};
  const auto r = static_cast<float>(Widen(lch[2]) * pi / 180.0);
  float hue = 0.17914F + r;
  for (std::size_t n = 0; n < kCos.size(); ++n) {
    const float angle = static_cast<float>(n + 1) * r;
    hue = hue + std::cos(angle) * kCos[n] + std::sin(angle) * kSin[n];
  }
  return {lightness, static_cast<float>(chroma), hue * 180.0F / static_cast<float>(pi)};
}

Triple LabHxFromLchHx(const Triple& lch) noexcept {
  const double angle = Widen(lch[2]) * pi / 180.0;
  return {lch[0], static_cast<float>(Widen(lch[1]) * std::cos(angle)),
          static_cast<float>(Widen(lch[1]) * std::sin(angle))};
}

Triple DeltaLch(const Quadruple& first, const Quadruple& second) noexcept {
  float squares = 0.0F;
  for (std::size_t i = 0; i < first.size(); ++i) {
    const float d = first[i] - second[i];
    squares += d * d;
  }
  const float length = std::sqrt(squares);
  const float lightness = first[0] - second[0];
  const float chroma = std::sqrt(first[1] * first[1] + first[2] * first[2]) -
                       std::sqrt(second[1] * second[1] + second[2] * second[2]);
  // The absolute value keeps a rounding residue from becoming a NaN.
  const float hue = std::sqrt(std::abs(length * length - lightness * lightness - chroma * chroma));
  const bool turns = first[1] * second[2] - first[2] * second[1] > 0.0F;
  return {lightness, chroma, turns ? -hue : hue};
}

}  // namespace Aldermoor::Tristim::Internals
