#ifndef ALDERMOOR_VEXDOC_SETPARENT_H
#define ALDERMOOR_VEXDOC_SETPARENT_H

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc {

/// Moves `element` from its current parent to `target`, both of class `Parent`, and returns the
/// parent that it has afterwards.
///
/// An element knows its own SmartPointer only through its current parent, so an element without
/// one stays without.
template <class Parent, class Element>
Header* MovedToParent(Element& element, Header* current, Header* target) {
  auto* const new_parent = dynamic_cast<Parent*>(target);
  auto* const old_parent = dynamic_cast<Parent*>(current);
  if (new_parent == nullptr || new_parent == old_parent || old_parent == nullptr) {
    return current;
  }
  const auto self = old_parent->GetElement(element.GetName());
  old_parent->RemoveElement(self);
  new_parent->AddElement(self);
  return new_parent;
}

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SETPARENT_H
