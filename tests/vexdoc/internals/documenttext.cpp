#include "tests/vexdoc/internals/documenttext.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <vector>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

std::string Quoted(std::string text) {
  std::replace(text.begin(), text.end(), '\n', '|');
  return "'" + text + "'";
}

std::string Number(float value) {
  std::array<char, 32> buffer{};
  return {buffer.data(), std::to_chars(buffer.data(), buffer.data() + buffer.size(), value).ptr};
}

std::string Pair(const std::string& name, const std::string& value) {
  return Quoted(name) + "=" + value;
}

std::string Numbers(const std::vector<float>& values) {
  std::string text;
  for (const float value : values) {
    text += (text.empty() ? "" : " ") + Number(value);
  }
  return "[" + text + "]";
}

class Writer : public ElementVisitor {
 public:
  std::string Text() const { return text_ + BlockLines(); }

  void VisitVex(VEX& vex) override { Node("VEX", vex, 0); }
  void VisitSampleSet(SampleSet& set) override { Node("VEXSampleSet", set, 1); }
  void VisitSample(Sample& sample) override { Node("VEXSample", sample, 2); }

  void VisitSpectrum(Spectrum& spectrum) override {
    Attribute(spectrum);
    text_ += " " + Numbers(spectrum.GetData()) + "\n";
  }
  void VisitColorVector(ColorVector& vector) override {
    Attribute(vector);
    for (const auto& [name, value] : vector.GetDatastore()) {
      text_ += " " + Pair(name, Number(value));
    }
    text_ += "\n";
  }
  void VisitRecipe(Recipe& recipe) override {
    Attribute(recipe);
    std::string components;
    for (const auto& [name, amount] : recipe.GetComponents()) {
      components += (components.empty() ? "" : " ") + Pair(name, Number(amount));
    }
    text_ += " [" + components + "] " + Quoted(recipe.GetAssortmentName()) + " " +
             Number(recipe.GetThickness()) + " " + Quoted(recipe.GetSubstrateLinkName()) + "\n";
  }
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override {
    Attribute(attribute);
    text_ += "\n";
    Tree(*attribute.GetData(), 4);
  }

 private:
  template <class Element>
  void Node(const std::string& type, Element& node, std::size_t depth) {
    Head(type, node, depth);
    text_ += "\n";
    for (const auto& [name, child] : node.GetElements()) {
      child->AcceptVisitor(*this);
      if (name != child->GetName()) {
        text_ += "(listed under " + Quoted(name) + ")\n";
      }
    }
  }

  void Head(const std::string& type, const Header& header, std::size_t depth) {
    text_ += std::string(depth, ' ') + type + " " + Quoted(header.GetName());
    for (const auto& [key, value] : header.GetAttributes()) {
      const bool is_stamp = key == Header::kCreatedKey || key == Header::kModifiedKey;
      if (key != Header::kNameKey && (!is_stamp || value.starts_with("file"))) {
        text_ += " " + Pair(key, Quoted(value));
      }
    }
  }

  void Attribute(const SampleAttribute& attribute) {
    Head(attribute.GetType(), attribute, 3);
    const Conditions* const block = &*attribute.GetConditions();
    auto entry = std::find(blocks_.begin(), blocks_.end(), block);
    if (entry == blocks_.end()) {
      entry = blocks_.insert(entry, block);
    }
    text_ += std::string(" block ") + Letter(static_cast<std::size_t>(entry - blocks_.begin()));
  }

  void Tree(const DataTree& tree, std::size_t depth) {
    text_ += std::string(depth, ' ') + "<" + tree.GetName();
    for (const auto& [name, value] : tree.GetAttributes()) {
      text_ += " " + Pair(name, Quoted(value));
    }
    text_ += "> " + Quoted(tree.GetValue()) + "\n";
    for (const auto& child : tree.GetChildren()) {
      Tree(*child, depth + 1);
    }
  }

  static char Letter(std::size_t index) { return static_cast<char>('A' + index); }

  std::string BlockLines() const {
    std::string text;
    for (std::size_t i = 0; i < blocks_.size(); ++i) {
      text += std::string("block ") + Letter(i);
      for (const auto& [key, value] : blocks_[i]->GetAttributes()) {
        text += " " + Pair(key, Quoted(value));
      }
      if (blocks_[i]->HasCustomIllumination()) {
        text += " lamp " + Numbers(blocks_[i]->GetCustomIllumination().GetData());
      }
      text += "\n";
    }
    return text;
  }

  std::string text_;
  std::vector<const Conditions*> blocks_;
};

}  // namespace

std::string DocumentText(const VEX& document) {
  Writer writer;
  const_cast<VEX&>(document).AcceptVisitor(writer);  // the writer only reads
  return writer.Text();
}

}  // namespace Aldermoor::Vexdoc::Testing
