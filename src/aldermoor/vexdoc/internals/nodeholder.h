#ifndef ALDERMOOR_VEXDOC_INTERNALS_NODEHOLDER_H
#define ALDERMOOR_VEXDOC_INTERNALS_NODEHOLDER_H

#include <string>

#include <xercesc/dom/DOMNode.hpp>

namespace Aldermoor::Vexdoc::Internals {

/// In the place of a name: any.
inline constexpr XMLCh kAnyElement[] = u"*";

/// A cursor on a DOM node, or on none.  Owns nothing.
///
/// Searches walk from sibling to sibling and compare the parser's own characters: the parser's
/// child lists are linear by index, and a transcoded string per comparison would cost more than
/// the parse.  Throws: NullPointerException from everything but FindByName on a null holder.
class NodeHolder {
 public:
  explicit NodeHolder(xercesc::DOMNode* node) : node_(node) {}

  bool IsNull() const { return node_ == nullptr; }
  xercesc::DOMNode& GetXMLNode() const;

  /// The first element of that name among the children, the following siblings, or this node and
  /// its following siblings; "*" means any element.  A null holder if there is none.
  /// Throws: VexException if there is none and `mandatory` is set.
  NodeHolder FindChild(const std::string& name, bool mandatory) const;
  NodeHolder FindChild(const XMLCh* name, bool mandatory) const;
  NodeHolder NextSibling(const std::string& name, bool mandatory) const;
  NodeHolder NextSibling(const XMLCh* name, bool mandatory) const;
  NodeHolder FindByName(const std::string& name, bool mandatory) const;
  NodeHolder FindByName(const XMLCh* name, bool mandatory) const;

  /// The attribute `name`, or the first one if `name` is empty, into the two strings.  Returns
  /// whether there is one; if not, the strings stay as they were.
  bool GetAttribute(std::string& name, std::string& value) const;
  /// The first attribute; null if there is none.
  const xercesc::DOMNode* FirstAttribute() const;
  /// The value of the attribute `name`; null if there is none.
  const XMLCh* AttributeValue(const XMLCh* name) const;

  std::string GetName() const;
  bool IsElement(const XMLCh* name) const;

  /// The first run of text among the children; empty if there is none.
  std::string GetText() const;
  /// The number at the beginning of that text; 0 if there is none.
  float GetFloat() const;

 private:
  const XMLCh* TextOrNull() const;

  xercesc::DOMNode* node_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_NODEHOLDER_H
