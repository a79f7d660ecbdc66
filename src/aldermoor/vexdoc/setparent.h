#ifndef ALDERMOOR_VEXDOC_SETPARENT_H
#define ALDERMOOR_VEXDOC_SETPARENT_H

// The body of Header::MoveToParent, for the files of the element classes.

#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc {

template <class Parent, class Element>
void Header::MoveToParent(Element& element, Header* target) {
  auto* const new_parent = dynamic_cast<Parent*>(target);
  auto* const old_parent = dynamic_cast<Parent*>(parent_);
  if (new_parent == nullptr || new_parent == old_parent || old_parent == nullptr) {
    return;
  }
  const auto self = old_parent->GetElement(element.GetName());
  parent_ = nullptr;  // or the insertion would move it once more
  try {
    new_parent->AddElement(self);
  } catch (...) {
    parent_ = old_parent;
    throw;
  }
  // Last, or an element that finds no room in its new parent would be in neither.
  old_parent->RemoveElement(self);
  parent_ = new_parent;
}

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SETPARENT_H
