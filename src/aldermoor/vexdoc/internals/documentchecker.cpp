#include "aldermoor/vexdoc/internals/documentchecker.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <optional>
#include <stdexcept>

#include <xercesc/util/XMLChar.hpp>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/attributerules.h"
#include "aldermoor/vexdoc/internals/documentparser.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/wavelengths.h"
#include "aldermoor/vexdoc/internals/xmlnames.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::NullPointerException;

namespace {

// "VEX", "SampleSet", "Sample" and "SampleAttribute" stand around the element of an attribute.
constexpr unsigned int kDeepestTree = DocumentParser::kDeepestElement - 4;

constexpr const char* kLinkName = "Conditions";

bool IsDate(const std::string& key) {
  return key == Header::kCreatedKey || key == Header::kModifiedKey;
}

bool IsStandardKey(const std::string& key) {
  return std::any_of(std::begin(XMLNames::kHeaderKeys), std::end(XMLNames::kHeaderKeys),
                     [&key](const auto& standard) { return key == standard.key; });
}

// The header that a load reads from the elements of an unknown attribute.  Nothing is known of
// those that hold elements themselves: blanks between these count as text.
std::map<std::string, std::optional<std::string>> HeaderInTree(const DataTree& tree) {
  std::map<std::string, std::optional<std::string>> header;
  const DataTree* additional = nullptr;
  const auto text_of = [](const DataTree& item) {
    return item.HasChildren() && item.GetValue().empty() ? std::nullopt
                                                         : std::optional(item.GetValue());
  };
  for (const auto& child : tree.GetChildren()) {
    if (IsStandardKey(child->GetName())) {
      header.emplace(child->GetName(), text_of(*child));
    } else if (child->GetName() == "AdditionalData" && additional == nullptr) {
      additional = child.Get();
    }
  }
  if (additional != nullptr) {
    for (const auto& child : additional->GetChildren()) {
      if (child->HasAttribute()) {
        header.insert_or_assign(child->GetAttributes().begin()->second, text_of(*child));
      }
    }
  }
  return header;
}

}  // namespace

std::vector<DocumentFault> DocumentChecker::Check(const VEX& document) try {
  RequireXMLPlatform();
  const_cast<VEX&>(document).AcceptVisitor(*this);  // which only reads
  return std::move(faults_);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::Check)

void DocumentChecker::VisitVex(VEX& vex) try {
  UseName("VEX");
  CheckHeader(vex);
  for (const auto& set : vex.GetElements()) {
    set.second->AcceptVisitor(*this);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitVex)

void DocumentChecker::VisitSampleSet(SampleSet& set) try {
  place_ = DocumentFault();
  place_.set = set.GetName();
  UseName("SampleSet");
  CheckHeader(set);
  for (const auto& sample : set.GetElements()) {
    sample.second->AcceptVisitor(*this);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitSampleSet)

void DocumentChecker::VisitSample(Sample& sample) try {
  place_.sample = sample.GetName();
  place_.attribute.clear();
  UseName("Sample");
  CheckHeader(sample);
  index_ = 0;
  for (const auto& attribute : sample.GetElements()) {
    ++index_;
    attribute.second->AcceptVisitor(*this);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitSample)

template <class Attribute>
bool DocumentChecker::EnterAttribute(Attribute& attribute, const char* kind) {
  if (attribute.IsDerived()) {
    return false;
  }
  NamePlace(kind, attribute.GetName());
  UseName("SampleAttribute");
  UseName(kind);
  CheckHeader(attribute);
  return true;
}

void DocumentChecker::NamePlace(const std::string& kind, const std::string& name) {
  place_.attribute = kind + " " + (name.empty() ? std::to_string(index_) : Quoted(name));
}

void DocumentChecker::VisitSpectrum(Spectrum& spectrum) try {
  if (!EnterAttribute(spectrum, "Spectrum")) {
    return;
  }
  const std::vector<float>& data = spectrum.GetData();
  if (!data.empty()) {
    UseName("Value");
  }
  CheckNumbers("value", data);
  const Conditions* const conditions = CheckConditions(spectrum);
  if (conditions == nullptr) {
    return;
  }
  const auto expected = ExpectedPoints(*conditions);
  if (!expected) {
    Add("the number of points in its conditions, " +
        Quoted(conditions->GetAttribute(ConditionKeys::kPointCount, "")) + ", is no number");
  } else if (*expected != data.size()) {
    Add(Counted(data.size(), "value") + " under conditions that name " + std::to_string(*expected));
  }
  if (!data.empty()) {
    CheckRange(*conditions);
    CheckSteps("", *conditions, data.size());
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitSpectrum)

void DocumentChecker::VisitColorVector(ColorVector& vector) try {
  if (!EnterAttribute(vector, "ColorVector")) {
    return;
  }
  const Conditions* const conditions = CheckConditions(vector);
  const ColorScheme::Channels* channels = nullptr;
  try {
    channels = &vector.GetDatastore();
  } catch (const NullPointerException&) {
    return Add("the colour has no channels, not even an empty list");
  }
  for (const auto& [label, value] : *channels) {
    UseName("Value");
    CheckText("a channel", label);
    CheckNumber("channel " + Quoted(label), value);
  }
  if (conditions != nullptr) {
    for (const std::string& fault : ColorFaults(*conditions, channels->size())) {
      Add(fault);
    }
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitColorVector)

void DocumentChecker::VisitRecipe(Recipe& recipe) try {
  if (!EnterAttribute(recipe, "Recipe")) {
    return;
  }
  for (const char* const name : {"AssortmentName", "Thickness", "SubstrateLinkName"}) {
    UseName(name);
  }
  CheckText("the assortment", recipe.GetAssortmentName());
  CheckText("the substrate", recipe.GetSubstrateLinkName());
  CheckNumber("the thickness", recipe.GetThickness());
  for (const auto& [name, concentration] : recipe.GetComponents()) {
    UseName("Components");
    UseName("Value");
    CheckText("a component", name);
    CheckNumber("component " + Quoted(name), concentration);
  }
  CheckConditions(recipe);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitRecipe)

void DocumentChecker::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  const UnknownSampleAttribute::Data tree = attribute.GetData();
  const std::string kind = tree.IsNull() || tree->GetName().empty() ? "attribute" : tree->GetName();
  NamePlace(kind, attribute.GetName());
  UseName("SampleAttribute");
  CheckConditions(attribute);
  if (tree.IsNull()) {
    return Add("an attribute of an unknown kind without content");
  }
  if (!ElementKind(kind).empty()) {
    Add("the content of an unknown kind is called " + Quoted(kind) +
        ", which is the name of a known one");
  }
  CheckTree(*tree, 1);
  CheckTreeHeader(attribute, *tree);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::DocumentChecker::VisitUnknownSampleAttribute)

void DocumentChecker::CheckHeader(const Header& header) {
  UseName("Name");
  for (const auto& [key, value] : header.GetAttributes()) {
    if (!IsStandardKey(key)) {
      UseName("AdditionalData");
      UseName("Value");
      CheckText("a header key", key);
    } else if (!value.empty()) {
      UseName(key);
    }
    CheckText("the header value " + Quoted(key), value);
  }
}

const Conditions* DocumentChecker::CheckConditions(const SampleAttribute& attribute) {
  const Conditions* const block = attribute.GetConditions().Get();
  if (block == nullptr) {
    Add("the attribute has no conditions");
  } else if (blocks_.insert(block).second) {
    CheckBlock(*block);
  }
  return block;
}

void DocumentChecker::CheckBlock(const Conditions& block) {
  UseName("Conditions");
  UseName("ID");
  for (const auto& [key, value] : block.GetAttributes()) {
    UseName("Attribute");
    CheckText("a key of the conditions", key);
    CheckText("the condition " + Quoted(key), value);
  }
  if (block.HasCustomIllumination()) {
    UseName("Spectrum");
    UseName("Value");
    CheckIllumination(block);
  }
}

void DocumentChecker::CheckIllumination(const Conditions& block) {
  const std::vector<float>& curve = block.GetCustomIllumination().GetData();
  if (curve.size() != kIlluminationPoints) {
    Add("the illumination of the conditions has " + Counted(curve.size(), "value") +
        " instead of " + std::to_string(kIlluminationPoints));
  }
  CheckNumbers("value of the illumination", curve);
  if (!curve.empty()) {
    CheckSteps(" of the illumination", block, curve.size());
  }
}

void DocumentChecker::CheckRange(const Conditions& conditions) {
  try {
    const WavelengthSteps steps(conditions, 1);
    const std::string first = conditions.GetAttribute(ConditionKeys::kWavelengthMin, "380");
    if (!IsInNanometres(first)) {
      Add("the first wavelength, " + Quoted(first) + ", would be written as " +
          std::to_string(steps.first));
    }
  } catch (const std::invalid_argument&) {
    // told with the steps
  }
}

void DocumentChecker::CheckSteps(const std::string& whose, const Conditions& conditions,
                                 std::size_t points) {
  const std::string values = Counted(points, "value") + whose + " from " +
                             Quoted(conditions.GetAttribute(ConditionKeys::kWavelengthMin, "380")) +
                             " to " +
                             Quoted(conditions.GetAttribute(ConditionKeys::kWavelengthMax, "730"));
  try {
    const WavelengthSteps steps(conditions, points);
    if (points > 1 && steps.step <= 0) {
      Add(values + " would get equal or falling wavelengths: the step is in whole nm");
    } else if (steps.first < 0) {
      Add(values + " would come back at other wavelengths: they are written without a sign");
    }
  } catch (const std::invalid_argument&) {
    Add(values + ", which are no whole wavelengths");
  }
}

void DocumentChecker::CheckTree(const DataTree& tree, unsigned int depth) {
  if (depth > kDeepestTree) {
    return Add("the content nests deeper than the " + std::to_string(kDeepestTree) +
               " levels that are read");
  }
  CheckTreeName("element", tree.GetName());
  UseName(tree.GetName());
  CheckText("element " + Quoted(tree.GetName()), tree.GetValue());
  if (tree.GetValue().starts_with('\n')) {
    Add("the text of element " + Quoted(tree.GetName()) +
        " begins with a line feed and would be taken for indentation");
  }
  CheckTreeAttributes(tree, depth);
  for (const auto& child : tree.GetChildren()) {
    CheckTree(*child, depth + 1);
  }
}

void DocumentChecker::CheckTreeName(const std::string& what, const std::string& name) {
  bool is_name = false;
  try {
    const XMLCh* const text = text_.Set(name);
    is_name = xercesc::XMLChar1_0::isValidName(text);
  } catch (const VexException&) {
    // nor is it text
  }
  if (!is_name) {
    Add(Quoted(name) + " is no name of an " + what + " in XML");
  }
}

// Of the attributes of an element the first by name is read.  The one of the root that holds its
// link is written anew.
void DocumentChecker::CheckTreeAttributes(const DataTree& tree, unsigned int depth) {
  const bool is_root = depth == 1;
  std::set<std::string> written;
  if (is_root) {
    written.insert(kLinkName);
  }
  for (const auto& [name, value] : tree.GetAttributes()) {
    written.insert(name);
    CheckTreeName("attribute", name);
    if (!is_root || name != kLinkName) {
      CheckText("attribute " + Quoted(name), value);
    }
  }
  for (const std::string& name : written) {
    if (name != *written.begin() && !(is_root && name == kLinkName)) {
      Add("of the attributes of element " + Quoted(tree.GetName()) + " " + Quoted(name) +
          " would be lost: only " + Quoted(*written.begin()) + " is read");
    }
  }
}

// The header of an unknown attribute is not written: its content holds it.
void DocumentChecker::CheckTreeHeader(const Header& header, const DataTree& tree) {
  const auto in_tree = HeaderInTree(tree);
  for (const auto& [key, value] : header.GetAttributes()) {
    const auto found = in_tree.find(key);
    const bool is_lost = found == in_tree.end()
                             ? !IsDate(key) && !(value.empty() && IsStandardKey(key))
                             : found->second && *found->second != value;
    if (is_lost) {
      Add("the header value " + Quoted(key) +
          " is not what the content says, which alone is "
          "written");
    }
  }
  for (const auto& [key, value] : in_tree) {
    if (value && !header.GetAttributes().contains(key) && !(value->empty() && IsStandardKey(key))) {
      Add("the header value " + Quoted(key) + " was removed, but stands in the content");
    }
  }
}

void DocumentChecker::CheckText(const std::string& what, const std::string& text) {
  try {
    text_.Set(text);
  } catch (const VexException&) {
    Add(what + ": XML cannot carry the text " + Quoted(text));
  }
}

void DocumentChecker::CheckNumber(const std::string& what, float value) {
  if (!std::isfinite(value)) {
    Add(what + " is " + NumberText(value) + ", which is read as 0");
  }
}

void DocumentChecker::CheckNumbers(const std::string& what, const std::vector<float>& values) {
  const auto is_bad = [](float value) {
    return !std::isfinite(value);
  };
  const auto first = std::find_if(values.begin(), values.end(), is_bad);
  if (first == values.end()) {
    return;
  }
  CheckNumber(what + " " + std::to_string(first - values.begin() + 1), *first);
  const auto count = std::count_if(first, values.end(), is_bad);
  if (count > 1) {
    faults_.back().reason += ", and so are " + std::to_string(count - 1) + " more";
  }
}

void DocumentChecker::UseName(std::string_view name) {
  if (names_.size() > DocumentParser::kMostElementNames || names_.contains(name)) {
    return;
  }
  names_.emplace(name);
  if (names_.size() > DocumentParser::kMostElementNames) {
    Add("the document has more than the " + std::to_string(DocumentParser::kMostElementNames) +
        " different names of elements that are read");
  }
}

void DocumentChecker::Add(const std::string& reason) {
  faults_.push_back(place_);
  faults_.back().reason = reason;
}

}  // namespace Aldermoor::Vexdoc::Internals
