#include <functional>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/utilities/tools/lexicalcast.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/utilities/tools/stringtokenizer.h"
#include "aldermoor/utilities/tools/tree.h"
#include "aldermoor/vexdoc/sample.h"

#include "tests/utilities/messageof.h"

namespace Aldermoor::Utilities::Tools {
namespace {

TEST(LexicalCastTest, ReadsTheNumberAtTheBeginning) {
  EXPECT_EQ(lexical_cast<unsigned short>(std::string("730nm")), 730);
  EXPECT_EQ(lexical_cast<short>(std::string("  -12.9")), -12);
  EXPECT_EQ(lexical_cast<double>(std::string("2.5e-3x")), 0.0025);
  EXPECT_EQ(lexical_cast<std::string>(1234567.0F), "1.23457e+06");
}

TEST(LexicalCastTest, FailsWithTheValueAndBothTypes) {
  for (const std::string text : {"", " ", "nm730", "-", "40000"}) {
    const std::string message = Tests::MessageOf<std::invalid_argument>(
        [&] { static_cast<void>(lexical_cast<short>(text)); });
    EXPECT_TRUE(
        message.starts_with("lexical_cast(): fail to convert '" + text + "' from class std::"))
        << message;
    EXPECT_TRUE(message.ends_with(" to short")) << message;
  }
}

TEST(StringTokenizerTest, GivesTheRunsBetweenDelimiters) {
  using Tokens = std::vector<std::string>;
  EXPECT_EQ(StringTokenizer("///", '/').GetTokens(), Tokens());
  EXPECT_EQ(StringTokenizer("//a//b c/", '/').GetTokens(), Tokens({"a", "b c"}));
}

struct Item {
  int number = 0;
};

TEST(TreeTest, ACopySharesTheChildrenAndBecomesTheirParent) {
  Tree<Item> root;
  Tree<Item> child(Item{1});
  root.AddChild(child);
  child.number = 2;
  root.AddChild(child);
  ASSERT_EQ(root.GetChildren().size(), 2U);
  EXPECT_EQ(root.GetChildren().front()->number, 1) << "a child is a copy";
  EXPECT_EQ(root.GetChildren().back()->number, 2);
  EXPECT_EQ(root.GetChildren().front()->GetParent(), &root);
  const Tree<Item> copy(root);
  EXPECT_TRUE(IsSame(copy.GetChildren().front(), root.GetChildren().front()));
  EXPECT_EQ(root.GetChildren().front()->GetParent(), &copy);
}

TEST(TreeTest, MayBecomeOneOfItsOwnChildren) {
  Tree<Item> root(Item{1});
  for (const int number : {2, 3}) {
    Tree<Item> child(Item{number});
    child.AddChild(Tree<Item>(Item{10 * number}));
    root.AddChild(child);
  }
  root = *root.GetChildren().front();
  EXPECT_EQ(root.number, 2);
  ASSERT_EQ(root.GetChildren().size(), 1U);
  EXPECT_EQ(root.GetChildren().front()->number, 20);
  EXPECT_EQ(root.GetChildren().front()->GetParent(), &root);
}

/// Counts its living objects; may own further ones.
struct Link {
  Link() { ++alive; }
  Link(const Link&) = delete;
  Link& operator=(const Link&) = delete;
  virtual ~Link() { --alive; }

  SmartPointer<Link> next;
  static int alive;
};
int Link::alive = 0;

struct DerivedLink : Link {};

TEST(SmartPointerTest, TheLastOneDeletesTheObjectOnce) {
  {
    SmartPointer<Link> first(new Link);
    first->next = SmartPointer<Link>(new Link);
    first->next->next = SmartPointer<Link>(new DerivedLink);
    const SmartPointer<Link> last = first->next->next;
    EXPECT_EQ(last.UseCount(), 2);
    first = SmartPointer<Link>();
    EXPECT_EQ(Link::alive, 1);
    EXPECT_EQ(last.UseCount(), 1);
    first = last;
    first = last;  // between owners of one object
    EXPECT_EQ(last.UseCount(), 2);
    const SmartPointer<Link>& itself = first;
    first = itself;
    EXPECT_EQ(last.UseCount(), 2);
  }
  EXPECT_EQ(Link::alive, 0);
}

TEST(SmartPointerTest, WhatIsAssignedMayLiveInWhatIsGivenUp) {
  using Pointer = SmartPointer<Link>;
  const auto list = [] {
    Pointer first(new Link);
    first->next = Pointer(new DerivedLink);
    first->next->next = Pointer(new Link);
    return first;
  };
  const std::function<void(Pointer&)> assignments[] = {
      [](Pointer& node) { node = node->next; },
      [](Pointer& node) { node = std::move(node->next); },
  };
  for (const auto& assign : assignments) {
    Pointer node = list();
    for (int left = 3; left > 0; --left) {
      EXPECT_EQ(Link::alive, left);
      assign(node);
    }
    EXPECT_TRUE(node == nullptr);
  }
  Pointer circle = list();
  circle->next->next->next = circle;
  circle->next->next->next = 0;  // the source of the value goes with the last owner but one
  EXPECT_EQ(Link::alive, 3);
  Link& last = *circle->next->next;
  last.next = circle;
  circle = 0;
  last.next = nullptr;  // the pointer itself lives in what it gives up
  EXPECT_EQ(Link::alive, 0);
}

TEST(SmartPointerTest, IsComparedByItsObject) {
  const SmartPointer<DerivedLink> derived(new DerivedLink);
  const SmartPointer<Link> base = derived;
  const SmartPointer<Link> none = nullptr;
  EXPECT_TRUE(base == derived && derived == base && none == nullptr && nullptr == none);
  EXPECT_TRUE(base != none && none != derived && nullptr != base);
  EXPECT_FALSE(base == SmartPointer<Link>(new Link));
}

TEST(SmartPointerTest, ADowncastSharesTheCountAndZeroGivesItUp) {
  SmartPointer<Link> base(new DerivedLink);
  SmartPointer<DerivedLink> derived(dynamic_cast<DerivedLink*>(base.Get()), base);
  const SmartPointer<DerivedLink> none(nullptr, base);
  EXPECT_TRUE(none.IsNull());
  EXPECT_EQ(base.UseCount(), 2);
  EXPECT_EQ(Tests::MessageOf<std::invalid_argument>([&] { base = 1; }),
            "SmartPointer<T>& operator =(long) argument was != Zero");
  EXPECT_EQ(base.UseCount(), 2);
  base = 0;
  EXPECT_TRUE(base.IsNull());
  EXPECT_EQ(Link::alive, 1);
  derived = 0;
  EXPECT_EQ(Link::alive, 0);
}

TEST(SmartPointerTest, AnEmptyOneNamesItsTypeAndOperationWhenUsed) {
  const SmartPointer<Vexdoc::Sample> empty;
  const auto expect = [](auto use, const std::string& operation) {
    const std::string location =
        "::Aldermoor::Utilities::Tools::SmartPointer<class Aldermoor::Vexdoc::Sample>::operator " +
        operation + "(): /src/aldermoor/utilities/tools/smartpointer.h:";
    try {
      use();
      FAIL() << "nothing was thrown";
    } catch (const Exceptions::NullPointerException& e) {
      EXPECT_STREQ(e.what(), "accessed null pointer (class Aldermoor::Vexdoc::Sample)");
      ASSERT_EQ(e.where().size(), 2U);
      EXPECT_NE(e.where().front(), e.where().back()) << "the two lines tell them apart";
      for (const std::string& entry : e.where()) {
        EXPECT_TRUE(entry.starts_with(location)) << entry;
      }
    }
  };
  expect([&] { empty->Clear(); }, "->");
  expect([&] { (*empty).Clear(); }, "*");
}

TEST(SmartPointerTest, AnObjectWithMoreOwnersThanCanBeCountedIsNeverDeleted) {
  { const std::vector<SmartPointer<Link>> owners(65'533, SmartPointer<Link>(new Link)); }
  EXPECT_EQ(Link::alive, 0) << "as many as can be counted";
  // Reached from a static pointer, so that the intended leak is none to a leak checker.
  static std::vector<SmartPointer<Link>>& kept = *new std::vector<SmartPointer<Link>>;
  kept.emplace_back(new Link);
  {
    const std::vector<SmartPointer<Link>> owners(70'000, kept.back());
    EXPECT_EQ(owners.back().UseCount(), 65'535);
  }
  EXPECT_EQ(kept.back().UseCount(), 65'535);
  EXPECT_EQ(Link::alive, 1);
  Link::alive = 0;
}

}  // namespace
}  // namespace Aldermoor::Utilities::Tools
