#include "aldermoor/vexdoc/recipe.h"

#include <gtest/gtest.h>

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

using Components = Recipe::Components;

Recipe Mixed(float thickness, const Components& components = {{"A", 1.0F}, {"B", 2.0F}},
             const Conditions& conditions = Conditions()) {
  return Recipe(conditions, "assortment", thickness, "substrate", components);
}

TEST(RecipeTest, ConcentrationsAddUpInPlaceAndStopAtZero) {
  Recipe recipe;
  recipe.AddConcentration("none", 0.0F);
  recipe.AddConcentration("none", -1.0F);
  EXPECT_EQ(recipe.GetComponents(), Components());
  recipe.AddConcentration("A", 3.0F);
  recipe.AddConcentration("B", 2.0F);
  recipe.AddConcentration("A", 0.5F);
  EXPECT_EQ(recipe.GetComponents(), Components({{"A", 3.5F}, {"B", 2.0F}}));
  recipe.AddConcentration("A", -5.0F);
  EXPECT_EQ(recipe.GetComponents(), Components({{"A", 0.0F}, {"B", 2.0F}}));
}

TEST(RecipeTest, OnlyTheThicknessIsComparedWithATolerance) {
  Recipe assortment = Mixed(1);
  assortment.SetAssortmentName("other");
  Recipe substrate = Mixed(1);
  substrate.SetSubstrateLinkName("other");
  EXPECT_TRUE(Equal(Mixed(0), Mixed(0.01F))) << "the limit belongs to it";
  EXPECT_FALSE(Equal(Mixed(0), Mixed(-0.0101F)));
  EXPECT_FALSE(Equal(Mixed(1), Mixed(1, {{"A", 1.001F}, {"B", 2.0F}})));
  EXPECT_FALSE(Equal(Mixed(1), Mixed(1, {{"B", 2.0F}, {"A", 1.0F}})));
  EXPECT_FALSE(Equal(Mixed(1), Mixed(1, {{"A", 1.0F}})));
  EXPECT_FALSE(Equal(Mixed(1), assortment));
  EXPECT_FALSE(Equal(Mixed(1), substrate));
  EXPECT_FALSE(Equal(Mixed(1), Mixed(1, {{"A", 1.0F}, {"B", 2.0F}}, With({{"a", "b"}}))));
  EXPECT_FALSE(Equal(Mixed(1), Flat(1)));
}

TEST(RecipeTest, OnlyARecipeIsAssignedAndItIsTurnedIntoNothing) {
  Recipe recipe = Mixed(1);
  recipe.Assign(Flat(1));
  EXPECT_TRUE(Equal(recipe, Mixed(1)));
  recipe.Assign(Mixed(5, {}, With({{"a", "b"}})));
  EXPECT_TRUE(Equal(recipe, Mixed(5, {}, With({{"a", "b"}}))));
  EXPECT_EQ(Refusal(recipe, "VEXRecipe"), "could not transform recipe to 'VEXRecipe'");
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
