#include "aldermoor/vexdoc/sampleattributeiterator.h"

#include <algorithm>
#include <iterator>

#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Vexdoc {

SampleAttributeIterator::SampleAttributeIterator() = default;

SampleAttributeIterator::SampleAttributeIterator(const Elements& elements,
                                                 const Conditions& filter) try
    : filter_(filter), position_(elements.begin()), elements_(&elements) {
  if (HasNext() && !HasMatch()) {
    Move2NextMatch();
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttributeIterator::SampleAttributeIterator)

bool SampleAttributeIterator::HasNext() const {
  return elements_ != nullptr && position_ != elements_->end();
}

Utilities::Tools::SmartPointer<SampleAttribute> SampleAttributeIterator::Dereference() const {
  return HasNext() ? position_->second : Utilities::Tools::SmartPointer<SampleAttribute>();
}

bool SampleAttributeIterator::IsMatch(const SampleAttribute& attribute) const {
  return filter_.IsEmpty() || filter_.IsSubsetOf(*attribute.GetConditions());
}

SampleAttributeIterator::Elements::const_iterator SampleAttributeIterator::FindNextMatch() const {
  return std::find_if(std::next(position_), elements_->end(),
                      [this](const auto& entry) { return IsMatch(*entry.second); });
}

bool SampleAttributeIterator::HasMatch() const try { return IsMatch(*position_->second); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttributeIterator::HasMatch)

void SampleAttributeIterator::Move2NextMatch() try {
  if (HasNext()) {
    position_ = FindNextMatch();
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttributeIterator::Move2NextMatch)

}  // namespace Aldermoor::Vexdoc
