#include "aldermoor/vexdoc/sampleiterator.h"

#include <algorithm>
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
    : set_end_(sets.end()), set_(sets.begin()), type_(type), filter_(filter) {
  Initialize(setName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::SampleIterator)

SampleIterator::SampleIterator(const SampleIterator&) = default;
SampleIterator& SampleIterator::operator=(const SampleIterator&) = default;

void SampleIterator::Initialize(const std::string& setName) try {
  if (!setName.empty()) {
    set_ = std::find_if(set_, set_end_,
                        [&setName](const auto& entry) { return entry.first == setName; });
    if (set_ != set_end_) {
      set_end_ = std::next(set_);
    }
  }
  if (set_ != set_end_) {
    position_ = set_->second->GetSamples().begin();
  }
  if (!HasNext() || !IsFilterMatching(*position_->second)) {
    Move2NextMatch();
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::Initialize)

bool SampleIterator::HasNext() const {
  return set_ != set_end_ && position_ != set_->second->GetSamples().end();
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

void SampleIterator::Move2NextMatch() try {
  if (HasNext()) {
    ++position_;
  }
  while (set_ != set_end_) {
    position_ = std::find_if(position_, set_->second->GetSamples().end(),
                             [this](const auto& entry) { return IsFilterMatching(*entry.second); });
    if (HasNext()) {
      return;
    }
    Move2NextSampleSet();
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::Move2NextMatch)

void SampleIterator::Move2NextSampleSet() {
  do {
    ++set_;
    if (set_ != set_end_) {
      position_ = set_->second->GetSamples().begin();
    }
  } while (set_ != set_end_ && set_->second->GetSamples().empty());
}

void SampleIterator::DeprecatedDelete() try {
  if (!HasNext()) {
    return;
  }
  try {
    position_ = set_->second->RemoveElement(position_);
    if (!HasNext()) {
      ++set_;
      Initialize("");
    }
  } catch (const std::out_of_range&) {
    // The sample is gone, which is what was asked for.
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleIterator::DeprecatedDelete)

SmartPointer<Sample> SampleIterator::Dereference() const try {
  if (!HasNext()) {
    throw ResourceNotAvailableException("nomore samples to iterate", "");
  }
  return position_->second;
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
