#include <cmath>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

// First and last values are the published ones.  The sums were made from the published decimals in
// exact decimal arithmetic; the one weighted by the place in the table tells exchanged values.
namespace Aldermoor::Tristim::Tests {
namespace {

using Aldermoor::Tests::kFloatRounding;
using Aldermoor::Tests::Within;
using Internals::StandardFilter;
using Internals::TristimFilter;

struct TableCase {
  int type;    ///< illumination type, or observer
  int number;  ///< fluorescent number, or axis
  int step, max, min;
  float first, last;
  double sum;
  double weighted_sum;  ///< each value times its place, counted from 1
};

constexpr TableCase kIlluminants[] = {
    {IlluminationType::kA, 0, 1, 830, 300, 0.930483F, 261.602F, 60250.921916, 23112030.357179},
    {IlluminationType::kB, 0, 5, 770, 320, 0.02F, 85.4F, 7085.3, 385076.82},
    {IlluminationType::kC, 0, 5, 780, 300, 0.0F, 59.1F, 7327.2, 393500.01},
    {IlluminationType::kD50, 0, 5, 830, 300, 0.02F, 74.44F, 7926.77, 487578.68},
    {IlluminationType::kD55, 0, 5, 830, 300, 0.02F, 68.31F, 7942.59, 469470.32},
    {IlluminationType::kD65, 0, 1, 830, 300, 0.0341F, 60.3125F, 40852.204, 11037754.9566},
    {IlluminationType::kD75, 0, 5, 830, 300, 0.04F, 55.54F, 8559.59, 443811.56},
    {IlluminationType::kDaylightS0, 0, 5, 830, 300, 0.04F, 61.9F, 8715.51, 466138.68},
    {IlluminationType::kDaylightS1, 0, 5, 830, 300, 0.02F, -9.8F, 890.13, -11113.16},
    {IlluminationType::kDaylightS2, 0, 5, 830, 300, 0.0F, 6.5F, 374.95, 27256.0},
    {IlluminationType::kFluorescent, 1, 5, 780, 380, 1.87F, 0.43F, 684.33, 20727.32},
    {IlluminationType::kFluorescent, 2, 5, 780, 380, 1.18F, 0.27F, 594.5, 19989.08},
    {IlluminationType::kFluorescent, 3, 5, 780, 380, 0.82F, 0.21F, 556.19, 19946.82},
    {IlluminationType::kFluorescent, 4, 5, 780, 380, 0.57F, 0.19F, 540.17, 20427.08},
    {IlluminationType::kFluorescent, 5, 5, 780, 380, 1.87F, 0.4F, 664.37, 20071.51},
    {IlluminationType::kFluorescent, 6, 5, 780, 380, 1.05F, 0.21F, 565.79, 19159.15},
    {IlluminationType::kFluorescent, 7, 5, 780, 380, 2.56F, 0.81F, 788.9, 26185.59},
    {IlluminationType::kFluorescent, 8, 5, 780, 380, 1.21F, 1.32F, 789.42, 30145.34},
    {IlluminationType::kFluorescent, 9, 5, 780, 380, 0.9F, 1.12F, 743.46, 29163.76},
    {IlluminationType::kFluorescent, 10, 5, 780, 380, 1.11F, 0.09F, 615.56, 20353.16},
    {IlluminationType::kFluorescent, 11, 5, 780, 380, 0.91F, 0.09F, 594.08, 20885.38},
    {IlluminationType::kFluorescent, 12, 5, 780, 380, 0.96F, 0.05F, 566.76, 21693.99},
    // F2, F7 and F11 have types of their own, too.
    {8, 0, 5, 780, 380, 1.18F, 0.27F, 594.5, 19989.08},
    {9, 0, 5, 780, 380, 2.56F, 0.81F, 788.9, 26185.59},
    {10, 0, 5, 780, 380, 0.91F, 0.09F, 594.08, 20885.38},
};

constexpr TableCase kObserverTables[] = {
    {0, 0, 1, 830, 360, 0.0001299F, 0.000001251141F, 106.865469489595, 22736.095467724695},
    {0, 1, 1, 830, 360, 0.000003917F, 0.00000045181F, 106.8569171011719, 21498.7427173007271},
    {0, 2, 1, 650, 360, 0.0006061F, 0.0F, 106.892251278636, 10161.605439286361},
    {1, 0, 1, 830, 360, 0.0000001222F, 0.00000155314F, 116.648519508908, 24387.388235727446},
    {1, 1, 1, 830, 360, 0.000000013398F, 0.0000006297F, 116.661877102312, 22847.215276271986},
    {1, 2, 1, 560, 360, 0.000000535027F, 0.0F, 116.673980514647, 10708.069381594067},
};

void ExpectTable(const StandardFilter& filter, const TableCase& table) {
  EXPECT_EQ(filter.GetStepSize(), table.step);
  EXPECT_EQ(filter.GetMaxWavelength(), table.max);
  EXPECT_EQ(filter.GetMinWavelength(), table.min);
  const int count = (table.max - table.min) / table.step + 1;
  double sum = 0.0;
  double weighted = 0.0;
  double rounding = 0.0;
  for (int i = 0; i < count; ++i) {
    const double value = static_cast<double>(filter.GetFilter()[i]);
    sum += value;
    weighted += value * (i + 1);
    rounding += std::abs(value) * kFloatRounding;
  }
  EXPECT_EQ(filter.GetFilter()[0], table.first);
  EXPECT_EQ(filter.GetFilter()[count - 1], table.last);
  EXPECT_TRUE(Within(sum, table.sum, rounding));
  EXPECT_TRUE(Within(weighted, table.weighted_sum, rounding * count));
}

HXIllumination Illumination(int type, int number = 0) {
  HXIllumination illumination(type);
  illumination.SetFluorescence(static_cast<std::uint8_t>(number));
  return illumination;
}

TEST(TablesTest, HoldThePublishedValues) {
  for (const TableCase& table : kIlluminants) {
    SCOPED_TRACE(::testing::Message() << "illuminant " << table.type << ", " << table.number);
    ExpectTable(TristimFilter::GetIlluFilter(Illumination(table.type, table.number)), table);
  }
  for (const TableCase& table : kObserverTables) {
    SCOPED_TRACE(::testing::Message() << "observer " << table.type << ", axis " << table.number);
    const auto axis = static_cast<unsigned short>(table.number);
    ExpectTable(TristimFilter::GetObserverFilter(table.type, axis), table);
  }
}

TEST(TablesTest, WhatHasNoTableIsRefused) {
  std::vector<HXIllumination> illuminations;
  for (const int type : {-2, -1, 7, 12, 13, 17}) {
    illuminations.push_back(Illumination(type));
  }
  for (const int number : {0, 13, 255}) {
    illuminations.push_back(Illumination(IlluminationType::kFluorescent, number));
  }
  for (const HXIllumination& illumination : illuminations) {
    EXPECT_EQ(MessageOf<TristimException>([&] { TristimFilter::GetIlluFilter(illumination); }),
              "Unsupported Illumination type");
  }
  constexpr std::pair<int, unsigned short> kNoObservers[] = {{-1, 0}, {2, 0}, {0, 3}, {1, 65535}};
  for (const auto& [observer, axis] : kNoObservers) {
    EXPECT_EQ(MessageOf<TristimException>(
                  [&, o = observer, a = axis] { TristimFilter::GetObserverFilter(o, a); }),
              "Unsupported Observer type");
  }
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
