#ifndef ALDERMOOR_UTILITIES_TOOLS_TREE_H
#define ALDERMOOR_UTILITIES_TOOLS_TREE_H

#include <list>
#include <utility>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/utilities/tools/typename.h"

namespace Aldermoor::Utilities::Tools {

/// A `T` with an ordered list of children, each a tree of its own.
///
/// Ownership: children are shared, also between a tree and its copy.  The parent that such a child
/// names is the younger of the two.
template <class T>
class Tree : public T {
 public:
  using Children = std::list<SmartPointer<Tree<T>>>;

  Tree() = default;
  explicit Tree(const T& payload) : T(payload) {}

  Tree(const Tree& other) try : T(other), children_(other.children_) { AdoptChildren(); }
  ALDERMOOR_TEMPLATE_FRAME(Name() + "::Tree")

  Tree& operator=(const Tree& other) try {
    if (this != &other) {
      // All copies first, for memory may be short; and `other` may be one of the children.
      T payload(other);
      Children children(other.children_);
      T::operator=(std::move(payload));
      children_.swap(children);
      AdoptChildren();
    }
    return *this;
  }
  ALDERMOOR_TEMPLATE_FRAME(Name() + "::operator =")

  virtual ~Tree() = default;

  /// Appends a copy of `child`.
  void AddChild(const Tree& child) try { AdoptChild(SmartPointer<Tree>(new Tree(child))); }
  ALDERMOOR_TEMPLATE_FRAME(Name() + "::AddChild")

  /// Appends `child` itself.
  void AdoptChild(const SmartPointer<Tree>& child) {
    Tree& added = *child;
    children_.push_back(child);
    added.parent_ = this;
  }

  const Children& GetChildren() const { return children_; }
  bool HasChildren() const { return !children_.empty(); }
  /// Null for a root.
  const T* GetParent() const { return parent_; }

 private:
  static std::string Name() { return "Aldermoor::Utilities::Tools::Tree<" + TypeName<T>() + ">"; }

  void AdoptChildren() {
    for (const SmartPointer<Tree>& child : children_) {
      child->parent_ = this;
    }
  }

  Children children_;
  const T* parent_ = nullptr;
};

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_TREE_H
