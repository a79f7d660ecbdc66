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
  old_parent->RemoveElement(self);
  parent_ = nullptr;  // or the insertion would move it once more
  new_parent->AddElement(self);
  parent_ = new_parent;
}

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SETPARENT_H
