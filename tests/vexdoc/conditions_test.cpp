#include "aldermoor/vexdoc/conditions.h"

#include <gtest/gtest.h>

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

constexpr char kNoIllumination[] = "User defined Illumination not defined!";

/// With one that is flat at `value`.
Conditions WithIllumination(Pairs attributes, float value) {
  Conditions conditions = With(attributes);
  conditions.SetCustomIllumination(Flat(value));
  return conditions;
}

TEST(ConditionsTest, AnAttributeIsReplacedAndTheOldValueReturned) {
  Conditions conditions;
  EXPECT_EQ(conditions.AddAttribute("", "x"), "");
  EXPECT_TRUE(conditions.IsEmpty());
  EXPECT_EQ(conditions.AddAttribute("k", "one"), "");
  EXPECT_EQ(conditions.AddAttribute("k", ""), "one");
  EXPECT_EQ(conditions.GetAttribute("k", "default"), "") << "an empty value is a value";
  EXPECT_EQ(conditions.GetAttribute("missing", "default"), "default");
  EXPECT_EQ(MessageOf<Missing>([&] { conditions.GetAttribute("A.B"); }),
            "Condition Attribute <A.B> not found");
  EXPECT_EQ(MessageOf<Missing>([&] { conditions.GetCustomIllumination(); }), kNoIllumination);
}

TEST(ConditionsTest, CopiesTakeTheContentAndShareTheIllumination) {
  const Conditions original = WithIllumination({{"a", "1"}}, 1);
  const Conditions copy("7", original);
  EXPECT_EQ(original.GetID(), "0");
  EXPECT_EQ(Conditions(copy).GetID(), "7");
  EXPECT_EQ(&copy.GetCustomIllumination(), &original.GetCustomIllumination());
  EXPECT_TRUE(copy == original) << "the ID is not compared";
  Conditions changed = original;
  changed.SetCustomIllumination(Flat(2));
  EXPECT_EQ(original.GetCustomIllumination().GetData()[0], 1.0F);
}

TEST(ConditionsTest, TheIlluminationIsComparedOnlyWhereTheAttributesReferToIt) {
  const Pairs user = {{kIlluminationKey, "Userdefined"}};
  const Pairs d65 = {{kIlluminationKey, "D65"}};
  struct Case {
    const char* name;
    Conditions first;
    Conditions second;
    bool equal;
  };
  for (const Case& c : {
           Case{"other value", With({{"a", "1"}}), With({{"a", "2"}}), false},
           Case{"other key", With({{"a", "1"}}), With({{"b", "1"}}), false},
           Case{"one more", With({{"a", "1"}}), With({{"a", "1"}, {"b", "1"}}), false},
           Case{"one illumination", WithIllumination(user, 1), With(user), false},
           Case{"one illumination, not referred to", WithIllumination({}, 1), With({}), false},
           Case{"same illumination", WithIllumination(user, 1), WithIllumination(user, 1), true},
           Case{"other illumination", WithIllumination(user, 1), WithIllumination(user, 2), false},
           Case{"not referred to", WithIllumination(d65, 1), WithIllumination(d65, 2), true},
           Case{"no key", WithIllumination({}, 1), WithIllumination({}, 2), true},
           Case{"word without curve", With(user), With(user), true},
       }) {
    EXPECT_EQ(c.first == c.second, c.equal) << c.name;
    EXPECT_EQ(c.second != c.first, !c.equal) << c.name;
  }
}

TEST(ConditionsTest, ASubsetDemandsNothingThatTheOtherDoesNotMeet) {
  const Conditions both = With({{"a", "1"}, {"b", "2"}});
  EXPECT_TRUE(With({}).IsSubsetOf(both));
  EXPECT_TRUE(With({{"b", "2"}}).IsSubsetOf(both));
  EXPECT_FALSE(both.IsSubsetOf(With({{"b", "2"}})));
  EXPECT_FALSE(With({{"b", "1"}}).IsSubsetOf(both));
  EXPECT_TRUE(WithIllumination({}, 1).IsSubsetOf(With({}))) << "a curve that no word refers to";

  const Conditions word = With({{kIlluminationKey, "Userdefined"}});
  const Conditions curve = WithIllumination({{kIlluminationKey, "Userdefined"}}, 1);
  EXPECT_TRUE(curve.IsSubsetOf(curve));
  EXPECT_FALSE(curve.IsSubsetOf(WithIllumination({{kIlluminationKey, "Userdefined"}}, 2)));
  EXPECT_EQ(MessageOf<Missing>([&] { word.IsSubsetOf(word); }), kNoIllumination);
  EXPECT_EQ(MessageOf<Missing>([&] { word.IsSubsetOf(curve); }), kNoIllumination);
  EXPECT_EQ(MessageOf<Missing>([&] { curve.IsSubsetOf(word); }), kNoIllumination);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
