#ifndef ALDERMOOR_VEXDOC_STORAGEPOLICY_H
#define ALDERMOOR_VEXDOC_STORAGEPOLICY_H

#include <algorithm>
#include <charconv>
#include <functional>
#include <iterator>
#include <list>
#include <map>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/location.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/utilities/tools/typename.h"

namespace Aldermoor::Vexdoc {

/// The children of a container in document order, each under the name with which it was inserted.
template <class T>
using ElementList = std::list<std::pair<std::string, Utilities::Tools::SmartPointer<T>>>;

/// What the two storage policies share.
namespace StorageDetail {

template <class T>
typename ElementList<T>::const_iterator FindByName(const ElementList<T>& list,
                                                   const std::string& name) {
  return std::find_if(list.begin(), list.end(),
                      [&name](const auto& entry) { return entry.first == name; });
}

/// The entry at `position`, to be written.
template <class T>
typename ElementList<T>::value_type& EntryAt(ElementList<T>& list,
                                             typename ElementList<T>::const_iterator position) {
  // An erase of nothing turns a constant position into one that can be written through.
  return *list.erase(position, position);
}

/// Exchanges the places of two entries.  The entries themselves move, and positions with them.
template <class T>
void SwapEntries(ElementList<T>& list, typename ElementList<T>::const_iterator first,
                 typename ElementList<T>::const_iterator second) noexcept {
  if (first == second) {
    return;
  }
  const auto behind = std::next(first);
  list.splice(second, list, first);
  if (behind != second) {
    list.splice(behind, list, second);
  } else {
    list.splice(first, list, second);
  }
}

/// A name of the form "Red (1)", taken apart; `number` is 0 for any other.
struct NumberedName {
  std::string_view base;
  unsigned long number = 0;
};

inline NumberedName TakeApart(std::string_view name) {
  const std::size_t open = name.rfind(" (");
  if (open == std::string_view::npos || !name.ends_with(')')) {
    return {};
  }
  const char* const end = name.data() + name.size() - 1;
  const char* const digits = name.data() + open + 2;
  unsigned long number = 0;
  const auto [behind, error] = std::from_chars(digits, end, number);
  if (error != std::errc() || behind != end || *digits == '0') {
    return {};
  }
  return {name.substr(0, open), number};
}

template <class T>
[[noreturn]] void FailNotFound(const std::string& name) {
  std::string message = "Could not find %TYPE%/%NAME%";
  Utilities::Exceptions::ReplaceAll("%TYPE%", Utilities::Tools::TypeName<T>(), message);
  Utilities::Exceptions::ReplaceAll("%NAME%", name, message);
  throw Utilities::Exceptions::ResourceNotAvailableException(message, "");
}

}  // namespace StorageDetail

/// Children in document order; names may repeat, and the first of equal names is found.
///
/// Here and in the other policy, an operation that fails leaves everything as it was: memory comes
/// first, then what the element may refuse, and what is stored changes last.
template <class T>
class MultiStoragePolicy {
 public:
  using Pointer = Utilities::Tools::SmartPointer<T>;
  using Elements = ElementList<T>;
  using Position = typename Elements::const_iterator;

  const Elements& GetElements() const { return list_; }

  /// Any name may be used: `name` itself.
  std::string GetUniqueName(const std::string& name) const { return name; }

  /// Sets `name` to the name under which `element` is stored then.
  Position Insert(const Pointer& element, Position position, std::string& name) {
    name = element->GetName();
    return list_.emplace(position, name, element);
  }

  /// Puts `element` at the end as it is.
  void Append(const Pointer& element) { list_.emplace_back(element->GetName(), element); }

  /// Stores the element at `position` under the name that it has got.
  void Rename(Position position) {
    std::string name = position->second->GetName();
    StorageDetail::EntryAt<T>(list_, position).first.swap(name);
  }

  Position Erase(Position position) noexcept { return list_.erase(position); }

  /// Empty if there is no such element.
  Pointer Find(const std::string& name) const {
    const Position position = StorageDetail::FindByName<T>(list_, name);
    return position == list_.end() ? Pointer() : position->second;
  }

  void SwapEntries(Position first, Position second) noexcept {
    StorageDetail::SwapEntries<T>(list_, first, second);
  }

  void Clear() noexcept { list_.clear(); }

  void Swap(MultiStoragePolicy& other) noexcept { list_.swap(other.list_); }

 private:
  Elements list_;
};

/// Children in document order under unique names, with an index for finding them.
///
/// An element that comes with a taken name gets another one: "Red", "Red (1)", "Red (2)".  Append
/// alone leaves equal names in the list; the index then keeps the first.
template <class T>
class UniqueStoragePolicy {
 public:
  using Pointer = Utilities::Tools::SmartPointer<T>;
  using Elements = ElementList<T>;
  using Position = typename Elements::const_iterator;

  const Elements& GetElements() const { return list_; }

  /// `name`, or the element type's name if it is empty, with the first free number behind it if
  /// that name is taken.
  std::string GetUniqueName(const std::string& name) const {
    return FindFreeName(name, nullptr).name;
  }

  /// Sets `name` to the name under which `element` is stored then, which is its own from then on.
  Position Insert(const Pointer& element, Position position, std::string& name) {
    Prepared prepared = Prepare(element, nullptr);
    const Position entry = prepared.entry.begin();
    list_.splice(position, prepared.entry);
    Index(prepared);
    name.swap(prepared.name.name);
    return entry;
  }

  /// Puts `element` at the end under its own name, taken or not.
  void Append(const Pointer& element) {
    Elements entry;
    entry.emplace_back(element->GetName(), element);
    const auto [named, is_new] = index_.try_emplace(entry.front().first, Named{element});
    named->second.repetitions += is_new ? 0 : 1;
    list_.splice(list_.end(), entry);
  }

  /// Stores the element at `position` under the name that it has got, or under another, which it
  /// gets then, if that name is taken.
  void Rename(Position position) {
    const bool is_alone = index_.find(position->first)->second.repetitions == 0;
    Prepared prepared = Prepare(position->second, is_alone ? &position->first : nullptr);
    if (prepared.name.name != position->first) {
      RemoveFromIndex(position);
      StorageDetail::EntryAt<T>(list_, position).first.swap(prepared.entry.front().first);
      Index(prepared);
    }
  }

  Position Erase(Position position) noexcept {
    RemoveFromIndex(position);
    return list_.erase(position);
  }

  /// Empty if there is no such element.
  Pointer Find(const std::string& name) const {
    const auto entry = index_.find(name);
    return entry == index_.end() ? Pointer() : entry->second.element;
  }

  void SwapEntries(Position first, Position second) noexcept {
    StorageDetail::SwapEntries<T>(list_, first, second);
  }

  void Clear() noexcept {
    list_.clear();
    index_.clear();
  }

  void Swap(UniqueStoragePolicy& other) noexcept {
    index_.swap(other.index_);
    list_.swap(other.list_);
  }

 private:
  struct Named {
    Pointer element;
    unsigned long repetitions = 0;  // further entries of that name in the list
    unsigned long free_number = 1;  // all lower ones stand behind that name somewhere
  };
  using NameIndex = std::map<std::string, Named, std::less<>>;

  struct FreeName {
    std::string name;
    unsigned long number = 0;           // 0 for a name without one
    const std::string* base = nullptr;  // for another number, the key of the name in front of it
  };

  // What an element is stored with.
  struct Prepared {
    FreeName name;
    Elements entry;
    NameIndex index;
  };

  // `given_up`, if there is one, counts as free.
  bool IsTaken(const std::string& name, const std::string* given_up) const {
    return index_.contains(name) && (given_up == nullptr || name != *given_up);
  }

  FreeName FindFreeName(const std::string& name, const std::string* given_up) const {
    FreeName free = {name.empty() ? Utilities::Tools::TypeName<T>() : name};
    if (!IsTaken(free.name, given_up)) {
      return free;
    }
    const auto base = index_.find(free.name);
    free.base = &base->first;
    free.number = base->second.free_number;
    if (given_up != nullptr) {
      const StorageDetail::NumberedName former = StorageDetail::TakeApart(*given_up);
      free.number = former.number > 0 && former.base == *free.base
                        ? std::min(free.number, former.number)
                        : free.number;
    }
    const std::string stem = *free.base + " (";
    while (IsTaken(free.name = stem + std::to_string(free.number) + ")", given_up)) {
      ++free.number;
    }
    return free;
  }

  Prepared Prepare(const Pointer& element, const std::string* given_up) const {
    Prepared prepared;
    FreeName& name = prepared.name;
    name.name = element->GetName();
    const bool is_taken = IsTaken(name.name, given_up);
    if (is_taken) {
      name = FindFreeName(name.name, given_up);
    }
    prepared.entry.emplace_back(name.name, element);
    prepared.index.try_emplace(name.name, Named{element});
    if (is_taken) {
      element->SetName(name.name);
    }
    return prepared;
  }

  void Index(Prepared& prepared) noexcept {
    index_.merge(prepared.index);
    if (prepared.name.number > 0) {
      index_.find(*prepared.name.base)->second.free_number = prepared.name.number + 1;
    }
  }

  void RemoveFromIndex(Position position) noexcept {
    const auto named = index_.find(position->first);
    if (named->second.repetitions == 0) {
      index_.erase(named);
      const StorageDetail::NumberedName name = StorageDetail::TakeApart(position->first);
      if (const auto base = index_.find(name.base); name.number > 0 && base != index_.end()) {
        base->second.free_number = std::min(base->second.free_number, name.number);
      }
      return;
    }
    --named->second.repetitions;
    if (IsSame(named->second.element, position->second)) {
      Position next = list_.begin();
      while (next == position || next->first != position->first) {
        ++next;
      }
      named->second.element = next->second;
    }
  }

  NameIndex index_;
  Elements list_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_STORAGEPOLICY_H
