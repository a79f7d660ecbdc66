#ifndef ALDERMOOR_VEXDOC_INTERNALS_CONDITIONCONTENT_H
#define ALDERMOOR_VEXDOC_INTERNALS_CONDITIONCONTENT_H

#include <cstddef>
#include <functional>
#include <string_view>

#include "aldermoor/vexdoc/conditions.h"

/// What condition blocks are found by.
namespace Aldermoor::Vexdoc::Internals {

/// Of attributes in ascending order of their keys.
template <class Attributes>
std::size_t HashOf(const Attributes& attributes) {
  std::size_t hash = 0;
  for (const auto& [key, value] : attributes) {
    const std::hash<std::string_view> text;
    hash = (hash * 31 + text(key)) * 31 + text(value);
  }
  return hash;
}

/// The same for conditions that are equal, whatever curve they have to which they do not refer.
std::size_t HashOf(const Conditions& conditions);

/// All that a file holds of a block, and to the bit: unlike the equality of conditions, which
/// passes over a curve to which the attributes do not refer.
bool HaveEqualContent(const Conditions& first, const Conditions& second);
/// The same for conditions of equal content.
std::size_t HashOfContent(const Conditions& conditions);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CONDITIONCONTENT_H
