#include "aldermoor/vexdoc/internals/conditionmanager.h"

#include <algorithm>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/recipe.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Internals {
namespace {

using Tests::IsSame;
using Tests::MessageOf;
using Tests::SmartPointer;
using Tests::With;
using Utilities::Exceptions::ResourceNotAvailableException;

ConditionManager& Manager() {
  return ConditionManager::GetInstance();
}

bool IsKnown(const std::string& id) {
  try {
    return !Manager().GetConditions(id).IsNull();
  } catch (const ResourceNotAvailableException&) {
    return false;
  }
}

TEST(ConditionManagerTest, EqualConditionsAreOneBlockAndABlockIsFoundUnderItsPresentContent) {
  // Few blocks are walked, many are found through an index.
  for (const unsigned others : {0U, 40U}) {
    Manager().RemoveAllConditions(false);
    for (unsigned i = 0; i < others; ++i) {
      Manager().GetOrCreateConditions(With({{"manager", std::to_string(i).c_str()}}));
    }
    const Conditions asked = With({{"manager", "asked"}});
    const Conditions changed = With({{"manager", "changed"}});
    const auto block = Manager().GetOrCreateConditions(asked);
    EXPECT_TRUE(*block == asked);
    EXPECT_TRUE(IsSame(Manager().GetOrCreateConditions(Conditions("other", asked)), block));
    EXPECT_TRUE(IsSame(Manager().GetConditions(block->GetID()), block));
    const std::vector<std::pair<std::string_view, std::string>> words = {{"manager", "asked"}};
    EXPECT_TRUE(IsSame(Manager().FindConditions(words), block));
    for (unsigned i = 0; i < others; ++i) {
      Manager().GetOrCreateConditions(With({{"manager", std::to_string(i).c_str()}}));
    }
    EXPECT_EQ(Manager().GetConditionsCount(), others + 1U);

    block->AddAttribute("manager", "changed");
    EXPECT_TRUE(Manager().FindConditions(words).IsNull());
    EXPECT_TRUE(IsSame(Manager().GetOrCreateConditions(changed), block));
    EXPECT_FALSE(IsSame(Manager().GetOrCreateConditions(asked), block));
    EXPECT_EQ(Manager().GetConditionsCount(), others + 2U);
    block->RemoveAttribute("manager");
    EXPECT_TRUE(IsSame(Manager().GetOrCreateConditions(Conditions()), block));
    block->AddAttribute("manager", "changed");
    block->RemoveAllAttributes();
    EXPECT_TRUE(IsSame(Manager().GetOrCreateConditions(Conditions()), block));
    Manager().RemoveConditions(block->GetID());
    EXPECT_FALSE(IsSame(Manager().GetOrCreateConditions(Conditions()), block));
    EXPECT_EQ(Manager().GetConditionsCount(), others + 2U);
  }
}

TEST(ConditionManagerTest, TheFirstOfEqualBlocksInTheOrderOfTheIdTextsIsFound) {
  std::vector<std::string> ids;
  const Conditions equal = With({{"manager", "forty of a kind"}});
  for (int i = 0; i < 40; ++i) {  // so that the number of digits or a carry is among them
    ids.push_back(Manager().AddConditions(equal)->GetID());
  }
  std::sort(ids.begin(), ids.end());
  for (const std::string& id : ids) {  // at first by the index
    EXPECT_EQ(Manager().GetOrCreateConditions(equal)->GetID(), id);
    Manager().RemoveConditions(id);
  }
}

TEST(ConditionManagerTest, AnIdIsNeverUsedTwice) {
  const auto first = Manager().NewConditions();
  EXPECT_TRUE(first->IsEmpty());
  const std::string id = first->GetID();
  Manager().RemoveConditions(id);
  Manager().RemoveConditions(id);
  EXPECT_EQ(MessageOf<ResourceNotAvailableException>([&] { Manager().GetConditions(id); }),
            "Condition(ID=<" + id + ">) not found");
  EXPECT_EQ(first->GetID(), id) << "who holds the block goes on using it";
  Manager().RemoveAllConditions(false);
  EXPECT_EQ(Manager().GetConditionsCount(), 0U);
  EXPECT_EQ(std::stoul(Manager().NewConditions()->GetID()), std::stoul(id) + 1);
}

TEST(ConditionManagerTest, BlocksThatNobodyOrAnUnusedBlockHoldsAreUnused) {
  Conditions conditions = With({{"manager", "holds a curve"}});
  conditions.SetCustomIllumination(
      Spectrum(Conditions("", Tests::SpectrumConditions()), std::vector<float>(36, 1.0F)));
  const std::string inner = conditions.GetCustomIllumination().GetConditions()->GetID();
  const std::string outer = Manager().GetOrCreateConditions(conditions)->GetID();
  Manager().RemoveAllConditions(true);
  EXPECT_TRUE(IsKnown(inner));
  EXPECT_FALSE(IsKnown(outer));
  conditions = Conditions();
  Manager().RemoveAllConditions(true);
  EXPECT_FALSE(IsKnown(inner));
}

TEST(ConditionManagerTest, ABlockServesMoreAttributesThanCanBeCounted) {
  // Reached from a static pointer, so that the intended leak is none to a leak checker.
  static auto& kept = *new std::vector<ConditionManager::Block>;
  const Conditions conditions = With({{"manager", "crowded"}});
  {
    const std::vector<Recipe> recipes(200'000, Recipe(conditions, "", 0.0F, "", {}));
    kept.push_back(recipes.back().GetConditions());
  }
  EXPECT_EQ(kept.back()->GetAttribute("manager"), "crowded");
  Manager().RemoveAllConditions(true);
  EXPECT_TRUE(IsSame(Recipe(conditions, "", 0.0F, "", {}).GetConditions(), kept.back()));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Internals
