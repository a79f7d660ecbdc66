#include "aldermoor/vexdoc/sampleset.h"

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/setparent.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/vexnode.inl.h"

namespace Aldermoor::Vexdoc {

using Utilities::Tools::SmartPointer;

template class VexNode<Sample, UniqueStoragePolicy<Sample>>;

SampleSet::SampleSet(const std::string& name) try : DeprecatedSampleSetInterface(name) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::SampleSet)

SampleSet::SampleSet(const SampleSet&) = default;
SampleSet& SampleSet::operator=(const SampleSet&) = default;
SampleSet::~SampleSet() = default;

SmartPointer<Sample> SampleSet::GetSample(const std::string& name) const try {
  return GetElement(name);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::GetSample)

std::string SampleSet::AddSample(const Sample& sample) try { return AppendNamed(sample); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::AddSample)

std::string SampleSet::InsertSample(const Sample& sample, SampleIterator& position) try {
  if (!position.HasNext() || position.place_.samples != &GetElements()) {
    throw VexException("SampleIterator not valid",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::SampleSet::InsertSample));
  }
  std::string name = InsertNamed(SmartPointer<Sample>(new Sample(sample)), position.place_.sample);
  position.StepOver();
  return name;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::InsertSample)

std::string SampleSet::RenameSample(const std::string& oldName, const std::string& newName) try {
  return RenameElement(oldName, newName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::RenameSample)

void SampleSet::RemoveSample(const std::string& name) try { RemoveElement(name); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::RemoveSample)

void SampleSet::RemoveAllSamples() try { Clear(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::RemoveAllSamples)

void SampleSet::SwapSample(const std::string& first, const std::string& second) try {
  SwapElements(first, second);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::SwapSample)

void SampleSet::SetParent(Header* parent) try { MoveToParent<VEX>(*this, parent); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::SetParent)

void SampleSet::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitSampleSet(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SampleSet::AcceptVisitor)

}  // namespace Aldermoor::Vexdoc
