// What is saved is what an attribute holds, whatever the process has under the ID of its block.

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/conditiontable.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/internals/documentcontent.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"
#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using namespace Vexdoc::Tests;
using Internals::ConditionManager;
using Internals::ConditionTable;

class SavedConditionsTest : public ::testing::Test {
 protected:
  SavedConditionsTest() {
    document_.AddSample("s", Sample("t"));
    sample_ = document_.FindSample("s", "t");
  }

  // An attribute whose block holds {"k": value}.
  void Add(const SmartPointer<Conditions>& block) {
    SmartPointer<SampleAttribute> attribute(new Recipe);
    attribute->SetConditions(block);
    sample_->AddSampleAttribute(attribute);
  }

  void AddUnknown(const std::string& link, const SmartPointer<Conditions>& block) {
    const UnknownSampleAttribute::Data tree(new DataTree(DataItem("Gloss", "1")));
    tree->SetAttribute("Conditions", link);
    SmartPointer<SampleAttribute> attribute(new UnknownSampleAttribute(tree));
    attribute->SetConditions(block);
    sample_->AddSampleAttribute(attribute);
  }

  // Through both forms, and with as many blocks in the file.
  void ExpectSaved(std::size_t blocks) {
    VEX again;
    const std::string xml = XmlOf(document_);
    LoadText(again, xml);
    EXPECT_EQ(ContentOf(again), ContentOf(document_));
    EXPECT_EQ(ContentOf(*LoadedCache(CacheOf(document_))), ContentOf(document_));
    std::size_t count = 0;
    for (std::size_t at = 0; (at = xml.find("<ID>", at)) != std::string::npos; ++at) {
      ++count;
    }
    EXPECT_EQ(count, blocks) << xml;
  }

  VEX document_{"d"};
  SmartPointer<Sample> sample_;
};

SmartPointer<Conditions> Own(const std::string& id, const char* value) {
  return SmartPointer<Conditions>(new Conditions(id, With({{"k", value}})));
}

TEST_F(SavedConditionsTest, BlocksOfOnesOwnAreWritten) {
  Add(Own("0", "zero"));
  Add(Own("", "none"));
  Add(Own("0", "another"));
  Add(Own("0", "zero"));
  Add(Own("name", "named"));
  ExpectSaved(4);
}

TEST_F(SavedConditionsTest, ABlockThatIsChangedOrDroppedBehindTheManagersBackIsWrittenAsItIs) {
  const auto shared = SharedConditions(With({{"k", "before"}}));
  Add(shared);
  shared->AddAttribute("k", "after");
  ExpectSaved(1);
  ConditionManager::GetInstance().RemoveConditions(shared->GetID());
  ExpectSaved(1);
  EXPECT_EQ(sample_->GetElements().front().second->GetConditions()->GetAttribute("k"), "after");
}

TEST_F(SavedConditionsTest, AnIdThatTwoBlocksHaveIsThatOfTheFirst) {
  const auto shared = SharedConditions(With({{"k", "shared"}}));
  Add(Own(shared->GetID(), "mine"));
  Add(shared);
  Add(Own(shared->GetID(), "mine too"));
  Add(Own(shared->GetID(), "shared"));
  ExpectSaved(3);
  EXPECT_NE(XmlOf(document_).find("<Recipe Conditions=\"" + shared->GetID() + "\">"),
            std::string::npos);
}

TEST_F(SavedConditionsTest, ACurveToWhichNothingRefersMakesOtherContentUnderOneId) {
  const auto first = Own("c", "x");
  first->SetCustomIllumination(Flat(1));
  const auto second = Own("c", "x");
  second->SetCustomIllumination(Flat(2));
  ConditionTable table;
  EXPECT_EQ(table.GetId(*first), "c");
  EXPECT_NE(table.GetId(*second), "c");
  second->SetCustomIllumination(Flat(1));
  EXPECT_EQ(ConditionTable().GetId(*second), "c");
}

TEST_F(SavedConditionsTest, AnInventedIdIsNoneOfTheProcessAndGivesWayToNobody) {
  ConditionTable table;
  const auto zero = Own("0", "zero");
  const std::string invented = table.GetId(*zero);
  EXPECT_FALSE(ConditionManager::GetInstance().HasConditions(invented));
  const auto late = Own(invented, "late");
  EXPECT_NE(table.GetId(*late), invented);
  EXPECT_EQ(table.GetId(*zero), invented);
  EXPECT_EQ(table.GetBlocks().size(), 2U);
}

TEST_F(SavedConditionsTest, TheLinkOfAnUnknownAttributeIsThatOfItsBlock) {
  const auto shared = SharedConditions(With({{"k", "shared"}}));
  Add(shared);
  AddUnknown(shared->GetID(), Own("0", "of the unknown"));  // the text of another file
  AddUnknown("nowhere", shared);
  ExpectSaved(2);
}

TEST_F(SavedConditionsTest, AFileWithUnknownAttributesKeepsItsLinksThroughSaves) {
  ConditionManager::GetInstance().NewConditions();
  LoadText(document_,
           "<VEX Version='1'><Name/><SampleSet><Name/><Sample><Name/><SampleAttribute>"
           "<Gloss Conditions='2'/></SampleAttribute><SampleAttribute><Gloss Conditions='1'/>"
           "</SampleAttribute></Sample></SampleSet>"
           "<Conditions><ID>1</ID><Attribute Name='k'>links: one</Attribute></Conditions>"
           "<Conditions><ID>2</ID><Attribute Name='k'>links: two</Attribute></Conditions></VEX>");
  sample_ = document_.GetSampleSets().front().second->GetSamples().front().second;
  Add(Own("1", "links: three"));
  Add(Own("2", "links: four"));
  ExpectSaved(4);
}

// An application may assign to a block that the manager holds, which then has another ID too.
TEST_F(SavedConditionsTest, ALoadLinksTheBlockThatWasFoundWhateverItsIdIs) {
  const auto first = SharedConditions(With({{"k", "assigned: first"}}));
  const auto second = SharedConditions(With({{"k", "assigned: second"}}));
  Conditions changed(*second);
  changed.AddAttribute("k", "assigned: third");
  *first = changed;
  Add(first);
  const auto lost = SharedConditions(With({{"k", "assigned: lost"}}));
  *lost = Conditions("no ID of the process", With({{"k", "assigned: lost"}}));
  Add(lost);
  ExpectSaved(2);
}

TEST_F(SavedConditionsTest, FailuresOfASaveNameTheSetAndTheSample) {
  const std::string place = "set 's', sample 't': ";
  const std::string internal = "An internal XML exception has occured while initializing XML:\n";
  SmartPointer<SampleAttribute> spectrum = Shared(Flat(1));
  const auto failing = [&](const SmartPointer<SampleAttribute>& attribute) {
    VEX document("d");
    document.AddSample("before", Sample("good"));
    document.AddSample("s", Sample("t"));
    document.FindSample("s", "t")->AddSampleAttribute(attribute);
    document.AddSample("s", Sample("after"));
    return document;
  };
  spectrum->SetConditions(SharedConditions(With({{"Physical.WavelengthSpectrumMin", "x"}})));
  EXPECT_TRUE(MessageOf<Utilities::Exceptions::InvalidArgumentException>([&] {
                XmlOf(failing(spectrum));
              }).starts_with(place + "lexical_cast(): fail to convert 'x'"));
  EXPECT_EQ(MessageOf<NullPointerException>([&] { XmlOf(failing(Shared(Recipe()))); }),
            place + "accessed null pointer (class Aldermoor::Vexdoc::Conditions)");
  EXPECT_EQ(
      MessageOf<VexException>([&] { XmlOf(failing(Shared(Recipe({}, "a\xFF", 0, "", {})))); }),
      "An error occurred during composing a VEXStream:\n" + place +
          "XML cannot carry the text 'a\xFF'");
  for (const Recipe& recipe :
       {Recipe({}, "a\x01", 0, "", {}), Recipe(With({{"k", "\x01"}}), "", 0, "", {})}) {
    EXPECT_TRUE(MessageOf<VexException>([&] {
                  XmlOf(failing(Shared(recipe)));
                }).starts_with(internal + place));
  }
  const UnknownSampleAttribute::Data tree(new DataTree(DataItem("1x", "")));
  EXPECT_TRUE(MessageOf<VexException>([&] {
                XmlOf(failing(Shared(UnknownSampleAttribute(tree))));
              }).starts_with(internal + place));
  VEX document = failing(Shared(Flat(1)));
  document.FindElement("s")->SetDescription("\xFF");
  EXPECT_EQ(MessageOf<VexException>([&] { XmlOf(document); }),
            "An error occurred during composing a VEXStream:\nset 's': XML cannot carry the text "
            "'\xFF'");
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
