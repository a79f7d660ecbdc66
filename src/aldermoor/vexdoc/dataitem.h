#ifndef ALDERMOOR_VEXDOC_DATAITEM_H
#define ALDERMOOR_VEXDOC_DATAITEM_H

#include <map>
#include <string>

#include "aldermoor/utilities/tools/tree.h"

namespace Aldermoor::Vexdoc {

/// One item of content that the library does not know: a name, a text and named attributes.
class DataItem {
 public:
  DataItem() = default;
  DataItem(const std::string& name, const std::string& value);

  const std::string& GetName() const { return name_; }
  void SetName(const std::string& name) { name_ = name; }
  const std::string& GetValue() const { return value_; }
  void SetValue(const std::string& value) { value_ = value; }

  /// The value, or the empty string if there is no such attribute.
  std::string GetAttribute(const std::string& name) const;
  /// Throws: InvalidArgumentException for an empty name.
  void SetAttribute(const std::string& name, const std::string& value);
  /// Whether there is any attribute.
  bool HasAttribute() const { return !attributes_.empty(); }
  const std::map<std::string, std::string>& GetAttributes() const { return attributes_; }

 private:
  std::string name_;
  std::string value_;
  std::map<std::string, std::string> attributes_;
};

/// Unknown content: for content from XML, an item per element.
using DataTree = Utilities::Tools::Tree<DataItem>;

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_DATAITEM_H
