#include "tests/vexdoc/randomwalk.h"

#include <limits>
#include <sstream>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/recipe.h"

#include "tests/faults/interposition.h"

namespace Aldermoor::Vexdoc::Testing {

RandomWalk::RandomWalk(unsigned long seed) : random_(seed) {
  for (int i = 0; i < 4; ++i) {
    VEX document;
    for (int set = 0; set < 3; ++set) {
      SmartPointer<SampleSet> content(new SampleSet(Name()));
      for (int sample = 0; sample < i + set; ++sample) {
        Internals::DocumentAccess::Append(*content, SmartPointer<Sample>(NewSample()));
      }
      Internals::DocumentAccess::Append(document, content);
    }
    std::ostringstream text;
    document.Store(text);
    texts_.push_back(text.str());
  }
}

Sample* RandomWalk::NewSample() {
  auto* const sample = new Sample(Name());
  if (Number(2) == 0) {
    sample->AddSampleAttribute(Shared(Recipe(filter_, "", 0, "", {})));
  }
  return sample;
}

// Runs it, in every third step with an allocation that fails.
bool RandomWalk::Succeeds(const std::function<void()>& operation, bool is_legal) {
  const long fault =
      Number(3) == 0 ? static_cast<long>(1 + Number(30)) : std::numeric_limits<long>::max();
  const Outcome outcome = RunWith({Fault::kAllocation, fault}, operation);
  EXPECT_TRUE(outcome.was_reached || outcome.has_failed != is_legal) << outcome.message;
  EXPECT_TRUE(is_legal || outcome.has_failed);
  failures_ += outcome.was_reached && outcome.has_failed ? 1 : 0;
  return !outcome.has_failed;
}

// The model of a document that is new as a whole.
void RandomWalk::TakeOver() {
  walks_.clear();
  sets_ = {};
  samples_.clear();
  for (const auto& [key, set] : document_.GetElements()) {
    sets_.entries.push_back({key, set.Get()});
    sets_.index.emplace(key, set.Get());
    for (const auto& [name, sample] : set->GetElements()) {
      Samples(set.Get()).entries.push_back({name, sample.Get()});
      Samples(set.Get()).index.emplace(name, sample.Get());
    }
  }
}

void RandomWalk::Remove(const SampleSet* set) {
  sets_.Erase(sets_.Find(set));
  samples_.erase(set);
  std::erase_if(walks_, [set](const Walk& walk) { return walk.set == set; });
}

void RandomWalk::Remove(const SampleSet* set, const Sample* sample) {
  Samples(set).Erase(Samples(set).Find(sample));
  std::erase_if(walks_, [sample](const Walk& walk) { return walk.set && walk.sample == sample; });
}

// The set that was made for a sample.
const SampleSet* RandomWalk::NewSet(const std::string& name) {
  const SampleSet* const set = document_.GetElements().back().second.Get();
  sets_.Insert(sets_.entries.size(), name, set, kSetType);
  return set;
}

// From `sample` of the set at the index `set` on.
void RandomWalk::Search(Walk& walk, std::size_t set, std::size_t sample) const {
  for (; set < sets_.entries.size(); ++set, sample = 0) {
    const auto found = samples_.find(sets_.entries[set].element);
    for (; found != samples_.end() && sample < found->second.entries.size(); ++sample) {
      const Sample* const candidate = found->second.entries[sample].element;
      if (!walk.is_filtered || candidate->Size() > 0) {
        walk.set = found->first;
        walk.sample = candidate;
        return;
      }
    }
    if (walk.is_confined) {
      break;
    }
  }
  walk.set = nullptr;
}

void RandomWalk::GoOn(Walk& walk) {
  if (walk.set != nullptr) {
    const auto& samples = Samples(walk.set);
    Search(walk, sets_.Find(walk.set),
           walk.sample == nullptr ? samples.entries.size() : samples.Find(walk.sample) + 1);
  }
}

void RandomWalk::AddSample() {
  const std::string set_name = Name();
  const SmartPointer<Sample> sample(NewSample());
  const SampleSet* set = sets_.LookUp(set_name);
  std::string name;
  if ((set == nullptr ? sets_.entries.size() >= kManySets
                      : Samples(set).entries.size() >= kManySamples) ||
      !Succeeds([&] { name = document_.AddSample(set_name, *sample); })) {
    return;
  }
  set = set == nullptr ? NewSet(set_name) : set;
  auto& samples = Samples(set);
  EXPECT_EQ(name, samples.Insert(samples.entries.size(), sample->GetName(),
                                 At(*set, samples.entries.size()), kSampleType));
  Modify(set);
}

void RandomWalk::InsertSample() {
  const std::string set_name = Name();
  const SmartPointer<Sample> sample(NewSample());
  const SampleSet* set = sets_.LookUp(set_name);
  const std::size_t count = set == nullptr ? 0 : Samples(set).entries.size();
  const long place = static_cast<long>(Number(count + 3)) - 1;
  std::string name;
  if ((set == nullptr ? sets_.entries.size() >= kManySets : count >= kManySamples) ||
      !Succeeds([&] { name = document_.InsertSample(set_name, *sample, place); },
                place >= 0 && place <= static_cast<long>(count))) {
    return;
  }
  set = set == nullptr ? NewSet(set_name) : set;
  const Sample* const added = At(*set, static_cast<std::size_t>(place));
  EXPECT_EQ(name, Samples(set).Insert(static_cast<std::size_t>(place), sample->GetName(), added,
                                      kSampleType));
  Modify(set);
}

void RandomWalk::InsertSet() {
  const std::string name = Name();
  const long place = static_cast<long>(Number(sets_.entries.size() + 3)) - 1;
  std::string told;
  if (sets_.entries.size() < kManySets &&
      Succeeds([&] { told = document_.InsertSampleSet(name, place); },
               place >= 0 && place <= static_cast<long>(sets_.entries.size()))) {
    const SampleSet* const set = At(document_, static_cast<std::size_t>(place));
    EXPECT_EQ(told, sets_.Insert(static_cast<std::size_t>(place), name, set, kSetType));
    Modify(&document_);
    Modify(set);
  }
}

void RandomWalk::RenameSample() {
  const SampleSet* const set = AnySet();
  if (set == nullptr || Samples(set).entries.empty()) {
    return;
  }
  auto& samples = Samples(set);
  const std::string from = samples.entries[Number(samples.entries.size())].key;
  const std::string to = Name();
  std::string told;
  if (Succeeds([&] { told = const_cast<SampleSet*>(set)->RenameSample(from, to); })) {
    EXPECT_EQ(told, samples.Rename(samples.First(from), to, kSampleType));
  }
}

void RandomWalk::RenameSet() {
  if (const SampleSet* const set = AnySet()) {
    const std::string from = sets_.entries[sets_.Find(set)].key;
    const std::string to = Name();
    std::string told;
    if (Succeeds([&] { told = document_.RenameSampleSet(from, to); })) {
      EXPECT_EQ(told, sets_.Rename(sets_.First(from), to, kSetType));
    }
  }
}

void RandomWalk::RemoveSample() {
  const SampleSet* const set = AnySet();
  const std::string name = Name();
  if (set != nullptr && Succeeds([&] { const_cast<SampleSet*>(set)->RemoveSample(name); })) {
    const std::size_t place = Samples(set).First(name);
    if (place < Samples(set).entries.size()) {
      Remove(set, Samples(set).entries[place].element);
      Modify(set);
    }
  }
}

void RandomWalk::RemoveSet() {
  const std::string name = Name();
  if (Succeeds([&] { document_.RemoveSampleSet(name); }) &&
      sets_.First(name) < sets_.entries.size()) {
    Remove(sets_.entries[sets_.First(name)].element);
    Modify(&document_);
  }
}

void RandomWalk::SwapSamples() {
  const SampleSet* const set = AnySet();
  if (set == nullptr) {
    return;
  }
  auto& entries = Samples(set).entries;
  const std::size_t one = Samples(set).First(Name());
  const std::size_t other = Samples(set).First(Name());
  if (one < entries.size() && other < entries.size() && Succeeds([&] {
        const_cast<SampleSet*>(set)->SwapSample(entries[one].key, entries[other].key);
      })) {
    std::swap(entries[one], entries[other]);
  }
}

void RandomWalk::SwapSets() {
  const std::size_t one = sets_.First(Name());
  const std::size_t other = sets_.First(Name());
  auto& entries = sets_.entries;
  if (one < entries.size() && other < entries.size() &&
      Succeeds([&] { document_.SwapElements(entries[one].key, entries[other].key); })) {
    std::swap(entries[one], entries[other]);
  }
}

void RandomWalk::StartWalk() {
  const std::string set_name = Name();
  const bool is_filtered = Number(3) == 0;
  std::optional<SampleIterator> iterator;
  if (walks_.size() < 8 && Succeeds([&] {
        iterator = is_filtered ? document_.GetFirstSample(filter_, "VEXRecipe", set_name)
                               : document_.GetFirstSample(set_name);
      })) {
    walks_.push_back({*iterator, !set_name.empty(), is_filtered});
    Search(walks_.back(), set_name.empty() ? 0 : sets_.First(set_name), 0);
  }
}

void RandomWalk::MoveWalk() {
  if (const auto walk = AnyWalk(); walk && Succeeds([&] { ++(*walk)->iterator; })) {
    GoOn(**walk);
  }
}

void RandomWalk::DeleteAtWalk() {
  const auto chosen = AnyWalk();
  if (!chosen || !Succeeds([&] { (*chosen)->iterator.DeprecatedDelete(); })) {
    return;
  }
  Walk walk = **chosen;
  walks_.erase(*chosen);
  if (walk.set != nullptr && walk.sample != nullptr) {
    const SampleSet* const set = walk.set;
    const Sample* const gone = walk.sample;
    const auto& entries = Samples(set).entries;
    const std::size_t next = Samples(set).Find(gone) + 1;
    if (next < entries.size()) {
      walk.sample = entries[next].element;
    } else {
      GoOn(walk);
    }
    Remove(set, gone);
    Modify(set);
  }
  walks_.push_back(walk);
}

void RandomWalk::InsertAtWalk() {
  const auto chosen = AnyWalk();
  if (!chosen) {
    return;
  }
  Walk& walk = **chosen;
  const SmartPointer<Sample> sample(NewSample());
  const bool is_foreign = Number(4) == 0;
  const bool is_legal = walk.set != nullptr && walk.sample != nullptr;
  if (is_legal && Samples(walk.set).entries.size() >= kManySamples) {
    return;
  }
  VEX other;
  other.AddSample("", *sample);
  if (!Succeeds([&] { (is_foreign ? other : document_).InsertSample(*sample, walk.iterator); },
                is_legal && !is_foreign)) {
    EXPECT_EQ(other.GetSampleSet("")->Size(), 1U);
    return;
  }
  const SampleSet* const set = walk.set;
  auto& samples = Samples(set);
  const std::size_t place = samples.Find(walk.sample);
  const Sample* const added = At(*set, place);
  samples.Insert(place, sample->GetName(), added, kSampleType);
  const bool is_last = place + 2 == samples.entries.size();
  walk.sample = is_last ? nullptr : samples.entries[place + 2].element;
  walk.set = is_last && walk.is_confined ? nullptr : set;
  Modify(set);
}

// The document as a whole, or a set.
void RandomWalk::Replace() {
  const std::string& text = texts_[Number(texts_.size())];
  const VEX copy = document_;
  switch (Number(4)) {
    case 0: {
      std::istringstream in(text);
      Succeeds([&] { document_.Load(in); });
      TakeOver();  // empty after a failure
      break;
    }
    case 1:
      if (Succeeds([&] { document_ = copy; })) {
        TakeOver();
      }
      break;
    case 2:
      if (const SampleSet* const set = AnySet()) {
        const_cast<SampleSet*>(set)->RemoveAllSamples();
        Samples(set) = {};
        std::erase_if(walks_, [set](const Walk& walk) { return walk.set == set; });
      }
      break;
    default:
      document_.RemoveAllSampleSets();
      TakeOver();
  }
  Mark();
}

// So that Check sees what has been modified since.
void RandomWalk::Mark() {
  modified_.clear();
  document_.SetAttribute(Header::kModifiedKey, kLongAgo);
  for (const auto& entry : document_.GetElements()) {
    entry.second->SetAttribute(Header::kModifiedKey, kLongAgo);
  }
}

}  // namespace Aldermoor::Vexdoc::Testing
