#include <string>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

using Utilities::Exceptions::InvalidArgumentException;

UnknownSampleAttribute Unknown(const std::string& name) {
  return UnknownSampleAttribute(SmartPointer<DataTree>(new DataTree(DataItem(name, "text"))));
}

TEST(DataItemTest, AttributesHaveNames) {
  DataItem item("name", "value");
  EXPECT_EQ(MessageOf<InvalidArgumentException>([&] { item.SetAttribute("", "x"); }),
            "DataItem::SetAttribute(): name is empty !!!");
  EXPECT_FALSE(item.HasAttribute());
  item.SetAttribute("a", "");
  EXPECT_TRUE(item.HasAttribute()) << "an empty value counts";
}

TEST(UnknownSampleAttributeTest, CopiesShareTheTree) {
  UnknownSampleAttribute original = Unknown("root");
  original.SetName("name");
  original.SetConditions(SmartPointer<Conditions>(new Conditions("7")));
  const auto copy = original.TransformTo("VEXUnknownSampleAttribute", With({{"any", "thing"}}));
  EXPECT_TRUE(IsSame(dynamic_cast<UnknownSampleAttribute&>(*copy).GetData(), original.GetData()));
  EXPECT_EQ(copy->GetName(), "name");
  EXPECT_EQ(copy->GetConditions()->GetID(), "7");
  EXPECT_EQ(Refusal(original, "VEXSpectrum"), "SampleAttribute Type VEXSpectrum not defined");
}

TEST(UnknownSampleAttributeTest, EqualsEverythingButTakesOverOnlyItsOwnKind) {
  UnknownSampleAttribute target = Unknown("a");
  EXPECT_TRUE(Equal(target, Unknown("b")));
  EXPECT_TRUE(Equal(target, Flat(1)));
  EXPECT_FALSE(Equal(Flat(1), target)) << "which is not mutual";
  target.Assign(Flat(1));
  EXPECT_TRUE(target.GetConditions().IsNull());
  const UnknownSampleAttribute source = Unknown("b");
  target.Assign(source);
  EXPECT_TRUE(IsSame(target.GetData(), source.GetData()));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
