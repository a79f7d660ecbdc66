#include "aldermoor/vexdoc/internals/binarydumper.h"

#include <algorithm>
#include <bit>
#include <limits>
#include <ostream>
#include <stdexcept>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/elementtyper.h"
#include "aldermoor/vexdoc/internals/binaryformat.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

namespace Aldermoor::Vexdoc::Internals {

BinaryDumper::BinaryDumper(std::ostream& out) : out_(out) {}

void BinaryDumper::VisitVex(VEX& vex) try {
  Write(static_cast<unsigned long>(BinaryFormat::kVersion));
  Write(std::string(BinaryFormat::kMagic));
  DumpVexNode(vex, -1);
  DumpConditions();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitVex)

void BinaryDumper::VisitSampleSet(SampleSet& set) try { DumpVexNode(set, -1); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitSampleSet)

void BinaryDumper::VisitSample(Sample& sample) try {
  const auto& attributes = sample.GetElements();
  DumpVexNode(sample, std::count_if(attributes.begin(), attributes.end(),
                                    [](const auto& entry) { return !entry.second->IsDerived(); }));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitSample)

void BinaryDumper::VisitSpectrum(Spectrum& spectrum) try { DumpSampleAttribute(spectrum); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitSpectrum)

void BinaryDumper::VisitColorVector(ColorVector& vector) try { DumpSampleAttribute(vector); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitColorVector)

void BinaryDumper::VisitRecipe(Recipe& recipe) try { DumpSampleAttribute(recipe); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitRecipe)

void BinaryDumper::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  DumpSampleAttribute(attribute);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryDumper::VisitUnknownSampleAttribute)

template <class Node>
void BinaryDumper::DumpVexNode(Node& node, long count) {
  DumpHeader(node);
  Write(count == -1 ? node.GetElements().size() : static_cast<unsigned long>(count));
  for (const auto& entry : node.GetElements()) {
    entry.second->AcceptVisitor(*this);
  }
}

template <class Attribute>
void BinaryDumper::DumpSampleAttribute(Attribute& attribute) {
  if (attribute.IsDerived()) {
    return;
  }
  DumpHeader(attribute);
  Write(conditions_.GetId(*attribute.GetConditions()));
  DumpMembers(attribute);
}

void BinaryDumper::DumpHeader(Header& header) {
  ElementTyper typer;
  header.AcceptVisitor(typer);
  Write(typer.GetElementName());
  Write(header.GetAttributes());
}

void BinaryDumper::DumpMembers(const Spectrum& spectrum) {
  Write(spectrum.GetData());
}

void BinaryDumper::DumpMembers(const ColorVector& vector) {
  Write(vector.GetDatastore().size());
  for (const auto& [label, value] : vector.GetDatastore()) {
    Write(label);
    Write(value);
  }
}

void BinaryDumper::DumpMembers(const Recipe& recipe) {
  Write(recipe.GetAssortmentName());
  Write(recipe.GetThickness());
  Write(recipe.GetSubstrateLinkName());
  Write(recipe.GetComponents().size());
  for (const auto& [name, concentration] : recipe.GetComponents()) {
    Write(name);
    Write(concentration);
  }
}

void BinaryDumper::DumpMembers(const UnknownSampleAttribute& attribute) {
  DumpDataTree(*attribute.GetData());
}

// Recursion is bounded by the depth that the loaders let through.
void BinaryDumper::DumpDataTree(const DataTree& tree) {
  Write(tree.GetName());
  Write(tree.GetValue());
  Write(tree.GetAttributes());
  Write(tree.GetChildren().size());
  for (const auto& child : tree.GetChildren()) {
    DumpDataTree(*child);
  }
}

void BinaryDumper::DumpConditions() {
  Write(conditions_.GetBlocks().size());
  for (const auto& [id, block] : conditions_.GetBlocks()) {
    Write(id);
    Write(block->GetAttributes());
    Write(block->HasCustomIllumination() ? 1UL : 0UL);
    if (block->HasCustomIllumination()) {
      Write(block->GetCustomIllumination().GetData());
    }
  }
}

void BinaryDumper::Write(const std::string& text) {
  Write(text.size());
  Put(text.data(), text.size());
}

void BinaryDumper::Write(unsigned long number) {
  if (number > std::numeric_limits<std::uint32_t>::max()) {
    throw std::length_error("a cache holds no text and no list of more than 4294967295");
  }
  const BinaryFormat::Bytes bytes =
      BinaryFormat::ToLittleEndian(static_cast<std::uint32_t>(number));
  Put(bytes.data(), bytes.size());
}

void BinaryDumper::Write(float value) {
  const BinaryFormat::Bytes bytes =
      BinaryFormat::ToLittleEndian(std::bit_cast<std::uint32_t>(value));
  Put(bytes.data(), bytes.size());
}

void BinaryDumper::Write(const std::map<std::string, std::string>& map) {
  Write(map.size());
  for (const auto& [key, value] : map) {
    Write(key);
    Write(value);
  }
}

void BinaryDumper::Write(const std::vector<float>& values) {
  Write(values.size());
  for (const float value : values) {
    Write(value);
  }
}

// Straight to the buffer: a formatted stream would look after its state for every four bytes.
void BinaryDumper::Put(const char* bytes, std::size_t count) {
  const auto size = static_cast<std::streamsize>(count);
  if (out_.rdbuf()->sputn(bytes, size) != size) {
    out_.setstate(std::ios_base::badbit);
  }
}

}  // namespace Aldermoor::Vexdoc::Internals
