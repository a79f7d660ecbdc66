#ifndef ALDERMOOR_VEXDOC_VEXNODE_INL_H
#define ALDERMOOR_VEXDOC_VEXNODE_INL_H

// The bodies of VexNode, for the three files that instantiate it.

#include <iterator>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/attributeguard.h"
#include "aldermoor/vexdoc/elementcloner.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/vexnode.h"

namespace Aldermoor::Vexdoc {

template <class T, class P>
std::string VexNode<T, P>::Here(const char* member) {
  return "Aldermoor::Vexdoc::VexNode<" + Utilities::Tools::TypeName<T>() + "," +
         Utilities::Tools::TypeName<P>() + ">::" + member;
}

template <class T, class P>
VexNode<T, P>::VexNode(const std::string& name) try : Header(name, "") {}
ALDERMOOR_TEMPLATE_FRAME(Here("VexNode"))

template <class T, class P>
VexNode<T, P>::VexNode(const VexNode& other) try : Header(other) {
  for (const auto& entry : other.GetElements()) {
    policy_.Append(CloneElement(*entry.second));
  }
}
ALDERMOOR_TEMPLATE_FRAME(Here("VexNode"))

template <class T, class P>
VexNode<T, P>& VexNode<T, P>::operator=(const VexNode& other) try {
  if (this != &other) {
    P clones;
    for (const auto& entry : other.GetElements()) {
      clones.Append(CloneElement(*entry.second));
    }
    Header::operator=(other);
    policy_.Swap(clones);
  }
  return *this;
}
ALDERMOOR_TEMPLATE_FRAME(Here("operator="))

template <class T, class P>
VexNode<T, P>::~VexNode() = default;

template <class T, class P>
bool VexNode<T, P>::AddElement(const Pointer& element) try {
  const std::string name = element->GetName();
  return InsertElement(element, GetElements().end())->first == name;
}
ALDERMOOR_TEMPLATE_FRAME(Here("AddElement"))

template <class T, class P>
Utilities::Tools::SmartPointer<T> VexNode<T, P>::AddElement(const T& element) try {
  const Pointer clone = CloneElement(element);
  AddElement(clone);
  return clone;
}
ALDERMOOR_TEMPLATE_FRAME(Here("AddElement"))

template <class T, class P>
typename ElementList<T>::const_iterator VexNode<T, P>::Insert(
    const Pointer& element, const typename Elements::const_iterator& position, std::string& name) {
  AttributeGuard modified(*this, Header::kModifiedKey);
  SetModified();
  element->SetParent(this);
  const auto entry = policy_.Insert(element, position, name);
  modified.Keep();
  return entry;
}

template <class T, class P>
typename ElementList<T>::const_iterator VexNode<T, P>::PositionOf(long index) const {
  const long count = static_cast<long>(GetElements().size());
  if (index < 0 || index > count) {
    throw Utilities::Exceptions::OutOfRangeException(
        "position " + std::to_string(index) + " is outside 0.." + std::to_string(count),
        Utilities::Exceptions::MakeLocation("", Here("PositionOf").c_str(), __FILE__, __LINE__));
  }
  return index <= count / 2 ? std::next(GetElements().begin(), index)
                            : std::prev(GetElements().end(), count - index);
}

template <class T, class P>
typename ElementList<T>::const_iterator VexNode<T, P>::InsertElement(
    const Pointer& element, const typename Elements::const_iterator& position) try {
  std::string name;
  return Insert(element, position, name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("InsertElement"))

template <class T, class P>
Utilities::Tools::SmartPointer<T> VexNode<T, P>::InsertElement(const T& element,
                                                               long position) try {
  const auto place = PositionOf(position);
  const Pointer clone = CloneElement(element);
  InsertElement(clone, place);
  return clone;
}
ALDERMOOR_TEMPLATE_FRAME(Here("InsertElement"))

template <class T, class P>
std::string VexNode<T, P>::InsertNamed(const Pointer& element,
                                       const typename Elements::const_iterator& position) try {
  std::string name;
  Insert(element, position, name);
  return name;
}
ALDERMOOR_TEMPLATE_FRAME(Here("InsertNamed"))

template <class T, class P>
std::string VexNode<T, P>::InsertNamed(const T& element, long position) try {
  const auto place = PositionOf(position);
  return InsertNamed(CloneElement(element), place);
}
ALDERMOOR_TEMPLATE_FRAME(Here("InsertNamed"))

template <class T, class P>
std::string VexNode<T, P>::AppendNamed(const T& element) try {
  return InsertNamed(CloneElement(element), GetElements().end());
}
ALDERMOOR_TEMPLATE_FRAME(Here("AppendNamed"))

template <class T, class P>
void VexNode<T, P>::AppendNew(const Pointer& element) try {
  std::string name;
  policy_.Insert(element, GetElements().end(), name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("AppendNew"))

template <class T, class P>
typename ElementList<T>::const_iterator VexNode<T, P>::RemoveElement(
    const typename Elements::const_iterator& position) try {
  position->second->SetParent(nullptr);
  SetModified();
  return policy_.Erase(position);
}
ALDERMOOR_TEMPLATE_FRAME(Here("RemoveElement"))

template <class T, class P>
void VexNode<T, P>::RemoveElement(const Pointer& element) try {
  const Elements& elements = GetElements();
  for (auto position = elements.begin(); position != elements.end(); ++position) {
    if (Utilities::Tools::IsSame(position->second, element)) {
      RemoveElement(position);
      return;
    }
  }
}
ALDERMOOR_TEMPLATE_FRAME(Here("RemoveElement"))

template <class T, class P>
void VexNode<T, P>::RemoveElement(const std::string& name) try {
  const auto position = StorageDetail::FindByName<T>(GetElements(), name);
  if (position != GetElements().end()) {
    RemoveElement(position);
  }
}
ALDERMOOR_TEMPLATE_FRAME(Here("RemoveElement"))

template <class T, class P>
std::string VexNode<T, P>::RenameElement(const std::string& oldName,
                                         const std::string& newName) try {
  const auto position = StorageDetail::FindByName<T>(GetElements(), oldName);
  if (position == GetElements().end()) {
    StorageDetail::FailNotFound<T>(oldName);
  }
  if (oldName == newName) {
    return oldName;
  }
  std::string result = policy_.GetUniqueName(newName);
  AttributeGuard name(*position->second, Header::kNameKey);
  position->second->SetName(newName);
  policy_.Rename(position);
  name.Keep();
  return result;
}
ALDERMOOR_TEMPLATE_FRAME(Here("RenameElement"))

template <class T, class P>
void VexNode<T, P>::SwapElements(const std::string& first, const std::string& second) try {
  const Elements& elements = GetElements();
  const auto one = StorageDetail::FindByName<T>(elements, first);
  const auto other = StorageDetail::FindByName<T>(elements, second);
  if (one == elements.end() || other == elements.end()) {
    throw VexException(
        "sample(s) not found",
        Utilities::Exceptions::MakeLocation("", Here("SwapElements").c_str(), __FILE__, __LINE__));
  }
  policy_.SwapEntries(one, other);
}
ALDERMOOR_TEMPLATE_FRAME(Here("SwapElements"))

template <class T, class P>
Utilities::Tools::SmartPointer<T> VexNode<T, P>::GetElement(const std::string& name) const try {
  return FindElement(name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("GetElement"))

template <class T, class P>
Utilities::Tools::SmartPointer<T> VexNode<T, P>::FindElement(const std::string& name) const try {
  Pointer found = policy_.Find(name);
  if (!found) {
    StorageDetail::FailNotFound<T>(name);
  }
  return found;
}
ALDERMOOR_TEMPLATE_FRAME(Here("FindElement"))

template <class T, class P>
Utilities::Tools::SmartPointer<T> VexNode<T, P>::LookUp(const std::string& name) const try {
  return policy_.Find(name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("LookUp"))

template <class T, class P>
std::string VexNode<T, P>::GetUniqueName(const std::string& name) const try {
  return policy_.GetUniqueName(name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("GetUniqueName"))

template <class T, class P>
void VexNode<T, P>::Clear() try {
  policy_.Clear();
}
ALDERMOOR_TEMPLATE_FRAME(Here("Clear"))

template <class T, class P>
void VexNode<T, P>::SetName(const std::string& name) try {
  Header::SetName(name);
}
ALDERMOOR_TEMPLATE_FRAME(Here("SetName"))

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_VEXNODE_INL_H
