#include "aldermoor/vexdoc/vexnode.h"

#include <functional>
#include <iterator>
#include <limits>
#include <string>
#include <utility>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/sampleset.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

using Internals::DocumentAccess;
using Utilities::Exceptions::OutOfRangeException;

const std::string kSampleType = "class Aldermoor::Vexdoc::Sample";

SmartPointer<Sample> NewSample(const std::string& name) {
  return SmartPointer<Sample>(new Sample(name));
}

SampleSet SetOf(const Keys& names) {
  SampleSet set("set");
  for (const std::string& name : names) {
    set.AddSample(Sample(name));
  }
  return set;
}

/// Keys, names and index must tell the same.
void ExpectSamples(const SampleSet& set, const Keys& names) {
  EXPECT_EQ(KeysOf(set.GetElements()), names);
  for (const auto& [key, element] : set.GetElements()) {
    EXPECT_EQ(element->GetName(), key);
    EXPECT_TRUE(IsSame(set.GetElement(key), element)) << key;
  }
}

TEST(HeaderTest, StartsWithNameAndTimes) {
  const Sample sample;
  EXPECT_EQ(sample.GetAttributes().size(), 3U);
  EXPECT_EQ(sample.GetAttributes().at("Name"), "");
  EXPECT_EQ(sample.GetAttributes().at("Created"), sample.GetAttributes().at("Modified"));
  EXPECT_EQ(sample.GetCreationDateTime().size(), std::string("2024-01-15/12:00:00").size());
}

TEST(VexNodeTest, AnElementWithATakenNameGetsANumber) {
  SampleSet set;
  EXPECT_TRUE(set.AddElement(NewSample("Red")));
  EXPECT_FALSE(set.AddElement(NewSample("Red")));
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red (2)");
  EXPECT_EQ(set.AddSample(Sample("Red (1)")), "Red (1) (1)");
  set.RemoveSample("Red (1)");
  EXPECT_EQ(set.GetUniqueName("Red"), "Red (1)") << "a gap is filled";
  ExpectSamples(set, {"Red", "Red (2)", "Red (1) (1)"});
  // An empty name is a name; its duplicates are called after the type.
  ExpectSamples(SetOf({"", "", ""}), {"", kSampleType, kSampleType + " (1)"});
}

TEST(VexNodeTest, AttributesOfASampleMayShareAName) {
  Sample sample;
  const auto first = Shared(Recipe(), "x");
  EXPECT_TRUE(sample.AddElement(first));
  EXPECT_TRUE(sample.AddElement(Shared(Recipe(), "x")));
  EXPECT_EQ(sample.GetUniqueName("x"), "x");
  EXPECT_TRUE(IsSame(sample.GetElement("x"), first));
  EXPECT_EQ(sample.RenameElement("x", "y"), "y");
  EXPECT_EQ(KeysOf(sample.GetElements()), Keys({"y", "x"}));
  EXPECT_TRUE(IsSame(sample.GetElement("y"), first));
}

TEST(VexNodeTest, ElementsAreInsertedBeforeAPosition) {
  SampleSet set = SetOf({"b"});
  set.InsertElement(Sample("a"), 0);
  set.InsertElement(Sample("d"), 2);
  EXPECT_EQ(set.InsertElement("c", 2)->GetName(), "c");
  const SmartPointer<Sample> taken = NewSample("a");
  const auto entry = set.InsertElement(taken, std::next(set.GetElements().begin()));
  EXPECT_TRUE(IsSame(entry->second, taken));
  ExpectSamples(set, {"a", "a (1)", "b", "c", "d"});
}

TEST(VexNodeTest, ARemovedElementLivesOnWithWhoeverHoldsIt) {
  SampleSet set = SetOf({"a", "b", "c", "d"});
  const SmartPointer<Sample> a = set.GetElement("a");
  const auto behind = set.RemoveElement(std::next(set.GetElements().begin()));
  EXPECT_EQ(behind->first, "c");
  set.RemoveElement(a);
  set.RemoveElement(a);               // no longer there
  set.RemoveElement(NewSample("c"));  // another object of that name
  set.RemoveElement(SmartPointer<Sample>());
  set.RemoveElement("no such sample");
  ExpectSamples(set, {"c", "d"});
  set.Clear();
  EXPECT_TRUE(set.AddElement(a));
  EXPECT_TRUE(set.AddElement(NewSample("c"))) << "the index must have forgotten the name";
  ExpectSamples(set, {"a", "c"});
}

TEST(VexNodeTest, RenamedElementsKeepTheirPlaceAndSwappedOnesTradeIt) {
  SampleSet set = SetOf({"a", "b", "c"});
  const SmartPointer<Sample> b = set.GetElement("b");
  EXPECT_EQ(set.RenameElement("b", "x"), "x");
  EXPECT_EQ(set.RenameElement("a", "c"), "c (1)");
  EXPECT_EQ(set.RenameElement("c", "c"), "c");
  ExpectSamples(set, {"c (1)", "x", "c"});
  set.SwapElements("x", "c");
  set.SwapElements("x", "x");
  ExpectSamples(set, {"c (1)", "c", "x"});
  EXPECT_TRUE(IsSame(set.GetElement("x"), b));
  // Reported is the name that was free before the old one was given up.
  SampleSet red = SetOf({"Red", "Red"});
  EXPECT_EQ(red.RenameElement("Red (1)", "Red"), "Red (2)");
  ExpectSamples(red, {"Red", "Red (1)"});
}

TEST(VexNodeTest, WhatIsNotThereIsReportedWithTypeAndName) {
  SampleSet set = SetOf({"a"});
  const std::string missing = "Could not find " + kSampleType + "/b";
  EXPECT_EQ(MessageOf<Missing>([&] { set.FindElement("b"); }), missing);
  EXPECT_EQ(MessageOf<Missing>([&] { set.FindElement("b", false); }), missing);
  EXPECT_EQ(MessageOf<Missing>([&] { set.RenameElement("b", "b"); }), missing);
  EXPECT_EQ(MessageOf<Missing>([] { Sample().GetElement("b"); }),
            "Could not find class Aldermoor::Vexdoc::SampleAttribute/b");
  EXPECT_EQ(MessageOf<VexException>([&] { set.SwapElements("a", "b"); }), "sample(s) not found");
  EXPECT_EQ(MessageOf<VexException>([&] { set.SwapElements("b", "a"); }), "sample(s) not found");
  const SmartPointer<Sample> empty;
  const std::string null = "accessed null pointer (" + kSampleType + ")";
  EXPECT_EQ(MessageOf<NullPointerException>([&] { set.AddElement(empty); }), null);
  EXPECT_EQ(
      MessageOf<NullPointerException>([&] { set.InsertElement(empty, set.GetElements().end()); }),
      null);
  EXPECT_EQ(set.FindElement("b", true)->GetName(), "b");
  ExpectSamples(set, {"a", "b"});
}

TEST(VexNodeTest, OnlyInsertionAndRemovalCountAsAModification) {
  const auto modifies = [](auto action) {
    SampleSet set = SetOf({"a", "b"});
    set.SetAttribute("Modified", "long ago");
    action(set);
    return set.GetModificationDateTime() != "long ago";
  };
  EXPECT_TRUE(modifies([](SampleSet& s) { s.AddSample(Sample("x")); }));
  EXPECT_TRUE(modifies([](SampleSet& s) { s.InsertElement(Sample("x"), 0); }));
  EXPECT_TRUE(modifies([](SampleSet& s) { s.RemoveElement("a"); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { s.RemoveElement("x"); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { s.RenameElement("a", "x"); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { s.SwapElements("a", "b"); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { s.FindElement("x", true); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { DocumentAccess::Append(s, NewSample("x")); }));
  EXPECT_FALSE(modifies([](SampleSet& s) { s.Clear(); }));
}

TEST(VexNodeTest, AnIndexOutOfRangeChangesNothing) {
  for (const long index : {-1L, 3L, 1'000'000'000'000L, std::numeric_limits<long>::min()}) {
    VEX document;
    document.AddSample("set", Sample("a"));
    document.AddSampleSet("other");
    const std::string message = "position " + std::to_string(index) + " is outside 0..";
    const std::pair<std::function<void()>, const char*> insertions[] = {
        {[&] { document.InsertSampleSet("x", index); }, "2"},
        {[&] { document.InsertSampleSet(SampleSet("x"), index); }, "2"},
        {[&] { document.InsertElement("x", index); }, "2"},
        {[&] { document.InsertSample("set", Sample("x"), index); }, "1"},
        {[&] { document.InsertSample("new", Sample("x"), index); }, "0"},
    };
    for (const auto& [insert, count] : insertions) {
      EXPECT_EQ(MessageOf<OutOfRangeException>(insert), message + count);
    }
    EXPECT_EQ(KeysOf(document.GetElements()), Keys({"set", "other"}));
    ExpectSamples(*document.GetSampleSet("set"), {"a"});
  }
}

// An element that refuses what a container asks of it.
struct Stubborn : Sample {
  explicit Stubborn(const std::string& name) : Sample(name) {}
  void SetName(const std::string& /*name*/) override { throw VexException("no", ""); }
  void SetParent(Header* parent) override {
    if (parent != nullptr && refuses_parents) {
      throw VexException("no", "");
    }
  }
  bool refuses_parents = false;
};

TEST(VexNodeTest, AnElementThatRefusesLeavesTheContainerAsItWas) {
  SampleSet set = SetOf({"a"});
  set.SetAttribute("Modified", "long ago");
  const SmartPointer<Stubborn> stubborn(new Stubborn("a"));
  EXPECT_THROW(set.AddElement(stubborn), VexException) << "it needs another name";
  stubborn->refuses_parents = true;
  EXPECT_THROW(set.AddElement(stubborn), VexException);
  EXPECT_THROW(set.AddElement(SmartPointer<Sample>()), NullPointerException);
  ExpectSamples(set, {"a"});
  EXPECT_EQ(set.GetModificationDateTime(), "long ago");
  stubborn->refuses_parents = false;
  set.RemoveElement("a");
  set.AddElement(stubborn);
  EXPECT_THROW(set.RenameElement("a", "b"), VexException);
  ExpectSamples(set, {"a"});
}

TEST(VexNodeTest, OfEqualNamesTheNextIsFoundWhenTheFirstGoes) {
  const std::function<void(SampleSet&)> ways[] = {
      [](SampleSet& set) { set.RemoveElement("a"); },
      [](SampleSet& set) { set.RemoveElement(set.GetElement("a")); },
      [](SampleSet& set) { set.RenameElement("a", "c"); },
  };
  for (const auto& way : ways) {
    SampleSet set;
    for (const char* name : {"a", "b", "a", "a"}) {
      DocumentAccess::Append(set, NewSample(name));
    }
    const auto third = std::next(set.GetElements().begin(), 2)->second;
    set.RemoveElement(set.GetElements().back().second);
    EXPECT_FALSE(IsSame(set.GetElement("a"), third));
    way(set);
    EXPECT_TRUE(IsSame(set.GetElement("a"), third));
    EXPECT_EQ(set.AddSample(Sample("a")), "a (1)");
    way(set);
    EXPECT_THROW(set.GetElement("a"), Missing);
  }
}

TEST(VexNodeTest, TheLowestFreeNumberIsFoundWhateverWentBefore) {
  SampleSet set = SetOf({"Red", "Red", "Red", "Red"});
  set.RenameElement("Red (2)", "Blue");
  EXPECT_EQ(set.GetUniqueName("Red"), "Red (2)");
  set.RemoveElement("Red (1)");
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red (1)");
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red (2)");
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red (4)");
  set.RemoveElement("Red");
  set.RemoveElement("Red (3)");
  set.AddSample(Sample("Red (03)"));  // of another form
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red");
  EXPECT_EQ(set.AddSample(Sample("Red")), "Red (3)");
  EXPECT_EQ(set.RenameElement("Red (2)", "Red"), "Red (5)");
  ExpectSamples(set, {"Blue", "Red (1)", "Red (2)", "Red (4)", "Red (03)", "Red", "Red (3)"});
}

TEST(VexNodeTest, AppendKeepsEqualNamesAndTheFirstIsFound) {
  SampleSet set;
  const SmartPointer<Sample> first = NewSample("a");
  DocumentAccess::Append(set, first);
  DocumentAccess::Append(set, NewSample("a"));
  EXPECT_TRUE(IsSame(set.GetElement("a"), first));
  const SampleSet copy = set;
  EXPECT_EQ(KeysOf(copy.GetElements()), Keys({"a", "a"})) << "a copy is made by appending";
  first->SetName("b");
  EXPECT_TRUE(IsSame(set.GetElement("a"), first)) << "the key of a child outlives its name";
  first->SetParent(&set);
  EXPECT_EQ(first->GetParent(), nullptr) << "no element ever gets a parent";
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
