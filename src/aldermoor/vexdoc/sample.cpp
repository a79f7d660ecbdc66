#include "aldermoor/vexdoc/sample.h"

#include <iterator>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/sampleset.h"
#include "aldermoor/vexdoc/setparent.h"
#include "aldermoor/vexdoc/vexnode.inl.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::OutOfRangeException;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

constexpr const char* kSpectrumType = "VEXSpectrum";

}  // namespace

template class VexNode<SampleAttribute, MultiStoragePolicy<SampleAttribute>>;

Sample::Sample(const std::string& name) try : VexNode(name) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::Sample)

Sample::Sample(const Sample&) = default;
Sample& Sample::operator=(const Sample&) = default;
Sample::~Sample() = default;

void Sample::AddSampleAttribute(const SmartPointer<SampleAttribute>& attribute) try {
  AddElement(attribute);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::AddSampleAttribute)

SmartPointer<SampleAttribute> Sample::GetSampleAttribute(const std::string& type,
                                                         const Conditions& conditions,
                                                         bool store) const try {
  if (GetElements().empty()) {
    throw ResourceNotAvailableException("Sample " + GetName() + " has no sample attributes !!", "");
  }
  if (SmartPointer<SampleAttribute> stored = FindStored(type, conditions)) {
    return stored;
  }
  SmartPointer<SampleAttribute> result = Compute(type, conditions, true);
  if (!result) {
    result = Compute(type, conditions, false);
  }
  if (!result) {
    throw ResourceNotAvailableException(
        Filled("No '%TYPE%' found satisfying the specified conditions", "%TYPE%", type),
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Sample::GetSampleAttribute));
  }
  if (store) {
    const_cast<Sample*>(this)->AddElement(result);  // asked for by the caller
    result->SetDerived(false);
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::GetSampleAttribute)

SmartPointer<SampleAttribute> Sample::FindStored(const std::string& type,
                                                 const Conditions& conditions) const {
  const bool any_conditions = type == kSpectrumType && conditions.IsEmpty();
  for (const auto& [name, attribute] : GetElements()) {
    if (attribute->GetType() == type &&
        (any_conditions || conditions.IsSubsetOf(*attribute->GetConditions()))) {
      return attribute;
    }
  }
  return {};
}

SmartPointer<SampleAttribute> Sample::Compute(const std::string& type, const Conditions& conditions,
                                              bool from_spectra) const {
  for (const auto& [name, attribute] : GetElements()) {
    if ((attribute->GetType() == kSpectrumType) != from_spectra) {
      continue;
    }
    try {
      return attribute->TransformTo(type, conditions);
    } catch (const ResourceNotAvailableException&) {
      // This attribute cannot give it; the next one may.
    }
  }
  return {};
}

SampleAttributeIterator Sample::GetFirstSampleAttribute() const try {
  return SampleAttributeIterator(GetElements(), Conditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::GetFirstSampleAttribute)

SampleAttributeIterator Sample::GetFirstSampleAttribute(const Conditions& filter) const try {
  return SampleAttributeIterator(GetElements(), filter);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::GetFirstSampleAttribute)

void Sample::Remove(SampleAttributeIterator& position) try {
  // An iterator at its end, or on the attributes of another sample, has nothing to remove here.
  if (!position.HasNext() || position.elements_ != &GetElements()) {
    return;
  }
  auto next = std::next(position.position_);
  try {
    next = position.FindNextMatch();
  } catch (const OutOfRangeException&) {
    // The attribute is to go all the same.
  }
  RemoveElement(position.position_);
  position.position_ = next;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::Remove)

void Sample::RemoveAll() try { Clear(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::RemoveAll)

void Sample::SetParent(Header* parent) try { MoveToParent<SampleSet>(*this, parent); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::SetParent)

void Sample::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitSample(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Sample::AcceptVisitor)

}  // namespace Aldermoor::Vexdoc
