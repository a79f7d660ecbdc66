#include <cmath>
#include <numbers>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

struct FamilyCase {
  int hue;  // whole degrees
  float chroma, lightness;
  const char* name;
};

// Each row of the table of hues from inside and on both sides of its limits.  Neutral colours go up
// to a chroma of 10 for black, 7 at L* 75, 5 for white.
constexpr FamilyCase kFamilies[] = {
    {0, 60, 50, "Magenta"},      {19, 60, 50, "Magenta"},      {335, 60, 50, "Magenta"},
    {359, 60, 50, "Magenta"},    {300, 60, 50, "Undefined"},   {334, 60, 50, "Undefined"},
    {299, 60, 50, "Blue"},       {260, 60, 50, "Blue"},        {259, 60, 50, "Cyan"},
    {210, 60, 50, "Cyan"},       {209, 60, 50, "Turquo"},      {175, 60, 50, "Turquo"},
    {174, 60, 50, "Green"},      {135, 60, 50, "Green"},       {134, 49, 49, "Olive"},
    {110, 49, 49, "Olive"},      {110, 51, 49, "YellowGreen"}, {134, 49, 50, "YellowGreen"},
    {109, 49, 65, "Beige"},      {80, 49, 65, "Beige"},        {109, 69, 64, "Olive"},
    {91, 49, 64, "Olive"},       {89, 69, 64, "Brown"},        {80, 49, 64, "Brown"},
    {89, 51, 65, "Yellow"},      {109, 71, 64, "Yellow"},      {79, 69, 65, "Beige"},
    {45, 69, 65, "Beige"},       {79, 69, 64, "Brown"},        {45, 69, 64, "Brown"},
    {79, 71, 65, "Orange"},      {45, 71, 64, "Orange"},       {44, 39, 49, "Brown"},
    {20, 39, 49, "Brown"},       {36, 54, 64, "Brown"},        {35, 54, 64, "Red"},
    {20, 41, 49, "Red"},         {20, 39, 50, "Red"},          {44, 56, 64, "Red"},
    {44, 54, 65, "Red"},         {10, 9.95F, 0, "Black"},      {10, 10.05F, 0, "Magenta"},
    {10, 6.95F, 75, "Gray"},     {10, 7.05F, 75, "Magenta"},   {10, 4.95F, 100, "White"},
    {10, 5.05F, 100, "Magenta"}, {10, 1, 80, "Gray"},          {10, 1, 80.1F, "White"},
    {10, 1, 30, "Black"},        {10, 1, 30.1F, "Gray"},       {10, 1, 101, "White"},
    {10, 1, -1, "White"},
};

TEST(JudgementTest, EveryRowOfTheTableOfHuesGivesItsFamily) {
  for (const auto& [hue, chroma, lightness, name] : kFamilies) {
    // Half a degree inside: a quotient b/a is cut toward zero, in every second quadrant upward.
    const double radians = (hue + (hue / 90 % 2 == 0 ? 0.5 : -0.5)) / 180.0 * std::numbers::pi;
    const Triple lab = {lightness, chroma * static_cast<float>(std::cos(radians)),
                        chroma * static_cast<float>(std::sin(radians))};
    EXPECT_STREQ(ColorFamilyName(ColorFamily(lab)), name)
        << "hue " << hue << ", chroma " << chroma << ", lightness " << lightness;
  }
}

TEST(JudgementTest, HuesOnTheAxesAndNumbersWithoutAName) {
  EXPECT_STREQ(ColorFamilyName(ColorFamily({60.0F, 0.0F, 60.0F})), "Olive") << "90 degrees";
  EXPECT_STREQ(ColorFamilyName(ColorFamily({60.0F, 1e-4F, 60.0F})), "Brown") << "cut to 89";
  EXPECT_STREQ(ColorFamilyName(ColorFamily({50.0F, 0.0F, -60.0F})), "Blue") << "270";
  EXPECT_STREQ(ColorFamilyName(ColorFamily({50.0F, -60.0F, 0.0F})), "Turquo") << "180";
  EXPECT_STREQ(ColorFamilyName(ColorFamily({50.0F, 60.0F, -1e-4F})), "Magenta") << "360";
  EXPECT_STREQ(ColorFamilyName(ColorFamily({50.0F, 0.0F, 0.0F})), "Gray");
  for (const int number : {-1, 1, 16}) {
    EXPECT_STREQ(ColorFamilyName(number), "Undefined");
  }
}

TEST(JudgementTest, SpectraAreJudgedUnderTheirOwnConditions) {
  EXPECT_EQ(TristimService::GetColorType(Flat(1.0F)), "White");
  EXPECT_EQ(TristimService::GetColorType(Flat(0.5F)), "Gray");
  EXPECT_EQ(TristimService::GetColorType(Flat(0.0F)), "Black");
  // Named 5R 5/14, 10YR 8/10, 5GY 4/4, 10B 7/8 and 5PB 4/12 by hue, value and chroma.
  const std::vector<Measured> paints = ReadMeasured("paints.csv");
  constexpr std::pair<std::size_t, const char*> kChips[] = {
      {0, "Red"}, {3, "Beige"}, {6, "Olive"}, {13, "Cyan"}, {14, "Blue"}};
  for (const auto& [chip, name] : kChips) {
    EXPECT_EQ(TristimService::GetColorType(HXSpectrum(paints[chip].values)), name)
        << paints[chip].name;
  }
  HXMeasureConditions conditions;
  conditions.SetWhiteBase(WhiteBase::Paper);
  EXPECT_EQ(TristimService::GetColorType(Flat(0.5F, conditions)), "Undefined") << "no paper white";
}

float Metamery(const HXSpectrum& first, const HXSpectrum& second, const std::string& test,
               const HXMeasureConditions& conditions = Conditions("D65")) {
  return TristimService::GetMetamery(first, second, conditions, Conditions(test));
}

TEST(JudgementTest, MetamerismIsWhatIsLeftAfterTheMatchUnderTheReference) {
  const std::vector<Measured> paints = ReadMeasured("paints.csv");
  const HXSpectrum first(paints[8].values);
  const HXSpectrum second(paints[10].values);
  const auto xyz = [](const HXSpectrum& spectrum, const std::string& light) {
    return TristimService::GetVector(spectrum, Conditions(light, "TwoDegree", "CIEXYZ"));
  };
  // CIE 15:2004, 9.2: the second sample corrected by the quotients, in double.
  std::array<double, 3> f[2];
  for (short i = 0; i < 3; ++i) {
    const double white = Widen(xyz(Flat(1.0F), "A")[i]);
    const double quotient = Widen(xyz(first, "D65")[i]) / Widen(xyz(second, "D65")[i]);
    f[0][static_cast<std::size_t>(i)] = std::cbrt(Widen(xyz(first, "A")[i]) / white);
    f[1][static_cast<std::size_t>(i)] = std::cbrt(Widen(xyz(second, "A")[i]) * quotient / white);
  }
  const double x = f[0][0] - f[1][0];
  const double y = f[0][1] - f[1][1];
  const double expected = std::hypot(116 * y, 500 * (x - y), 200 * (y - f[0][2] + f[1][2]));
  ASSERT_GT(expected, 1.0);
  EXPECT_TRUE(Near(Metamery(first, second, "A"), expected, 3e-4));
  // A sample that is half as light matches after the correction under any light.
  HXSpectrum half = first;
  for (unsigned band = 0; band < HXSpectrum::kBands; ++band) {
    half[band] /= 2.0F;
  }
  EXPECT_TRUE(Near(Metamery(first, half, "F11 "), 0.0, 1e-4));
  for (const char* const light : {"A", "D65", "F11 "}) {
    EXPECT_EQ(Metamery(first, first, light), 0.0F);
  }
}

TEST(JudgementTest, BlackIsNotCorrectedAndAMissingPaperIsReported) {
  EXPECT_TRUE(Near(Metamery(Flat(1.0F), Flat(0.0F), "A"), 100.0, 1e-3));
  HXMeasureConditions conditions = Conditions("D65");
  conditions.SetWhiteBase(WhiteBase::Paper);
  EXPECT_EQ(MessageOf<TristimException>([&] { Metamery(Flat(1.0F), Flat(0.5F), "A", conditions); }),
            "TristimCalculator");
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
