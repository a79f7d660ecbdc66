#ifndef ALDERMOOR_VEXDOC_INTERNALS_CONDITIONMANAGER_H
#define ALDERMOOR_VEXDOC_INTERNALS_CONDITIONMANAGER_H

#include <cstddef>
#include <map>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>

#include "aldermoor/utilities/patterns/singleton.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"

namespace Aldermoor::Vexdoc::Internals {

/// The owner of the condition blocks that sample attributes share.
///
/// Attributes of different documents share a block too, if their conditions are equal.  IDs count
/// up from "1" and are never given out again.  Nothing in the library removes a block by itself.
/// Shared state: this one object, for the whole process and without a lock.
class ConditionManager final : public Utilities::Patterns::Singleton<ConditionManager> {
 public:
  using Block = Utilities::Tools::SmartPointer<Conditions>;

  /// Stores a copy under the next ID, without looking for an equal block.
  virtual Block AddConditions(const Conditions& conditions);
  /// The first block in the order of the IDs' texts that equals `conditions`, else a new one.
  virtual Block GetOrCreateConditions(const Conditions& conditions);
  /// The same for what was read from a file, but the block has all of its content, a curve to which
  /// the attributes do not refer included; a new one takes it over, since it can be big.
  Block GetOrCreateConditions(Conditions&& conditions);
  /// The first block with exactly these attributes, in ascending order of their keys, and without
  /// a custom illumination; empty if there is none.
  Block FindConditions(std::span<const std::pair<std::string_view, std::string>> attributes);
  /// Throws: ResourceNotAvailableException if there is no block of that ID.
  virtual Block GetConditions(const std::string& id);
  bool HasConditions(const std::string& id) const { return conditions_.contains(id); }
  /// Stores an empty block under the next ID.
  virtual Block NewConditions();
  /// No effect if there is no such block; attributes that hold it go on using it.
  virtual void RemoveConditions(const std::string& id);
  /// With `onlyUnused`, removes the blocks that nobody but the manager holds.
  virtual void RemoveAllConditions(bool onlyUnused);
  virtual unsigned long GetConditionsCount();

 private:
  friend class Utilities::Patterns::Singleton<ConditionManager>;

  ConditionManager() = default;

  using Blocks = std::map<std::string, Block>;

  Block Store(const Block& block);
  std::string GetNextUniqueID();
  template <class Content, class Predicate>
  Block FindFirst(const Content& content, Predicate is_wanted);
  Block FindEqual(const Conditions& conditions);
  void UpdateIndex();
  void DropIndex();

  unsigned long next_id_ = 0;  // the last ID handed out
  Blocks conditions_;
  // Blocks by a hash of their content, kept once there are many; see FindFirst.
  std::unordered_multimap<std::size_t, Blocks::const_iterator> index_;
  unsigned long indexed_changes_ = 0;
  bool is_index_stale_ = true;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CONDITIONMANAGER_H
