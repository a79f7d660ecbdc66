#include "aldermoor/vexdoc/spectrum.h"

#include <string>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

constexpr char kNoConditions[] = "accessed null pointer (class Aldermoor::Vexdoc::Conditions)";

TEST(SpectrumTest, TheFirstMissingMandatoryConditionIsReported) {
  Conditions conditions;
  for (const std::string key : {"Physical.WavelengthSpectrumMin", "Physical.WavelengthSpectrumMax",
                                "Physical.NumberOfDataPointsSpectrum", "Physical.SpectrumType"}) {
    EXPECT_EQ(MessageOf<MissingConditionException>([&] { Spectrum(conditions, {}); }),
              "missing mandatory condition '" + key + "'");
    conditions.AddAttribute(key, "");  // an empty value counts as present
  }
  EXPECT_NO_THROW(Spectrum(conditions, {}));
  EXPECT_NO_THROW(Spectrum().ValidateMandatoryConditions({}));
  EXPECT_EQ(
      MessageOf<NullPointerException>([] { Spectrum().ValidateMandatoryConditions({"key"}); }),
      kNoConditions);
}

TEST(SpectrumTest, IsEqualByConditionsAndValuesInOrder) {
  const Conditions conditions = SpectrumConditions();
  Conditions other = conditions;
  other.AddAttribute("Physical.Filter", "UVCut");
  const Spectrum spectrum(conditions, {1, 2, 3});
  const Spectrum twin(conditions, {1, 2, 3});
  EXPECT_TRUE(spectrum == twin && !(spectrum != twin));
  EXPECT_TRUE(IsSame(spectrum.GetConditions(), twin.GetConditions())) << "equal blocks are one";
  const Spectrum disordered(conditions, {1, 3, 2});
  EXPECT_TRUE(spectrum != disordered && !(spectrum == disordered));
  EXPECT_FALSE(Equal(spectrum, Spectrum(conditions, {1, 2})));
  EXPECT_FALSE(Equal(spectrum, Spectrum(other, {1, 2, 3})));
  EXPECT_FALSE(Equal(spectrum, ColorVector()));
}

TEST(SpectrumTest, OnlyASpectrumIsAssigned) {
  Spectrum spectrum = Flat(1);
  spectrum.Assign(Recipe());
  EXPECT_TRUE(Equal(spectrum, Flat(1)));
  Spectrum source = Flat(2);
  source.SetName("source");
  source.SetDerived(true);
  spectrum.Assign(source);
  EXPECT_TRUE(Equal(spectrum, source));
  EXPECT_EQ(spectrum.GetName(), "source");
  EXPECT_TRUE(spectrum.IsDerived());
}

TEST(SpectrumTest, GivesItselfUnderConditionsThatItMeets) {
  Spectrum spectrum = Flat(0.25F);
  const auto copy =
      spectrum.TransformTo("VEXSpectrum", With({{"Physical.SpectrumType", "Remission"}}));
  EXPECT_TRUE(Equal(*copy, spectrum));
  EXPECT_FALSE(copy->IsDerived());
  const auto zeros = Spectrum().TransformTo("VEXSpectrum", Conditions());
  EXPECT_EQ(dynamic_cast<const Spectrum&>(*zeros).GetData(), Values(36, 0.0F));
}

TEST(SpectrumTest, WhatItCannotGiveIsReportedWithTheTypeAskedFor) {
  const std::string refusal = "Could not convert 'VEXSpectrum' to '";
  const Conditions lab = ColorConditions("CIELab");
  EXPECT_EQ(Refusal(Flat(1), "VEXRecipe"), refusal + "VEXRecipe'");
  EXPECT_EQ(Refusal(Flat(1), ""), refusal + "'");
  EXPECT_EQ(Refusal(Flat(1), "VEXSpectrum", With({{"a", "b"}})), refusal + "VEXSpectrum'");
  EXPECT_EQ(Refusal(Flat(1, 35), "VEXColorVector", lab), refusal + "VEXColorVector'");
  EXPECT_EQ(Refusal(Flat(1, 37), "VEXColorVector", lab), refusal + "VEXColorVector'");
  EXPECT_EQ(Refusal(Flat(1), "VEXColorVector", ColorConditions("CMYK")),
            refusal + "VEXColorVector'");
  EXPECT_EQ(MessageOf<NullPointerException>([&] { Spectrum().TransformTo("VEXColorVector", lab); }),
            kNoConditions);
}

TEST(SpectrumTest, AComputedColorSaysUnderWhatItWasComputed) {
  Conditions measured = SpectrumConditions();
  measured.AddAttribute("Physical.Filter", "UVCut");
  // The grid is fixed all the same.
  measured.AddAttribute("Physical.WavelengthSpectrumMin", "400nm");
  Conditions target = ColorConditions("CIELab", "Candlelight");
  target.AddAttribute("No.Such.Key", "dropped");
  const auto color = Spectrum(measured, Values(36, 0.25F)).TransformTo("VEXColorVector", target);
  EXPECT_TRUE(color->IsDerived());
  ExpectColor(color, {57.07542, 0, 0});  // L* of Y = 25: 116 · 0.25^(1/3) - 16
  EXPECT_EQ(color->GetConditions()->GetAttributes(),
            With({{"Physical.Filter", "UVCut"},
                  {"Physical.NumberOfDataPointsSpectrum", "36"},
                  {"Physical.WavelengthSpectrumMin", "380nm"},
                  {"Physical.WavelengthSpectrumMax", "730nm"},
                  {kObserverKey, "TwoDegree"},
                  {kIlluminationKey, "D65"},  // an unknown word leaves the default
                  {"Colorimetric.WhiteBase", "Automatic"},
                  {"Colorimetric.DensityStandard", "DIN"},
                  {"Colorimetric.DensityFilterMode", "Auto"},
                  {kTypeKey, "CIELab"},
                  {"ColorSpaceDescription.AbsoluteOrDeltaVector", "AbsoluteVector"},
                  {"ColorSpaceDescription.DeltaEFormula", "CIELab"},
                  {"Physical.SpectrumType", "Remission"}})
                .GetAttributes());
}

TEST(SpectrumTest, AUserdefinedIlluminationNeedsItsCurve) {
  Conditions target = ColorConditions("CIEXYZ", "Userdefined");
  EXPECT_THROW(Flat(1).TransformTo("VEXColorVector", target), NullPointerException);
  target.SetCustomIllumination(Flat(1));
  const auto color = Flat(1).TransformTo("VEXColorVector", target);
  EXPECT_EQ(color->GetConditions()->GetCustomIllumination().GetData(), Values(36, 1.0F));
  // Equal energy has X = Y = Z; the sums over 10 nm from 380 nm to 730 nm leave three digits.
  ExpectColor(color, {100, 100, 100}, 0.15);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
