#include "aldermoor/tristim/tristimservice.h"

#include <cmath>
#include <memory>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Aldermoor::Tests;
using Internals::TristimCalculator;

/// A smooth bluish green: 0.1 at both ends, 0.6 at 510 nm.
HXSpectrum BluishGreen(const HXMeasureConditions& conditions = {}) {
  HXSpectrum spectrum = Flat(0.1F, conditions);
  for (unsigned i = 5; i <= 21; ++i) {
    const float distance = (static_cast<float>(i) - 13.0F) / 8.5F;
    spectrum[i] = 0.1F + 0.5F * (1.0F - distance * distance);
  }
  return spectrum;
}

std::string TypeOf(const HXColorVector& vector) {
  return vector.GetMeasureConditions().GetMeasureCondition("ColorSpaceDescription.Type");
}

constexpr const char* kSpectrumSpaces[] = {
    "CIELab", "CIELCh",     "CIEXYZ",     "CIExyY",    "CIELChuv", "LABhx", "LCHhx",
    "CIELuv", "CIEuvY1976", "CIEuvY1960", "HunterLab", "RxRyRz",   "RGB"};

TEST(TristimServiceTest, SpectraGiveTheColorUnderTheConditionsOfTheRequest) {
  HXMeasureConditions physical;
  physical.SetMeasureCondition("Physical.Filter", "Polarizer");
  for (const std::string space : kSpectrumSpaces) {
    const HXMeasureConditions request = Conditions("A", "TenDegree", space);
    const HXColorVector color = TristimService::GetVector(BluishGreen(physical), request);
    EXPECT_EQ(color[3], 0.0F);
    HXMeasureConditions expected = space == "RGB" ? InSpace("RGB") : request;
    if (space != "RGB") {
      expected.SetPhysMeasCond(physical);
    }
    EXPECT_TRUE(color.GetMeasureConditions() == expected) << space;
    EXPECT_EQ(color.GetMeasureConditions().GetPhysicalFilter(), expected.GetPhysicalFilter());
  }
}

TEST(TristimServiceTest, EveryWayFromASpectrumAgreesWithTheWayThroughAnotherSpace) {
  const auto from_spectrum = [](const char* space) {
    return TristimService::GetVector(BluishGreen(), InSpace(space));
  };
  constexpr std::pair<const char*, const char*> kWays[] = {
      {"CIEXYZ", "CIELab"},     {"CIEXYZ", "CIExyY"},  {"CIEXYZ", "CIEuvY1976"},
      {"CIEXYZ", "CIEuvY1960"}, {"CIEXYZ", "RGB"},     {"CIELab", "CIELCh"},
      {"CIELab", "RGB"},        {"CIELuv", "CIELChuv"}};
  for (const auto& [through, space] : kWays) {
    const HXColorVector color = TristimService::GetVector(from_spectrum(through), space);
    EXPECT_EQ(color.GetChannels(), from_spectrum(space).GetChannels()) << through << space;
  }
  // The hx spaces: the polar form wraps the hue, the way from the spectrum does not.
  const HXColorVector polar = TristimService::GetVector(from_spectrum("LABhx"), "LCHhx");
  HXColorVector difference = from_spectrum("LCHhx");
  difference -= polar;
  EXPECT_LT(difference.Length(), 2e-4F);
  // Twice the same chromaticity, once from XYZ and once by way of x, y, z.
  difference = from_spectrum("CIELuv");
  EXPECT_TRUE(Near(difference[1] - from_spectrum("CIEuvY1976")[0], 0.0, 1e-6));
}

struct VectorRow {
  const char* from;
  const char* to;
  HXColorVector::Channels in;
  std::array<double, 3> out;
  double tolerance;
};

// Under D65 and the two-degree observer, but for the ways from RGB and CMYK, which have a white of
// their own.  Computed apart from this code, in double precision.
const VectorRow kVectorRows[] = {
    {"CIEXYZ", "CIELab", {95.047F, 100.0F, 108.883F}, {100.0, 0.0, 0.0}, 2e-3},
    {"CIELab", "CIEXYZ", {100.0F}, {95.047, 100.0, 108.883}, kWhitePoint},
    {"CIELab", "CIELCh", {50.0F, 20.0F, 10.0F}, {50.0, 22.360680, 26.565051}, 1e-5},
    {"LABhx", "LCHhx", {50.0F, 20.0F, 10.0F}, {50.0, 22.360680, 26.565051}, 1e-5},
    {"CIELuv", "CIELChuv", {50.0F, 3.0F, -4.0F}, {50.0, 5.0, 306.869898}, 1e-4},
    {"CIEXYZ", "CIExyY", {20.0F, 30.0F, 40.0F}, {0.222222, 0.333333, 30.0}, 1e-6},
    {"CIELab", "RGB", {100.0F}, {255.0, 255.0, 255.0}, 0.0},
    {"CMYK", "RGB", {0.0F, 0.0F, 0.0F, 100.0F}, {51.0, 51.0, 51.0}, 1e-5},
    {"CIEXYZ", "RGB", {20.344F, 21.404F, 23.310F}, {127.0, 127.0, 127.0}, 0.0},
    {"CIEXYZ", "CIEuvY1960", {20.0F, 30.0F, 40.0F}, {0.135593, 0.305085, 30.0}, 1e-6},
    {"CIExyY", "CIEuvY1960", {0.222222F, 0.333333F, 30.0F}, {0.135593, 0.305085, 30.0}, 1e-6},
    {"CIEXYZ", "CIEuvY1976", {20.0F, 30.0F, 40.0F}, {0.135593, 0.457627, 30.0}, 1e-6},
    {"CIExyY", "CIEuvY1976", {0.222222F, 0.333333F, 30.0F}, {0.135593, 0.457627, 30.0}, 1e-6},
    {"RGB", "CIELab", {255.0F, 255.0F, 255.0F}, {100.0, 0.0, 0.0}, 0.03},
};

TEST(TristimServiceTest, VectorsGiveTheSameColorInTheOtherSpace) {
  for (const VectorRow& row : kVectorRows) {
    SCOPED_TRACE(::testing::Message() << row.from << " to " << row.to);
    const HXColorVector in({row.in.begin(), row.in.end()}, InSpace(row.from));
    const HXColorVector out = TristimService::GetVector(in, row.to);
    ExpectNear(out.GetChannels(), row.out, row.tolerance);
    EXPECT_EQ(out[3], 0.0F);
    EXPECT_EQ(TypeOf(out), row.to);
    EXPECT_TRUE(TristimService::GetVector(in, row.from) == in);
  }
}

TEST(TristimServiceTest, ConditionsOfAConvertedVector) {
  const auto illumination = [](const HXColorVector& vector) {
    return vector.GetMeasureConditions().GetMeasureCondition("Colorimetric.Illumination");
  };
  const HXColorVector lab(50.0F, 20.0F, 10.0F, Conditions("A", "TenDegree"));
  EXPECT_TRUE(TristimService::GetVector(lab, "CIELCh").GetMeasureConditions() ==
              Conditions("A", "TenDegree", "CIELCh"));
  EXPECT_TRUE(TristimService::GetVector(lab, "RGB").GetMeasureConditions() == InSpace("RGB"));
  const HXColorVector rgb(200.0F, 100.0F, 50.0F, Conditions("A", "TenDegree", "RGB"));
  EXPECT_EQ(illumination(TristimService::GetVector(rgb, "CIELab")), "A")
      << "though it was computed against D50";
  const HXColorVector cmyk =
      TristimService::GetVector(HXColorVector({0.0F, 0.0F, 0.0F, 0.0F}, InSpace("CMYK")), "RGB");
  EXPECT_EQ(illumination(cmyk), "D50");
  EXPECT_EQ(cmyk.GetMeasureConditions().GetWhiteBase(), WhiteBase::Absolute);
}

TEST(TristimServiceTest, RefusesWhatHasNoWay) {
  for (const std::string space : {"CMYK", "Undefined"}) {
    const auto run = [&] {
      TristimService::GetVector(Flat(0.5F), InSpace(space));
    };
    EXPECT_EQ(MessageOf<TristimException>(run), "GetVector not supported for ColorSpace " + space);
  }
  constexpr std::array<const char*, 3> kRefused[] = {
      {"CMYK", "CIELab", "CMYK to ColorSpace CIELab"},
      {"CIELCh", "CIELab", "CIELCh to ColorSpace CIELab"},
      {"CIELCh", "RGB", "CIELCh to ColorSpace CIELab"},  // from the step in between
      {"CIELuv", "CIEXYZ", "CIELuv to ColorSpace CIEXYZ"},
      {"CIExyY", "CIEXYZ", "CIExyY to ColorSpace CIEXYZ"},
      {"RGB", "CIEXYZ", "RGB to ColorSpace CIEXYZ"},
      {"CIELab", "CMYK", "CIELab to ColorSpace CMYK"},
      {"CIELab", "", "CIELab to ColorSpace "}};
  for (const auto& [from, to, text] : kRefused) {
    const HXColorVector vector(50.0F, 1.0F, 1.0F, InSpace(from));
    EXPECT_EQ(MessageOf<TristimException>([&, t = to] { TristimService::GetVector(vector, t); }),
              std::string("Conversion not supported from ColorSpace ") + text);
  }
}

TEST(TristimServiceTest, ThePaperBaseNeedsAPaperAndMakesItWhite) {
  for (const char* const space : kSpectrumSpaces) {
    HXMeasureConditions conditions = InSpace(space);
    conditions.SetWhiteBase(WhiteBase::Paper);
    const auto run = [&] {
      TristimService::GetVector(Flat(0.5F), conditions);
    };
    EXPECT_EQ(MessageOf<TristimException>(run), "TristimCalculator") << space;
  }
  auto paper = std::make_unique<Internals::HXSample>();
  paper->SetSpectrum(BluishGreen());
  TristimCalculator::SetPaperWhitePointer(
      Utilities::Tools::SmartPointer<Internals::HXSample>(paper.release()));
  HXMeasureConditions conditions = InSpace("CIELab");
  conditions.SetWhiteBase(WhiteBase::Paper);
  const HXColorVector lab = TristimService::GetVector(BluishGreen(), conditions);
  TristimCalculator::SetPaperWhitePointer({});
  ExpectNear(lab.GetChannels(), {100.0, 0.0, 0.0}, 2 * kSinglePrecisionFormula);
}

TEST(TristimServiceTest, AnEmissionStaysAnEmission) {
  HXMeasureConditions request = Conditions("D50", "TwoDegree", "CIEXYZ");
  request.SetWhiteBase(WhiteBase::Paper);  // not looked at
  const HXColorVector xyz = TristimService::GetVector(Flat(1.0F, Conditions("Emission")), request);
  EXPECT_EQ(xyz.GetMeasureConditions().GetMeasureCondition("Colorimetric.Illumination"),
            "Emission");
  // 683 lm/W times the integral of y-bar, in kilo-units.
  EXPECT_TRUE(Near(xyz[1], 0.683 * 106.857, 0.001));
}

TEST(TristimServiceTest, BlackHasTheChromaticityOfTheLight) {
  const HXColorVector xyy =
      TristimService::GetVector(Flat(0.0F), Conditions("A", "TwoDegree", "CIExyY"));
  EXPECT_TRUE(Near(xyy[0], 0.44758, kChromaticityFiveDigits));
  EXPECT_TRUE(Near(xyy[1], 0.40745, kChromaticityFiveDigits));
  EXPECT_EQ(xyy[2], 0.0F);
  // u' and v' of illuminant A: 0.2560, 0.5243 (CIE 15:2004).
  const HXColorVector luv =
      TristimService::GetVector(Flat(0.0F), Conditions("A", "TwoDegree", "CIELuv"));
  EXPECT_TRUE(Near(luv[1], 0.2560, 0.5e-4));
  EXPECT_TRUE(Near(luv[2], 0.5243, 0.5e-4));
  EXPECT_TRUE(Near(luv[0], 0.0, 1e-4));
}

TEST(TristimCalculatorTest, FailuresWriteNothing) {
  HXMeasureConditions paper = Conditions("D65");
  paper.SetWhiteBase(WhiteBase::Paper);
  const HXColorVector before(1.0F, 2.0F, 3.0F, Conditions("A"));
  HXColorVector out = before;
  EXPECT_FALSE(TristimCalculator::GetVector_CIEXYZ(Flat(0.5F), paper, out));
  EXPECT_FALSE(TristimCalculator::GetVector_CIEuvY1976(before, out)) << "of a colour in CIELab";
  EXPECT_FALSE(TristimCalculator::GetVector_CIEuvY1960(before, out));
  EXPECT_TRUE(out == before);
}

TEST(TristimCalculatorTest, TheNormIsTheWhiteWithoutAPhysicalFilter) {
  HXMeasureConditions conditions = Conditions("D65");
  conditions.SetMeasureCondition("Physical.Filter", "UVCut");
  HXColorVector white;
  EXPECT_TRUE(TristimCalculator::GetNormValence(conditions, white));
  EXPECT_TRUE(Near(white[0], 95.047, kWhitePoint));
  EXPECT_EQ(white[1], 100.0F);
  EXPECT_EQ(white.GetMeasureConditions().GetPhysicalFilter(), PhysicalFilter::No);
}

TEST(TristimCalculatorTest, TheThreeDeltaFormsAreOne) {
  const HXColorVector first(50.0F, 10.0F, 5.0F, Conditions("A"));
  const HXColorVector second(48.0F, 7.0F, 9.0F, Conditions("D50"));
  HXColorVector delta;
  for (const auto form :
       {&TristimCalculator::GetVector_DeltaCIELCH_ab, &TristimCalculator::GetVector_CIELCH_uv,
        &TristimCalculator::GetVector_LCHhx_delta}) {
    EXPECT_TRUE(form(first, second, delta));
    EXPECT_TRUE(delta.GetMeasureConditions() == first.GetMeasureConditions());
    EXPECT_TRUE(Near(delta.Length(), std::sqrt(29.0), 1e-5));
  }
}

TEST(TristimServiceTest, DifferencesArePolarAndFirstMinusSecond) {
  constexpr const char* kSpaces[][2] = {
      {"CIELab", "CIELCh"}, {"CIELuv", "CIELChuv"}, {"LABhx", "LCHhx"}};
  for (const auto& [rectangular, polar] : kSpaces) {
    const HXMeasureConditions conditions = Conditions("A", "TenDegree", rectangular);
    const HXColorVector delta = TristimService::GetDeltaVector(
        HXColorVector(60.0F, 6.0F, 8.0F, conditions), HXColorVector(50.0F, 3.0F, 4.0F, conditions));
    EXPECT_EQ(delta[0], 10.0F);
    EXPECT_EQ(delta[1], 5.0F);
    EXPECT_TRUE(delta.GetMeasureConditions() == Conditions("A", "TenDegree", polar)) << polar;
  }
  const HXColorVector xyz(1.0F, 2.0F, 3.0F, InSpace("CIEXYZ"));
  EXPECT_EQ(MessageOf<TristimException>([&] { TristimService::GetDeltaVector(xyz, xyz); }),
            "TristimCalculator");
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
