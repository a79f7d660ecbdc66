#include "aldermoor/vexdoc/conditions.h"

#include <gtest/gtest.h>
#include <pthread.h>

#include "aldermoor/vexdoc/recipe.h"

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

TEST(ConditionsTest, WhatLiesInABlockCanBeGivenToIt) {
  Conditions conditions = With({{"a", "a text that no small string holds"}, {"b", "2"}});
  const std::string text = conditions.GetAttribute("a");
  for (const auto& [key, value] : conditions.GetAttributes()) {
    EXPECT_EQ(conditions.AddAttribute(key, value), value);
  }
  EXPECT_EQ(conditions.GetAttribute("a"), text);
  EXPECT_EQ(conditions.AddAttribute("b", conditions.GetAttributes().at("a")), "2");
  EXPECT_EQ(conditions.AddAttribute("c", conditions.GetAttributes().at("a")), "");
  EXPECT_EQ(conditions.GetAttributes(),
            With({{"a", text.c_str()}, {"b", text.c_str()}, {"c", text.c_str()}}).GetAttributes());
  conditions.RemoveAttribute(conditions.GetAttributes().begin()->first);
  EXPECT_FALSE(conditions.HasAttribute("a"));
  conditions.SetCustomIllumination(Flat(3));
  conditions.SetCustomIllumination(conditions.GetCustomIllumination());
  EXPECT_EQ(conditions.GetCustomIllumination(), Flat(3));
}

// A block with a curve under `inner`, and referring to it.
SmartPointer<Conditions> Around(const SmartPointer<Conditions>& inner, float value = 1.0F) {
  Spectrum curve = Flat(value);
  curve.SetConditions(inner);
  SmartPointer<Conditions> block(new Conditions(With({{kIlluminationKey, "Userdefined"}})));
  block->SetCustomIllumination(curve);
  return block;
}

TEST(ConditionsTest, ABlockCanTakeOverTheConditionsOfItsOwnCurve) {
  const SmartPointer<Conditions> block = Around(SmartPointer<Conditions>(
      new Conditions("7", With({{"a", "of the curve, and long enough"}}))));
  *block = *block->GetCustomIllumination().GetConditions();  // which goes with the curve
  EXPECT_EQ(block->GetID(), "7");
  EXPECT_EQ(block->GetAttribute("a"), "of the curve, and long enough");
  EXPECT_FALSE(block->HasCustomIllumination());
}

// On a stack that holds a few thousand calls at most.
void RunOnSmallStack(void (*body)()) {
  constexpr std::size_t kStackBytes = 256 * 1024;
  pthread_attr_t attributes;
  pthread_attr_init(&attributes);
  pthread_attr_setstacksize(&attributes, kStackBytes);
  pthread_t thread{};
  ASSERT_EQ(pthread_create(
                &thread, &attributes,
                [](void* argument) -> void* {
                  (*static_cast<void (**)()>(argument))();
                  return nullptr;
                },
                &body),
            0);
  pthread_join(thread, nullptr);
  pthread_attr_destroy(&attributes);
}

TEST(ConditionsTest, CurvesOfCurvesAreComparedAndFreedHoweverManyThereAre) {
  RunOnSmallStack([] {
    const auto chain = [](float innermost) {
      constexpr int kMany = 20'000;
      SmartPointer<Conditions> block = Around(SmartPointer<Conditions>(new Conditions), innermost);
      for (int i = 0; i < kMany; ++i) {
        block = Around(block);
      }
      return block;
    };
    const auto one = chain(1);
    EXPECT_TRUE(*one == *chain(1));
    EXPECT_FALSE(*one == *chain(2)) << "the values of the innermost curve";
    EXPECT_TRUE(one->IsSubsetOf(*chain(1)));
    EXPECT_FALSE(*one == *Around(one)) << "one curve more";
  });
  const SmartPointer<Conditions> nothing = Around({});
  EXPECT_THROW((void)(*nothing == *Around({})), NullPointerException);
}

TEST(ConditionsTest, RingsOfCurvesAreComparedAndComputedWith) {
  // Kept from a static pointer: what a ring holds is never freed.
  static auto& kept = *new std::vector<SmartPointer<Conditions>>;
  const auto ring = [](int length, float value) {
    const SmartPointer<Conditions> first = Around(SmartPointer<Conditions>(new Conditions), value);
    SmartPointer<Conditions> last = first;
    for (int i = 1; i < length; ++i) {
      last = Around(last);
    }
    Spectrum curve = Flat(value);
    curve.SetConditions(last);
    first->SetCustomIllumination(curve);
    kept.push_back(first);
    return first;
  };
  EXPECT_TRUE(*ring(1, 1) == *ring(1, 1));
  EXPECT_TRUE(*ring(1, 1) == *ring(3, 1)) << "all that can be seen of them is alike";
  EXPECT_FALSE(*ring(3, 1) == *ring(3, 2));
  EXPECT_TRUE(ring(2, 1)->IsSubsetOf(*ring(5, 1)));
  EXPECT_FALSE(ring(2, 1)->IsSubsetOf(*ring(5, 2)));
  const Conditions copy = *ring(1, 1);
  EXPECT_TRUE(copy == *ring(1, 1));

  Conditions target = ColorConditions("CIEXYZ", "Userdefined");
  for (const int length : {1, 3}) {
    const auto block = ring(length, 1);
    target.SetCustomIllumination(block->GetCustomIllumination());
    Conditions plain = target;
    plain.SetCustomIllumination(Flat(1));
    const auto color = Flat(0.5F).TransformTo("VEXColorVector", target);
    const auto expected = Flat(0.5F).TransformTo("VEXColorVector", plain);
    EXPECT_EQ(dynamic_cast<const ColorVector&>(*color).GetDatastore(),
              dynamic_cast<const ColorVector&>(*expected).GetDatastore());
  }
}

TEST(ConditionsTest, SharedBlocksAreThoseOfAttributesAndGoWhenNobodyHoldsThem) {
  ReleaseUnusedConditions();
  const Conditions conditions = With({{"shared", "x"}});
  {
    const auto block = SharedConditions(conditions);
    EXPECT_TRUE(*block == conditions);
    EXPECT_NE(block->GetID(), "0");
    EXPECT_TRUE(IsSame(SharedConditions(conditions), block));
    EXPECT_TRUE(IsSame(Recipe(conditions, "", 0.0F, "", {}).GetConditions(), block));
    EXPECT_EQ(ReleaseUnusedConditions(), 0U) << "somebody holds it";
  }
  SharedConditions(With({{"shared", "y"}}));
  EXPECT_EQ(ReleaseUnusedConditions(), 2U);
  EXPECT_EQ(ReleaseUnusedConditions(), 0U);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
