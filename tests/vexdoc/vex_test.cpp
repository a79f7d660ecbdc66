#include "aldermoor/vexdoc/vex.h"

#include <string>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/elementcloner.h"
#include "aldermoor/vexdoc/elementtyper.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

using Utilities::Exceptions::OutOfRangeException;

VEX DocumentOfTwo() {
  VEX vex("doc");
  vex.AddSample("set", Sample("a"));
  vex.AddSample("set", Sample("b"));
  return vex;
}

TEST(VexTest, SetsAreStoredAsCopiesUnderUniqueNames) {
  VEX vex;
  const SampleSet set("s");
  EXPECT_EQ(vex.AddSampleSet(set), "s");
  EXPECT_EQ(vex.AddSampleSet(set), "s (1)");
  EXPECT_EQ(vex.AddSampleSet("s"), "s (2)");
  EXPECT_EQ(vex.InsertSampleSet(set, 0), "s (3)");
  EXPECT_EQ(vex.InsertSampleSet("t", 1), "t");
  EXPECT_EQ(vex.RenameSampleSet("s (1)", "u"), "u");
  vex.RemoveSampleSet("s (2)");
  EXPECT_EQ(KeysOf(vex.GetSampleSets()), Keys({"s (3)", "t", "s", "u"}));
}

TEST(VexTest, SamplesAreReachedThroughTheirSetWhichTheyBringAlong) {
  VEX vex = DocumentOfTwo();
  EXPECT_EQ(vex.InsertSample("set", Sample("b"), 0), "b (1)");
  EXPECT_EQ(vex.InsertSample("new", Sample("c"), 0), "c");
  EXPECT_EQ(KeysOf(vex.GetSampleSets()), Keys({"set", "new"}));
  EXPECT_EQ(vex.RenameSample("set", "a", "b"), "b (2)");
  vex.SwapSample("set", "b (1)", "b");
  EXPECT_EQ(KeysOf(vex.GetSampleSet("set")->GetSamples()), Keys({"b", "b (2)", "b (1)"}));
  EXPECT_EQ(vex.GetUniqueSampleName("set", "b"), "b (3)");
  EXPECT_EQ(vex.GetUniqueSampleName("none", "b"), "Unknown");
}

TEST(VexTest, FailuresTellWhatIsMissing) {
  const std::string set = "Could not find class Aldermoor::Vexdoc::SampleSet/none";
  const std::string sample = "Could not find class Aldermoor::Vexdoc::Sample/none";
  VEX vex = DocumentOfTwo();
  EXPECT_EQ(MessageOf<OutOfRangeException>([&] { vex.FindSample("none", "a"); }), set);
  EXPECT_EQ(MessageOf<OutOfRangeException>([&] { vex.FindSample("set", "none"); }), sample);
  EXPECT_EQ(MessageOf<Missing>([&] { vex.GetSampleSet("none"); }), set);
  EXPECT_EQ(MessageOf<Missing>([&] { vex.GetSampleSet("abcdef%NAME%"); }),
            "Could not find class Aldermoor::Vexdoc::SampleSet/abcdef%NAME%");
  EXPECT_EQ(MessageOf<Missing>([&] { vex.RenameSample("none", "a", "c"); }), set);
  EXPECT_EQ(MessageOf<Missing>([&] { vex.RenameSample("set", "none", "c"); }), sample);
  EXPECT_EQ(MessageOf<Missing>([&] { vex.SwapSample("none", "a", "b"); }), set);
  EXPECT_EQ(MessageOf<std::logic_error>([&] { vex.SetParent(nullptr); }),
            "VEX is already THE root element and can not accept a parent therefore");
  EXPECT_EQ(vex.GetSampleSetCount(), 1U) << "no failed look-up makes a set";
}

template <class E, class Action>
void ExpectWay(Action action, const Keys& beginnings) {
  try {
    action();
    FAIL() << "nothing was thrown";
  } catch (const E& e) {
    const Keys where(e.where().begin(), e.where().end());
    ASSERT_EQ(where.size(), beginnings.size());
    for (std::size_t i = 0; i < where.size(); ++i) {
      EXPECT_TRUE(where[i].starts_with(beginnings[i])) << where[i];
    }
  }
}

TEST(VexTest, AFailureCarriesTheWayThatItTook) {
  const VEX vex = DocumentOfTwo();
  const std::string here = "::Aldermoor::Vexdoc::VEX::FindSample(): /src/aldermoor/vexdoc/vex.cpp:";
  ExpectWay<OutOfRangeException>([&] { vex.FindSample("set", "none"); }, {here, here});
  ExpectWay<Missing>(
      [&] { vex.GetSampleSet("none"); },
      {"",
       "::Aldermoor::Vexdoc::VexNode<class Aldermoor::Vexdoc::SampleSet,class Aldermoor::Vexdoc::"
       "UniqueStoragePolicy<Aldermoor::Vexdoc::SampleSet>>::FindElement(): ",
       "::Aldermoor::Vexdoc::VEX::GetSampleSet(): "});
}

/// A document with one attribute of every kind, under the names of their elements.
VEX Everything() {
  Sample sample("s");
  sample.AddSampleAttribute(Shared(Flat(0.5F), "Spectrum"));
  sample.AddSampleAttribute(Shared(Lab(50, 20, 10), "ColorVector"));
  sample.AddSampleAttribute(Shared(Recipe(Conditions(), "as", 1, "li", {{"c", 2}}), "Recipe"));
  sample.AddSampleAttribute(Shared(UnknownSampleAttribute({})));
  sample.SetAttribute("Created", "once");
  VEX vex("doc");
  vex.AddSample("set", sample);
  return vex;
}

TEST(VexTest, CopiesAreDeepButShareTheConditions) {
  const VEX original = Everything();
  VEX assigned = DocumentOfTwo();
  assigned = original;
  const VEX& itself = assigned;
  assigned = itself;
  for (const VEX& copy : {VEX(original), assigned}) {
    EXPECT_EQ(copy.GetAttributes(), original.GetAttributes());
    EXPECT_FALSE(IsSame(copy.GetSampleSet("set"), original.GetSampleSet("set")));
    const SmartPointer<Sample> sample = copy.FindSample("set", "s");
    const SmartPointer<Sample> source = original.FindSample("set", "s");
    EXPECT_FALSE(IsSame(sample, source));
    EXPECT_EQ(sample->GetAttributes(), source->GetAttributes());
    EXPECT_EQ(KeysOf(sample->GetElements()), KeysOf(source->GetElements()));
    for (const auto& [name, attribute] : sample->GetElements()) {
      const SmartPointer<SampleAttribute> twin = source->GetElement(name);
      EXPECT_FALSE(IsSame(attribute, twin)) << name;
      EXPECT_TRUE(*attribute == *twin) << name;
      EXPECT_EQ(attribute->GetAttributes(), twin->GetAttributes());
      EXPECT_TRUE(IsSame(attribute->GetConditions(), twin->GetConditions())) << name;
    }
  }
}

TEST(ElementTyperTest, TellsTypeAndElementNameOfEveryKindAndOfItsClone) {
  VEX vex = Everything();
  const auto expect = [](Header& element, const std::string& type, const std::string& name) {
    ElementCloner cloner;
    element.AcceptVisitor(cloner);
    EXPECT_NE(cloner.GetClone().Get(), &element);
    for (Header* each : {&element, static_cast<Header*>(cloner.GetClone().Get())}) {
      ElementTyper typer;
      each->AcceptVisitor(typer);
      EXPECT_EQ(typer.GetTypeName(), type);
      EXPECT_EQ(typer.GetElementName(), name);
    }
  };
  expect(vex, "VEX", "VEX");
  expect(*vex.GetSampleSet("set"), "VEXSampleSet", "SampleSet");
  expect(*vex.FindSample("set", "s"), "VEXSample", "Sample");
  for (const auto& [name, attribute] : vex.FindSample("set", "s")->GetElements()) {
    expect(*attribute, "VEX" + (name.empty() ? "UnknownSampleAttribute" : name), name);
  }
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
