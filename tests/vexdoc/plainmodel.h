#ifndef ALDERMOOR_TESTS_VEXDOC_PLAINMODEL_H
#define ALDERMOOR_TESTS_VEXDOC_PLAINMODEL_H

#include <algorithm>
#include <map>
#include <string>
#include <vector>

namespace Aldermoor::Vexdoc::Testing {

/// What a container of unique names should hold, by the plainest means; an element stands for
/// itself by its address.
template <class T>
struct PlainModel {
  struct Entry {
    std::string key;
    const T* element;
  };
  using Position = std::size_t;

  std::vector<Entry> entries;
  std::map<std::string, const T*> index;

  Position First(const std::string& key) const {
    const auto is_it = [&](const Entry& entry) {
      return entry.key == key;
    };
    return static_cast<Position>(std::find_if(entries.begin(), entries.end(), is_it) -
                                 entries.begin());
  }
  Position Find(const T* element) const {
    const auto is_it = [&](const Entry& entry) {
      return entry.element == element;
    };
    return static_cast<Position>(std::find_if(entries.begin(), entries.end(), is_it) -
                                 entries.begin());
  }
  const T* LookUp(const std::string& key) const {
    const auto found = index.find(key);
    return found == index.end() ? nullptr : found->second;
  }

  /// No name that is tried here is empty and taken, but by the element `type`.
  std::string FreeName(const std::string& name, const std::string& type) const {
    const std::string base = name.empty() ? type : name;
    std::string free = base;
    for (int number = 1; index.contains(free); ++number) {
      free = base + " (" + std::to_string(number) + ")";
    }
    return free;
  }

  std::string Insert(Position position, const std::string& name, const T* element,
                     const std::string& type) {
    const std::string key = index.contains(name) ? FreeName(name, type) : name;
    entries.insert(entries.begin() + static_cast<long>(position), {key, element});
    index.emplace(key, element);
    return key;
  }

  void Erase(Position position) {
    const Entry gone = entries[position];
    entries.erase(entries.begin() + static_cast<long>(position));
    const Position next = First(gone.key);
    if (next == entries.size()) {
      index.erase(gone.key);
    } else if (index.at(gone.key) == gone.element) {
      index[gone.key] = entries[next].element;
    }
  }

  /// Returns what the operation tells.
  std::string Rename(Position position, const std::string& name, const std::string& type) {
    const Entry entry = entries[position];
    if (entry.key == name) {
      return name;
    }
    const std::string told = FreeName(name, type);
    Erase(position);
    Insert(position, name, entry.element, type);
    return told;
  }
};

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_PLAINMODEL_H
