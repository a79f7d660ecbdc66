#ifndef ALDERMOOR_VEXDOC_STORAGEPOLICY_H
#define ALDERMOOR_VEXDOC_STORAGEPOLICY_H

#include <algorithm>
#include <list>
#include <map>
#include <string>
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

template <class T>
void SwapEntries(ElementList<T>& list, typename ElementList<T>::const_iterator first,
                 typename ElementList<T>::const_iterator second) {
  // An erase of nothing turns a constant position into one that can be written through.
  std::swap(*list.erase(first, first), *list.erase(second, second));
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
template <class T>
class MultiStoragePolicy {
 public:
  using Pointer = Utilities::Tools::SmartPointer<T>;
  using Elements = ElementList<T>;
  using Position = typename Elements::const_iterator;

  const Elements& GetElements() const { return list_; }

  /// Any name may be used: `name` itself.
  std::string GetUniqueName(const std::string& name) const { return name; }

  Position Insert(const Pointer& element, Position position) {
    return list_.emplace(position, element->GetName(), element);
  }

  /// Puts `element` at the end as it is.
  void Append(const Pointer& element) { list_.emplace_back(element->GetName(), element); }

  Position Erase(Position position) { return list_.erase(position); }

  /// Throws: ResourceNotAvailableException if there is no such element.
  Pointer Find(const std::string& name) const {
    const Position position = StorageDetail::FindByName<T>(list_, name);
    if (position == list_.end()) {
      StorageDetail::FailNotFound<T>(name);
    }
    return position->second;
  }

  void SwapEntries(Position first, Position second) {
    StorageDetail::SwapEntries<T>(list_, first, second);
  }

  void Clear() { list_.clear(); }

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
    const std::string base = name.empty() ? Utilities::Tools::TypeName<T>() : name;
    std::string candidate = base;
    for (unsigned long counter = 1; index_.contains(candidate); ++counter) {
      candidate = base + " (" + std::to_string(counter) + ")";
    }
    return candidate;
  }

  Position Insert(const Pointer& element, Position position) {
    std::string name = element->GetName();
    if (index_.contains(name)) {
      name = GetUniqueName(name);
      element->SetName(name);
    }
    const Position entry = list_.emplace(position, name, element);
    index_.emplace(name, element);
    return entry;
  }

  /// Puts `element` at the end under its own name, taken or not.
  void Append(const Pointer& element) {
    const std::string name = element->GetName();
    list_.emplace_back(name, element);
    index_.emplace(name, element);
  }

  Position Erase(Position position) {
    index_.erase(position->first);
    return list_.erase(position);
  }

  /// Throws: ResourceNotAvailableException if there is no such element.
  Pointer Find(const std::string& name) const {
    const auto entry = index_.find(name);
    if (entry == index_.end()) {
      StorageDetail::FailNotFound<T>(name);
    }
    return entry->second;
  }

  void SwapEntries(Position first, Position second) {
    StorageDetail::SwapEntries<T>(list_, first, second);
  }

  void Clear() {
    list_.clear();
    index_.clear();
  }

  void Swap(UniqueStoragePolicy& other) noexcept {
    index_.swap(other.index_);
    list_.swap(other.list_);
  }

 private:
  std::map<std::string, Pointer> index_;
  Elements list_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_STORAGEPOLICY_H
