#ifndef ALDERMOOR_VEXDOC_INTERNALS_CONDITIONTABLE_H
#define ALDERMOOR_VEXDOC_INTERNALS_CONDITIONTABLE_H

#include <cstddef>
#include <map>
#include <string>
#include <unordered_map>

#include "aldermoor/vexdoc/conditions.h"

namespace Aldermoor::Vexdoc::Internals {

/// The condition blocks of one file and the IDs that they have in it.
///
/// What is written is the block that an attribute holds, whatever the ConditionManager has under
/// its ID.  A block keeps its own ID if no other one in the file has it; for all blocks of the
/// manager that is so.  A block of the application's, whose ID is "0" or is taken by other content,
/// gets the ID of equal content that the file has already, or else one that neither the file nor
/// the manager uses.
class ConditionTable {
 public:
  /// By ID in the file, in the order of the texts, in which they are written.
  using Blocks = std::map<std::string, const Conditions*>;

  ConditionTable() = default;
  ConditionTable(const ConditionTable&) = delete;
  ConditionTable& operator=(const ConditionTable&) = delete;

  /// The ID of `block` in this file.  The block is kept by reference.
  const std::string& GetId(const Conditions& block);
  const Blocks& GetBlocks() const { return blocks_; }

 private:
  using Entry = Blocks::const_iterator;

  Entry Find(const Conditions& block);
  Entry FindEqual(const Conditions& block) const;
  Entry Add(const std::string& id, const Conditions& block);
  std::string MakeFreeId();

  Blocks blocks_;
  std::unordered_map<const Conditions*, Entry> entries_;    // by object
  std::unordered_multimap<std::size_t, Entry> by_content_;  // by a hash
  unsigned long last_free_id_ = 0;
  // Attributes mostly come in runs under one block.
  const Conditions* last_block_ = nullptr;
  Entry last_entry_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CONDITIONTABLE_H
