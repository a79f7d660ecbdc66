#include <bit>
#include <cmath>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/colortemperature.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/published.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

HXMeasureConditions Emission(const std::string& observer = "TwoDegree") {
  return Conditions("Emission", observer, "CIEXYZ");
}

struct Rendering {
  float index = 0.0F;
  bool valid = false;
  std::string reference = "not set";
};

Rendering RenderingOf(const HXSpectrum& lamp) {
  Rendering result;
  result.valid = TristimService::GetColorRenderingIndex(lamp, result.index, result.reference);
  return result;
}

HXSpectrum Planck(float kelvin) {
  return ColorTemperature().GetPlanckRadiator(kelvin, Conditions("D65"));
}

TEST(LightTest, ABlackBodyHasItsOwnTemperatureAndAnIndexOf100) {
  for (const float kelvin : {1000.0F, 2000.0F, 2856.0F, 4000.0F, 4999.0F}) {
    const HXSpectrum radiator = Planck(kelvin);
    EXPECT_TRUE(Near(TristimService::GetColorTemperature(radiator), Widen(kelvin), 1.0));
    const Rendering rendering = RenderingOf(radiator);
    EXPECT_EQ(rendering.index, 100.0F) << kelvin;
    EXPECT_TRUE(rendering.valid);
    EXPECT_EQ(rendering.reference, "");
  }
  for (const float kelvin : {6500.0F, 10000.0F, 20000.0F}) {
    EXPECT_TRUE(Near(TristimService::GetColorTemperature(Planck(kelvin)), Widen(kelvin),
                     2e-4 * Widen(kelvin)));
  }
  EXPECT_EQ(RenderingOf(Planck(5000.0F)).reference, "D50");
}

TEST(LightTest, IlluminantsHaveThePublishedTemperatureAndDaylightsAreTheirOwnReference) {
  for (const auto& [word, kelvin] : kTemperatures) {
    SCOPED_TRACE(word);
    const HXSpectrum light = LampOf(word, false, Emission());
    // 36 bands instead of 5 nm: up to 7 K at 7500 K.
    EXPECT_TRUE(Near(TristimService::GetColorTemperature(light), kelvin, 1e-3 * kelvin));
    if (word[0] == 'D') {
      const Rendering rendering = RenderingOf(light);
      EXPECT_EQ(rendering.index, 100.0F);
      EXPECT_TRUE(rendering.valid);
      EXPECT_EQ(rendering.reference, word);
    }
  }
}

// Computed from the same 36 bands by an independent program: the nearest point of the
// Planckian locus in u, v (c2 = 1.4388e-2 m·K), and CIE 13.3-1995.
struct Lamp {
  double kelvin, index;
};

constexpr Lamp kLamps[] = {{2813, 99.8}, {2753, 77.1}, {3914, 58.1}, {2429, 84.5}, {5278, 89.9},
                           {4518, 93.3}, {6575, 98.2}, {2094, 19.2}, {2815, 51.0}, {4092, 92.2},
                           {2881, 91.8}, {6801, 81.5}, {2568, 81.9}, {3598, 94.3}, {4102, 84.9}};

TEST(LightTest, MeasuredLampsAgreeWithAnIndependentComputation) {
  const std::vector<Measured> lamps = ReadMeasured("lamps.csv");
  ASSERT_EQ(lamps.size(), std::size(kLamps));
  for (std::size_t i = 0; i < lamps.size(); ++i) {
    SCOPED_TRACE(lamps[i].name);
    const HXSpectrum lamp(lamps[i].values, Emission());
    EXPECT_TRUE(
        Near(TristimService::GetColorTemperature(lamp), kLamps[i].kelvin, 1e-3 * kLamps[i].kelvin));
    // One unit: whole numbers, and test colours that are means over bands centred 5 nm lower.
    EXPECT_TRUE(Near(RenderingOf(lamp).index, kLamps[i].index, 1.0));
  }
}

TEST(LightTest, FluorescentLampsHaveThePublishedIndexIfAveragedOverTheBands) {
  for (std::size_t i = 0; i < std::size(kFluorescents); ++i) {
    const std::string word = "F" + std::to_string(i + 1);
    SCOPED_TRACE(word);
    const auto& [kelvin, index] = kFluorescents[i];
    const HXSpectrum averaged = LampOf(word, true, Emission());
    EXPECT_TRUE(Near(RenderingOf(averaged).index, index, 1.0));
    // Published to 10 K or 50 K; the rest, up to 34 K for F7, is due to sums of 10 nm.
    EXPECT_TRUE(Near(TristimService::GetColorTemperature(averaged), kelvin, 6e-3 * kelvin));
    // Picked values leave out every second emission line.
    EXPECT_LT(Widen(TristimService::GetColorTemperature(LampOf(word, false, Emission()))),
              0.95 * kelvin);
  }
}

TEST(LightTest, WhatIsNoLightHasNeitherTemperatureNorIndex) {
  // Black has the chromaticity of equal energy, whose temperature is published with 5455 K.
  EXPECT_TRUE(Near(TristimService::GetColorTemperature(Flat(0.0F, Emission())), 5455.0, 2.0));
  EXPECT_TRUE(Near(TristimService::GetColorTemperature(Flat(1.0F, Emission())), 5455.0, 5.0));
  HXSpectrum blue = Flat(0.0F, Emission());
  blue[7] = 1.0F;  // 450 nm alone, beyond the end of the locus
  EXPECT_EQ(TristimService::GetColorTemperature(blue), -1.0F);
  for (const HXSpectrum& light : {Flat(0.0F, Emission()), Flat(std::nanf(""), Emission()), blue}) {
    const Rendering rendering = RenderingOf(light);
    EXPECT_FALSE(rendering.valid);
    EXPECT_EQ(rendering.index, 0.0F);
    EXPECT_EQ(rendering.reference, "");
  }
  HXSpectrum sodium = Flat(0.0F, Emission());
  sodium[21] = 1.0F;  // 590 nm alone
  EXPECT_LT(RenderingOf(sodium).index, 0.0F) << "not limited";
  EXPECT_FALSE(RenderingOf(sodium).valid) << "far from its reference";
}

/// The angle by way of the spectrum, its XYZ and their conversion.
double PlainCosine(float kelvin, const HXColorVector& sample,
                   const HXMeasureConditions& conditions) {
  const ColorTemperature temperature;
  const auto at = [&](float t) {
    HXColorVector uvy;
    EXPECT_TRUE(TristimCalculator::GetVector_CIEuvY1960(
        temperature.GetPlanckRadiatorXYZ(t, conditions), uvy));
    return uvy;
  };
  const HXColorVector foot = at(kelvin);
  const HXColorVector above = at(kelvin + 50.0F);
  const HXColorVector below = at(kelvin - 50.0F);
  const float d[] = {sample[0] - foot[0], sample[1] - foot[1]};
  const float t[] = {above[0] - below[0], above[1] - below[1]};
  const auto length = [](const float* v) {
    return std::sqrt(Widen(v[0] * v[0] + v[1] * v[1]));
  };
  return Widen(d[0] * t[0] + d[1] * t[1]) / length(d) / length(t);
}

TEST(LightTest, TheCosineOfTheLocusIsThatOfThePlainOperations) {
  for (const char* const observer : {"TwoDegree", "TenDegree"}) {
    const HXMeasureConditions conditions = Emission(observer);
    const HXColorVector sample(0.21F, 0.32F, 100.0F, conditions);
    for (float kelvin = 250.0F; kelvin < 999950.0F; kelvin *= 1.13F) {
      double cosine = 0.0;
      ASSERT_TRUE(ColorTemperature().GetPlanckianCosine(kelvin, sample, conditions, cosine));
      EXPECT_EQ(std::bit_cast<std::uint64_t>(cosine),
                std::bit_cast<std::uint64_t>(PlainCosine(kelvin, sample, conditions)))
          << kelvin;
    }
    HXColorVector on_locus;
    ASSERT_TRUE(TristimCalculator::GetVector_CIEuvY1960(
        ColorTemperature().GetPlanckRadiatorXYZ(3000.0F, conditions), on_locus));
    double cosine = 0.0;
    EXPECT_FALSE(ColorTemperature().GetPlanckianCosine(3000.0F, on_locus, conditions, cosine));
  }
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
