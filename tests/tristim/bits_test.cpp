#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/support.h"

// Every compiler and every level of optimisation has to give the same bits.  The checksums below
// are over all channels of all results; they change only when a formula, a table or an order of
// summation changes.
namespace Aldermoor::Tristim::Tests {
namespace {

using Internals::TristimCalculator;

/// Linear congruential generator of Numerical Recipes; the same numbers everywhere.
class Lcg {
 public:
  /// In steps of 2^-16 of the range.
  float Next(float low = 0.0F, float high = 1.0F) {
    state_ = state_ * 1664525U + 1013904223U;
    return low + (high - low) * (static_cast<float>(state_ >> 16) / 65536.0F);
  }

 private:
  std::uint32_t state_ = 20260101U;
};

/// FNV-1a, 64 bit, over the bit patterns of floats, lowest byte first.
class Checksum {
 public:
  void Add(const HXColorVector& vector) { Add(vector.GetChannels()); }
  template <std::size_t N>
  void Add(const std::array<float, N>& values) {
    for (const float value : values) {
      // The sign of a NaN is the compiler's choice, so none may come up.
      ASSERT_FALSE(std::isnan(value));
      const auto bits = std::bit_cast<std::uint32_t>(value);
      for (unsigned shift = 0; shift < 32; shift += 8) {
        hash_ = (hash_ ^ ((bits >> shift) & 0xFFU)) * 1099511628211ULL;
      }
    }
  }
  std::uint64_t Get() const { return hash_; }

 private:
  std::uint64_t hash_ = 14695981039346656037ULL;
};

std::vector<HXMeasureConditions> AllLights(Lcg& random) {
  std::vector<HXMeasureConditions> lights;
  for (const char* const observer : {"TwoDegree", "TenDegree"}) {
    for (const char* const word :
         {"A", "B", "C", "D50", "D55", "D65", "D75", "Emission", "Dxx, Temperature:4000",
          "Dxx, Temperature:6996", "Dxx, Temperature:6997", "Dxx, Temperature:25000"}) {
      lights.push_back(Conditions(word, observer));
    }
    for (int number = 1; number <= 12; ++number) {
      lights.push_back(Conditions(std::string("F").append(std::to_string(number)) + " ", observer));
    }
    HXSpectrum curve;
    for (unsigned i = 0; i < HXSpectrum::kBands; ++i) {
      curve[i] = random.Next(10.0F, 100.0F);
    }
    lights.push_back(Conditions("D65", observer));
    lights.back().SetUserdefinedIllumination(curve);
  }
  return lights;
}

TEST(BitsTest, OfAllColorSpacesFromSpectra) {
  Lcg random;
  Checksum checksum;
  for (HXMeasureConditions light : AllLights(random)) {
    for (int round = 0; round < 20; ++round) {
      HXSpectrum spectrum;
      const float level = random.Next();
      for (unsigned i = 0; i < HXSpectrum::kBands; ++i) {
        spectrum[i] = level * random.Next() + 0.001F;
      }
      for (const char* const space :
           {"CIELab", "CIELCh", "CIEXYZ", "CIExyY", "CIELuv", "CIELChuv", "CIEuvY1976",
            "CIEuvY1960", "HunterLab", "RxRyRz", "LABhx", "LCHhx", "RGB"}) {
        light.SetMeasureCondition(Vocabulary::kColorSpaceKey, space);
        checksum.Add(TristimService::GetVector(spectrum, light));
      }
    }
  }
  EXPECT_EQ(checksum.Get(), 0x9C0560E1D4F8E71ULL);
}

TEST(BitsTest, OfAllConversionsOfVectors) {
  Lcg random;
  Checksum checksum;
  constexpr std::pair<const char*, const char*> kRows[] = {
      {"CIEXYZ", "CIELab"},     {"CIELab", "CIEXYZ"},     {"CIELab", "CIELCh"},
      {"LABhx", "LCHhx"},       {"CIELuv", "CIELChuv"},   {"CIEXYZ", "CIExyY"},
      {"CIELab", "RGB"},        {"CMYK", "RGB"},          {"CIEXYZ", "RGB"},
      {"CIEXYZ", "CIEuvY1960"}, {"CIExyY", "CIEuvY1960"}, {"CIEXYZ", "CIEuvY1976"},
      {"CIExyY", "CIEuvY1976"}, {"RGB", "CIELab"}};
  for (const HXMeasureConditions& light : AllLights(random)) {
    for (const auto& [from, to] : kRows) {
      HXMeasureConditions conditions = light;
      conditions.SetMeasureCondition(Vocabulary::kColorSpaceKey, from);
      for (int round = 0; round < 20; ++round) {
        const bool rectangular = std::string_view(from).ends_with("Lab") || from[0] == 'L';
        HXColorVector vector(
            {random.Next(0.0F, 100.0F), random.Next(rectangular ? -80.0F : 0.0F, 100.0F),
             random.Next(rectangular ? -80.0F : 0.0F, 100.0F), 0.0F},
            conditions);
        vector[3] = from[0] == 'C' && from[1] == 'M' ? random.Next(0.0F, 100.0F) : 0.0F;
        checksum.Add(TristimService::GetVector(vector, to));
        HXColorVector delta;
        ASSERT_TRUE(TristimCalculator::GetVector_DeltaCIELCH_ab(
            vector, HXColorVector(50.0F, 10.0F, -5.0F, conditions), delta));
        checksum.Add(delta);
      }
    }
  }
  EXPECT_EQ(checksum.Get(), 0xFEFDD023194A4D2BULL);
}

HXSpectrum Smooth(Lcg& random, const HXMeasureConditions& conditions) {
  HXSpectrum spectrum = Flat(0.0F, conditions);
  float value = random.Next(0.1F, 0.9F);
  for (unsigned i = 0; i < HXSpectrum::kBands; ++i) {
    value = std::clamp(value + random.Next(-0.1F, 0.1F), 0.05F, 0.95F);
    spectrum[i] = value;
  }
  return spectrum;
}

TEST(BitsTest, OfDifferencesAndReconstructedSpectra) {
  Lcg random;
  Checksum checksum;
  const std::vector<HXMeasureConditions> lights = AllLights(random);
  for (HXMeasureConditions light : lights) {
    if (light.GetIllumination().GetIlluminationType() == IlluminationType::kEmission) {
      continue;
    }
    for (int round = 0; round < 20; ++round) {
      const HXSpectrum first = Smooth(random, light);
      const HXSpectrum second = Smooth(random, light);
      for (const char* const formula :
           {"CIELab", "LABhx", "CIELuv", "FMCII", "CMC", "94", "2000"}) {
        light.SetMeasureCondition(Vocabulary::kDeltaEFormulaKey, formula);
        checksum.Add(std::array{TristimService::GetDeltaE(first, second, light, 0.0F, 1.5F, 2.0F)});
      }
      checksum.Add(std::array{TristimService::GetMetamery(first, second, light, lights[0])});
      checksum.Add(TristimService::GetSpectrum(TristimService::GetVector(first, light)).GetBands());
    }
  }
  EXPECT_EQ(checksum.Get(), 0xE8E0081AF5457DD6ULL);
}

TEST(BitsTest, OfLightsAndDensities) {
  Lcg random;
  Checksum checksum;
  for (int round = 0; round < 200; ++round) {
    const HXSpectrum spectrum =
        Smooth(random, Conditions("Emission", round % 2 == 0 ? "TwoDegree" : "TenDegree"));
    float index = 0.0F;
    std::string reference;
    (void)TristimService::GetColorRenderingIndex(spectrum, index, reference);
    checksum.Add(std::array{index, TristimService::GetColorTemperature(spectrum)});
    Internals::HXDensity density;
    ASSERT_TRUE(
        Internals::DensityCalculator::GetDensityVector(spectrum, round % 7, false, density));
    checksum.Add(density.GetAll());
    checksum.Add(std::array{
        Internals::DotArea(density.ByChannel(1), density.ByChannel(2), random.Next(1.0F, 3.0F))});
  }
  EXPECT_EQ(checksum.Get(), 0x9FB92FD9FD114C0ULL);
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
