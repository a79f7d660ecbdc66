#include "aldermoor/tristim/internals/colormath.h"

#include <cmath>

#include <gtest/gtest.h>

#include "tests/tristim/support.h"

// Where no source is named, the expected figures were computed apart from this code, in double
// precision, from the published formula.
namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

constexpr Triple kD50 = {96.422F, 100.0F, 82.521F};
constexpr Triple kD65 = {95.047F, 100.0F, 108.883F};
constexpr Triple kInk = {20.0F, 30.0F, 40.0F};

TEST(ColorMathTest, LabOnBothBranches) {
  ExpectNear(LabFromXyz(kInk, kD50), {61.654222, -38.741751, -23.220276});
  ExpectNear(LabFromXyz({60.0F, 50.0F, 10.0F}, kD50), {76.069261, 30.019156, 59.768981});
  ExpectNear(LabFromXyz({0.5F, 0.4F, 0.3F}, kD50), {3.613168, 4.615894, 0.567768});
  EXPECT_EQ(LabFromXyz(kD50, kD50), (Triple{100.0F, 0.0F, 0.0F}));
  const Triple negative = LabFromXyz({0.0F, -1.0F, 0.0F}, kD50);
  EXPECT_EQ(negative[0], 0.0F) << "only the lightness stops at zero";
  EXPECT_GT(negative[1], 0.0F);
  EXPECT_LT(negative[2], 0.0F);
}

TEST(ColorMathTest, LabComesBackThroughXyz) {
  for (float lightness = 0.0F; lightness <= 100.0F; lightness += 4.0F) {
    for (float a = -60.0F; a <= 60.0F; a += 30.0F) {
      const float b = 0.5F * a - 5.0F;
      const Triple back = LabFromXyz(XyzFromLab({lightness, a, b}, kD65), kD65);
      // The line and the power meet at 0.008856 within 1e-4 of L* only.
      ExpectNear(Triple{back[0] - lightness, back[1] - a, back[2] - b}, {0.0, 0.0, 0.0}, 2e-3);
    }
  }
}

TEST(ColorMathTest, HueIsNeverZero) {
  constexpr Triple kCases[] = {{0, 0, 360},   {10, 0, 360},    {-10, 0, 180},
                               {0, -10, 270}, {0, 10, 90},     {9e-6F, -9e-6F, 360},
                               {10, 10, 45},  {-10, -10, 225}, {10, -0.0F, 360}};
  for (const auto& [a, b, hue] : kCases) {
    const Triple polar = PolarFromRectangular({50.0F, a, b});
    EXPECT_TRUE(Near(polar[2], static_cast<double>(hue), 1e-4)) << a << ", " << b;
    EXPECT_TRUE(Near(polar[1], static_cast<double>(std::hypot(a, b)), 1e-5)) << a << ", " << b;
    EXPECT_EQ(polar[0], 50.0F);
  }
}

TEST(ColorMathTest, Chromaticities) {
  ExpectNear(XyYFromXyz(kInk), {20.0 / 90, 30.0 / 90, 30.0}, 1e-6);
  ExpectNear(LuvFromXyz(61.0F, kInk), {61.0, 0.135593220, 0.457627119}, 1e-6);
  ExpectNear(UvY1976FromXyz(kInk), {0.135593220, 0.457627119, 30.0}, 1e-6);
  ExpectNear(UvY1976FromXyY(XyYFromXyz(kInk)), {0.135593220, 0.457627119, 30.0}, 1e-6);
  ExpectNear(UvY1960FromUvY1976(UvY1976FromXyz(kInk)), {0.135593220, 0.305084746, 30.0}, 1e-6);
  // D65: u' = 0.1978, v' = 0.4683 (CIE 15:2004).
  ExpectNear(UvY1976FromXyz(kD65), {0.1978, 0.4683, 100.0}, 0.5e-4);
  // Black has that of equal energy.
  const Triple black = {0.21052632F, 0.47368422F, 0.0F};
  EXPECT_EQ(UvY1976FromXyz({0.0F, 0.0F, 0.0F}), black);
  EXPECT_EQ(UvY1976FromXyY({0.3F, 0.3F, 0.0F}), black);
  EXPECT_EQ(UvY1960FromUvY1976(black)[1], 0.31578949F);
}

TEST(ColorMathTest, HunterAndColorimeterFilters) {
  ExpectNear(HunterLabFromXyz(kInk, kD65), {54.772256, -28.620535, -8.609608});
  ExpectNear(HunterLabFromXyz({0.0F, 0.0F, 0.0F}, kD65), {0.001, 0.0, 0.0}, 1e-9);
  ExpectNear(HunterLabFromXyz(kD65, kD65), {100.0, 0.0, 0.0});
  ExpectNear(RxRyRzFromXyz(kInk, kD65, 0.167F), {17.696880, 30.0, 36.736681});
  ExpectNear(RxRyRzFromXyz(kD65, kD65, 0.167F), {100.0, 100.0, 100.0});
}

TEST(ColorMathTest, TheEvenlySteppedTransform) {
  ExpectNear(LchHxFromLch({50.0F, 30.0F, 40.0F}), {53.109684, 23.581031, 45.537910});
  ExpectNear(LchHxFromLch({10.0F, 5.0F, 200.0F}), {19.569472, 6.399610, 209.859018});
  ExpectNear(LchHxFromLch({16.0F, 0.0F, 360.0F}), {24.701548, 3.6049e-6, 360.0});
  EXPECT_GT(LchHxFromLch({15.999F, 0.0F, 360.0F})[0], 31.0F) << "the lightness steps at 16";
  ExpectNear(LabHxFromLchHx({53.0F, 23.581031F, 45.537910F}), {53.0, 16.517031, 16.830113});
}

TEST(ColorMathTest, RgbIsWholeAndClippedAndItsWayBackHasAnotherWhiteAndExponent) {
  EXPECT_EQ(RgbFromXyz({95.04F, 100.0F, 108.9F}), (Triple{255.0F, 255.0F, 255.0F}));
  EXPECT_EQ(RgbFromXyz({20.344F, 21.404F, 23.310F}), (Triple{127.0F, 127.0F, 127.0F}));
  EXPECT_EQ(RgbFromXyz({41.24F, 21.26F, 1.93F}), (Triple{250.0F, 2.0F, 1.0F}));
  EXPECT_EQ(RgbFromXyz({35.76F, 71.52F, 11.92F}), (Triple{61.0F, 255.0F, 0.0F}));
  EXPECT_EQ(RgbFromXyz({18.05F, 7.22F, 95.05F}), (Triple{4.0F, 8.0F, 255.0F}));
  EXPECT_EQ(RgbFromXyz({-5.0F, -5.0F, -5.0F}), (Triple{0.0F, 0.0F, 0.0F}));
  ExpectNear(XyzFromRgb({255.0F, 255.0F, 255.0F}), {96.42, 100.0, 82.49});
  ExpectNear(XyzFromRgb({200.0F, 100.0F, 50.0F}), {29.772023, 23.648597, 4.859105});
  EXPECT_LT(XyzFromRgb({-10.0F, 0.0F, 0.0F})[0], 0.0F) << "a negative value is not squared";
}

TEST(ColorMathTest, CmykToRgb) {
  EXPECT_EQ(RgbFromCmyk({0.0F, 0.0F, 0.0F, 0.0F}), (Triple{255.0F, 255.0F, 255.0F}));
  ExpectNear(RgbFromCmyk({0.0F, 0.0F, 0.0F, 100.0F}), {51.0, 51.0, 51.0});
  ExpectNear(RgbFromCmyk({20.0F, 40.0F, 60.0F, 10.0F}), {196.86, 149.94, 103.02});
  // 2.55 times 100 is a little below 255 in double.
  ExpectNear(RgbFromCmyk({100.0F, 100.0F, 100.0F, 100.0F}), {0.0, 0.0, 0.0}, 1e-13);
  ExpectNear(RgbFromCmyk({-50.0F, 0.0F, 150.0F, 0.0F}), {255.0, 229.5, 0.0});
}

TEST(ColorMathTest, DeltaOfLightnessChromaAndHue) {
  const Quadruple red = {50.0F, 10.0F, 0.0F, 0.0F};
  const Quadruple yellow = {40.0F, 0.0F, 10.0F, 0.0F};
  ExpectNear(DeltaLch(red, yellow), {10.0, 0.0, -std::sqrt(200.0)});
  ExpectNear(DeltaLch(yellow, red), {-10.0, 0.0, std::sqrt(200.0)});
  EXPECT_EQ(DeltaLch(red, red), (Triple{0.0F, 0.0F, 0.0F}));
  ExpectNear(DeltaLch({50.0F, 6.0F, 8.0F, 0.0F}, {50.0F, 3.0F, 4.0F, 0.0F}), {0.0, 5.0, 0.0}, 2e-3);
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
