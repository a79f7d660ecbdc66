#include "aldermoor/tristim/internals/weightfactors.h"

#include <algorithm>
#include <numeric>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/published.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Aldermoor::Tests;
using namespace Internals;

double Sum(const float* values, std::size_t count = 36) {
  return std::accumulate(values, values + count, 0.0);
}

// What the CIE tables at 1 nm give, to three decimals.
constexpr WhiteCase kWhites[] = {
    {"D50", "TwoDegree", 96.422, 82.522},  {"D65", "TwoDegree", 95.047, 108.883},
    {"D65", "TenDegree", 94.811, 107.305}, {"A", "TwoDegree", 109.849, 35.585},
    {"C", "TwoDegree", 98.073, 118.232},   {"F11", "TwoDegree", 100.963, 64.353}};

void ExpectWhite(const WhiteCase& c, double tolerance) {
  SCOPED_TRACE(::testing::Message() << c.illumination << ", " << c.observer);
  const Weightfactors weights(Conditions(c.illumination, c.observer));
  EXPECT_TRUE(Near(weights.GetFilterSum(0), c.x, tolerance));
  EXPECT_TRUE(Near(weights.GetFilterSum(2), c.z, tolerance));
  EXPECT_EQ(weights.GetFilterSum(1), 100.0F);
  EXPECT_EQ(weights.GetFilterSum(3), 0.0F);
  EXPECT_TRUE(Within(Sum(weights[1]), 100.0, kWeightSum));
}

TEST(WeightfactorsTest, SumsAreThePublishedWhitePoints) {
  for (const WhiteCase& c : kWhites) {
    ExpectWhite(c, kWhitePoint);
  }
  for (const WhiteCase& c : kPublishedWhites) {
    ExpectWhite(c, kPublishedWhitePoint);
  }
}

TEST(WeightfactorsTest, WhitePointsHaveThePublishedChromaticity) {
  for (const ChromaticityCase& c : kChromaticities) {
    SCOPED_TRACE(c.illumination);
    const double tolerance =
        c.illumination[0] == 'F' ? kChromaticityFourDigits : kChromaticityFiveDigits;
    const Weightfactors weights(Conditions(c.illumination));
    const double x = static_cast<double>(weights.GetFilterSum(0));
    const double sum = x + 100.0 + static_cast<double>(weights.GetFilterSum(2));
    EXPECT_TRUE(Within(x / sum, c.x, tolerance));
    EXPECT_TRUE(Within(100.0 / sum, c.y, tolerance));
  }
}

TEST(WeightfactorsTest, TheWeightsOfYUnderD65AreThePublishedOnesToThreeDecimals) {
  constexpr std::array<float, 36> kY = {
      0.000F, 0.001F, 0.003F, 0.010F, 0.035F, 0.098F, 0.226F, 0.417F, 0.664F,
      0.998F, 1.501F, 2.164F, 3.352F, 5.129F, 7.076F, 8.708F, 9.474F, 9.752F,
      9.419F, 8.722F, 7.802F, 6.442F, 5.351F, 4.263F, 3.145F, 2.113F, 1.373F,
      0.818F, 0.463F, 0.248F, 0.124F, 0.055F, 0.027F, 0.014F, 0.006F, 0.006F};
  Weightfactors weights(Conditions("D65"));
  const float x = weights.GetFilterSum(0);
  const float* const rounded = weights.Round()[1];
  for (std::size_t i = 0; i < kY.size(); ++i) {
    EXPECT_EQ(rounded[i], kY[i]) << "band " << i;
  }
  EXPECT_EQ(weights.GetFilterSum(0), x) << "the sums stay";
}

TEST(WeightfactorsTest, ConstantsOfTheNormalisation) {
  const auto k = [](const char* illumination, const char* observer) {
    return Weightfactors(Conditions(illumination, observer)).GetKFactor();
  };
  EXPECT_TRUE(Near(k("D65", "TwoDegree"), 0.0094634, 0.5e-7));
  EXPECT_TRUE(Near(k("F11", "TwoDegree"), 0.0682975, 0.5e-7));
  EXPECT_EQ(k("Emission", "TwoDegree"), 0.683F);
  EXPECT_EQ(k("Emission", "TenDegree"), 0.683F);
  EXPECT_TRUE(Near(Weightfactors(Conditions("D65", "TenDegree"))[0][0], -0.0005, 0.5e-4));
  // The integral of y-bar at 1 nm is 106.857 (ISO/CIE 11664-1).
  const Weightfactors emission(Conditions("Emission"));
  EXPECT_TRUE(Within(Sum(emission[1]), 0.683 * 106.857, 0.001));
  EXPECT_EQ(emission.GetFilterSum(1), 100.0F);
}

TEST(WeightfactorsTest, TheBandpassCorrectionSharpensAndKeepsTheSum) {
  Weightfactors weights(Conditions("D65"));
  const float peak = weights[1][17];
  weights.BandpassCorrection();
  EXPECT_TRUE(Within(Sum(weights[1]), 100.0, kWeightSum));
  EXPECT_TRUE(
      Near(weights[1][17], static_cast<double>(peak) * 1.166 - 0.083 * (9.474 + 9.419), 1e-3));
}

TEST(WeightfactorsTest, RefusesAxesAndIlluminantsThatItCannotHave) {
  const Weightfactors weights(Conditions("D65"));
  EXPECT_EQ(MessageOf<TristimException>([&] { weights[3]; }), "Invalid Axis");
  const auto build = [](const char* illumination, const char* observer) {
    return [=] {
      Weightfactors bad(Conditions(illumination, observer));
    };
  };
  for (const char* const word :
       {"F13", "Undefined", "Dxx, Temperature:0", "Dxx, Temperature:-6500"}) {
    EXPECT_EQ(MessageOf<TristimException>(build(word, "TwoDegree")),
              "Unsupported Illumination type");
  }
  EXPECT_EQ(MessageOf<TristimException>(build("D65", "Undefined")), "Unsupported Observer type");
  EXPECT_THROW(build("Userdefined", "TwoDegree")(), Utilities::Exceptions::NullPointerException);
}

struct GridCase {
  int count, max, min;
  const char* text;
};

constexpr char kTooFew[] = "Measure conditions: Too few measure data";
constexpr char kBandwidth[] = "Measure conditions: Check bandwidth of measure data";
constexpr char kStep[] =
    "Measure conditions: measure data bandwith conflicts Step size is not a integer.";
constexpr char kOffGrid[] =
    "Measure conditions: measure data bandwith conflicts with internal calculation bandwith.";

constexpr GridCase kBadGrids[] = {
    {3, 300, 400, kTooFew},      {0, 730, 380, kTooFew},    {36, 380, 380, kBandwidth},
    {36, 380, 730, kBandwidth},  {5, 360, 320, kBandwidth}, {5, 820, 780, kBandwidth},
    {400, 730, 380, kBandwidth}, {40, 729, 378, kStep},     {36, 735, 385, kOffGrid},
    {36, 731, 380, kOffGrid},    {4, 780, 360, kTooFew}};

TEST(MeasureGridTest, TellsWhatIsWrong) {
  for (const GridCase& c : kBadGrids) {
    EXPECT_EQ(MessageOf<TristimException>([&] { MakeMeasureGrid(c.count, c.max, c.min); }), c.text)
        << c.count << " bands from " << c.min << " to " << c.max;
  }
  EXPECT_EQ(MakeMeasureGrid(36, 730, 380).Intervals(), 42);
  EXPECT_EQ(MakeMeasureGrid(5, 780, 360).step, 105) << "the fewest intervals";
}

constexpr int kSteps[] = {1, 2, 5, 10, 20, 35, 60, 70};  // in nm

TEST(FoldTest, NodesOfAQuadraticBecomeTheQuadraticAgain) {
  const auto quadratic = [](int wavelength) {
    const double t = (wavelength - 500) / 100.0;
    return 3.0 - 2.0 * t + 0.5 * t * t;
  };
  for (const int step : kSteps) {
    std::vector<float> nodes;
    for (int at = 360; at <= 780; at += step) {
      nodes.push_back(static_cast<float>(quadratic(at)));
    }
    const std::vector<float> curve = InterpolateTo1nm(nodes, step);
    ASSERT_EQ(curve.size(), kInternalCount);
    for (int at = 360; at <= 780; ++at) {
      EXPECT_TRUE(Near(curve[static_cast<std::size_t>(at - 360)], quadratic(at), 1e-5))
          << at << " nm, step " << step;
    }
  }
}

TEST(FoldTest, NodesAndBandsTogetherHoldTheSumOfTheCurve) {
  for (const int step : kSteps) {
    // The last two intervals take part in the node at 780 nm, which is left out on purpose.
    const int filled = 420 - 2 * step;
    std::vector<float> curve(kInternalCount);
    std::fill_n(curve.begin(), filled, 1.0F);
    curve[420] = 1000.0F;  // the node itself
    const std::vector<float> nodes = FoldOntoNodes(curve, step);
    EXPECT_TRUE(Within(Sum(nodes.data(), nodes.size()), filled, 1e-3)) << step;
    const MeasureGrid grid = MakeMeasureGrid(420 / step - 1, 780 - step, 360 + step);
    const std::vector<float> bands = TransferToBands(nodes, grid);
    EXPECT_TRUE(Within(Sum(bands.data(), bands.size()), filled, 1e-3)) << step;
  }
}

TEST(TransferTest, UnmeasuredNodesGoToTheNearestEndBandAndBandsBeyondTheGridGetNothing) {
  const std::vector<float> nodes(43, 1.0F);
  std::vector<float> expected(36, 1.0F);
  expected.front() = 3.0F;
  expected.back() = 5.0F;
  EXPECT_EQ(TransferToBands(nodes, MakeMeasureGrid(36, 730, 380)), expected);
  expected.assign(47, 1.0F);  // 340 to 800 nm
  for (const std::size_t beyond : {0U, 1U, 44U, 45U, 46U}) {
    expected[beyond] = 0.0F;
  }
  EXPECT_EQ(TransferToBands(nodes, MakeMeasureGrid(47, 800, 340)), expected);
}

TEST(TristimFilterTest, KeepsTheWeightsWhileIlluminantAndObserverStay) {
  TristimFilter filter;
  EXPECT_EQ(filter.GetFilterSum(1), 0.0F);
  EXPECT_THROW(filter[0], Utilities::Exceptions::NullPointerException);

  HXMeasureConditions conditions = Conditions("Dxx, Temperature:5000");
  filter.SetMeasuringConditions(conditions);
  const float* const weights = filter[0];
  const float x = filter.GetFilterSum(0);
  conditions.SetMeasureCondition(Vocabulary::kWhiteBaseKey, "Paper");
  filter.SetMeasuringConditions(conditions);
  EXPECT_EQ(filter[0], weights);
  EXPECT_THROW(filter.SetMeasuringConditions(Conditions("F13")), TristimException);
  EXPECT_EQ(filter.GetFilterSum(0), x) << "a failure leaves the weights of before";
  filter.SetMeasuringConditions(Conditions("Dxx, Temperature:5001"));
  EXPECT_NE(filter.GetFilterSum(0), x);
  filter.SetMeasuringConditions(Conditions("Dxx, Temperature:5000", "TenDegree"));
  EXPECT_NE(filter.GetFilterSum(0), x);
}

TEST(TristimFilterTest, AnotherCurveObjectIsAnotherIlluminant) {
  HXMeasureConditions first;
  first.SetUserdefinedIllumination(Flat(1.0F));
  HXSpectrum rising = Flat(1.0F);
  for (unsigned i = 0; i < 36; ++i) {
    rising[i] = static_cast<float>(i);
  }
  HXMeasureConditions second;
  second.SetUserdefinedIllumination(rising);
  TristimFilter filter;
  filter.SetMeasuringConditions(first);
  // Equal energy: x = y = 1/3.
  EXPECT_TRUE(Near(filter.GetFilterSum(0), 100.0, 0.02));
  EXPECT_TRUE(Near(filter.GetFilterSum(2), 100.0, 0.05));
  filter.SetMeasuringConditions(second);
  EXPECT_LT(filter.GetFilterSum(2), 60.0F);
}

TEST(DaylightTest, ComputedIsTheTableOfTheDSeries) {
  constexpr std::pair<const char*, int> kSeries[] = {{"5000", IlluminationType::kD50},
                                                     {"5500", IlluminationType::kD55},
                                                     {"6500", IlluminationType::kD65},
                                                     {"7500", IlluminationType::kD75}};
  for (const auto& [kelvin, type] : kSeries) {
    StandardFilter computed;
    computed.SetDxxIllumination(Conditions(std::string("Dxx, Temperature:").append(kelvin)));
    const StandardFilter table = TristimFilter::GetIlluFilter(HXIllumination(type));
    ASSERT_EQ(computed.GetStepSize(), 5);
    ASSERT_EQ(computed.GetMinWavelength(), 300);
    ASSERT_EQ(computed.GetMaxWavelength(), 830);
    EXPECT_EQ(computed.GetFilter()[52], 100.0F) << "560 nm";
    for (int i = 0; i < 107; ++i) {
      const float expected = table.GetFilter()[i * 5 / table.GetStepSize()];
      EXPECT_TRUE(Near(computed.GetFilter()[i], static_cast<double>(expected), kDaylightTable))
          << kelvin << " K, " << 300 + 5 * i << " nm";
    }
  }
}

TEST(DaylightTest, ChromaticityAndFactorsOfD65) {
  // Source: CIE 15:2004, clause 3.
  const Daylight day = DaylightOf(6500 * 1.4388 / 1.438);
  EXPECT_TRUE(Within(day.x, 0.31272, 0.5e-5));
  EXPECT_TRUE(Within(day.y, 0.32913, 0.5e-5));
  EXPECT_EQ(day.m1, -0.295);
  EXPECT_EQ(day.m2, -0.689);
  // The polynomial changes at 7000 K.
  EXPECT_TRUE(Within(DaylightOf(6999.8921).x, 0.305358896, 1e-8));
  EXPECT_TRUE(Within(DaylightOf(7000.8926).x, 0.305344801, 1e-8));
  EXPECT_TRUE(
      Within(DaylightOf(7000.0).x, -2.0064 / 343 + 1.9018 / 49 + 0.24748 / 7 + 0.23704, 1e-12));
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
