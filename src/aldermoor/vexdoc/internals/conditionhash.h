#ifndef ALDERMOOR_VEXDOC_INTERNALS_CONDITIONHASH_H
#define ALDERMOOR_VEXDOC_INTERNALS_CONDITIONHASH_H

#include <cstddef>
#include <functional>
#include <string_view>

namespace Aldermoor::Vexdoc::Internals {

/// Of attributes in ascending order of their keys, by which equal condition blocks are found.
template <class Attributes>
std::size_t HashOf(const Attributes& attributes) {
  std::size_t hash = 0;
  for (const auto& [key, value] : attributes) {
    const std::hash<std::string_view> text;
    hash = (hash * 31 + text(key)) * 31 + text(value);
  }
  return hash;
}

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CONDITIONHASH_H
