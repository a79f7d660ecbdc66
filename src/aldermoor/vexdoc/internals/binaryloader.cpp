#include "aldermoor/vexdoc/internals/binaryloader.h"

#include <algorithm>
#include <bit>
#include <istream>
#include <type_traits>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/internals/binaryformat.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/customillumination.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/internals/elementfactory.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::DynamicCast;
using Utilities::Tools::SmartPointer;

namespace {

[[noreturn]] void FailAtEnd(const char* message) {
  throw ResourceNotAvailableException(message,
                                      ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryLoader));
}

std::uint32_t NumberAt(const char* bytes) {
  BinaryFormat::Bytes number;
  std::copy_n(bytes, number.size(), number.begin());
  return BinaryFormat::FromLittleEndian(number);
}

std::string ReadRest(std::istream& in) {
  std::streambuf& buffer = *in.rdbuf();
  const std::streamoff here = buffer.pubseekoff(0, std::ios_base::cur, std::ios_base::in);
  const std::streamoff end = buffer.pubseekoff(0, std::ios_base::end, std::ios_base::in);
  if (in.eof() || here < 0 || end < here || buffer.pubseekpos(here, std::ios_base::in) < 0) {
    return "";
  }
  std::string bytes(static_cast<std::size_t>(end - here), '\0');
  bytes.resize(static_cast<std::size_t>(buffer.sgetn(bytes.data(), end - here)));
  return bytes;
}

}  // namespace

BinaryLoader::BinaryLoader(std::istream& in) : owned_(ReadRest(in)), bytes_left_(owned_) {}

BinaryLoader::BinaryLoader(std::string_view bytes, const LoadRules& rules)
    : rules_(rules), bytes_left_(bytes) {}

BinaryLoader::~BinaryLoader() = default;

SmartPointer<VEX> BinaryLoader::Load() try {
  if (ReadNumber() != BinaryFormat::kVersion) {
    throw VexException("Version conflict",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryLoader::Load));
  }
  condition_links_.clear();
  pending_colors_.clear();
  ReadString();  // the magic, which decides nothing
  ReadString();  // the name of the root
  SmartPointer<VEX> vex(new VEX);
  vex->AcceptVisitor(*this);
  LoadConditions();
  RelinkConditions(*vex);
  return vex;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::Load)

void BinaryLoader::VisitVex(VEX& vex) try { LoadVexNode(vex); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitVex)

void BinaryLoader::VisitSampleSet(SampleSet& set) try { LoadVexNode(set); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitSampleSet)

void BinaryLoader::VisitSample(Sample& sample) try { LoadVexNode(sample); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitSample)

void BinaryLoader::VisitSpectrum(Spectrum& spectrum) try { LoadSampleAttribute(spectrum); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitSpectrum)

void BinaryLoader::VisitColorVector(ColorVector& vector) try { LoadSampleAttribute(vector); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitColorVector)

void BinaryLoader::VisitRecipe(Recipe& recipe) try { LoadSampleAttribute(recipe); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitRecipe)

void BinaryLoader::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  LoadSampleAttribute(attribute);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::VisitUnknownSampleAttribute)

template <class Node>
void BinaryLoader::LoadVexNode(Node& node) {
  using Child = std::remove_reference_t<decltype(*std::declval<typename Node::Pointer>())>;
  LoadHeader(node);
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    const SmartPointer<Child> child =
        DynamicCast<Child>(ElementFactory::GetInstance().CreateElement(ReadString()));
    child->AcceptVisitor(*this);  // fails for a level that does not belong here
    // Not an insertion: equal names of a file stay, and so does its "Modified".
    DocumentAccess::Append(node, child);
  }
}

template <class Attribute>
void BinaryLoader::LoadSampleAttribute(Attribute& attribute) {
  LoadHeader(attribute);
  // A placeholder that bears the ID of the file.  Each attribute has one of its own: a pointer that
  // very many share would be held for ever.
  attribute.SetConditions(SmartPointer<Conditions>(new Conditions(ReadString())));
  LoadMembers(attribute);
}

void BinaryLoader::LoadHeader(Header& header) try {
  if (!rules_.gives_dates) {
    DocumentAccess::ClearAttributes(header);  // the constructor has put in the present
  }
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    const std::string key = ReadString();
    header.SetAttribute(key, ReadString());
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::LoadHeader)

void BinaryLoader::LoadMembers(Spectrum& spectrum) {
  LoadVector(DocumentAccess::Data(spectrum));
}

void BinaryLoader::LoadVector(std::vector<float>& target) {
  const std::uint64_t count = ReadNumber();
  if (count * sizeof(BinaryFormat::Bytes) > bytes_left_.size()) {
    FailAtEnd("EOF while reading float");
  }
  target.resize(count);
  for (float& value : target) {
    value = ReadFloat();
  }
}

void BinaryLoader::LoadMembers(ColorVector& vector) {
  Channels channels;
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    std::string label = ReadString();
    channels.emplace_back(std::move(label), ReadFloat());
  }
  pending_colors_.emplace_back(&vector, std::move(channels));
}

void BinaryLoader::LoadMembers(Recipe& recipe) {
  recipe.SetAssortmentName(ReadString());
  recipe.SetThickness(ReadFloat());
  recipe.SetSubstrateLinkName(ReadString());
  Recipe::Components components;
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    std::string name = ReadString();
    components.emplace_back(std::move(name), ReadFloat());
  }
  recipe.SetComponents(components);
}

void BinaryLoader::LoadMembers(UnknownSampleAttribute& attribute) {
  const SmartPointer<DataTree> tree(new DataTree);
  LoadDataTree(*tree);
  DocumentAccess::ReplaceContent(attribute, UnknownSampleAttribute(tree));
}

void BinaryLoader::LoadDataTree(DataTree& tree) try {
  if (++tree_depth_ > BinaryFormat::kDeepestTree) {
    throw VexException(
        "Data trees nest deeper than " + std::to_string(BinaryFormat::kDeepestTree) + " levels",
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryLoader::LoadDataTree));
  }
  tree.SetName(ReadString());
  tree.SetValue(ReadString());
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    const std::string name = ReadString();
    tree.SetAttribute(name, ReadString());
  }
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    const SmartPointer<DataTree> child(new DataTree);
    LoadDataTree(*child);
    tree.AdoptChild(child);
  }
  --tree_depth_;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::LoadDataTree)

void BinaryLoader::LoadConditions() try {
  for (std::uint32_t count = ReadNumber(); count > 0; --count) {
    const std::string id = ReadString();
    Conditions conditions;
    for (std::uint32_t attributes = ReadNumber(); attributes > 0; --attributes) {
      const std::string key = ReadString();
      conditions.AddAttribute(key, ReadString());
    }
    if (ReadNumber() != 0) {
      LoadCustomIllumination(conditions);
    }
    condition_links_[id] =
        ConditionManager::GetInstance().GetOrCreateConditions(std::move(conditions));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::LoadConditions)

void BinaryLoader::LoadCustomIllumination(Conditions& conditions) {
  std::vector<float> data;
  LoadVector(data);
  conditions.SetCustomIllumination(Spectrum(CustomIlluminationConditions(), data));
}

void BinaryLoader::RelinkConditions(VEX& vex) try {
  for (const auto& set : vex.GetElements()) {
    for (const auto& sample : set.second->GetElements()) {
      for (const auto& attribute : sample.second->GetElements()) {
        const std::string id = attribute.second->GetConditions()->GetID();
        const auto link = condition_links_.find(id);
        if (link == condition_links_.end()) {
          throw ResourceNotAvailableException(
              Filled("Condition(ID=<%NAME%>) not found", "%NAME%", id),
              ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryLoader::RelinkConditions));
        }
        attribute.second->SetConditions(link->second);
      }
    }
  }
  for (auto& [vector, channels] : pending_colors_) {
    DocumentAccess::ReplaceContent(*vector, ColorVector(*vector->GetConditions(), channels));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryLoader::RelinkConditions)

std::uint32_t BinaryLoader::ReadNumber() {
  const char* const bytes = Take(BinaryFormat::kNumberSize);
  if (bytes == nullptr) {
    FailAtEnd("EOF while reading number");
  }
  return NumberAt(bytes);
}

std::string BinaryLoader::ReadString() {
  const char* const length = Take(BinaryFormat::kNumberSize);
  if (length == nullptr) {
    FailAtEnd("EOF while reading string");
  }
  const std::size_t count = NumberAt(length);
  const char* const text = Take(count);
  if (text == nullptr) {
    FailAtEnd("EOF while reading string");
  }
  return {text, count};
}

float BinaryLoader::ReadFloat() {
  const char* const bytes = Take(BinaryFormat::kNumberSize);
  if (bytes == nullptr) {
    FailAtEnd("EOF while reading float");
  }
  return std::bit_cast<float>(NumberAt(bytes));
}

const char* BinaryLoader::Take(std::size_t count) {
  if (count > bytes_left_.size()) {
    bytes_left_ = {};  // nothing behind the end of the file
    return nullptr;
  }
  const char* const bytes = bytes_left_.data();
  bytes_left_.remove_prefix(count);
  return bytes;
}

}  // namespace Aldermoor::Vexdoc::Internals
