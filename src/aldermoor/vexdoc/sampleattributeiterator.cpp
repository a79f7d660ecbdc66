#include "aldermoor/vexdoc/sampleattributeiterator.h"

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

bool SampleAttributeIterator::HasMatch() const try {
  return filter_.IsEmpty() || filter_.IsSubsetOf(*position_->second->GetConditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttributeIterator::HasMatch)

void SampleAttributeIterator::Move2NextMatch() try {
  if (!HasNext()) {
    return;
  }
  do {
    ++position_;
  } while (HasNext() && !HasMatch());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleAttributeIterator::Move2NextMatch)

}  // namespace Aldermoor::Vexdoc
