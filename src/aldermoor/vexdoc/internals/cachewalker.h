#ifndef ALDERMOOR_VEXDOC_INTERNALS_CACHEWALKER_H
#define ALDERMOOR_VEXDOC_INTERNALS_CACHEWALKER_H

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/internals/faultlist.h"

namespace Aldermoor::Vexdoc::Internals {

/// A field of a cache: a number, a text with its length, or a run of floats.
struct CacheField {
  enum class Kind {
    kNumber,  ///< A number that stands for itself.
    kCount,   ///< A number of things, which `label` calls in the singular.
    kText,
    kFloats,
    kBytes,  ///< What has no meaning.
  };

  Kind kind;
  const char* label;
  std::size_t offset;
  std::size_t size;    // in bytes
  unsigned int depth;  // of nesting
};

/// Walks over the fields of a cache as BinaryLoader does, but builds nothing and goes on behind a
/// fault as far as the next field can be found.  Whatever makes the loader throw is an error here.
/// Serves one walk; takes no more memory than a fixed multiple of the bytes.
class CacheWalker {
 public:
  using Visit = std::function<void(const CacheField& field)>;

  /// `bytes` must outlive this object.
  explicit CacheWalker(std::string_view bytes) : bytes_(bytes) {}

  /// The faults by offset.  `visit` may be empty; fields come in the order of the file.
  std::vector<Fault> Walk(const Visit& visit = {});
  /// The fault that ended the walk, if one did.
  const std::optional<Fault>& GetEnd() const { return end_; }

 private:
  struct Attribute {
    enum class Kind { kSpectrum, kColor, kOther };
    Kind kind;
    std::size_t offset;
    std::size_t count;  // of points or channels
    std::string_view id;
    std::vector<std::string> labels = {};  // of channels
  };
  struct Block {
    std::size_t offset = 0;
    Conditions conditions;
    bool is_used = false;
    bool is_told = false;  // what it lacks for a spectrum
  };
  enum class Level { kVex, kSampleSet, kSample };

  void WalkFile();
  std::string_view WalkNode(Level level);  // behind the element name; returns the own name
  void WalkChild(Level level, std::set<std::string_view>& names);
  void WalkAttribute(std::size_t offset, const std::string& kind);
  void WalkRecipe();
  void WalkDataTree(unsigned int tree_depth);
  void WalkTable();
  void WalkBlock();
  void CheckAttributes();
  void CheckSpectrum(const Attribute& spectrum, Block& block);
  void CheckColor(const Attribute& color, const Block& block);

  std::uint32_t Number(const char* label, CacheField::Kind kind = CacheField::Kind::kNumber);
  // Of records that take at least `size` bytes each.
  std::size_t Count(const char* noun, std::size_t size);
  std::string_view Text(const char* label);
  void Float(const char* label);
  std::size_t FloatVector();
  // Adds the texts to `texts` unless it is null.
  std::size_t Pairs(const char* noun, const char* label, std::vector<std::string>* texts = nullptr);
  // Calls `entry(key, value)` for each entry.
  template <class Entry>
  void Map(const char* noun, Entry entry);
  void Field(CacheField::Kind kind, const char* label, std::size_t size);

  std::size_t BytesLeft() const { return bytes_.size() - at_; }
  void Add(Fault::Severity severity, std::size_t offset, const std::string& text);
  void Error(std::size_t offset, const std::string& text);
  void Warn(std::size_t offset, const std::string& text);
  [[noreturn]] void Stop(std::size_t offset, const std::string& text) const;

  std::string_view bytes_;
  std::size_t at_ = 0;
  unsigned int depth_ = 0;
  const Visit* visit_ = nullptr;
  std::vector<Attribute> attributes_;
  std::map<std::string_view, Block> blocks_;
  FaultList faults_;
  std::optional<Fault> end_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CACHEWALKER_H
