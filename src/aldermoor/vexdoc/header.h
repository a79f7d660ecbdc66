#ifndef ALDERMOOR_VEXDOC_HEADER_H
#define ALDERMOOR_VEXDOC_HEADER_H

#include <map>
#include <string>

#include "aldermoor/export.h"

namespace Aldermoor::Vexdoc {

class AttributeGuard;
class ElementVisitor;

namespace Internals {
class DocumentAccess;
}

/// The attribute access of every document element, as a layer of its own.
template <int>
class DeprecatedVexHeaderInterface {
 public:
  virtual const std::map<std::string, std::string>& GetAttributes() const = 0;
  virtual std::string GetAttribute(const std::string& key) const = 0;
  virtual void SetAttribute(const std::string& key, const std::string& value) = 0;
  virtual void RemoveAttribute(const std::string& key) = 0;

 protected:
  DeprecatedVexHeaderInterface() = default;
  DeprecatedVexHeaderInterface(const DeprecatedVexHeaderInterface&) = default;
  DeprecatedVexHeaderInterface& operator=(const DeprecatedVexHeaderInterface&) = default;
  ~DeprecatedVexHeaderInterface() = default;
};

/// The base of every document element: a map of named text attributes.
///
/// Standard keys are "Name", "Description", "Creator", "Created" and "Modified"; any other key may
/// be stored beside them and goes into the file.  "Created" and "Modified" are local time in the
/// form "YYYY-MM-DD/hh:mm:ss", set at construction.  Texts are UTF-8.
///
/// An operation that fails, for want of memory for instance, leaves an element as it was, here and
/// in the classes below.
class ALDERMOOR_EXPORT Header : public DeprecatedVexHeaderInterface<0> {
 public:
  static constexpr const char* kNameKey = "Name";
  static constexpr const char* kDescriptionKey = "Description";
  static constexpr const char* kCreatorKey = "Creator";
  static constexpr const char* kCreatedKey = "Created";
  static constexpr const char* kModifiedKey = "Modified";

  /// An empty `description` is not stored.
  explicit Header(const std::string& name = "", const std::string& description = "");
  /// Copies the attributes; the copy has no parent.
  Header(const Header& other);
  /// Replaces the attributes; the parent stays.
  Header& operator=(const Header& other);

  const std::map<std::string, std::string>& GetAttributes() const override;
  /// The value, or the empty string if the key is not there.
  std::string GetAttribute(const std::string& key) const override;
  /// Every key may be written, also the standard ones.
  void SetAttribute(const std::string& key, const std::string& value) override;
  /// No effect if the key is not there.
  void RemoveAttribute(const std::string& key) override;

  virtual ~Header();

  virtual std::string GetName() const;
  virtual void SetDescription(const std::string& description);
  virtual std::string GetDescription() const;
  virtual void SetCreator(const std::string& creator);
  virtual std::string GetCreator() const;
  /// Stores the current time under "Modified".
  virtual void SetModified();
  virtual std::string GetCreationDateTime() const;
  virtual std::string GetModificationDateTime() const;

  /// Null for an element that came into its container by insertion, as every element does.
  virtual Header* GetParent();
  const Header* GetParent() const { return const_cast<Header*>(this)->GetParent(); }
  virtual void SetParent(Header* parent) = 0;
  /// Calls the visitor's operation for the class of this element; children are the visitor's task.
  virtual void AcceptVisitor(ElementVisitor& visitor) = 0;
  /// Stores the name; the key under which a container holds the element stays as it was.
  virtual void SetName(const std::string& name);

 protected:
  /// Moves this element, of class `Element`, from its current parent to `target`, both of class
  /// `Parent`.  Only a current parent can give an element the SmartPointer to itself, so nothing
  /// happens without one, nor for another target than such a parent.
  template <class Parent, class Element>
  void MoveToParent(Element& element, Header* target);

 private:
  friend class AttributeGuard;
  friend class Internals::DocumentAccess;

  Header* parent_ = nullptr;  // not owned
  std::map<std::string, std::string> attributes_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_HEADER_H
