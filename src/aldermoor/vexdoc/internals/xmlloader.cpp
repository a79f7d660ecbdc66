#include "aldermoor/vexdoc/internals/xmlloader.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <utility>

#include <xercesc/util/XMLString.hpp>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/lexicalcast.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/customillumination.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/internals/elementfactory.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/internals/xmlnames.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Tools::DynamicCast;
using Utilities::Tools::SmartPointer;
using xercesc::DOMNode;
using xercesc::XMLString;

namespace {

using namespace XMLNames;

// Calls `visit(name, holder)` for every child that has an attribute, with the value of its first
// one, whatever child and attribute are called.
template <class Visit>
void ForEachNamedChild(const NodeHolder& parent, Visit visit) {
  for (DOMNode* child = parent.GetXMLNode().getFirstChild(); child != nullptr;
       child = child->getNextSibling()) {
    const NodeHolder holder(child);
    if (const DOMNode* attribute = holder.FirstAttribute()) {
      visit(ToNativeString(attribute->getNodeValue()), holder);
    }
  }
}

// Calls `visit(name, holder)` for every "Value" child whose first attribute is called "Name".
template <class Visit>
void ForEachValue(const NodeHolder& parent, Visit visit) {
  for (NodeHolder value = parent.FindChild(kValue, false); !value.IsNull();
       value = value.NextSibling(kValue, false)) {
    const DOMNode* const attribute = value.FirstAttribute();
    if (attribute != nullptr && XMLString::equals(attribute->getNodeName(), kName)) {
      visit(attribute->getNodeValue(), value);
    }
  }
}

struct Points {
  Ruler ruler;
  std::vector<float> values;
};

// What `text` says beyond the whole number that is read from it.
std::string MisreadText(const XMLCh* text, unsigned int number) {
  const XMLCh* c = text;
  while (*c >= u'0' && *c <= u'9') {
    ++c;
  }
  if (*c == 0) {
    return "";  // all of it are digits, as nearly always
  }
  const std::string native = ToNativeString(text);
  return SaysOtherThanItsNumber(native)
             ? "the wavelength " + Quoted(native) + " is read as " + std::to_string(number)
             : "";
}

// The points of a spectrum in ascending order of wavelength; of equal wavelengths the first counts.
Points PointsByWavelength(const NodeHolder& holder) {
  std::vector<std::pair<unsigned int, float>> points;
  Points sorted;
  ForEachValue(holder, [&](const XMLCh* wavelength, const NodeHolder& value) {
    points.emplace_back(ReadUnsigned(wavelength), value.GetFloat());
    if (sorted.ruler.misread.empty()) {
      sorted.ruler.misread = MisreadText(wavelength, points.back().first);
    }
  });
  const auto by_wavelength = [](const auto& a, const auto& b) {
    return a.first < b.first;
  };
  if (!std::is_sorted(points.begin(), points.end(), by_wavelength)) {
    std::stable_sort(points.begin(), points.end(), by_wavelength);
  }
  const auto same_wavelength = [](const auto& a, const auto& b) {
    return a.first == b.first;
  };
  points.erase(std::unique(points.begin(), points.end(), same_wavelength), points.end());
  sorted.ruler.points.reserve(points.size());
  sorted.values.reserve(points.size());
  for (const auto& [wavelength, value] : points) {
    sorted.ruler.points.push_back(wavelength);
    sorted.values.push_back(value);
  }
  return sorted;
}

}  // namespace

XMLLoader::XMLLoader(NodeHolder document) : current_(document) {}

SmartPointer<VEX> XMLLoader::Load() try {
  current_ = current_.FindChild(kVex, true);
  SmartPointer<VEX> vex(new VEX);
  vex->AcceptVisitor(*this);
  return vex;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::Load)

void XMLLoader::VisitVex(VEX& vex) try {
  condition_links_.clear();
  for (NodeHolder block = current_.FindChild(kConditions, false); !block.IsNull();
       block = block.NextSibling(kConditions, false)) {
    ConditionParser(block);
  }
  LoadVexNode(vex, kSampleSet);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitVex)

void XMLLoader::VisitSampleSet(SampleSet& set) try { LoadVexNode(set, kSample); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitSampleSet)

void XMLLoader::VisitSample(Sample& sample) try { LoadVexNode(sample, kSampleAttribute); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitSample)

void XMLLoader::VisitSpectrum(Spectrum& spectrum) try { LoadSampleAttribute(spectrum); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitSpectrum)

void XMLLoader::VisitColorVector(ColorVector& vector) try { LoadSampleAttribute(vector); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitColorVector)

void XMLLoader::VisitRecipe(Recipe& recipe) try { LoadSampleAttribute(recipe); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitRecipe)

void XMLLoader::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  LoadSampleAttribute(attribute);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VisitUnknownSampleAttribute)

template <class Node>
void XMLLoader::LoadVexNode(Node& node, const XMLCh* childName) {
  using Child = typename Node::Pointer;
  HeaderParser(current_, node, false);
  const bool wrapped = childName == kSampleAttribute;
  for (NodeHolder child = current_.FindChild(childName, false); !child.IsNull();
       child = child.NextSibling(childName, false)) {
    current_ = wrapped ? child.FindChild(kAnyElement, false) : child;
    const SmartPointer<Header> element =
        ElementFactory::GetInstance().CreateElement(current_.GetName());
    element->AcceptVisitor(*this);
    // Not an insertion: equal names of a file stay, and so does its "Modified".
    using Element = std::remove_reference_t<decltype(*std::declval<Child>())>;
    DocumentAccess::Append(node, DynamicCast<Element>(element));
  }
}

template <class Attribute>
void XMLLoader::LoadSampleAttribute(Attribute& attribute) {
  const XMLCh* const link = current_.AttributeValue(kConditions);
  if (link == nullptr) {
    throw VexException(
        "Missing condition-link",
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XMLLoader::LoadSampleAttribute));
  }
  const auto known = condition_links_.find(ToNativeString(link));
  // No block has an empty ID, which is how the failure shows it.
  attribute.SetConditions(known == condition_links_.end()
                              ? ConditionManager::GetInstance().GetConditions("")
                              : known->second);
  HeaderParser(current_, attribute, true);
  LoadMembers(attribute);
}

void XMLLoader::HeaderParser(NodeHolder& holder, Header& header, bool isSampleAttribute) try {
  // One walk over the children for all keys; the first child of a name counts.
  std::array<DOMNode*, std::size(kHeaderKeys)> found{};
  DOMNode* additional_data = nullptr;
  for (DOMNode* child = holder.GetXMLNode().getFirstChild(); child != nullptr;
       child = child->getNextSibling()) {
    if (child->getNodeType() != DOMNode::ELEMENT_NODE) {
      continue;
    }
    for (std::size_t i = 0; i < found.size(); ++i) {
      if (found[i] == nullptr && XMLString::equals(child->getNodeName(), kHeaderKeys[i].element)) {
        found[i] = child;
      }
    }
    if (additional_data == nullptr && XMLString::equals(child->getNodeName(), kAdditionalData)) {
      additional_data = child;
    }
  }
  if (found[0] == nullptr && !isSampleAttribute) {
    holder.FindChild(kName, true);  // raises the failure
  }
  for (std::size_t i = 0; i < found.size(); ++i) {
    const std::string key = kHeaderKeys[i].key;
    if (found[i] != nullptr) {
      header.SetAttribute(key, NodeHolder(found[i]).GetText());
    } else if (key == Header::kCreatedKey || key == Header::kModifiedKey) {
      // The constructor has put in the present.
      rules_.gives_dates ? notes_.AddGivenDate() : header.RemoveAttribute(key);
    }
  }
  if (additional_data != nullptr) {
    ForEachNamedChild(NodeHolder(additional_data),
                      [&header](const std::string& key, const NodeHolder& child) {
                        header.SetAttribute(key, child.GetText());
                      });
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::HeaderParser)

void XMLLoader::ConditionParser(NodeHolder& block) try {
  Conditions conditions("0");
  const NodeHolder id = block.FindChild(kId, true);
  ForEachNamedChild(block, [&conditions](const std::string& key, const NodeHolder& child) {
    if (!child.IsElement(kSpectrum)) {
      conditions.AddAttribute(key, child.GetText());
    }
  });
  if (NodeHolder spectrum = id.NextSibling(kSpectrum, false); !spectrum.IsNull()) {
    const Conditions own = CustomIlluminationConditions();
    std::vector<float> data;
    notes_.AddIllumination(id.GetText(), SpectrumVectorParser(spectrum, own, data), conditions);
    conditions.SetCustomIllumination(Spectrum(own, data));
  }
  condition_links_[id.GetText()] =
      ConditionManager::GetInstance().GetOrCreateConditions(std::move(conditions));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::ConditionParser)

Ruler XMLLoader::SpectrumVectorParser(NodeHolder& holder, const Conditions& conditions,
                                      std::vector<float>& out) try {
  const auto expected = Utilities::Tools::lexical_cast<unsigned int>(
      conditions.GetAttribute(ConditionKeys::kPointCount, "36"));
  Points points = PointsByWavelength(holder);
  if (points.values.size() != expected && !(rules_.takes_any_count && !points.values.empty())) {
    throw VexParseException(
        "Missing Spectrum elements in XML",
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XMLLoader::SpectrumVectorParser));
  }
  out.swap(points.values);
  return std::move(points.ruler);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::SpectrumVectorParser)

std::vector<float> XMLLoader::ReadSpectrumValues(const Spectrum& spectrum) {
  Points points = PointsByWavelength(current_);
  notes_.AddSpectrum(spectrum, std::move(points.ruler));
  return std::move(points.values);
}

std::vector<std::pair<std::string, float>> XMLLoader::ReadChannels() const {
  std::vector<std::pair<std::string, float>> channels;
  ForEachValue(current_, [&channels](const XMLCh* label, const NodeHolder& value) {
    channels.emplace_back(ToNativeString(label), value.GetFloat());
  });
  return channels;
}

void XMLLoader::LoadMembers(Spectrum& spectrum) try {
  notes_.AddSpectrum(spectrum, SpectrumVectorParser(current_, *spectrum.GetConditions(),
                                                    DocumentAccess::Data(spectrum)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::LoadMembers)

void XMLLoader::LoadMembers(ColorVector& vector) try {
  DocumentAccess::ReplaceContent(vector, ColorVector(*vector.GetConditions(), ReadChannels()));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::LoadMembers)

void XMLLoader::LoadMembers(Recipe& recipe) try {
  if (const NodeHolder name = current_.FindChild(kAssortmentName, false); !name.IsNull()) {
    recipe.SetAssortmentName(name.GetText());
  }
  if (const NodeHolder thickness = current_.FindChild(kThickness, false); !thickness.IsNull()) {
    recipe.SetThickness(thickness.GetFloat());
  }
  if (const NodeHolder link = current_.FindChild(kSubstrateLinkName, false); !link.IsNull()) {
    recipe.SetSubstrateLinkName(link.GetText());
  }
  if (const NodeHolder list = current_.FindChild(kComponents, false); !list.IsNull()) {
    Recipe::Components components;
    ForEachNamedChild(list, [&components](const std::string& name, const NodeHolder& child) {
      components.emplace_back(name, child.GetFloat());
    });
    recipe.SetComponents(components);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::LoadMembers)

void XMLLoader::LoadMembers(UnknownSampleAttribute& attribute) try {
  DocumentAccess::ReplaceContent(attribute, UnknownSampleAttribute(VEXDataTreeParser(current_)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::LoadMembers)

// Recursion is bounded by the depth that the parser lets through.
SmartPointer<DataTree> XMLLoader::VEXDataTreeParser(const NodeHolder& holder) try {
  SmartPointer<DataTree> tree(new DataTree);
  std::string name;
  std::string value;
  if (holder.GetAttribute(name, value)) {
    tree->SetAttribute(name, value);
  }
  std::string text = holder.GetText();
  if (text.starts_with('\n')) {
    text.clear();  // the indentation in front of the first child
  }
  tree->SetName(holder.GetName());
  tree->SetValue(text);
  for (NodeHolder child = holder.FindChild(kAnyElement, false); !child.IsNull();
       child = child.NextSibling(kAnyElement, false)) {
    tree->AdoptChild(VEXDataTreeParser(child));
  }
  return tree;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLLoader::VEXDataTreeParser)

}  // namespace Aldermoor::Vexdoc::Internals
