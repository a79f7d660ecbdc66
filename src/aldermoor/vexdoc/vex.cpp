#include "aldermoor/vexdoc/vex.h"

#include <istream>
#include <stdexcept>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/xercesadapter.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/vexnode.inl.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::OutOfRangeException;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;
using Utilities::Tools::SmartPointer;

namespace {

SmartPointer<Internals::XMLParserAdapter> GetXMLParserAdapter(VEX& document) {
  return SmartPointer<Internals::XMLParserAdapter>(new Internals::XercesAdapter(&document));
}

}  // namespace

template class VexNode<SampleSet, UniqueStoragePolicy<SampleSet>>;

VEX::VEX(const std::string& name) try : DeprecatedVEXInterface(name) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::VEX)

VEX::VEX(const VEX&) = default;
VEX& VEX::operator=(const VEX&) = default;
VEX::~VEX() = default;

SmartPointer<SampleSet> VEX::GetSampleSet(const std::string& name) const try {
  return FindElement(name);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetSampleSet)

void VEX::Load(std::istream& in) try {
  Clear();
  GetXMLParserAdapter(*this)->Load(in);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::Load)

void VEX::LoadXML(const File& file, bool /*updateCache*/) try {
  try {
    File xml(file.GetAbsoluteName());
    GetXMLParserAdapter(*this)->Load(xml);
  } catch (const VexException&) {
    throw;
  } catch (const std::exception& e) {
    throw VexException(e.what(), ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::LoadXML));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::LoadXML)

std::string VEX::AddSampleSet(const SampleSet& set) try { return AddElement(set)->GetName(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSampleSet)

std::string VEX::AddSampleSet(const std::string& name) try { return AddElement(name)->GetName(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSampleSet)

std::string VEX::InsertSampleSet(const SampleSet& set, const long& position) try {
  return InsertElement(set, position)->GetName();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSampleSet)

std::string VEX::InsertSampleSet(const std::string& name, const long& position) try {
  return InsertElement(name, position)->GetName();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSampleSet)

std::string VEX::RenameSampleSet(const std::string& oldName, const std::string& newName) try {
  return RenameElement(oldName, newName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RenameSampleSet)

void VEX::RemoveSampleSet(const std::string& name) try { RemoveElement(name); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RemoveSampleSet)

void VEX::RemoveAllSampleSets() try { Clear(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RemoveAllSampleSets)

std::string VEX::AddSample(const std::string& setName, const Sample& sample) try {
  return FindElement(setName, true)->AddSample(sample);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AddSample)

std::string VEX::InsertSample(const std::string& setName, const Sample& sample,
                              const long& position) try {
  return FindElement(setName, true)->InsertElement(sample, position)->GetName();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::InsertSample)

SmartPointer<Sample> VEX::FindSample(const std::string& setName,
                                     const std::string& sampleName) const try {
  try {
    return FindElement(setName)->FindElement(sampleName);
  } catch (const ResourceNotAvailableException& e) {
    throw OutOfRangeException(e.what(), ALDERMOOR_HERE(Aldermoor::Vexdoc::VEX::FindSample));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::FindSample)

std::string VEX::RenameSample(const std::string& setName, const std::string& oldName,
                              const std::string& newName) try {
  return FindElement(setName, false)->RenameSample(oldName, newName);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::RenameSample)

void VEX::SwapSample(const std::string& setName, const std::string& first,
                     const std::string& second) try {
  FindElement(setName, false)->SwapSample(first, second);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::SwapSample)

std::string VEX::GetUniqueSampleName(const std::string& setName, const std::string& name) try {
  try {
    return FindElement(setName)->GetUniqueName(name);
  } catch (const ResourceNotAvailableException&) {
    return "Unknown";
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::GetUniqueSampleName)

void VEX::SetParent(Header* /*parent*/) {
  throw std::logic_error("VEX is already THE root element and can not accept a parent therefore");
}

void VEX::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitVex(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::VEX::AcceptVisitor)

}  // namespace Aldermoor::Vexdoc
