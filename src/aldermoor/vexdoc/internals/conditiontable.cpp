#include "aldermoor/vexdoc/internals/conditiontable.h"

#include <algorithm>

#include "aldermoor/vexdoc/internals/conditioncontent.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

// "0" is the ID of whatever got none, and text that is not plain might not come back as it is.
bool IsUsable(const std::string& id) {
  return !id.empty() && id != "0" &&
         std::all_of(id.begin(), id.end(), [](char c) { return c > ' ' && c <= '~'; });
}

}  // namespace

const std::string& ConditionTable::GetId(const Conditions& block) {
  if (&block != last_block_) {
    const auto known = entries_.find(&block);
    last_entry_ = known != entries_.end() ? known->second : Find(block);
    last_block_ = &block;
  }
  return last_entry_->first;
}

ConditionTable::Entry ConditionTable::Find(const Conditions& block) {
  const std::string id = block.GetID();
  if (IsUsable(id) && !blocks_.contains(id)) {
    return Add(id, block);
  }
  const Entry equal = FindEqual(block);
  if (equal == blocks_.end()) {
    return Add(MakeFreeId(), block);
  }
  entries_.emplace(&block, equal);
  return equal;
}

ConditionTable::Entry ConditionTable::FindEqual(const Conditions& block) const {
  const auto [begin, end] = by_content_.equal_range(HashOfContent(block));
  const auto found = std::find_if(begin, end, [&block](const auto& candidate) {
    return HaveEqualContent(*candidate.second->second, block);
  });
  return found == end ? blocks_.end() : found->second;
}

ConditionTable::Entry ConditionTable::Add(const std::string& id, const Conditions& block) {
  const Entry entry = blocks_.emplace(id, &block).first;
  entries_.emplace(&block, entry);
  by_content_.emplace(HashOfContent(block), entry);
  return entry;
}

std::string ConditionTable::MakeFreeId() {
  std::string id;
  do {
    id = std::to_string(++last_free_id_);
  } while (blocks_.contains(id) || ConditionManager::GetInstance().HasConditions(id));
  return id;
}

}  // namespace Aldermoor::Vexdoc::Internals
