// Walks while the document changes under them, against a plain model, with allocations that fail.
//
// ALDERMOOR_RANDOM_STEPS and ALDERMOOR_RANDOM_SEED set how long it goes on and from where.

#include "tests/vexdoc/randomwalk.h"

#include <algorithm>
#include <cstdlib>

#include <gtest/gtest.h>

namespace Aldermoor::Vexdoc::Testing {

void RandomWalk::Step() {
  using Operation = void (RandomWalk::*)();
  static constexpr Operation kOperations[] = {
      &RandomWalk::AddSample,    &RandomWalk::AddSample,    &RandomWalk::InsertSample,
      &RandomWalk::InsertSample, &RandomWalk::InsertSet,    &RandomWalk::RenameSample,
      &RandomWalk::RenameSet,    &RandomWalk::RemoveSample, &RandomWalk::SwapSamples,
      &RandomWalk::SwapSets,     &RandomWalk::StartWalk,    &RandomWalk::MoveWalk,
      &RandomWalk::MoveWalk,     &RandomWalk::DeleteAtWalk, &RandomWalk::InsertAtWalk};
  Mark();
  if (Number(100) == 0) {
    Replace();
  } else if (Number(40) == 0) {
    RemoveSet();
  } else {
    (this->*kOperations[Number(std::size(kOperations))])();
  }
}

template <class T>
bool RandomWalk::IsAsModelled(const PlainModel<T>& model,
                              const VexNode<T, UniqueStoragePolicy<T>>& node) const {
  const bool has_been_modified =
      std::find(modified_.begin(), modified_.end(), &node) != modified_.end();
  return std::equal(model.entries.begin(), model.entries.end(), node.GetElements().begin(),
                    node.GetElements().end(),
                    [&](const auto& entry, const auto& real) {
                      return entry.key == real.first && entry.element == real.second.Get() &&
                             entry.key == real.second->GetName();
                    }) &&
         std::all_of(model.index.begin(), model.index.end(),
                     [&](const auto& entry) {
                       return node.GetElement(entry.first).Get() == entry.second;
                     }) &&
         has_been_modified == (node.GetModificationDateTime() != kLongAgo);
}

void RandomWalk::Check() {
  ASSERT_TRUE(IsAsModelled(sets_, document_));
  for (const auto& [key, set] : document_.GetElements()) {
    ASSERT_TRUE(IsAsModelled(Samples(set.Get()), *set)) << key;
  }
  for (Walk& walk : walks_) {
    const bool is_on_sample = walk.set != nullptr && walk.sample != nullptr;
    ASSERT_EQ(walk.iterator.HasNext(), is_on_sample);
    if (is_on_sample) {
      ASSERT_EQ(walk.iterator.Dereference().Get(), walk.sample);
    }
  }
}
namespace {

unsigned long Setting(const char* name, unsigned long otherwise) {
  const char* const text = std::getenv(name);
  return text == nullptr ? otherwise : std::stoul(text);
}

TEST(RandomWalkTest, AgreesWithAPlainModelWhateverFails) {
  const unsigned long steps = Setting("ALDERMOOR_RANDOM_STEPS", 20'000);
  RandomWalk walk(Setting("ALDERMOOR_RANDOM_SEED", 12));
  for (unsigned long step = 0; step < steps; ++step) {
    walk.Step();
    walk.Check();
    if (::testing::Test::HasFailure()) {
      FAIL() << "at step " << step;
    }
  }
  EXPECT_GT(walk.GetFailures(), steps / 20) << "allocations that failed";
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
