#ifndef ALDERMOOR_TESTS_MEASURE_SUPPORT_H
#define ALDERMOOR_TESTS_MEASURE_SUPPORT_H

#include <array>
#include <cmath>
#include <cstddef>
#include <limits>
#include <random>
#include <string>
#include <utility>
#include <vector>

#include "aldermoor/measure/context.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Measure::Tests {

using Vexdoc::Conditions;

inline Conditions Words(std::initializer_list<std::pair<const char*, std::string>> words) {
  Conditions conditions;
  for (const auto& [key, word] : words) {
    conditions.AddAttribute(key, word);
  }
  return conditions;
}

constexpr const char* kSpace = "ColorSpaceDescription.Type";
constexpr const char* kFormula = "ColorSpaceDescription.DeltaEFormula";
constexpr const char* kIllumination = "Colorimetric.Illumination";
constexpr const char* kObserver = "Colorimetric.Observer";
constexpr const char* kWhiteBase = "Colorimetric.WhiteBase";

/// A reflectance spectrum of a document.
inline Vexdoc::Spectrum Reflectance(const std::vector<float>& values) {
  return Vexdoc::Spectrum(Words({{"Physical.Filter", "No"},
                                 {"Physical.SpectrumType", "Remission"},
                                 {"Physical.NumberOfDataPointsSpectrum", "36"},
                                 {"Physical.WavelengthSpectrumMin", "380nm"},
                                 {"Physical.WavelengthSpectrumMax", "730nm"}}),
                          values);
}

/// Every illuminant under both observers.
inline std::vector<Conditions> AllLights() {
  std::vector<Conditions> lights;
  std::vector<std::string> words = {
      "A", "B", "C", "D50", "D55", "D65", "D75", "Emission", "Dxx, Temperature:6500"};
  for (int number = 1; number <= 12; ++number) {
    words.push_back("F" + std::to_string(number) + " ");
  }
  for (const char* const observer : {"TwoDegree", "TenDegree"}) {
    for (const std::string& word : words) {
      lights.push_back(Words({{kIllumination, word}, {kObserver, observer}}));
    }
    std::vector<float> curve;
    for (std::size_t i = 0; i < kBands; ++i) {
      curve.push_back(20.0F + 2.0F * static_cast<float>(i));
    }
    lights.push_back(Words({{kIllumination, "Userdefined"}, {kObserver, observer}}));
    lights.back().SetCustomIllumination(Reflectance(curve));
  }
  return lights;
}

/// Spectra, colours and among them what no instrument gives.
class Numbers {
 public:
  explicit Numbers(unsigned seed) : random_(seed) {}

  float Uniform(float low, float high) {
    return low + (high - low) * std::uniform_real_distribution<float>()(random_);
  }

  float Edge() {
    constexpr float kInfinity = std::numeric_limits<float>::infinity();
    constexpr std::array kEdges = {0.0F,
                                   -0.0F,
                                   -1.0F,
                                   1.0F,
                                   2.0F,
                                   1e-5F,
                                   1e-30F,
                                   std::numeric_limits<float>::denorm_min(),
                                   3e-40F,
                                   3e38F,
                                   kInfinity,
                                   -kInfinity,
                                   1e6F,
                                   -0.00001F,
                                   std::numeric_limits<float>::quiet_NaN()};
    return kEdges[random_() % kEdges.size()];
  }

  /// Mostly reflectances of all levels; every eighth row has edges in single bands, every
  /// thirty-second is one edge all over.
  std::vector<float> Spectra(std::size_t count, std::size_t stride = kBands) {
    std::vector<float> values(count * stride, std::numeric_limits<float>::quiet_NaN());
    for (std::size_t row = 0; row < count; ++row) {
      const float level = Uniform(0.0F, 1.1F) * (row % 3 == 0 ? Uniform(0.0F, 0.1F) : 1.0F);
      const float all = Edge();
      for (std::size_t band = 0; band < kBands; ++band) {
        const bool is_edge = row % 8 == 0 && random_() % 12 == 0;
        values[row * stride + band] = row % 32 == 31 ? all
                                      : is_edge      ? Edge()
                                                     : level * Uniform(0.0F, 1.0F);
      }
    }
    return values;
  }

  /// Turns colours to hues all around, and takes one in seven towards an axis, or to the neutral
  /// one, as near as floats come.
  void Turn(std::vector<float>& colors) {
    for (std::size_t i = 0; i + 2 < colors.size(); i += 3) {
      for (std::size_t k = i + 1; k < i + 3; ++k) {
        const bool is_near = i % 7 == 0 && random_() % 3 != 0;
        colors[k] *= Uniform(-1.0F, 1.0F) * (is_near ? std::pow(10.0F, Uniform(-46.0F, 0.0F)) : 1);
      }
    }
  }

  /// Rows around `centers` of three channels: near, far, equal, opposite, mirrored, neutral.
  std::vector<float> Around(const std::vector<float>& centers) {
    std::vector<float> values = centers;
    for (std::size_t row = 0; row < values.size() / 3; ++row) {
      float* const v = values.data() + 3 * row;
      const float distance = row % 5 == 0   ? 40.0F
                             : row % 5 == 1 ? 0.001F
                             : row % 5 == 2 ? 0.0F
                                            : 3.0F;
      for (std::size_t i = 0; i < 3; ++i) {
        v[i] += distance * Uniform(-1.0F, 1.0F);
      }
      if (row % 13 == 0) {
        v[1] = -v[1];
        v[2] = -v[2];
      }
      if (row % 11 < 2) {  // from the centre itself, so that hues are next to each other
        std::copy_n(centers.begin() + static_cast<std::ptrdiff_t>(3 * row), 3, v);
        v[1 + row % 2] *= row % 11 == 0 ? -1.0F : Uniform(0.9F, 1.1F);
      }
      if (row % 17 == 0) {
        v[2] = 0.0F;
      }
      if (row % 19 == 0) {
        v[1] = 0.0F;
      }
      if (row % 16 == 0) {
        v[random_() % 3] = Edge();
      }
    }
    return values;
  }

 private:
  std::mt19937 random_;
};

}  // namespace Aldermoor::Measure::Tests

#endif  // ALDERMOOR_TESTS_MEASURE_SUPPORT_H
