#include "aldermoor/vexdoc/internals/cachewalker.h"

#include <algorithm>
#include <utility>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/header.h"
#include "aldermoor/vexdoc/internals/attributerules.h"
#include "aldermoor/vexdoc/internals/binaryformat.h"
#include "aldermoor/vexdoc/internals/faulttext.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

using Kind = CacheField::Kind;

// The least that a record takes, in bytes: its numbers, with all texts and lists empty.
using BinaryFormat::kNumberSize;
constexpr std::size_t kEntrySize = 2 * kNumberSize;
constexpr std::size_t kNodeSize = 3 * kNumberSize;
constexpr std::size_t kAttributeSize = 4 * kNumberSize;
constexpr std::size_t kTreeSize = 4 * kNumberSize;
constexpr std::size_t kBlockSize = 3 * kNumberSize;

// Where a walk ends ahead of the end of the file.
struct End {
  Fault fault;
};

// One step deeper for the time of the scope.
class Deeper {
 public:
  explicit Deeper(unsigned int& depth) : depth_(depth) { ++depth_; }
  Deeper(const Deeper&) = delete;
  Deeper& operator=(const Deeper&) = delete;
  ~Deeper() { --depth_; }

 private:
  unsigned int& depth_;
};

}  // namespace

std::vector<Fault> CacheWalker::Walk(const Visit& visit) try {
  visit_ = &visit;
  try {
    WalkFile();
  } catch (const End& end) {
    end_ = end.fault;
    faults_.Add(end.fault);
  }
  return faults_.Take();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::CacheWalker::Walk)

void CacheWalker::WalkFile() {
  const std::uint32_t version = Number("version");
  if (version != BinaryFormat::kVersion) {
    Stop(0, "version " + std::to_string(version) + " of the format instead of " +
                std::to_string(BinaryFormat::kVersion));
  }
  std::size_t offset = at_;
  if (Text("magic") != BinaryFormat::kMagic) {
    Warn(offset, "the magic text is another one");
  }
  offset = at_;
  if (const std::string_view name = Text("element"); name != "VEX") {
    Warn(offset, "the root is " + Quoted(name) + " instead of 'VEX'");
  }
  WalkNode(Level::kVex);
  WalkTable();
  CheckAttributes();
  if (const std::size_t left = BytesLeft(); left > 0) {
    Warn(at_, Counted(left, "byte") + " behind the table of conditions");
    Field(Kind::kBytes, "behind the end", left);
  }
}

std::string_view CacheWalker::WalkNode(Level level) {
  const Deeper deeper(depth_);
  std::string_view name;
  Map("header value", [&name](std::string_view key, std::string_view value) {
    if (key == Header::kNameKey) {
      name = value;
    }
  });
  const std::size_t count = level == Level::kVex         ? Count("sample set", kNodeSize)
                            : level == Level::kSampleSet ? Count("sample", kNodeSize)
                                                         : Count("attribute", kAttributeSize);
  const Deeper children(depth_);
  std::set<std::string_view> names;
  for (std::size_t i = 0; i < count; ++i) {
    WalkChild(level, names);
  }
  return name;
}

void CacheWalker::WalkChild(Level level, std::set<std::string_view>& names) {
  const std::size_t offset = at_;
  const std::string_view element = Text("element");
  const std::string kind = ElementKind(std::string(element));
  if (level == Level::kSample) {
    if (IsLevel(kind)) {
      Stop(offset, Quoted(element) + " cannot stand among the attributes of a sample");
    }
    if (kind.empty() && !element.empty()) {
      Warn(offset, Quoted(element) + " is read as an unknown attribute, whose name is empty");
    }
    return WalkAttribute(offset, kind);
  }
  const bool is_set = level == Level::kVex;
  if (kind != (is_set ? "SampleSet" : "Sample")) {
    Stop(offset, Quoted(element) + (is_set ? " instead of 'SampleSet'" : " instead of 'Sample'"));
  }
  const std::string_view name = WalkNode(is_set ? Level::kSampleSet : Level::kSample);
  if (!names.insert(name).second) {
    Warn(offset, std::string("there is a ") + (is_set ? "sample set " : "sample ") + Quoted(name) +
                     " already; only the first one is found by that name");
  }
}

void CacheWalker::WalkAttribute(std::size_t offset, const std::string& kind) {
  const Deeper deeper(depth_);
  Map("header value", [](std::string_view, std::string_view) {});
  Attribute attribute{Attribute::Kind::kOther, offset, 0, Text("conditions")};
  if (kind == "Spectrum") {
    attribute.kind = Attribute::Kind::kSpectrum;
    attribute.count = FloatVector();
  } else if (kind == "ColorVector") {
    attribute.kind = Attribute::Kind::kColor;
    attribute.count = Pairs("channel", "label", &attribute.labels);
  } else if (kind == "Recipe") {
    WalkRecipe();
  } else {
    WalkDataTree(1);
  }
  attributes_.push_back(std::move(attribute));
}

void CacheWalker::WalkRecipe() {
  Text("assortment");
  Float("thickness");
  Text("substrate");
  Pairs("component", "name");
}

void CacheWalker::WalkDataTree(unsigned int tree_depth) {
  if (tree_depth > BinaryFormat::kDeepestTree) {
    Stop(at_,
         "data trees nest deeper than " + std::to_string(BinaryFormat::kDeepestTree) + " levels");
  }
  Text("item");
  Text("value");
  Map("item attribute", [](std::string_view, std::string_view) {});
  const std::size_t count = Count("child item", kTreeSize);
  const Deeper deeper(depth_);
  for (std::size_t i = 0; i < count; ++i) {
    WalkDataTree(tree_depth + 1);
  }
}

void CacheWalker::WalkTable() {
  const std::size_t count = Count("condition block", kBlockSize);
  for (std::size_t i = 0; i < count; ++i) {
    WalkBlock();
  }
}

void CacheWalker::WalkBlock() {
  const Deeper deeper(depth_);
  const std::size_t offset = at_;
  const std::string_view id = Text("ID");
  const Deeper content(depth_);
  Block block;
  block.offset = offset;
  Map("condition", [&block](std::string_view key, std::string_view value) {
    block.conditions.AddAttribute(std::string(key), std::string(value));
  });
  const std::size_t flag_offset = at_;
  const std::uint32_t flag = Number("illumination");
  if (flag > 1) {
    Warn(flag_offset, "the sign of an illumination is " + std::to_string(flag) + " instead of 1");
  }
  if (flag != 0) {
    const std::size_t vector_offset = at_;
    if (const std::size_t points = FloatVector(); points != kIlluminationPoints) {
      Warn(vector_offset, "the illumination has " + Counted(points, "point") + " instead of " +
                              std::to_string(kIlluminationPoints));
    }
  }
  if (blocks_.contains(id)) {
    Warn(offset, "conditions " + Quoted(id) + " are declared again; the last ones count");
  }
  blocks_.insert_or_assign(id, std::move(block));
}

void CacheWalker::CheckAttributes() {
  for (const Attribute& attribute : attributes_) {
    const auto found = blocks_.find(attribute.id);
    if (found == blocks_.end()) {
      Error(attribute.offset,
            "links to conditions " + Quoted(attribute.id) + ", which the table does not declare");
      continue;
    }
    Block& block = found->second;
    block.is_used = true;
    if (attribute.kind == Attribute::Kind::kSpectrum) {
      CheckSpectrum(attribute, block);
    } else if (attribute.kind == Attribute::Kind::kColor) {
      CheckColor(attribute, block);
    }
  }
  for (const auto& [id, block] : blocks_) {
    if (!block.is_used) {
      Warn(block.offset, "no attribute links to the conditions " + Quoted(id));
    }
  }
}

// The reader takes a spectrum as it is, whatever its conditions say.
void CacheWalker::CheckSpectrum(const Attribute& spectrum, Block& block) {
  const auto expected = ExpectedPoints(block.conditions);
  if (!expected) {
    Warn(spectrum.offset, "the number of points in its conditions is no number");
  } else if (*expected != spectrum.count) {
    Warn(spectrum.offset, Counted(spectrum.count, "point") + " instead of the " +
                              std::to_string(*expected) + " of its conditions");
  }
  if (!std::exchange(block.is_told, true)) {
    for (const std::string& fault : SpectrumFaults(block.conditions)) {
      Warn(block.offset, fault);
    }
  }
}

void CacheWalker::CheckColor(const Attribute& color, const Block& block) {
  const auto faults = ColorFaults(block.conditions, color.count);
  for (const std::string& fault : faults) {
    Error(color.offset, fault);
  }
  if (const std::string fault = LabelFault(block.conditions, color.labels);
      faults.empty() && !fault.empty()) {
    Warn(color.offset, fault);
  }
}

std::uint32_t CacheWalker::Number(const char* label, CacheField::Kind kind) {
  if (BytesLeft() < kNumberSize) {
    Stop(at_, std::string("the file ends inside a number: ") + label);
  }
  BinaryFormat::Bytes bytes;
  std::copy_n(bytes_.data() + at_, bytes.size(), bytes.begin());
  Field(kind, label, bytes.size());
  return BinaryFormat::FromLittleEndian(bytes);
}

std::size_t CacheWalker::Count(const char* noun, std::size_t size) {
  const std::size_t offset = at_;
  const std::size_t count = Number(noun, Kind::kCount);
  if (count > BytesLeft() / size) {
    Stop(offset, Counted(count, noun) + " cannot be in the " + Counted(BytesLeft(), "byte") +
                     " that follow");
  }
  return count;
}

std::string_view CacheWalker::Text(const char* label) {
  if (BytesLeft() < kNumberSize) {
    Stop(at_, std::string("the file ends inside the length of a text: ") + label);
  }
  BinaryFormat::Bytes bytes;
  std::copy_n(bytes_.data() + at_, bytes.size(), bytes.begin());
  const std::size_t length = BinaryFormat::FromLittleEndian(bytes);
  if (length > BytesLeft() - kNumberSize) {
    Stop(at_, "a text of " + Counted(length, "byte") + " cannot be in the " +
                  Counted(BytesLeft() - kNumberSize, "byte") + " that follow: " + label);
  }
  const std::string_view text = bytes_.substr(at_ + kNumberSize, length);
  Field(Kind::kText, label, kNumberSize + length);
  return text;
}

void CacheWalker::Float(const char* label) {
  if (BytesLeft() < kNumberSize) {
    Stop(at_, std::string("the file ends inside a float: ") + label);
  }
  Field(Kind::kFloats, label, kNumberSize);
}

std::size_t CacheWalker::FloatVector() {
  const std::size_t count = Count("value", kNumberSize);
  if (count > 0) {
    const Deeper deeper(depth_);
    Field(Kind::kFloats, "values", count * kNumberSize);
  }
  return count;
}

std::size_t CacheWalker::Pairs(const char* noun, const char* label,
                               std::vector<std::string>* texts) {
  const std::size_t count = Count(noun, kEntrySize);
  const Deeper deeper(depth_);
  for (std::size_t i = 0; i < count; ++i) {
    const std::string_view text = Text(label);
    if (texts != nullptr) {
      texts->emplace_back(text);
    }
    Float("value");
  }
  return count;
}

template <class Entry>
void CacheWalker::Map(const char* noun, Entry entry) {
  const std::size_t count = Count(noun, kEntrySize);
  const Deeper deeper(depth_);
  std::string_view last;
  bool is_ordered = true;
  for (std::size_t i = 0; i < count; ++i) {
    const std::size_t offset = at_;
    const std::string_view key = Text("key");
    entry(key, Text("value"));
    // Writers hold keys in ascending order, so that equal ones stand side by side.
    if (i > 0 && key == last) {
      Warn(offset, "the key " + Quoted(key) + " is given again; the last one counts");
    } else if (i > 0 && key < last && std::exchange(is_ordered, false)) {
      Warn(offset, "the key " + Quoted(key) + " is out of order");
    }
    last = key;
  }
}

void CacheWalker::Field(CacheField::Kind kind, const char* label, std::size_t size) {
  if (*visit_) {
    (*visit_)({kind, label, at_, size, depth_});
  }
  at_ += size;
}

void CacheWalker::Add(Fault::Severity severity, std::size_t offset, const std::string& text) {
  faults_.Add({severity, text, 0, 0, offset});
}

void CacheWalker::Error(std::size_t offset, const std::string& text) {
  Add(Fault::Severity::kError, offset, text);
}

void CacheWalker::Warn(std::size_t offset, const std::string& text) {
  Add(Fault::Severity::kWarning, offset, text);
}

void CacheWalker::Stop(std::size_t offset, const std::string& text) const {
  throw End{{Fault::Severity::kError, text, 0, 0, offset}};
}

}  // namespace Aldermoor::Vexdoc::Internals
