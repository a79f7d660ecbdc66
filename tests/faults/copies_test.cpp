// Copies and assignments for which memory runs out: the failure carries its trace, and what was to
// be replaced is as it was.

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/colorspace.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"

#include "tests/faults/interposition.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

const std::string kLong(40, 'x');  // beyond what a string holds without memory of its own

Conditions All() {
  Conditions conditions;
  for (const auto& [key, value] : {std::pair("Physical.WavelengthSpectrumMin", "380nm"),
                                   {"Physical.WavelengthSpectrumMax", "730nm"},
                                   {"Physical.NumberOfDataPointsSpectrum", "36"},
                                   {"Physical.SpectrumType", "Remission"},
                                   {"ColorSpaceDescription.Type", "CIELab"},
                                   {"Colorimetric.Illumination", "D65"},
                                   {"Colorimetric.Observer", "TenDegree"}}) {
    conditions.AddAttribute(key, value);
  }
  return conditions;
}

std::string TextOf(const Header& element) {
  std::string text;
  for (const auto& [key, value] : element.GetAttributes()) {
    text += key + "=" + value + ";";
  }
  return text;
}

std::string TextOf(const ColorScheme& scheme) {
  std::string text;
  for (const auto& [label, value] : scheme.GetData()) {
    text += label + "=" + std::to_string(value) + ";";
  }
  return text;
}

std::string TextOf(const Recipe& recipe) {
  std::string text = TextOf(static_cast<const Header&>(recipe)) + recipe.GetAssortmentName() +
                     std::to_string(recipe.GetThickness()) + recipe.GetSubstrateLinkName();
  for (const auto& [name, amount] : recipe.GetComponents()) {
    text += name + std::to_string(amount);
  }
  return text;
}

std::string TextOf(const Spectrum& spectrum) {
  std::string text = TextOf(static_cast<const Header&>(spectrum));
  for (const float value : spectrum.GetData()) {
    text += std::to_string(value);
  }
  return text;
}

std::string TextOf(const ColorVector& vector) {
  return TextOf(static_cast<const Header&>(vector)) +
         std::to_string(vector.GetDatastore()[0].second);
}

std::string TextOf(const SampleIterator& walk) {
  return walk.Dereference()->GetName();
}

template <class T>
void CheckCopies(const char* name, const T& source, const T& other) {
  int failures = 0;
  Outcome outcome;
  for (long number = 1; number == 1 || outcome.was_reached; ++number) {
    SCOPED_TRACE(name + (" allocation " + std::to_string(number)));
    outcome = RunWith({Fault::kAllocation, number}, [&] { const T copy(source); });
    EXPECT_EQ(outcome.has_failed, outcome.was_reached);
    EXPECT_TRUE(!outcome.has_failed || outcome.is_traceable) << "copied";
    failures += outcome.has_failed ? 1 : 0;
  }
  EXPECT_GT(failures, 0) << name;
  const std::string before = TextOf(other);
  for (long number = 1; number == 1 || outcome.was_reached; ++number) {
    SCOPED_TRACE(name + (" assigned, allocation " + std::to_string(number)));
    T target(other);
    outcome = RunWith({Fault::kAllocation, number}, [&] { target = source; });
    EXPECT_TRUE(!outcome.has_failed || outcome.is_traceable);
    EXPECT_EQ(TextOf(target), outcome.has_failed ? before : TextOf(source));
  }
}

TEST(CopiesTest, AreTracedAndWholeOrNotMade) {
  const Conditions all = All();
  Recipe recipe(all, kLong, 1.0F, kLong, {{kLong, 1.0F}, {kLong + "2", 2.0F}});
  recipe.SetDescription(kLong);
  CheckCopies("Recipe", recipe, Recipe(all, "a", 2.0F, "b", {{"c", 3.0F}}));
  Spectrum spectrum(all, std::vector<float>(36, 0.5F));
  spectrum.SetCreator(kLong);
  CheckCopies("Spectrum", spectrum, Spectrum(all, std::vector<float>(2, 0.25F)));
  ColorVector color(all, {1.0F, 2.0F, 3.0F});
  color.SetDescription(kLong);
  CheckCopies("ColorVector", color, ColorVector(all, {4.0F, 5.0F, 6.0F}));
  CheckCopies("ColorScheme", ColorScheme({{kLong, 1.0F}, {kLong, 2.0F}}),
              ColorScheme({{"k", 3.0F}}));
  CheckCopies("ColorSpace", ColorSpace("CIELab", {1.0F, 2.0F, 3.0F}),
              ColorSpace("RGB", {4.0F, 5.0F, 6.0F}));
  VEX document;
  document.AddSample("set", Sample("first"));
  Sample second("second");
  second.AddElement(color);
  document.AddSample("set", second);
  CheckCopies("SampleIterator", document.GetFirstSample(all, "VEXColorVector", "set"),
              document.GetFirstSample(""));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
