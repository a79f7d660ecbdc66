#include <algorithm>
#include <cmath>
#include <random>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/lab2spec.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

/// Colours of mixtures of two or three measured surfaces, the same on every machine.
std::vector<HXColorVector> SurfaceColors(std::size_t count) {
  const std::vector<Measured> paints = ReadMeasured("paints.csv");
  const HXMeasureConditions lights[] = {Conditions("D65"), Conditions("A", "TenDegree"),
                                        Conditions("D50"), Conditions("F11 ")};
  std::mt19937 random(20260101U);  // whose numbers are prescribed, unlike those of distributions
  const auto part = [&] {
    return static_cast<float>(random() >> 8) * 0x1p-24F;
  };
  std::vector<HXColorVector> colors;
  while (colors.size() < count) {
    const float first = part();
    const float parts[] = {first, (1.0F - first) * part(), (1.0F - first) * part() * 0.5F};
    HXSpectrum mixture;
    for (const float share : parts) {
      const Measured& paint = paints[random() % paints.size()];
      for (unsigned band = 0; band < HXSpectrum::kBands; ++band) {
        mixture[band] += share * paint.values[band];
      }
    }
    colors.push_back(TristimService::GetVector(mixture, lights[random() % 4]));
  }
  return colors;
}

TEST(ReconstructTest, ASurfaceColorGetsASpectrumOfThatColorBetween0And1) {
  for (const HXColorVector& color : SurfaceColors(1000)) {
    const HXSpectrum spectrum = TristimService::GetSpectrum(color);
    const auto [least, most] =
        std::minmax_element(spectrum.GetBands().begin(), spectrum.GetBands().end());
    EXPECT_GE(*least, 0.0F);
    EXPECT_LE(*most, 1.0F);
    EXPECT_TRUE(spectrum.GetMeasureConditions() == color.GetMeasureConditions());
    HXColorVector lab = TristimService::GetVector(spectrum, color.GetMeasureConditions());
    lab -= color;
    EXPECT_LT(lab.Length(), 0.1F);
  }
}

float Dot(const HXColorVector& a, const HXColorVector& b) {
  return a[0] * b[0] + a[1] * b[1] + a[2] * b[2];
}

/// The iteration as it is defined, by the operations of the service; 99 steps at most.
bool PlainLoop(const HXColorVector& lab, HXSpectrum& spectrum) {
  HXMeasureConditions as_xyz = lab.GetMeasureConditions();
  as_xyz.SetMeasureCondition(Vocabulary::kColorSpaceKey, "CIEXYZ");
  std::vector<HXColorVector> response;
  for (unsigned band = 0; band < 36; ++band) {
    spectrum = Flat(0.0F);
    spectrum[band] = 1.0F;
    response.push_back(TristimService::GetVector(spectrum, as_xyz));
  }
  HXColorVector target = TristimService::GetVector(lab, "CIEXYZ");
  for (short axis = 0; axis < 3; ++axis) {
    target[axis] = std::max(target[axis], 0.0F);
  }
  spectrum = Flat(0.5F);
  HXColorVector error = target;
  error -= TristimService::GetVector(spectrum, as_xyz);
  double former = 1e38;
  for (int iteration = 1;; ++iteration) {
    double best_angle = 1e38;
    double best_cosine = 0.0;
    unsigned best = 36;
    for (unsigned band = 0; band < 36; ++band) {
      const auto d = Widen(Dot(response[band], error));
      if ((d >= 0.0 && spectrum[band] < 1.0F) || (d < 0.0 && spectrum[band] > 0.0F)) {
        const double divisor = Widen(response[band].Length()) * Widen(error.Length());
        const double cosine = divisor > 0.0 ? std::clamp(d / divisor, -1.0, 1.0) : 0.0;
        if (std::acos(std::abs(cosine)) < best_angle) {
          best_angle = std::acos(std::abs(cosine));
          best_cosine = cosine;
          best = band;
        }
      }
    }
    if (best < 36 && response[best].Length() > 0.0F) {
      const float step = static_cast<float>(best_cosine) * error.Length() / response[best].Length();
      spectrum[best] = std::clamp(step + spectrum[best], 0.0F, 1.0F);
    }
    const HXColorVector current = TristimService::GetVector(spectrum, as_xyz);
    error = target;
    error -= current;
    const auto square = Widen(Dot(error, error));
    if (former - square < 1e-15 || iteration > 99) {
      return false;
    }
    if (square < 0.001 && TristimService::GetDeltaE(current, lab, 0.0F, 0.0F, 0.0F) < 0.1F) {
      return true;
    }
    former = square;
  }
}

TEST(ReconstructTest, TheFastLoopGivesTheBitsOfThePlainOne) {
  std::vector<HXColorVector> colors = SurfaceColors(60);
  colors.emplace_back(60.0F, 120.0F, -120.0F, Conditions("D65"));  // no surface has it
  colors.emplace_back(2.0F, 60.0F, 20.0F, Conditions("A"));        // Z below 0
  int found = 0;
  for (const HXColorVector& color : colors) {
    HXSpectrum expected;
    HXSpectrum spectrum;
    const bool is_found = PlainLoop(color, expected);
    EXPECT_EQ(Lab2Spec().GetSpectrum(color, spectrum, 0.1, false, 99), is_found);
    EXPECT_EQ(spectrum.GetBands(), expected.GetBands());
    found += is_found ? 1 : 0;
  }
  EXPECT_GT(found, 30);
  EXPECT_LE(found, 60);
}

TEST(ReconstructTest, TheGreyOfTheStartIsThereAfterOneStep) {
  const HXColorVector grey = TristimService::GetVector(Flat(0.5F), Conditions("D65"));
  HXSpectrum spectrum;
  EXPECT_TRUE(Lab2Spec().GetSpectrum(grey, spectrum, 0.1, true, 1));
  for (const float value : spectrum.GetBands()) {
    EXPECT_TRUE(Near(value, 0.5, 2e-6)) << "but for the rounding of Lab";
  }
  EXPECT_FALSE(Lab2Spec().GetSpectrum(grey, spectrum, 0.1, false, 0)) << "the first step is beyond";
}

TEST(ReconstructTest, WhatHasNoSpectrumIsRefused) {
  const auto message = [](const HXColorVector& color) {
    return MessageOf<TristimException>([&] { TristimService::GetSpectrum(color); });
  };
  const HXColorVector vivid(60.0F, 120.0F, -120.0F, Conditions("D65"));
  EXPECT_EQ(message(vivid), "TristimCalculator: Conversion out of Range");
  EXPECT_EQ(message(HXColorVector(50.0F, 20.0F, 40.0F, InSpace("CIELCh"))),
            "Conversion not supported from ColorSpace CIELCh to ColorSpace CIELab");
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
