#include <cmath>
#include <numbers>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/published.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;
using Aldermoor::Tests::kSinglePrecisionFormula;

// The hues of the tenth pair are exactly 180 degrees apart in decimals, where the mean hue may be
// either of two.  The single-precision channels fall on the side of the eleventh.
constexpr std::size_t kPairOnTheEdge = 9;

TEST(DeltaETest, Ciede2000OfThePublishedPairsBothWaysRound) {
  for (std::size_t i = 0; i < std::size(kPublished2000); ++i) {
    SCOPED_TRACE(::testing::Message() << "pair " << i + 1);
    Quadruple lab[2] = {};
    for (std::size_t k = 0; k < 6; ++k) {
      lab[k / 3][k % 3] = static_cast<float>(kPublished2000[i][k]);
    }
    const double expected = i == kPairOnTheEdge ? 7.2195 : kPublished2000[i][6];
    EXPECT_TRUE(Near(DeltaE2000(lab[0], lab[1], {1.0F, 1.0F, 1.0F}), expected, 1e-4));
    EXPECT_TRUE(Near(DeltaE2000(lab[1], lab[0], {1.0F, 1.0F, 1.0F}), expected, 1e-4));
  }
}

// As given with the formulas of the Python package colour-science, for graphic arts and CMC(2:1).
TEST(DeltaETest, Cie94AndCmcOfPairsThatAnotherLibraryPublishes) {
  constexpr Quadruple kReference = {100.0F, 21.57210357F, 272.22819350F, 0.0F};
  constexpr struct {
    Quadruple sample;
    double cie94;
    double cmc;
  } kPairs[] = {{{100.0F, 426.67945353F, 72.39590835F, 0.0F}, 83.779225501, 172.704771287},
                {{100.0F, 74.05216981F, 276.45318193F, 0.0F}, 10.053931954, 20.597329912}};
  for (const auto& [sample, cie94, cmc] : kPairs) {
    EXPECT_TRUE(Near(DeltaE94(kReference, sample, {1.0F, 1.0F, 1.0F}), cie94, 1e-4));
    EXPECT_TRUE(Near(DeltaECmc(kReference, sample, 2.0F, 1.0F), cmc, 1e-4));
  }
}

// The other formulas once more, from their publications and in extended precision.
using Real = long double;

Real Wide(float value) {
  return static_cast<Real>(value);
}

struct Polar {
  Real l, c, h;  // degrees
};

constexpr Real kDegree = std::numbers::pi_v<Real> / 180;

Polar PolarOf(const Quadruple& lab) {
  const Real hue = std::atan2(Wide(lab[2]), Wide(lab[1])) / kDegree;
  return {Wide(lab[0]), std::hypot(Wide(lab[1]), Wide(lab[2])), hue < 0 ? hue + 360 : hue};
}

Real Weighted(const Polar& first, const Polar& second, Real sl, Real sc, Real sh) {
  const Real hue = 2 * std::sqrt(first.c * second.c) * std::sin(kDegree * (first.h - second.h) / 2);
  return std::hypot((first.l - second.l) / sl, (first.c - second.c) / sc, hue / sh);
}

Real Cie76(const Quadruple& first, const Quadruple& second, const Triple& /*k*/) {
  return Weighted(PolarOf(first), PolarOf(second), 1, 1, 1);
}

Real Cie94(const Quadruple& first, const Quadruple& second, const Triple& k) {
  const Polar one = PolarOf(first);
  return Weighted(one, PolarOf(second), Wide(k[0]), Wide(k[1]) * (1 + 0.045L * one.c),
                  Wide(k[2]) * (1 + 0.015L * one.c));
}

Real Cie2000(const Quadruple& first, const Quadruple& second, const Triple& k) {
  return Wide(DeltaE2000(first, second, k));  // whose figures are published
}

// BS 6923:1988.
Real CmcOf(const Polar& first, const Polar& second, Real l, Real c) {
  const auto [l1, c1, h1] = first;
  const Real sl = l1 > 16 ? 0.040975L * l1 / (1 + 0.01765L * l1) : 0.511L;
  const Real sc = 0.0638L * c1 / (1 + 0.0131L * c1) + 0.638L;
  const Real t = h1 >= 164 && h1 <= 345 ? 0.56L + std::abs(0.2L * std::cos(kDegree * (h1 + 168)))
                                        : 0.36L + std::abs(0.4L * std::cos(kDegree * (h1 + 35)));
  const Real f = std::sqrt(std::pow(c1, 4.0L) / (std::pow(c1, 4.0L) + 1900));
  return Weighted(first, second, l * sl, c * sc, sc * (f * t + 1 - f));
}

Real Cmc(const Quadruple& first, const Quadruple& second, const Triple& k) {
  return CmcOf(PolarOf(first), PolarOf(second), Wide(k[0]), Wide(k[1]));
}

// K. D. Chickering, J. Opt. Soc. Am. 57, 537 (1967) and 61, 118 (1971).
Real Fmc2(const Quadruple& first, const Quadruple& second, const Triple& /*k*/) {
  const auto cones = [](const Quadruple& xyz) {
    const Real x = Wide(xyz[0]);
    const Real y = Wide(xyz[1]);
    const Real z = Wide(xyz[2]);
    return std::array<Real, 3>{0.724L * x + 0.382L * y - 0.098L * z,
                               -0.48L * x + 1.37L * y + 0.1276L * z, 0.686L * z};
  };
  const auto [p, q, s] = cones(first);
  const auto [p2, q2, s2] = cones(second);
  const Real y = Wide(first[1]);
  const Real k1 =
      0.55669L + y * (0.049434L + y * (-0.82575e-3L + y * (0.79172e-5L - y * 0.30087e-7L)));
  const Real k2 =
      0.17548L + y * (0.027556L + y * (-0.57262e-3L + y * (0.63893e-5L - y * 0.26731e-7L)));
  const Real length = std::hypot(p, q);
  const Real a = std::sqrt(17.3e-6L * length * length /
                           (1 + 2.73L * p * p * q * q / (std::pow(p, 4.0L) + std::pow(q, 4.0L))));
  const Real b = std::sqrt(3.098e-4L * (s * s + 0.2015L * y * y));
  const Real along = (p * (p2 - p) + q * (q2 - q)) / length;
  const Real red_green = (q * (p2 - p) - p * (q2 - q)) / length;
  const Real yellow_blue = s * along / length - (s2 - s);
  return std::hypot(k1 * red_green / a, k1 * yellow_blue / b, k2 * 0.279L * along / a);
}

Polar HxOf(const Quadruple& lab) {
  constexpr Real kCos[] = {-0.09622L, -0.06742L, -0.02137L, 0.00587L};
  constexpr Real kSin[] = {0.13893L, -0.0539L, -0.04029L, -0.01043L};
  const auto [l, c, h] = PolarOf(lab);
  Real hue = 0.17914L + kDegree * h;
  for (int n = 1; n <= 4; ++n) {
    hue += kCos[n - 1] * std::cos(n * kDegree * h) + kSin[n - 1] * std::sin(n * kDegree * h);
  }
  return {l >= 16 ? 0.01765L * l + std::log(0.040975L * l) / 0.040975L + 34.7231L : l / 0.511L,
          12.253L * std::log(0.072158L * c + 0.638L) + 0.181547L * c + 5.50671L, hue / kDegree};
}

Real Hx(const Quadruple& first, const Quadruple& second, const Triple& /*k*/) {
  return Weighted(HxOf(first), HxOf(second), 1, 1, 1);
}

HXMeasureConditions WithFormula(const std::string& formula,
                                HXMeasureConditions conditions = Conditions("A", "TenDegree")) {
  conditions.SetMeasureCondition(Vocabulary::kDeltaEFormulaKey, formula);
  return conditions;
}

struct FormulaRow {
  const char* formula;
  const char* space;  ///< in which `expected` takes the two colours
  bool of_vectors;    ///< whether there is a form for vectors, too
  Triple usual;       ///< weights
  Real (*expected)(const Quadruple& first, const Quadruple& second, const Triple& weights);
};

constexpr FormulaRow kFormulas[] = {
    {"CIELab", "CIELab", true, {}, Cie76},
    {"LABhx", "CIELab", false, {}, Hx},
    {"CIELuv", "CIELuv", false, {}, Cie76},
    {"FMCII", "CIEXYZ", false, {}, Fmc2},
    {"CMC", "CIELab", true, {2.0F, 1.0F, 1.0F}, Cmc},
    {"94", "CIELab", true, {1.0F, 1.0F, 1.0F}, Cie94},
    {"2000", "CIELab", true, {1.0F, 1.0F, 1.0F}, Cie2000},
};

TEST(DeltaETest, EveryFormulaOfMeasuredPairsIsThatOfItsPublication) {
  const std::vector<Measured> paints = ReadMeasured("paints.csv");
  for (const FormulaRow& row : kFormulas) {
    const HXMeasureConditions conditions = WithFormula(row.formula);
    HXMeasureConditions in_space = conditions;
    in_space.SetMeasureCondition(Vocabulary::kColorSpaceKey, row.space);
    for (std::size_t i = 0; i < paints.size(); ++i) {
      const std::size_t other = (i + 7) % paints.size();
      SCOPED_TRACE(row.formula + (" " + paints[i].name) + ", " + paints[other].name);
      const HXSpectrum first(paints[i].values);
      const HXSpectrum second(paints[other].values);
      const HXColorVector one = TristimService::GetVector(first, in_space);
      const HXColorVector two = TristimService::GetVector(second, in_space);
      for (const Triple& given : {Triple{}, Triple{1.0F, 3.0F, 0.5F}}) {
        Triple weights = row.usual;
        for (std::size_t k = 0; k < 3; ++k) {
          weights[k] = given[k] == 0.0F ? weights[k] : given[k];
        }
        const auto expected =
            static_cast<double>(row.expected(one.GetChannels(), two.GetChannels(), weights));
        // FMC II takes differences of cone signals and raises Y to the fourth power.
        const double tolerance =
            kSinglePrecisionFormula + expected * (row.formula[0] == 'F' ? 1e-5 : 2e-6);
        EXPECT_TRUE(
            Near(TristimService::GetDeltaE(first, second, conditions, given[0], given[1], given[2]),
                 expected, tolerance));
        if (row.of_vectors) {
          EXPECT_TRUE(Near(TristimService::GetDeltaE(one, two, given[0], given[1], given[2]),
                           expected, tolerance));
        }
      }
      EXPECT_EQ(TristimService::GetDeltaE(first, first, conditions, 0.0F, 0.0F, 0.0F), 0.0F);
    }
  }
}

TEST(DeltaETest, CmcOnTheEdgesOfItsBranches) {
  for (const float edge : {164.0F, 345.0F}) {
    Quadruple lab{};
    for (float c = 20.0F; PolarFromRectangular({60.0F, lab[1], lab[2]})[2] != edge; c += 0.01F) {
      const auto radians = static_cast<float>(kDegree * (Wide(edge)));
      lab = {60.0F, c * std::cos(radians), c * std::sin(radians), 0.0F};
      ASSERT_LT(c, 60.0F) << "no colour has this hue exactly";
    }
    const Quadruple turned = {lab[0], -lab[2], lab[1], 0.0F};  // by 90 degrees
    Polar first = PolarOf(lab);
    first.h = Wide(edge);
    EXPECT_TRUE(Near(DeltaECmc(lab, turned, 2.0F, 1.0F),
                     static_cast<double>(CmcOf(first, PolarOf(turned), 2, 1)), 1e-3));
  }
  // 16 belongs to the dark branch.  A neutral reference has F = 0, so T has no say.
  EXPECT_TRUE(Near(DeltaECmc({16.0F}, {15.0F}, 1.0F, 1.0F), 1 / 0.511, 1e-5));
  EXPECT_TRUE(Near(DeltaECmc({16.001F}, {15.001F}, 1.0F, 1.0F), 1 / 0.511254, 2e-5));
  EXPECT_TRUE(Near(DeltaECmc({50.0F}, {50.0F, 3.0F, 0.0F}, 2.0F, 1.0F), 3 / 0.638, 1e-5));
}

TEST(DeltaETest, WhatHasNoDifferenceSaysSo) {
  const Quadruple lab = {50.0F, 10.0F, 5.0F, 0.0F};
  const float nan = std::numeric_limits<float>::quiet_NaN();
  for (std::size_t k = 0; k < 3; ++k) {
    Triple weights = {1.0F, 1.0F, 1.0F};
    weights[k] = 0.0F;
    EXPECT_EQ(DeltaE94(lab, lab, weights), kNoDeltaE);
    EXPECT_EQ(DeltaE2000(lab, lab, weights), kNoDeltaE);
  }
  EXPECT_EQ(DeltaE2000(lab, {50.0F, nan, 5.0F}, {1.0F, 1.0F, 1.0F}), kNoDeltaE);
  EXPECT_EQ(DeltaEFmc2({}, {10.0F, 10.0F, 10.0F}), kNoDeltaE);
  EXPECT_EQ(DeltaEFmc2({10.0F, 0.0F, 0.0F}, {10.0F, 10.0F, 10.0F}), kNoDeltaE);
  EXPECT_LT(DeltaEFmc2({10.0F, 0.0F, 1.0F}, {10.0F, 10.0F, 10.0F}), kNoDeltaE);
}

TEST(DeltaETest, TheServiceTellsWhatFailed) {
  const auto of_spectra = [](float first, const HXMeasureConditions& conditions) {
    return MessageOf<TristimException>(
        [&] { TristimService::GetDeltaE(Flat(first), Flat(0.5F), conditions, 0.0F, 0.0F, 0.0F); });
  };
  EXPECT_EQ(of_spectra(0.4F, WithFormula("Undefined")),
            "GetDeltaE not supported for DeltaEFormula Undefined");
  EXPECT_EQ(of_spectra(0.0F, WithFormula("FMCII")), "TristimCalculator");
  for (const FormulaRow& row : kFormulas) {
    HXMeasureConditions conditions = WithFormula(row.formula);
    const HXColorVector lab(50.0F, 10.0F, 5.0F, conditions);
    const auto of_vectors = [&](const HXColorVector& second) {
      return MessageOf<TristimException>(
          [&] { TristimService::GetDeltaE(lab, second, 0.0F, 0.0F, 0.0F); });
    };
    EXPECT_EQ(of_vectors(lab), row.of_vectors ? "nothing was thrown" : "TristimCalculator");
    EXPECT_EQ(of_vectors(HXColorVector(1.0F, 2.0F, 3.0F, InSpace("CIELCh"))),
              "Conversion not supported from ColorSpace CIELCh to ColorSpace CIELab");
    conditions.SetWhiteBase(WhiteBase::Paper);
    EXPECT_EQ(of_spectra(0.4F, conditions), "TristimCalculator") << row.formula;
  }
}

TEST(DeltaETest, TheFastFormOfAnOptimiserIsThePlainOneButForNegativeLightness) {
  const auto paper = Utilities::Tools::SmartPointer<HXSample>(new HXSample);
  paper->SetSpectrum(Flat(0.8F));
  TristimCalculator::SetPaperWhitePointer(paper);
  HXMeasureConditions conditions = Conditions("A", "TenDegree");
  for (const WhiteBase base : {WhiteBase::Paper, WhiteBase::Absolute}) {
    conditions.SetWhiteBase(base);
    const HXLab target = HXColorVector(40.0F, 10.0F, -20.0F, conditions);
    HXColorVector lab = TristimService::GetVector(Flat(0.3F), conditions);
    lab -= target;
    const HXSpectrum grey = Flat(0.3F);
    EXPECT_TRUE(
        Near(TristimCalculator::GetDeltaE_CIELAB_SpeedOptimized(target, grey.GetBands().data()),
             static_cast<double>(lab.Length()), kSinglePrecisionFormula));
  }
  TristimCalculator::SetPaperWhitePointer({});
  const HXSpectrum below = Flat(-0.01F);
  EXPECT_TRUE(Near(TristimCalculator::GetDeltaE_CIELAB_SpeedOptimized(
                       HXColorVector(0.0F, 0.0F, 0.0F, conditions), below.GetBands().data()),
                   7.787 * 0.01 * 116, 0.01));
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
