#include "aldermoor/vexdoc/internals/conditionmanager.h"

#include <algorithm>
#include <utility>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/internals/conditioncontent.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;

namespace {

// A walk over fewer blocks costs less than a hash of the attributes.
constexpr std::size_t kFewBlocks = 16;

// An application may hold a curve without conditions, which cannot be compared.
bool HasComparableCurve(const Conditions& conditions) {
  return !conditions.HasCustomIllumination() ||
         !conditions.GetCustomIllumination().GetConditions().IsNull();
}

}  // namespace

ConditionManager::Block ConditionManager::AddConditions(const Conditions& conditions) try {
  return Store(Block(new Conditions(GetNextUniqueID(), conditions)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::AddConditions)

ConditionManager::Block ConditionManager::Store(const Block& block) {
  block->is_shared_ = true;
  const auto entry = conditions_.emplace(block->GetID(), block).first;
  if (!is_index_stale_) {
    is_index_stale_ = true;  // should the next line fail
    index_.emplace(HashOf(*block), entry);
    is_index_stale_ = false;
  }
  return block;
}

ConditionManager::Block ConditionManager::GetOrCreateConditions(const Conditions& conditions) try {
  const Block block = FindEqual(conditions);
  return block ? block : AddConditions(conditions);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::GetOrCreateConditions)

ConditionManager::Block ConditionManager::GetOrCreateConditions(Conditions&& conditions) try {
  // Also in a curve to which the attributes do not refer: what a file gives may not depend on what
  // was read before it.
  const Block found = FindFirst(conditions, [&conditions](const Conditions& block) {
    return HaveEqualContent(block, conditions) && HasComparableCurve(block) && block == conditions;
  });
  if (found) {
    return found;
  }
  const Block block(new Conditions(GetNextUniqueID()));
  block->attributes_.swap(conditions.attributes_);
  block->custom_illumination_ = std::move(conditions.custom_illumination_);
  return Store(block);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::GetOrCreateConditions)

ConditionManager::Block ConditionManager::FindConditions(
    std::span<const std::pair<std::string_view, std::string>> attributes) try {
  return FindFirst(attributes, [attributes](const Conditions& block) {
    return !block.HasCustomIllumination() &&
           std::ranges::equal(block.GetAttributes(), attributes,
                              [](const auto& own, const auto& wanted) {
                                return own.first == wanted.first && own.second == wanted.second;
                              });
  });
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::FindConditions)

ConditionManager::Block ConditionManager::FindEqual(const Conditions& conditions) {
  return FindFirst(conditions,
                   [&conditions](const Conditions& block) { return block == conditions; });
}

template <class Content, class Predicate>
ConditionManager::Block ConditionManager::FindFirst(const Content& content, Predicate is_wanted) {
  if (conditions_.size() <= kFewBlocks) {
    for (const auto& [id, block] : conditions_) {
      if (is_wanted(*block)) {
        return block;
      }
    }
    return {};
  }
  // A file with very many blocks must not cost the square of their number.
  UpdateIndex();
  auto first = conditions_.cend();
  const auto [begin, end] = index_.equal_range(HashOf(content));
  for (auto candidate = begin; candidate != end; ++candidate) {
    const auto entry = candidate->second;
    if (is_wanted(*entry->second) && (first == conditions_.cend() || entry->first < first->first)) {
      first = entry;
    }
  }
  return first == conditions_.cend() ? Block() : first->second;
}

// Applications may change a shared block; the index then is made anew.
void ConditionManager::UpdateIndex() {
  if (!is_index_stale_ && indexed_changes_ == Conditions::changes_of_shared_) {
    return;
  }
  is_index_stale_ = true;
  index_.clear();
  for (auto entry = conditions_.cbegin(); entry != conditions_.cend(); ++entry) {
    index_.emplace(HashOf(*entry->second), entry);
  }
  indexed_changes_ = Conditions::changes_of_shared_;
  is_index_stale_ = false;
}

void ConditionManager::DropIndex() {
  index_.clear();
  is_index_stale_ = true;
}

ConditionManager::Block ConditionManager::GetConditions(const std::string& id) try {
  const auto entry = conditions_.find(id);
  if (entry == conditions_.end()) {
    throw ResourceNotAvailableException(Filled("Condition(ID=<%NAME%>) not found", "%NAME%", id),
                                        "");
  }
  return entry->second;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::GetConditions)

ConditionManager::Block ConditionManager::NewConditions() try {
  return AddConditions(Conditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::NewConditions)

void ConditionManager::RemoveConditions(const std::string& id) try {
  DropIndex();
  conditions_.erase(id);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::RemoveConditions)

void ConditionManager::RemoveAllConditions(bool onlyUnused) try {
  DropIndex();
  if (!onlyUnused) {
    conditions_.clear();
    return;
  }
  // A block may hold an illuminant whose own block becomes unused with it, so the walk begins
  // again until nothing was removed.
  while (std::erase_if(conditions_,
                       [](const auto& entry) { return entry.second.UseCount() == 1; }) != 0) {
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ConditionManager::RemoveAllConditions)

unsigned long ConditionManager::GetConditionsCount() {
  return conditions_.size();
}

std::string ConditionManager::GetNextUniqueID() {
  return std::to_string(++next_id_);
}

}  // namespace Aldermoor::Vexdoc::Internals
