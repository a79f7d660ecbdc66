#include "aldermoor/vexdoc/sampleiterator.h"

#include <algorithm>
#include <iterator>
#include <stdexcept>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/sampleset.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

SampleIterator::SampleIterator(const SampleSets& sets, const std::string& setName) try
    : SampleIterator(sets, Conditions(), "", setName) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::SampleIterator)

SampleIterator::SampleIterator(const SampleSets& sets, const Conditions& filter,
                               const std::string& type, const std::string& setName) try
    : sets_(&sets), is_confined_(!setName.empty()), type_(type), filter_(filter) {
  const auto set =
      is_confined_ ? StorageDetail::FindByName<SampleSet>(sets, setName) : sets.begin();
  if (set != sets.end()) {
    place_ = Front(set);
    Search(place_);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::SampleIterator)

SampleIterator::SampleIterator(const SampleIterator& other) try
    : SampleIteratorDeprecated(other),
      sets_(other.sets_),
      place_(other.place_),
      is_confined_(other.is_confined_),
      type_(other.type_),
      filter_(other.filter_) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::SampleIterator)

SampleIterator& SampleIterator::operator=(const SampleIterator& other) try {
  std::string type(other.type_);  // first, for memory may be short
  filter_ = other.filter_;
  type_.swap(type);
  sets_ = other.sets_;
  place_ = other.place_;
  is_confined_ = other.is_confined_;
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::operator=)

bool SampleIterator::HasNext() const {
  return place_.samples != nullptr && place_.sample != place_.samples->end();
}

bool SampleIterator::IsFilterMatching(const Sample& sample) const try {
  if (filter_.IsEmpty() && type_.empty()) {
    return true;
  }
  try {
    return !sample.GetSampleAttribute(type_, filter_, false).IsNull();
  } catch (const ResourceNotAvailableException&) {
    return false;
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::IsFilterMatching)

SampleIterator::Place SampleIterator::Front(SampleSets::const_iterator set) {
  const ElementList<Sample>& samples = set->second->GetSamples();
  return {&samples, samples.begin(), set};
}

SampleIterator::Place SampleIterator::FrontOfNextSet(const Place& place) const {
  const auto set = is_confined_ ? sets_->end() : std::next(place.set);
  return set == sets_->end() ? Place() : Front(set);
}

// Moves `place` to the first match from there on, or behind all.  A failure leaves it where the
// search failed.
void SampleIterator::Search(Place& place) const {
  while (place.samples != nullptr) {
    for (; place.sample != place.samples->end(); ++place.sample) {
      if (IsFilterMatching(*place.sample->second)) {
        return;
      }
    }
    place = FrontOfNextSet(place);
  }
}

void SampleIterator::Move2NextMatch() try {
  Place place = place_;
  if (HasNext()) {
    ++place.sample;
  }
  Search(place);
  place_ = place;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::Move2NextMatch)

// Goes on to the next entry of the set, whatever the filter says, or behind the last.
void SampleIterator::StepOver() {
  ++place_.sample;
  if (is_confined_ && !HasNext()) {
    place_ = Place();
  }
}

void SampleIterator::DeprecatedDelete() try {
  if (!HasNext()) {
    return;
  }
  Place next = place_;
  ++next.sample;
  if (next.sample == next.samples->end()) {
    next = FrontOfNextSet(next);
    try {
      Search(next);
    } catch (const std::out_of_range&) {
      // The sample is to go all the same.
    }
  }
  place_.set->second->RemoveElement(place_.sample);
  place_ = next;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::DeprecatedDelete)

SmartPointer<Sample> SampleIterator::Dereference() const try {
  if (!HasNext()) {
    throw ResourceNotAvailableException("nomore samples to iterate", "");
  }
  return place_.sample->second;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::Dereference)

SampleIterator& SampleIterator::operator++() try {
  Move2NextMatch();
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::operator++)

SampleIterator SampleIterator::operator++(int) try {
  SampleIterator former(*this);
  Move2NextMatch();
  return former;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::operator++)

}  // namespace Aldermoor::Vexdoc
