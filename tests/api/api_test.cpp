// What an application sees of the shared library: classes that it can build, derive from and copy,
// and exceptions that keep their types across the border.

#include <memory>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/directory.h"
#include "aldermoor/vexdoc/colorspace.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/xmlplatform.h"

namespace {

using namespace Aldermoor;
using namespace Aldermoor::Vexdoc;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Exceptions::TraceableException;
using Utilities::FileSystem::Directory;
using Utilities::FileSystem::File;
using Utilities::Tools::DynamicCast;
using Utilities::Tools::SmartPointer;

Conditions Measured() {
  Conditions conditions;
  conditions.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
  conditions.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", "36");
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  return conditions;
}

TEST(ApiTest, ADocumentIsBuiltCopiedAndRearranged) {
  VEX document("lab");
  SampleSet set("inks");
  Sample sample("cyan");
  sample.AddSampleAttribute(
      SmartPointer<Spectrum>(new Spectrum(Measured(), std::vector<float>(36, 0.25F))));
  Recipe recipe(Conditions(), "basic", 1.5F, "paper", {{"blue", 3.0F}});
  sample.AddElement(recipe);
  set.AddSample(sample);
  set.AddElement("cyan");
  document.AddSampleSet(set);
  document.InsertSampleSet("first", 0);

  const VEX copy(document);
  document.RemoveAllSampleSets();

  ASSERT_EQ(copy.Size(), 2U);
  EXPECT_EQ(copy.GetElements().front().first, "first");
  EXPECT_EQ(copy.GetSampleSet("inks")->GetSamples().back().first, "cyan (1)");
  const SmartPointer<Sample> kept = copy.FindSample("inks", "cyan");
  ASSERT_EQ(kept->Size(), 2U);
  const auto stored = DynamicCast<Recipe>(kept->GetElements().back().second);
  ASSERT_TRUE(stored);
  EXPECT_TRUE(stored->Equals(recipe));
}

TEST(ApiTest, ExceptionsKeepTheirTypesAcrossTheBorder) {
  const XMLPlatform platform;
  VEX document;
  EXPECT_THROW((void)document.FindSample("a", "b"), std::out_of_range);
  EXPECT_THROW((void)document.GetSampleSet("a"), ResourceNotAvailableException);
  EXPECT_THROW(Spectrum(Conditions(), {}), MissingConditionException);
  EXPECT_THROW(ColorSpace("CIELab", ColorScheme::Channels()), VexParseException);
  EXPECT_THROW(ColorSpace("CIELAB", std::vector<float>(3)), Tristim::TristimException);
  EXPECT_THROW(File(""), std::invalid_argument);
  EXPECT_THROW(Directory(Directory::Named, "/no/such/place"), TraceableException);
  EXPECT_THROW(document.SetParent(nullptr), std::logic_error);
  std::istringstream text("<VEX Version='1.0'>\n<Name>x</VEX>");
  try {
    document.Load(text);
    FAIL() << "loaded";
  } catch (const VexXMLParseException& e) {
    EXPECT_EQ(e.GetFile(), "VEX");
    EXPECT_EQ(e.GetLine(), 2U);
    EXPECT_GT(e.GetColumn(), 1U);
  }
}

// An attribute kind of an application's own takes part in documents like the library's.
class Note : public Recipe {
 public:
  std::string GetAssortmentName() const override { return "note: " + Recipe::GetAssortmentName(); }
};

TEST(ApiTest, ClassesCanBeDerivedFrom) {
  auto note = std::make_unique<Note>();
  note->SetAssortmentName("x");
  Sample sample("s");
  sample.AddSampleAttribute(SmartPointer<SampleAttribute>(note.release()));
  const auto stored = DynamicCast<Recipe>(sample.GetElements().front().second);
  ASSERT_TRUE(stored);
  EXPECT_EQ(stored->GetType(), "VEXRecipe");
  EXPECT_EQ(stored->GetAssortmentName(), "note: x");
}

TEST(ApiTest, LoadingWithoutThePlatformIsReported) {
  std::istringstream text("<VEX Version='1.0'><Name>x</Name></VEX>");
  VEX document;
  EXPECT_THROW(document.Load(text), VexException);
}

}  // namespace
