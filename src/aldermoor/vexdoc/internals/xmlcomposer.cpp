#include "aldermoor/vexdoc/internals/xmlcomposer.h"

#include <algorithm>
#include <cstdint>
#include <iterator>

#include <xercesc/dom/DOMException.hpp>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/exceptions/traceableexception.h"
#include "aldermoor/utilities/tools/lexicalcast.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/attributerules.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/xmlnames.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::TraceableException;
using Utilities::Tools::lexical_cast;
using xercesc::DOMElement;

namespace {

constexpr XMLCh kOwnConditions[] = u"0";  // a custom illumination refers to no block

bool IsStandardKey(const std::string& key) {
  return std::any_of(std::begin(XMLNames::kHeaderKeys), std::end(XMLNames::kHeaderKeys),
                     [&key](const XMLNames::HeaderKey& standard) { return key == standard.key; });
}

}  // namespace

XMLComposer::XMLComposer(xercesc::DOMDocument& document) : document_(document) {}

void XMLComposer::VisitVex(VEX& vex) try {
  try {
    DOMElement* const root = VexNodeComposer(vex, XMLNames::kVex);
    root->setAttribute(XMLNames::kVersion, u"1.0");
    ConditionsComposer(root);
    current_ = root;
  } catch (TraceableException& e) {
    e.prepend(PlaceText(place_.set == nullptr ? "" : place_.set->GetName(),
                        place_.sample == nullptr ? "" : place_.sample->GetName(), ""));
    throw;
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitVex)

void XMLComposer::VisitSampleSet(SampleSet& set) try {
  place_.set = &set;
  current_ = VexNodeComposer(set, XMLNames::kSampleSet);
  place_.set = nullptr;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitSampleSet)

void XMLComposer::VisitSample(Sample& sample) try {
  place_.sample = &sample;
  current_ = VexNodeComposer(sample, XMLNames::kSample);
  place_.sample = nullptr;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitSample)

void XMLComposer::VisitSpectrum(Spectrum& spectrum) try {
  current_ = SampleAttributeComposer(spectrum, XMLNames::kSpectrum);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitSpectrum)

void XMLComposer::VisitColorVector(ColorVector& vector) try {
  current_ = SampleAttributeComposer(vector, XMLNames::kColorVector);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitColorVector)

void XMLComposer::VisitRecipe(Recipe& recipe) try {
  current_ = SampleAttributeComposer(recipe, XMLNames::kRecipe);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitRecipe)

void XMLComposer::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  const UnknownSampleAttribute::Data data = attribute.GetData();
  DOMElement* const element = NewNode(name_.Set(data->GetName()));
  VEXDataTreeComposer(element, *data);
  if (!attribute.GetConditions().IsNull()) {
    // The tree still holds the link of the file that it came from.
    Link(element, *attribute.GetConditions());
  }
  current_ = Wrap(element);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VisitUnknownSampleAttribute)

template <class Node>
DOMElement* XMLComposer::VexNodeComposer(Node& node, const XMLCh* name) {
  DOMElement* const element = NewNode(name);
  HeaderComposer(element, node, false);
  for (const auto& child : node.GetElements()) {
    xercesc::DOMNode* const saved = current_;
    child.second->AcceptVisitor(*this);
    if (current_ != nullptr) {
      element->appendChild(current_);
    }
    current_ = saved;
  }
  return element;
}

template <class Attribute>
DOMElement* XMLComposer::SampleAttributeComposer(Attribute& attribute, const XMLCh* name) {
  if (attribute.IsDerived()) {
    return nullptr;
  }
  DOMElement* const element = NewNode(name);
  Link(element, *attribute.GetConditions());
  HeaderComposer(element, attribute, true);
  ComposeMembers(attribute, element);
  return Wrap(element);
}

void XMLComposer::Link(DOMElement* element, const Conditions& block) {
  const std::string& id = conditions_.GetId(block);
  if (conditions_.GetBlocks().size() > users_.size()) {
    users_.emplace(id, place_);
  }
  element->setAttribute(XMLNames::kConditions, text_.Set(id));
}

DOMElement* XMLComposer::Wrap(DOMElement* element) {
  DOMElement* const wrapper = NewNode(XMLNames::kSampleAttribute);
  wrapper->appendChild(element);
  return wrapper;
}

void XMLComposer::HeaderComposer(DOMElement* element, const Header& header,
                                 bool isSampleAttribute) {
  const auto& attributes = header.GetAttributes();
  for (const XMLNames::HeaderKey& standard : XMLNames::kHeaderKeys) {
    const auto entry = attributes.find(standard.key);
    const bool is_forced = standard.element == XMLNames::kName && !isSampleAttribute;
    if (entry != attributes.end() && !entry->second.empty()) {
      AppendNode(element, standard.element, entry->second);
    } else if (is_forced) {
      AppendNode(element, standard.element, "");
    }
  }
  DOMElement* additional = nullptr;
  for (const auto& [key, value] : attributes) {
    if (IsStandardKey(key)) {
      continue;
    }
    if (additional == nullptr) {
      additional = NewNode(XMLNames::kAdditionalData);
      element->appendChild(additional);
    }
    AppendNamed(additional, XMLNames::kValue, key, text_.Set(value));
  }
}

void XMLComposer::ComposeMembers(Spectrum& spectrum, DOMElement* element) try {
  SpectrumVectorComposer(element, *spectrum.GetConditions(), spectrum.GetData());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::ComposeMembers)

void XMLComposer::SpectrumVectorComposer(DOMElement* element, const Conditions& conditions,
                                         const std::vector<float>& data) {
  if (data.empty()) {
    return;
  }
  const WavelengthSteps steps(conditions, data.size());
  std::int64_t wavelength = steps.first;
  for (const float value : data) {
    DOMElement* const node = NewNode(XMLNames::kValue, text_.Set(value));
    node->setAttribute(XMLNames::kName, name_.Set(static_cast<unsigned int>(wavelength)));
    element->appendChild(node);
    wavelength += steps.step;
  }
}

void XMLComposer::ComposeMembers(ColorVector& vector, DOMElement* element) try {
  for (const auto& [label, value] : vector.GetDatastore()) {
    AppendNamed(element, XMLNames::kValue, label, text_.Set(value));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::ComposeMembers)

void XMLComposer::ComposeMembers(Recipe& recipe, DOMElement* element) try {
  AppendNode(element, XMLNames::kAssortmentName, recipe.GetAssortmentName());
  element->appendChild(NewNode(XMLNames::kThickness, text_.Set(recipe.GetThickness())));
  AppendNode(element, XMLNames::kSubstrateLinkName, recipe.GetSubstrateLinkName());
  if (recipe.GetComponents().empty()) {
    return;
  }
  DOMElement* const components = NewNode(XMLNames::kComponents);
  for (const auto& [name, concentration] : recipe.GetComponents()) {
    AppendNamed(components, XMLNames::kValue, name, text_.Set(concentration));
  }
  element->appendChild(components);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::ComposeMembers)

// Recursion is bounded by the depth that the loaders let through.
void XMLComposer::VEXDataTreeComposer(DOMElement* element, const DataTree& tree) try {
  if (!tree.GetName().empty()) {
    element->appendChild(document_.createTextNode(text_.Set(tree.GetValue())));
  }
  for (const auto& [name, value] : tree.GetAttributes()) {
    SetAttribute(element, name, value);
  }
  has_mixed_content_ = has_mixed_content_ || (tree.HasChildren() && !tree.GetValue().empty());
  for (const auto& child : tree.GetChildren()) {
    DOMElement* const node = NewNode(name_.Set(child->GetName()));
    VEXDataTreeComposer(node, *child);
    element->appendChild(node);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLComposer::VEXDataTreeComposer)

void XMLComposer::ConditionsComposer(DOMElement* parent) {
  for (const auto& [id, block] : conditions_.GetBlocks()) {
    place_ = users_.at(id);
    DOMElement* const element = NewNode(XMLNames::kConditions);
    AppendNode(element, XMLNames::kId, id);
    for (const auto& [key, value] : block->GetAttributes()) {
      AppendNamed(element, XMLNames::kAttribute, key, text_.Set(value));
    }
    if (block->HasCustomIllumination()) {
      DOMElement* const spectrum = NewNode(XMLNames::kSpectrum);
      spectrum->setAttribute(XMLNames::kConditions, kOwnConditions);
      SpectrumVectorComposer(spectrum, *block, block->GetCustomIllumination().GetData());
      element->appendChild(spectrum);
    }
    parent->appendChild(element);
  }
}

// What the frames on the way would make of a foreign exception says nothing.
void XMLComposer::SetAttribute(DOMElement* element, const std::string& name,
                               const std::string& value) try {
  element->setAttribute(name_.Set(name), text_.Set(value));
} catch (const xercesc::DOMException& e) {
  throw XMLFailure(ToNativeString(e.getMessage()), "");
}

DOMElement* XMLComposer::NewNode(const XMLCh* name) try {
  return document_.createElement(name);
} catch (const xercesc::DOMException& e) {
  throw XMLFailure(ToNativeString(e.getMessage()), "");
}

DOMElement* XMLComposer::NewNode(const XMLCh* name, const XMLCh* text) {
  DOMElement* const element = NewNode(name);
  element->appendChild(document_.createTextNode(text));
  return element;
}

void XMLComposer::AppendNode(DOMElement* parent, const XMLCh* name, const std::string& text) {
  parent->appendChild(NewNode(name, text_.Set(text)));
}

void XMLComposer::AppendNamed(DOMElement* parent, const XMLCh* element, const std::string& name,
                              const XMLCh* text) {
  DOMElement* const node = NewNode(element, text);
  node->setAttribute(XMLNames::kName, name_.Set(name));
  parent->appendChild(node);
}

}  // namespace Aldermoor::Vexdoc::Internals
