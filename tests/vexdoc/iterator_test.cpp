#include <gtest/gtest.h>

#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

const Conditions kLab = With({{kTypeKey, "CIELab"}});

// Sets "empty", "a" (1, 2, 3), "none", "b" (4, 5); of the samples 2, 3 and 5 hold a spectrum.
VEX Document() {
  VEX document;
  for (const char* name : {"empty", "a", "none", "b"}) {
    document.AddSampleSet(name);
  }
  for (const char* name : {"1", "2", "3", "4", "5"}) {
    Sample sample(name);
    if (*name == '1' || *name == '4') {
      sample.AddSampleAttribute(Shared(Recipe(kLab, "", 0, "", {})));
    } else {
      sample.AddSampleAttribute(Shared(Flat(0.5F)));
    }
    document.AddSample(*name < '4' ? "a" : "b", sample);
  }
  return document;
}

std::string Walk(SampleIterator position) {
  std::string names;
  for (; position.HasNext(); ++position) {
    names += position.Dereference()->GetName();
  }
  return names;
}

std::string Walk(SampleAttributeIterator position) {
  std::string names;
  for (; position.HasNext(); position.Move2NextMatch()) {
    names += position.Dereference()->GetName();
  }
  return names;
}

Sample Attributes() {
  Sample sample("s");
  sample.AddSampleAttribute(Shared(Flat(1), "a"));
  sample.AddSampleAttribute(Shared(Lab(1, 2, 3), "b"));
  sample.AddSampleAttribute(Shared(Flat(1), "c"));
  sample.AddSampleAttribute(Shared(Lab(1, 2, 3), "d"));
  return sample;
}

TEST(SampleIteratorTest, WalksTheSetsInOrderAndPassesEmptyOnes) {
  const VEX document = Document();
  EXPECT_EQ(Walk(document.GetFirstSample("")), "12345");
  EXPECT_EQ(Walk(document.GetFirstSample("a")), "123");
  EXPECT_EQ(Walk(document.GetFirstSample("b")), "45");
  EXPECT_EQ(Walk(document.GetFirstSample("empty")), "");
  EXPECT_EQ(Walk(document.GetFirstSample("no such set")), "");
  EXPECT_EQ(Walk(VEX().GetFirstSample("")), "");
}

TEST(SampleIteratorTest, AFilterPassesWhatIsStoredOrCanBeComputed) {
  const VEX document = Document();
  EXPECT_EQ(Walk(document.GetFirstSample(ColorConditions("CIELab"), "VEXColorVector", "")), "235");
  EXPECT_EQ(Walk(document.GetFirstSample(kLab, "VEXRecipe", "")), "14");
  EXPECT_EQ(Walk(document.GetFirstSample(kLab, "VEXRecipe", "b")), "4");
  EXPECT_EQ(Walk(document.GetFirstSample(Conditions(), "VEXSpectrum", "")), "235");
  EXPECT_EQ(document.FindSample("a", "2")->Size(), 1U) << "what was computed is not kept";
  // Failures of another kind are the caller's.
  EXPECT_THROW(
      document.GetFirstSample(ColorConditions("CIEXYZ", "Userdefined"), "VEXColorVector", ""),
      NullPointerException);
}

TEST(SampleIteratorTest, PostfixGivesTheFormerPositionAndTheEndStaysTheEnd) {
  const VEX document = Document();
  SampleIterator position = document.GetFirstSample("b");
  EXPECT_EQ((position++).Dereference()->GetName(), "4");
  EXPECT_EQ(position.Dereference()->GetName(), "5");
  for (int i = 0; i < 2; ++i) {
    ++position;
    EXPECT_EQ(MessageOf<Missing>([&] { position.Dereference(); }), "nomore samples to iterate");
  }
}

TEST(SampleIteratorTest, DeletionStandsOnTheNextEntryOrTheNextMatchOfAnotherSet) {
  VEX document = Document();
  SampleIterator position = document.GetFirstSample(Conditions(), "VEXSpectrum", "");
  position.DeprecatedDelete();
  EXPECT_EQ(position.Dereference()->GetName(), "3");
  position.DeprecatedDelete();
  EXPECT_EQ(position.Dereference()->GetName(), "5") << "4 does not match";
  position.DeprecatedDelete();
  EXPECT_FALSE(position.HasNext());
  position.DeprecatedDelete();
  EXPECT_EQ(Walk(document.GetFirstSample("")), "14");
  SampleIterator first = document.GetFirstSample("a");
  first.DeprecatedDelete();
  EXPECT_FALSE(first.HasNext()) << "the walk was confined to its set";
}

TEST(SampleIteratorTest, InsertionComesBeforeThePositionWhichThenMovesOn) {
  VEX document = Document();
  SampleIterator position = document.GetFirstSample("a");
  EXPECT_EQ(document.InsertSample(Sample("x"), position), "x");
  EXPECT_EQ(position.Dereference()->GetName(), "2");
  ++position;
  EXPECT_EQ(document.GetSampleSet("a")->InsertSample(Sample("x"), position), "x (1)");
  EXPECT_EQ(Walk(document.GetFirstSample("a")), "x12x (1)3");
  EXPECT_FALSE(position.HasNext());
  const char* const invalid = "SampleIterator not valid";
  EXPECT_EQ(MessageOf<VexException>([&] { document.InsertSample(Sample(), position); }), invalid);
  SampleIterator other = document.GetFirstSample("b");
  const auto set = document.GetSampleSet("a");
  EXPECT_EQ(MessageOf<VexException>([&] { set->InsertSample(Sample(), position); }), invalid);
  EXPECT_EQ(MessageOf<VexException>([&] { set->InsertSample(Sample(), other); }), invalid);
}

TEST(SampleIteratorTest, KeepsToItsSetWhateverComesAndGoesBehindIt) {
  VEX document = Document();
  std::string names;
  for (const auto& sample : document.GetFirstSample("b")) {
    names += sample->GetName();
    document.AddSample("new " + std::to_string(names.size()), Sample("x"));
    ASSERT_LT(names.size(), 5U) << "the walk must not run into what it adds";
  }
  EXPECT_EQ(names, "45");
  SampleIterator position = document.GetFirstSample("a");
  document.InsertSampleSet("between", 2);
  document.AddSample("between", Sample("y"));
  document.RemoveSampleSet("none");
  for (int i = 0; i < 9; ++i) {
    position.DeprecatedDelete();
  }
  EXPECT_EQ(Walk(document.GetFirstSample("")), "y45xx") << "only the walk's own samples may go";
  position = document.GetFirstSample("between");
  document.RemoveSampleSet("b");
  EXPECT_EQ(Walk(position), "y");
  ++position;
  document.RemoveSampleSet("between");
  EXPECT_FALSE((++position).HasNext()) << "it is over and needs no set any more";
}

TEST(SampleIteratorTest, StandsOnItsSampleWhileNamesAndPlacesChange) {
  VEX document = Document();
  SampleIterator position = document.GetFirstSample("");
  document.RenameSampleSet("a", "b");  // taken
  document.RenameSample("b (1)", "1", "2");
  EXPECT_EQ(position.Dereference()->GetName(), "2 (1)");
  document.SwapSample("b (1)", "2 (1)", "2");
  document.SwapElements("b (1)", "none");
  document.RemoveSampleSet("none");
  EXPECT_EQ(Walk(position), "2 (1)345");
  int renamed = 0;
  for (const auto& entry : document.GetSampleSets()) {
    for (const auto& [key, sample] : entry.second->GetSamples()) {
      document.RenameSample(entry.first, key, "sample");
      renamed += sample->GetName().starts_with("sample") ? 1 : 0;
    }
  }
  EXPECT_EQ(renamed, 5);
}

TEST(SampleIteratorTest, OfAnotherDocumentIsNotValid) {
  VEX document = Document();
  VEX other = Document();
  SampleIterator position = other.GetFirstSample("a");
  EXPECT_EQ(MessageOf<VexException>([&] { document.InsertSample(Sample("x"), position); }),
            "SampleIterator not valid");
  EXPECT_EQ(Walk(other.GetFirstSample("")) + Walk(document.GetFirstSample("")), "1234512345");
  EXPECT_EQ(position.Dereference()->GetName(), "1");
}

TEST(SampleAttributeIteratorTest, ServesALoop) {
  Sample sample = Attributes();
  std::string names;
  for (const auto& attribute : sample.GetFirstSampleAttribute(kLab)) {
    names += attribute->GetName();
    sample.RenameElement(attribute->GetName(), "x");
  }
  EXPECT_EQ(names, "bd");
  EXPECT_EQ(Walk(sample.GetFirstSampleAttribute()), "axcx");
}

TEST(SampleAttributeIteratorTest, StopsAtTheMatchesOfItsFilter) {
  const Sample sample = Attributes();
  EXPECT_EQ(Walk(sample.GetFirstSampleAttribute()), "abcd");
  EXPECT_EQ(Walk(sample.GetFirstSampleAttribute(kLab)), "bd");
  EXPECT_EQ(Walk(sample.GetFirstSampleAttribute(With({{kTypeKey, "RGB"}}))), "");
  EXPECT_EQ(Walk(Sample().GetFirstSampleAttribute()), "");
  EXPECT_TRUE(SampleAttributeIterator().Dereference().IsNull());
}

TEST(SampleAttributeIteratorTest, RemovalMovesOnToTheNextMatch) {
  Sample sample = Attributes();
  SampleAttributeIterator position = sample.GetFirstSampleAttribute(kLab);
  Sample().Remove(position);
  sample.Remove(position);
  EXPECT_EQ(position.Dereference()->GetName(), "d");
  sample.Remove(position);
  EXPECT_FALSE(position.HasNext());
  sample.Remove(position);
  EXPECT_EQ(Walk(sample.GetFirstSampleAttribute()), "ac");
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
