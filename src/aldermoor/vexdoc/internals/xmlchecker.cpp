#include "aldermoor/vexdoc/internals/xmlchecker.h"

#include <algorithm>
#include <iterator>
#include <stdexcept>
#include <utility>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMException.hpp>
#include <xercesc/dom/DOMNamedNodeMap.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/XMLException.hpp>
#include <xercesc/util/XMLString.hpp>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/attributerules.h"
#include "aldermoor/vexdoc/internals/customillumination.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/parsebudget.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/internals/xmllosses.h"
#include "aldermoor/vexdoc/internals/xmlnames.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::DOMNode;
using xercesc::XMLString;

namespace {

using namespace XMLNames;

template <class Visit>
void ForEachElement(const NodeHolder& parent, const XMLCh* name, Visit visit) {
  for (NodeHolder child = parent.FindChild(name, false); !child.IsNull();
       child = child.NextSibling(name, false)) {
    visit(child);
  }
}

std::string NameOf(const NodeHolder& element) {
  const NodeHolder name = element.FindChild(kName, false);
  return name.IsNull() ? "" : name.GetText();
}

// Without the title in front, which says no more than that there is a fault.
std::string ParseReason(const std::string& message) {
  return message.substr(message.find('\n') + 1);
}

}  // namespace

std::vector<Fault> XMLChecker::Check(std::string_view bytes) try {
  RequireXMLPlatform();
  try {
    CheckText(bytes);
  } catch (const VexXMLParseException& e) {
    faults_.Add({Fault::Severity::kError, ParseReason(e.what()), e.GetLine(), e.GetColumn(), 0});
  } catch (const xercesc::OutOfMemoryException&) {
    faults_.Add({Fault::Severity::kError,
                 "the document takes more memory than a text of its size may take", 0, 0, 0});
  } catch (const xercesc::XMLException& e) {
    faults_.Add({Fault::Severity::kError, ToNativeString(e.getMessage()), 0, 0, 0});
  } catch (const xercesc::DOMException& e) {  // for a version "1.2" in the declaration
    faults_.Add({Fault::Severity::kError, ToNativeString(e.getMessage()), 0, 0, 0});
  }
  return faults_.Take();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XMLChecker::Check)

void XMLChecker::CheckText(std::string_view bytes) {
  const xercesc::MemBufInputSource source(reinterpret_cast<const XMLByte*>(bytes.data()),
                                          bytes.size(), u"VEX");
  ParseBudget budget(bytes.size());
  PlacedParser parser(budget);
  try {
    parser.parse(source);
  } catch (const VexException&) {
    // As a load does: what a document type says about the content keeps nothing from being read.
    parser.resetDocumentPool();
    parser.setValidationScheme(xercesc::XercesDOMParser::Val_Never);
    parser.parse(source);
  }
  parser_ = &parser;
  FindRemarks(*parser.getDocument(), [this](const NodeHolder& holder, const std::string& text) {
    WarnOfLoss(holder, text);
  });
  CheckDocument(NodeHolder(parser.getDocument()));
  parser_ = nullptr;
}

void XMLChecker::CheckDocument(const NodeHolder& document) {
  const NodeHolder root = document.FindChild(kVex, false);
  if (root.IsNull()) {
    const NodeHolder other = document.FindChild(kAnyElement, false);
    return Error(other, "the root is " + Quoted(other.GetName()) + " instead of 'VEX'");
  }
  const XMLCh* const version = root.AttributeValue(kVersion);
  is_legacy_ = version == nullptr || *version == 0;
  CheckContainer(root, kVersion);
  ForEachElement(root, kConditions, [this](const NodeHolder& block) { CheckBlock(block); });
  CheckHeader(root, true, {kSampleSet, kConditions});
  std::set<std::string> names;
  ForEachElement(root, kSampleSet, [this, &names](const NodeHolder& set) {
    CheckIsFirst(set, "sample set", names);
    CheckSampleSet(set);
  });
  for (const auto& [id, block] : blocks_) {
    if (!block.is_used) {
      WarnOfLoss(block.holder,
                 "no attribute links to the conditions " + Quoted(id) + "; a save drops them");
    }
  }
}

void XMLChecker::CheckBlock(const NodeHolder& block) {
  CheckContainer(block);
  Conditions conditions;
  ForEachElement(block, kAnyElement, [&](const NodeHolder& child) {
    const DOMNode* const key = child.FirstAttribute();
    if (child.IsElement(kSpectrum) || (child.IsElement(kId) && key == nullptr)) {
      return;
    }
    if (key == nullptr || *key->getNodeValue() == 0) {
      return WarnOfLoss(child, Quoted(child.GetName()) + " is not read: it names no condition");
    }
    CheckLeaf(child, true);
    const std::string name = ToNativeString(key->getNodeValue());
    if (conditions.HasAttribute(name)) {
      WarnOfLoss(child, "the condition " + Quoted(name) + " is given again; the last one counts");
    }
    const std::string value = child.GetText();
    if ((name == ConditionKeys::kWavelengthMin || name == ConditionKeys::kWavelengthMax) &&
        IsWavelengthMisread(value)) {
      WarnOfLoss(child, "the wavelength " + Quoted(value) + " is read as " +
                            std::to_string(*ReadWavelength(value)));
    }
    conditions.AddAttribute(name, value);
  });
  const NodeHolder id = block.FindChild(kId, false);
  if (id.IsNull()) {
    return Error(block, "the conditions have no 'ID'");
  }
  CheckLeaf(id, false);
  CheckIllumination(block, id, conditions);
  const std::string text = id.GetText();
  if (blocks_.contains(text)) {
    WarnOfLoss(block, "conditions " + Quoted(text) + " are declared again; the last ones count");
  }
  blocks_.insert_or_assign(text, Block{std::move(conditions), block});
}

void XMLChecker::CheckIllumination(const NodeHolder& block, const NodeHolder& id,
                                   const Conditions& conditions) {
  const NodeHolder spectrum = id.NextSibling(kSpectrum, false);
  ForEachElement(block, kSpectrum, [&](const NodeHolder& other) {
    if (spectrum.IsNull() || &other.GetXMLNode() != &spectrum.GetXMLNode()) {
      WarnOfLoss(other, "'Spectrum' is not read: only the first one behind the 'ID' is");
    }
  });
  if (spectrum.IsNull()) {
    return;
  }
  CheckContainer(spectrum, kConditions);
  const auto points = CheckPoints(spectrum);
  if (points && points->size() != kIlluminationPoints) {
    Error(spectrum, "the illumination has " + Counted(points->size(), "different wavelength") +
                        " instead of " + std::to_string(kIlluminationPoints));
  } else if (points && !AreOfIllumination(*points, conditions)) {
    Add(Fault::Severity::kWarning, spectrum,
        ContradictionText(*points, CustomIlluminationConditions()), Fault::Loss::kWavelengths);
  }
}

void XMLChecker::CheckSampleSet(const NodeHolder& set) {
  CheckContainer(set);
  CheckHeader(set, true, {kSample});
  std::set<std::string> names;
  ForEachElement(set, kSample, [this, &names](const NodeHolder& sample) {
    CheckIsFirst(sample, "sample", names);
    CheckSample(sample);
  });
}

void XMLChecker::CheckSample(const NodeHolder& sample) {
  CheckContainer(sample);
  CheckHeader(sample, true, {kSampleAttribute});
  ForEachElement(sample, kSampleAttribute,
                 [this](const NodeHolder& wrapper) { CheckAttribute(wrapper); });
}

void XMLChecker::CheckAttribute(const NodeHolder& wrapper) {
  CheckContainer(wrapper);
  const NodeHolder typed = wrapper.FindChild(kAnyElement, false);
  if (typed.IsNull()) {
    return Error(wrapper, "'SampleAttribute' holds no element");
  }
  if (const NodeHolder other = typed.NextSibling(kAnyElement, false); !other.IsNull()) {
    WarnOfLoss(other, Quoted(other.GetName()) +
                          " is not read: only the first element of a 'SampleAttribute' is");
  }
  const std::string kind = ElementKind(typed.GetName());
  if (IsLevel(kind)) {
    return Error(typed, Quoted(typed.GetName()) + " cannot stand in a 'SampleAttribute'");
  }
  CheckMembers(kind, typed, CheckLink(typed));
}

void XMLChecker::CheckMembers(const std::string& kind, const NodeHolder& typed, Block* block) {
  if (kind == "Spectrum") {
    CheckSpectrum(typed, block);
  } else if (kind == "ColorVector") {
    CheckColor(typed, block);
  } else if (kind == "Recipe") {
    CheckRecipe(typed);
  } else {
    CheckDataTree(typed, true);
  }
}

void XMLChecker::CheckSpectrum(const NodeHolder& spectrum, Block* block) {
  CheckContainer(spectrum, kConditions);
  CheckHeader(spectrum, false, {kValue});
  const auto points = CheckPoints(spectrum);
  if (block == nullptr) {
    return;
  }
  if (points && !AreOfConditions(*points, block->conditions)) {
    Add(Fault::Severity::kWarning, spectrum, ContradictionText(*points, block->conditions),
        Fault::Loss::kWavelengths);
  }
  if (is_legacy_) {
    return;  // legacy spectra have as many points as they have, under whatever conditions
  }
  const auto expected = ExpectedPoints(block->conditions);
  if (!expected) {
    Error(spectrum, "the number of points in its conditions is no number");
  } else if (points && points->size() != *expected) {
    Error(spectrum, Counted(points->size(), "different wavelength") + " instead of the " +
                        std::to_string(*expected) + " of its conditions");
  }
  if (!std::exchange(block->is_told, true)) {
    for (const std::string& fault : SpectrumFaults(block->conditions)) {
      Warn(block->holder, fault);
    }
  }
}

void XMLChecker::CheckColor(const NodeHolder& color, const Block* block) {
  CheckContainer(color, kConditions);
  CheckHeader(color, false, {kValue});
  std::vector<std::string> labels;
  ForEachElement(color, kValue, [this, &labels](const NodeHolder& value) {
    const DOMNode* const attribute = value.FirstAttribute();
    if (attribute == nullptr || !XMLString::equals(attribute->getNodeName(), kName)) {
      return WarnOfLoss(value, "'Value' is not read: its first attribute is not 'Name'");
    }
    labels.push_back(ToNativeString(attribute->getNodeValue()));
    CheckNumber(value, true);
  });
  if (block == nullptr) {
    return;
  }
  const auto faults = is_legacy_ ? LegacyColorFaults(block->conditions, labels.size())
                                 : ColorFaults(block->conditions, labels.size());
  for (const std::string& fault : faults) {
    Error(color, fault);
  }
  if (const std::string fault = LabelFault(block->conditions, labels);
      faults.empty() && !fault.empty()) {
    // The legacy dialect forgets the labels, so that nothing shows what they were.
    Add(Fault::Severity::kWarning, color, fault,
        is_legacy_ ? Fault::Loss::kContent : Fault::Loss::kLabels);
  }
}

void XMLChecker::CheckRecipe(const NodeHolder& recipe) {
  CheckContainer(recipe, kConditions);
  CheckHeader(recipe, false, {kAssortmentName, kThickness, kSubstrateLinkName, kComponents});
  if (const NodeHolder thickness = recipe.FindChild(kThickness, false); !thickness.IsNull()) {
    CheckNumber(thickness, false);
  }
  for (const XMLCh* const name : {kAssortmentName, kSubstrateLinkName}) {
    if (const NodeHolder text = recipe.FindChild(name, false); !text.IsNull()) {
      CheckLeaf(text, false);
    }
  }
  const NodeHolder list = recipe.FindChild(kComponents, false);
  if (list.IsNull()) {
    return;
  }
  CheckContainer(list);
  ForEachElement(list, kAnyElement, [this](const NodeHolder& component) {
    if (component.FirstAttribute() == nullptr) {
      WarnOfLoss(component, "the component is not read: it has no name");
    } else {
      CheckNumber(component, true);
    }
  });
}

// Recursion is bounded by the depth that the parser lets through.
void XMLChecker::CheckDataTree(const NodeHolder& node, bool is_root) {
  WarnOfLoss(node, LostRuns(node));
  WarnOfLoss(node, LostFurtherAttributes(node, is_root ? kConditions : nullptr));
  if (const std::string text = node.GetText();
      text.starts_with('\n') && text.find_first_not_of(" \t\r\n") != std::string::npos) {
    WarnOfLoss(node, "the text of " + Quoted(node.GetName()) +
                         " begins with a line feed and is read as empty");
  }
  ForEachElement(node, kAnyElement,
                 [this](const NodeHolder& child) { CheckDataTree(child, false); });
}

void XMLChecker::CheckAdditional(const std::vector<NodeHolder>& values,
                                 const std::set<const XMLCh*>& elements) {
  std::set<std::string> keys;
  for (const auto& [element, key] : kHeaderKeys) {
    if (elements.contains(element)) {
      keys.insert(key);
    }
  }
  for (const NodeHolder& value : values) {
    const xercesc::DOMNode* const key = value.FirstAttribute();
    if (key != nullptr && !keys.insert(ToNativeString(key->getNodeValue())).second) {
      WarnOfLoss(value, Quoted(ToNativeString(key->getNodeValue())) +
                            " is given again; the last one counts");
    }
  }
}

void XMLChecker::CheckHeader(const NodeHolder& holder, bool is_name_mandatory,
                             ElementNames others) {
  std::set<const XMLCh*> seen;
  std::vector<NodeHolder> additional;  // read behind the others, wherever they stand
  bool has_additional_data = false;
  ForEachElement(holder, kAnyElement, [&](const NodeHolder& child) {
    const auto key = std::find_if(std::begin(kHeaderKeys), std::end(kHeaderKeys),
                                  [&](const auto& k) { return child.IsElement(k.element); });
    if (key != std::end(kHeaderKeys)) {
      CheckLeaf(child, false);
      if (!seen.insert(key->element).second) {
        WarnOfLoss(child, Quoted(key->key) + " is given again; the first one counts");
      }
    } else if (child.IsElement(kAdditionalData)) {
      if (std::exchange(has_additional_data, true)) {
        WarnOfLoss(child, "'AdditionalData' is given again; the first one counts");
      }
      CheckContainer(child);
      ForEachElement(child, kAnyElement, [&](const NodeHolder& value) {
        CheckLeaf(value, true);
        additional.push_back(value);
        if (value.FirstAttribute() == nullptr) {
          WarnOfLoss(value, Quoted(value.GetName()) + " is not read: it has no key");
        }
      });
    } else if (std::none_of(others.begin(), others.end(),
                            [&](const XMLCh* name) { return child.IsElement(name); })) {
      WarnOfLoss(child, Quoted(child.GetName()) + " is not read here");
    }
  });
  CheckAdditional(additional, seen);
  if (is_name_mandatory && !seen.contains(kName)) {
    Error(holder, Quoted(holder.GetName()) + " has no 'Name'");
  }
}

void XMLChecker::CheckIsFirst(const NodeHolder& element, const char* noun,
                              std::set<std::string>& names) {
  const std::string name = NameOf(element);
  if (!names.insert(name).second) {
    Warn(element, "there is a " + std::string(noun) + " " + Quoted(name) +
                      " already; only the first one is found by that name");
  }
}

XMLChecker::Block* XMLChecker::CheckLink(const NodeHolder& typed) {
  const XMLCh* const link = typed.AttributeValue(kConditions);
  if (link == nullptr) {
    Error(typed, Quoted(typed.GetName()) + " has no attribute 'Conditions'");
    return nullptr;
  }
  const std::string id = ToNativeString(link);
  const auto block = blocks_.find(id);
  if (block == blocks_.end()) {
    Error(typed, "links to conditions " + Quoted(id) + ", which the document does not declare");
    return nullptr;
  }
  block->second.is_used = true;
  return &block->second;
}

std::optional<Wavelengths> XMLChecker::CheckPoints(const NodeHolder& spectrum) {
  std::set<unsigned int> wavelengths;
  bool are_numbers = true;
  ForEachElement(spectrum, kValue,
                 [&](const NodeHolder& value) { CheckValue(value, wavelengths, are_numbers); });
  return are_numbers ? std::make_optional(Wavelengths(wavelengths.begin(), wavelengths.end()))
                     : std::nullopt;
}

void XMLChecker::CheckValue(const NodeHolder& value, std::set<unsigned int>& wavelengths,
                            bool& are_numbers) {
  const DOMNode* const attribute = value.FirstAttribute();
  if (attribute == nullptr || !XMLString::equals(attribute->getNodeName(), kName)) {
    return WarnOfLoss(value, "'Value' is not read: its first attribute is not 'Name'");
  }
  CheckNumber(value, true);
  const std::string text = ToNativeString(attribute->getNodeValue());
  try {
    const unsigned int wavelength = ReadUnsigned(attribute->getNodeValue());
    if (text.find_first_not_of("0123456789") != std::string::npos) {
      const bool is_other = IsWavelengthMisread(text) || text.find('-') != std::string::npos;
      Add(Fault::Severity::kWarning, value,
          "the wavelength " + Quoted(text) + " is read as " + std::to_string(wavelength),
          is_other ? Fault::Loss::kContent : Fault::Loss::kNone);
    }
    if (!wavelengths.insert(wavelength).second) {
      WarnOfLoss(value, "the wavelength " + std::to_string(wavelength) +
                            " is given again; the first one counts");
    }
  } catch (const std::invalid_argument&) {
    are_numbers = false;
    Error(value, "the wavelength " + Quoted(text) + " is no number");
  }
}

void XMLChecker::CheckLeaf(const NodeHolder& holder, bool is_named) {
  WarnOfLoss(holder, LostRuns(holder));
  WarnOfLoss(holder, is_named ? LostFurtherAttributes(holder) : LostAttributes(holder, nullptr));
}

void XMLChecker::CheckNumber(const NodeHolder& holder, bool is_named) {
  CheckLeaf(holder, is_named);
  if (const std::string fault = NumberFault(holder.GetText()); !fault.empty()) {
    WarnOfLoss(holder, fault + "; it is read as " + NumberText(holder.GetFloat()));
  }
}

void XMLChecker::CheckContainer(const NodeHolder& holder, const XMLCh* attribute) {
  WarnOfLoss(holder, LostText(holder));
  WarnOfLoss(holder, LostAttributes(holder, attribute));
}

void XMLChecker::Add(Fault::Severity severity, const NodeHolder& holder, const std::string& text,
                     Fault::Loss loss) {
  const Place place = parser_->GetPlace(holder.GetXMLNode());
  faults_.Add({severity, text, place.line, place.column, 0, loss});
}

void XMLChecker::Error(const NodeHolder& holder, const std::string& text) {
  Add(Fault::Severity::kError, holder, text);
}

void XMLChecker::Warn(const NodeHolder& holder, const std::string& text) {
  Add(Fault::Severity::kWarning, holder, text);
}

void XMLChecker::WarnOfLoss(const NodeHolder& holder, const std::string& text) {
  if (!text.empty()) {
    Add(Fault::Severity::kWarning, holder, text, Fault::Loss::kContent);
  }
}

}  // namespace Aldermoor::Vexdoc::Internals
