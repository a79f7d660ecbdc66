#include "tests/vexdoc/internals/documentcontent.h"

#include <sstream>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

class Content {
 public:
  std::string Of(const VEX& document) {
    Add(document);
    for (const auto& set : document.GetElements()) {
      out_ << "\nset";
      Add(*set.second);
      for (const auto& sample : set.second->GetElements()) {
        out_ << "\n sample";
        Add(*sample.second);
        for (const auto& attribute : sample.second->GetElements()) {
          AddAttribute(*attribute.second);
        }
      }
    }
    return out_.str();
  }

 private:
  // The empty value of a standard key is the same as none.
  void Add(const Header& header) {
    for (const auto& [key, value] : header.GetAttributes()) {
      const bool is_name = key == "Name" || key == "Description" || key == "Creator";
      if (key != Header::kCreatedKey && key != Header::kModifiedKey &&
          !(is_name && value.empty())) {
        Add(key);
        Add(value);
      }
    }
  }

  // With its length, so that no two contents give one text.
  void Add(const std::string& text) { out_ << ' ' << text.size() << ':' << text; }

  void Add(const Conditions& conditions) {
    out_ << "\n   under";
    for (const auto& [key, value] : conditions.GetAttributes()) {
      Add(key);
      Add(value);
    }
    if (conditions.HasCustomIllumination()) {
      out_ << " curve";
      Add(conditions.GetCustomIllumination().GetData());
    }
  }

  void Add(const std::vector<float>& values) {
    for (const float value : values) {
      out_ << ' ' << value;
    }
  }

  template <class Pairs>
  void AddPairs(const Pairs& pairs) {
    for (const auto& [name, value] : pairs) {
      Add(name);
      out_ << ' ' << value;
    }
  }

  void Add(const DataTree& tree, bool is_root) {
    Add(tree.GetName());
    Add(tree.GetValue());
    for (const auto& [name, value] : tree.GetAttributes()) {
      if (!is_root || name != "Conditions") {
        out_ << " @";
        Add(name);
        Add(value);
      }
    }
    out_ << " (";
    for (const auto& child : tree.GetChildren()) {
      Add(*child, false);
    }
    out_ << ")";
  }

  void AddAttribute(const SampleAttribute& attribute) {
    const auto* const unknown = dynamic_cast<const UnknownSampleAttribute*>(&attribute);
    if (attribute.IsDerived() && unknown == nullptr) {
      return;
    }
    out_ << "\n  " << attribute.GetType();
    Add(attribute);
    if (const auto* const spectrum = dynamic_cast<const Spectrum*>(&attribute)) {
      Add(spectrum->GetData());
    } else if (const auto* const color = dynamic_cast<const ColorVector*>(&attribute)) {
      AddPairs(color->GetDatastore());
    } else if (const auto* const recipe = dynamic_cast<const Recipe*>(&attribute)) {
      Add(recipe->GetAssortmentName());
      Add(recipe->GetSubstrateLinkName());
      out_ << ' ' << recipe->GetThickness();
      AddPairs(recipe->GetComponents());
    } else if (unknown != nullptr) {
      Add(*unknown->GetData(), true);
    }
    Add(*attribute.GetConditions());
  }

  std::ostringstream out_;
};

}  // namespace

std::string ContentOf(const VEX& document) {
  return Content().Of(document);
}

}  // namespace Aldermoor::Vexdoc::Testing
