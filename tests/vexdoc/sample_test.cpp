#include "aldermoor/vexdoc/sample.h"

#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/recipe.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

Sample SampleOf(const std::vector<SmartPointer<SampleAttribute>>& attributes) {
  Sample sample("s");
  for (const auto& attribute : attributes) {
    sample.AddSampleAttribute(attribute);
  }
  return sample;
}

TEST(SampleTest, AStoredAttributeThatMatchesComesFirst) {
  const auto spectrum = Shared(Flat(0.25F));
  const auto first = Shared(Lab(1, 2, 3));
  const Sample sample = SampleOf({spectrum, first, Shared(Lab(4, 5, 6))});
  const Conditions lab = With({{kTypeKey, "CIELab"}});
  EXPECT_TRUE(IsSame(sample.GetSampleAttribute("VEXColorVector", lab, true), first));
  EXPECT_TRUE(IsSame(sample.GetSampleAttribute("VEXSpectrum", Conditions(), false), spectrum));
  EXPECT_EQ(sample.Size(), 3U);
  const auto bare = Shared(Spectrum());
  EXPECT_TRUE(
      IsSame(SampleOf({bare}).GetSampleAttribute("VEXSpectrum", Conditions(), false), bare));
}

TEST(SampleTest, ASpectrumIsPreferredAsTheSourceAndOthersFollowInOrder) {
  const Conditions target = ColorConditions("CIELCh");
  const auto useless = Shared(Flat(1, 35));
  // L* of Y = 0.25 is 57; the other vectors would give 90 and 80.
  const Sample grey = SampleOf({Shared(Lab(90, 3, 4)), useless, Shared(Flat(0.25F))});
  const auto computed = grey.GetSampleAttribute("VEXColorVector", target, false);
  EXPECT_NEAR(static_cast<double>(dynamic_cast<const ColorVector&>(*computed).GetData()[0]),
              57.07542, Aldermoor::Tests::kSinglePrecisionFormula);
  const Sample light =
      SampleOf({useless, Shared(Recipe()), Shared(Lab(90, 3, 4)), Shared(Lab(80, 3, 4))});
  const auto converted = light.GetSampleAttribute("VEXColorVector", target, false);
  ExpectColor(converted, {90, 5, 53.130102});
  EXPECT_TRUE(converted->IsDerived());
  EXPECT_EQ(light.Size(), 4U);
}

TEST(SampleTest, AStoredResultIsDataAndIsFoundAgain) {
  const Sample sample = SampleOf({Shared(Flat(0.25F), "spectrum")});
  const Conditions target = ColorConditions("CIELab");
  const auto computed = sample.GetSampleAttribute("VEXColorVector", target, true);
  EXPECT_FALSE(computed->IsDerived());
  EXPECT_TRUE(IsSame(sample.GetElements().back().second, computed));
  EXPECT_TRUE(IsSame(sample.GetSampleAttribute("VEXColorVector", target, true), computed));
  EXPECT_EQ(sample.Size(), 2U);
}

TEST(SampleTest, WhatNobodyCanGiveIsAFailure) {
  const auto fails = [](const Sample& sample, const char* type, const Conditions& target) {
    return [=] {
      sample.GetSampleAttribute(type, target, true);
    };
  };
  EXPECT_EQ(MessageOf<Missing>(fails(Sample("Red"), "VEXSpectrum", Conditions())),
            "Sample Red has no sample attributes !!");
  const Sample sample = SampleOf({Shared(Flat(1)), Shared(Lab(1, 2, 3))});
  EXPECT_EQ(MessageOf<Missing>(fails(sample, "VEXSpectrum", ColorConditions("CIELab"))),
            "No 'VEXSpectrum' found satisfying the specified conditions");
  EXPECT_EQ(sample.Size(), 2U);
  // Other failures of a source reach the caller.
  EXPECT_THROW(fails(sample, "VEXColorVector", ColorConditions("CIEXYZ", "Userdefined"))(),
               NullPointerException);
  EXPECT_EQ(MessageOf<NullPointerException>(
                fails(SampleOf({Shared(Recipe())}), "VEXRecipe", Conditions())),
            "accessed null pointer (class Aldermoor::Vexdoc::Conditions)");
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
