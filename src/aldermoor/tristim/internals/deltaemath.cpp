#include "aldermoor/tristim/internals/deltaemath.h"

#include <array>
#include <cmath>
#include <cstddef>
#include <iterator>
#include <limits>
#include <numbers>

namespace Aldermoor::Tristim::Internals {
namespace {

using std::numbers::pi;
constexpr double kDegreesPerRadian = 57.29577951308232;

double Widen(float value) {
  return static_cast<double>(value);
}

Triple TripleOf(const Quadruple& channels) {
  return {channels[0], channels[1], channels[2]};
}

bool HasZero(const Triple& weights) {
  return weights[0] == 0.0F || weights[1] == 0.0F || weights[2] == 0.0F;
}

float Square(float value) {
  return value * value;
}

double Square(double value) {
  return value * value;
}

double CosDegrees(double degrees) {
  return std::cos(degrees / 360.0 * 2.0 * pi);
}

double SinDegrees(double degrees) {
  return std::sin(degrees / 360.0 * 2.0 * pi);
}

// sqrt(c^7 / (c^7 + 25^7))
double ChromaShare(double chroma) {
  constexpr double k25To7 = 6103515625.0;
  const double square = chroma * chroma;
  const double power = square * square * square * chroma;
  return std::sqrt(power / (power + k25To7));
}

// Degrees, at or above 0.
double HueDegrees(double radians) {
  double degrees = radians * kDegreesPerRadian;
  while (degrees < 0.0) {
    degrees += 360.0;
  }
  return degrees;
}

double MeanHue(double first, double second) {
  if (std::abs(first - second) > 180.0) {
    return first > second ? (360.0 - first + second) / 2.0 + first
                          : (360.0 - second + first) / 2.0 + second;
  }
  return (first + second) / 2.0;
}

}  // namespace

float DeltaE76(const Quadruple& first, const Quadruple& second) noexcept {
  float sum = 0.0F;
  for (std::size_t i = 0; i < first.size(); ++i) {
    sum += Square(first[i] - second[i]);
  }
  return std::sqrt(sum);
}

float DeltaE94(const Quadruple& first, const Quadruple& second, const Triple& weights) noexcept {
  if (HasZero(weights)) {
    return kNoDeltaE;
  }
  const float chroma = PolarFromRectangular(TripleOf(first))[1];
  const Triple delta = DeltaLch(first, second);
  const float sc = 1.0F + 0.045F * chroma;
  const float sh = 1.0F + 0.015F * chroma;
  return std::sqrt(Square(delta[0] / weights[0]) + Square(delta[1] / (weights[1] * sc)) +
                   Square(delta[2] / (weights[2] * sh)));
}

float DeltaECmc(const Quadruple& first, const Quadruple& second, float l, float c) noexcept {
  const auto [lightness, chroma, hue] = PolarFromRectangular(TripleOf(first));
  const Triple delta = DeltaLch(first, second);
  const float sl =
      lightness > 16.0F ? 0.040975F * lightness / (1.0F + 0.01765F * lightness) : 0.511F;
  const float sc = 0.0638F * chroma / (1.0F + 0.0131F * chroma) + 0.638F;
  const float chroma4 = Square(Square(chroma));
  const float f = std::sqrt(chroma4 / (chroma4 + 1900.0F));
  const bool is_blue_side = hue >= 164.0F && hue <= 345.0F;
  const float doubled = ((is_blue_side ? 168.0F : 35.0F) + hue) * 2.0F;
  const double wave = std::cos(Widen(doubled) * pi / 360.0);
  const auto t = static_cast<float>(is_blue_side ? 0.56 + std::abs(Widen(0.2F) * wave)
                                                 : 0.36 + std::abs(Widen(0.4F) * wave));
  const float sh = (f * t + 1.0F - f) * sc;
  return std::sqrt(Square(delta[0] / (l * sl)) + Square(delta[1] / (c * sc)) +
                   Square(delta[2] / sh));
}

float DeltaE2000(const Quadruple& first, const Quadruple& second, const Triple& weights) noexcept {
  if (HasZero(weights)) {
    return kNoDeltaE;
  }
  const double mean_chroma = (Widen(PolarFromRectangular(TripleOf(first))[1]) +
                              Widen(PolarFromRectangular(TripleOf(second))[1])) /
                             2.0;
  const double g = (1.0 - ChromaShare(mean_chroma)) * 0.5;
  std::array<double, 2> chroma{};
  std::array<double, 2> hue{};
  for (std::size_t i = 0; i < 2; ++i) {
    const Quadruple& lab = i == 0 ? first : second;
    const double a = (1.0 + g) * Widen(lab[1]);
    const double b = Widen(lab[2]);
    chroma[i] = std::sqrt(a * a + b * b);
    hue[i] = a == 0.0 && b == 0.0 ? 0.0 : std::atan2(b, a);
  }
  double turn = hue[1] - hue[0];
  if (turn > pi) {
    turn -= 2.0 * pi;
  } else if (turn < -pi) {
    turn += 2.0 * pi;
  }
  if (std::isnan(hue[0]) || std::isnan(hue[1])) {
    return kNoDeltaE;
  }
  const double delta_hue = 2.0 * std::sqrt(chroma[0] * chroma[1]) * std::sin(turn / 2.0);
  const double lightness = (Widen(first[0]) + Widen(second[0])) / 2.0;
  const double mean = (chroma[0] + chroma[1]) / 2.0;
  const double h = MeanHue(HueDegrees(hue[0]), HueDegrees(hue[1]));
  const double t = 1.0 - 0.17 * CosDegrees(h - 30.0) + 0.24 * CosDegrees(2.0 * h) +
                   0.32 * CosDegrees(3.0 * h + 6.0) - 0.2 * CosDegrees(4.0 * h - 63.0);
  const double from_grey = Square(lightness - 50.0);
  const double sl = 1.0 + 0.015 * from_grey / std::sqrt(20.0 + from_grey);
  const double sc = 1.0 + 0.045 * mean;
  const double sh = 1.0 + 0.015 * mean * t;
  const double theta = 30.0 * std::exp(-Square((h - 275.0) / 25.0));
  const double rt = -SinDegrees(2.0 * theta) * (2.0 * ChromaShare(mean));
  const double x = Widen(first[0] - second[0]) / (Widen(weights[0]) * sl);
  const double y = (chroma[1] - chroma[0]) / (Widen(weights[1]) * sc);
  const double z = delta_hue / (Widen(weights[2]) * sh);
  return static_cast<float>(std::sqrt(x * x + y * y + z * z + rt * y * z));
}

float DeltaEFmc2(const Triple& first, const Triple& second) noexcept {
  const float y1 = first[1];
  const float y2 = y1 * y1;
  const float y3 = y2 * y1;
  const float y4 = y3 * y1;
  const auto k1 =
      static_cast<float>(0.556689977645874 + 0.049434 * Widen(y1) - 0.00082575 * Widen(y2) +
                         7.9172e-6 * Widen(y3) - 3.0087e-8 * Widen(y4));
  const auto k2 = static_cast<float>(0.17548 + 0.027556 * Widen(y1) - 0.00057262 * Widen(y2) +
                                     6.3893e-6 * Widen(y3) - 2.6731e-8 * Widen(y4));
  const auto cones = [](const Triple& xyz) {
    return Triple{0.724F * xyz[0] + 0.382F * xyz[1] - 0.098F * xyz[2],
                  -0.48F * xyz[0] + 1.37F * xyz[1] + 0.1276F * xyz[2], 0.686F * xyz[2]};
  };
  const auto [p, q, s] = cones(first);
  const auto [p_other, q_other, s_other] = cones(second);
  const float dp = p_other - p;
  const float dq = q_other - q;
  const float ds = s_other - s;
  const float p2 = p * p;
  const float q2 = q * q;
  const float r = p2 + q2;
  if (!(r > 0.0F) || (!(y1 > 0.0F) && !(first[2] > 0.0F))) {
    return kNoDeltaE;
  }
  const float a2 = 1.73e-5F * r / (1.0F + 2.73F * p2 * q2 / (p2 * p2 + q2 * q2));
  const float b2 = 0.0003098F * (s * s + 0.2015F * y2);
  const float a = q * dp - p * dq;
  const float b = p * dp + q * dq;
  const float e1 = a * a / (a2 * r);
  const float e2 = Square(s * b / r - ds) / b2;
  const float g1 = k1 * k1 * (e1 + e2);
  const float g2 = k2 * k2 * 0.077841F * (b * b) / (a2 * r);
  return std::sqrt(g1 + g2);
}

namespace {

constexpr int kUnnamed = 1;
constexpr int kNeutralWhite = 13;
constexpr int kNeutralGray = 14;
constexpr int kNeutralBlack = 15;
constexpr int kNoHue = -1;

constexpr const char* kFamilyNames[] = {
    "Magenta", "Undefined", "Blue",   "Cyan",   "Turquo", "Green", "Olive", "YellowGreen",
    "Beige",   "Brown",     "Yellow", "Orange", "Red",    "White", "Gray",  "Black",
};

/// A row of the table of hues; the first one that holds decides.  Lightness and chroma are compared
/// as "below", but for the least lightness.
struct HueRow {
  int from;  // whole degrees, inclusive
  int to;
  float chroma_below;
  float lightness_below;
  float lightness_least;
  int family;
};

constexpr float kAny = std::numeric_limits<float>::infinity();

constexpr HueRow kHueRows[] = {
    {300, 334, kAny, kAny, -kAny, kUnnamed}, {260, 299, kAny, kAny, -kAny, 2},
    {210, 259, kAny, kAny, -kAny, 3},        {175, 209, kAny, kAny, -kAny, 4},
    {135, 174, kAny, kAny, -kAny, 5},        {110, 134, 50.0F, 50.0F, -kAny, 6},
    {110, 134, kAny, kAny, -kAny, 7},        {80, 109, 50.0F, kAny, 65.0F, 8},
    {90, 109, 70.0F, 65.0F, -kAny, 6},       {80, 89, 70.0F, 65.0F, -kAny, 9},
    {80, 109, kAny, kAny, -kAny, 10},        {45, 79, 70.0F, kAny, 65.0F, 8},
    {45, 79, 70.0F, 65.0F, -kAny, 9},        {45, 79, kAny, kAny, -kAny, 11},
    {20, 44, 40.0F, 50.0F, -kAny, 9},        {36, 44, 55.0F, 65.0F, -kAny, 9},
    {20, 44, kAny, kAny, -kAny, 12},
};

// Whole degrees; -1 for a colour on the neutral axis.
int WholeHue(float a, float b) {
  if (a == 0.0F) {
    return b > 0.0F ? 90 : b < 0.0F ? 270 : kNoHue;
  }
  const double degrees = std::atan(Widen(b / a)) * kDegreesPerRadian;
  const int t = std::isnan(degrees) ? 0 : static_cast<int>(degrees);
  if (a < 0.0F) {
    return t + 180;
  }
  return b < 0.0F ? t + 360 : t;
}

bool IsBelow(float value, float limit) {
  return limit == kAny || value < limit;
}

int ChromaticFamily(int hue, float chroma, float lightness) {
  for (const HueRow& row : kHueRows) {
    if (hue >= row.from && hue <= row.to && IsBelow(chroma, row.chroma_below) &&
        IsBelow(lightness, row.lightness_below) && lightness >= row.lightness_least) {
      return row.family;
    }
  }
  return 0;
}

int NeutralFamily(float lightness) {
  if (lightness >= 0.0F && lightness <= 30.0F) {
    return kNeutralBlack;
  }
  return lightness > 30.0F && lightness <= 80.0F ? kNeutralGray : kNeutralWhite;
}

}  // namespace

int ColorFamily(const Triple& lab) noexcept {
  const auto [lightness, a, b] = lab;
  const float chroma = std::sqrt(a * a + b * b);
  const double l = Widen(lightness);
  auto limit = static_cast<float>(lightness <= 75.0F ? 10.0 - l / 75.0 * 3.0
                                                     : 7.0 - (l - 75.0) / 25.0 * 2.0);
  const int hue = WholeHue(a, b);
  if (hue == kNoHue) {
    limit = 1001.0F;
  }
  return chroma > limit ? ChromaticFamily(hue, chroma, lightness) : NeutralFamily(lightness);
}

const char* ColorFamilyName(int family) noexcept {
  return family >= 0 && family < static_cast<int>(std::size(kFamilyNames)) ? kFamilyNames[family]
                                                                           : kFamilyNames[kUnnamed];
}

}  // namespace Aldermoor::Tristim::Internals
