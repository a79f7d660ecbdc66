#ifndef ALDERMOOR_VEXDOC_VEXNODE_H
#define ALDERMOOR_VEXDOC_VEXNODE_H

#include <concepts>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/header.h"
#include "aldermoor/vexdoc/storagepolicy.h"

namespace Aldermoor::Vexdoc {

namespace Internals {
class DocumentAccess;
}

/// A document element with named children in document order.
///
/// Ownership: children are shared with whoever holds a SmartPointer to them; a removed child lives
/// on as long as somebody does.  Copies are deep.  The key of a child is fixed at insertion;
/// rename children through RenameElement.  docs/iterators.md tells which positions, references and
/// pointers outlive which operation.
/// Throws: NullPointerException for an empty pointer to an element.  Whatever fails leaves the
/// container as it was, and its "Modified" too.
template <class T, class StoragePolicy>
class VexNode : public Header {
 public:
  using Pointer = Utilities::Tools::SmartPointer<T>;
  using Elements = ElementList<T>;

  /// Appends `element` itself.  Returns whether it kept its name.
  bool AddElement(const Pointer& element);
  /// Appends a deep copy and returns it.
  Pointer AddElement(const T& element);
  /// Appends a new empty element of that name and returns it.
  template <class Element = T>
  requires std::constructible_from<Element, const std::string&> Pointer
  AddElement(const std::string& name)
  try {
    return AddElement(Element(name));
  }
  ALDERMOOR_TEMPLATE_FRAME(Here("AddElement"))

  /// Inserts `element` itself before `position` and returns the new entry.
  typename Elements::const_iterator InsertElement(
      const Pointer& element, const typename Elements::const_iterator& position);
  /// Inserts a deep copy at the index `position`, 0..Size(), and returns it.
  /// Throws: OutOfRangeException for another index, here and in the form below.
  Pointer InsertElement(const T& element, long position);
  /// Inserts a new empty element of that name and returns it.
  template <class Element = T>
  requires std::constructible_from<Element, const std::string&> Pointer
  InsertElement(const std::string& name, long position)
  try {
    return InsertElement(Element(name), position);
  }
  ALDERMOOR_TEMPLATE_FRAME(Here("InsertElement"))

  /// Returns the entry behind the removed one.
  typename Elements::const_iterator RemoveElement(
      const typename Elements::const_iterator& position);
  /// The two forms do nothing if there is no such element; of equal names the first goes.
  void RemoveElement(const Pointer& element);
  void RemoveElement(const std::string& name);

  /// Gives the element another name, made unique where names are; it stays where it is, and so do
  /// all positions that stand on it.  Returns the name
  /// that was free before the old one was given up.
  /// Throws: ResourceNotAvailableException if there is no element `oldName`.
  std::string RenameElement(const std::string& oldName, const std::string& newName);
  /// Exchanges the places of two elements; positions go with the elements on which they stand.
  /// Throws: VexException if one of them is missing.
  void SwapElements(const std::string& first, const std::string& second);

  /// Throws: ResourceNotAvailableException if there is no such element.
  Pointer GetElement(const std::string& name) const;
  Pointer FindElement(const std::string& name) const;
  /// With `create`, a missing element is appended, empty, and returned.
  template <class Element = T>
  requires std::constructible_from<Element, const std::string&> Pointer
  FindElement(const std::string& name, bool create);

  const Elements& GetElements() const { return policy_.GetElements(); }
  std::string GetUniqueName(const std::string& name) const;
  /// Neither tells the children nor changes "Modified".
  void Clear();
  unsigned int Size() const { return static_cast<unsigned int>(GetElements().size()); }

  void SetName(const std::string& name) override;

 protected:
  explicit VexNode(const std::string& name);
  VexNode(const VexNode& other);
  VexNode& operator=(const VexNode& other);
  ~VexNode() override;

  /// As InsertElement, but they return the name of what was inserted.
  std::string InsertNamed(const T& element, long position);
  std::string InsertNamed(const Pointer& element,
                          const typename Elements::const_iterator& position);
  std::string AppendNamed(const T& element);
  /// Empty if there is no such element.
  Pointer LookUp(const std::string& name) const;
  /// Puts a new element at the end, which does not count as a modification.
  void AppendNew(const Pointer& element);

 private:
  friend class Internals::DocumentAccess;

  // `name` becomes that under which `element` is stored then.
  typename Elements::const_iterator Insert(const Pointer& element,
                                           const typename Elements::const_iterator& position,
                                           std::string& name);
  typename Elements::const_iterator PositionOf(long index) const;

  // Where the frame of a member says it is.
  static std::string Here(const char* member);

  StoragePolicy policy_;
};

template <class T, class StoragePolicy>
template <class Element>
requires std::constructible_from<Element, const std::string&> Utilities::Tools::SmartPointer<T>
VexNode<T, StoragePolicy>::FindElement(const std::string& name, bool create)
try {
  if (!create) {
    return FindElement(name);
  }
  if (const Pointer found = LookUp(name)) {
    return found;
  }
  const Pointer element(new Element(name));
  AppendNew(element);
  return element;
}
ALDERMOOR_TEMPLATE_FRAME(Here("FindElement"))

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_VEXNODE_H
