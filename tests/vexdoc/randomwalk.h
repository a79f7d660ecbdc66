#ifndef ALDERMOOR_TESTS_VEXDOC_RANDOMWALK_H
#define ALDERMOOR_TESTS_VEXDOC_RANDOMWALK_H

#include <functional>
#include <iterator>
#include <list>
#include <map>
#include <optional>
#include <random>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

#include "tests/vexdoc/plainmodel.h"
#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Testing {

using namespace Aldermoor::Vexdoc::Tests;

inline constexpr const char* kNames[] = {"Red",     "Blue", "Red (1)",
                                         "Red (2)", "",     "a name with a long text"};
inline const std::string kSetType = "class Aldermoor::Vexdoc::SampleSet";
inline const std::string kSampleType = "class Aldermoor::Vexdoc::Sample";
inline constexpr const char* kLongAgo = "long ago";
inline constexpr std::size_t kManySets = 5;
inline constexpr std::size_t kManySamples = 9;

template <class Set>
auto At(const Set& set, std::size_t place) {
  return std::next(set.GetElements().begin(), static_cast<long>(place))->second.Get();
}
// A walk and where it should stand: without a set it is over, without a sample behind the last.
struct Walk {
  SampleIterator iterator;
  bool is_confined;
  bool is_filtered;
  const SampleSet* set = nullptr;
  const Sample* sample = nullptr;
};

/// A document, what it should hold, and walks in it, all of which change at random.
class RandomWalk {
 public:
  explicit RandomWalk(unsigned long seed);

  /// One operation, which may fail for want of memory.
  void Step();
  /// That document and walks are as they should be.
  void Check();
  /// How many operations failed for want of memory.
  unsigned long GetFailures() const { return failures_; }

 private:
  std::size_t Number(std::size_t count) { return random_() % count; }
  std::string Name() { return kNames[Number(std::size(kNames))]; }
  Sample* NewSample();
  PlainModel<Sample>& Samples(const SampleSet* set) { return samples_[set]; }
  const SampleSet* AnySet() {
    return sets_.entries.empty() ? nullptr : sets_.entries[Number(sets_.entries.size())].element;
  }
  std::optional<std::list<Walk>::iterator> AnyWalk() {
    if (walks_.empty()) {
      return {};
    }
    return std::next(walks_.begin(), static_cast<long>(Number(walks_.size())));
  }

  bool Succeeds(const std::function<void()>& operation, bool is_legal = true);
  void TakeOver();
  const SampleSet* NewSet(const std::string& name);
  void Remove(const SampleSet* set);
  void Remove(const SampleSet* set, const Sample* sample);
  void Modify(const Header* container) { modified_.push_back(container); }

  void Search(Walk& walk, std::size_t set, std::size_t sample) const;
  void GoOn(Walk& walk);

  void AddSample();
  void InsertSample();
  void InsertSet();
  void RenameSample();
  void RenameSet();
  void RemoveSample();
  void RemoveSet();
  void SwapSamples();
  void SwapSets();
  void StartWalk();
  void MoveWalk();
  void DeleteAtWalk();
  void InsertAtWalk();
  void Replace();
  void Mark();

  template <class T>
  bool IsAsModelled(const PlainModel<T>& model,
                    const VexNode<T, UniqueStoragePolicy<T>>& node) const;

  const Conditions filter_ = With({{kTypeKey, "CIELab"}});
  const XMLPlatform platform_;
  std::mt19937 random_;
  std::vector<std::string> texts_;
  VEX document_;
  PlainModel<SampleSet> sets_;
  std::map<const SampleSet*, PlainModel<Sample>> samples_;
  std::list<Walk> walks_;
  std::vector<const Header*> modified_;  // by this step
  unsigned long failures_ = 0;
};

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_RANDOMWALK_H
