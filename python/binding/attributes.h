#ifndef ALDERMOOR_PYTHON_ATTRIBUTES_H
#define ALDERMOOR_PYTHON_ATTRIBUTES_H

#include <optional>
#include <string>

#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include "lock.h"

namespace Aldermoor::Python {

/// The members that every element of a document has.
template <class Type>
void AddHeader(Type& type) {
  using Element = typename Type::type;
  const auto text = [&type](const char* name, std::string (Element::*get)() const,
                            const char* help) {
    type.def_property_readonly(
        name,
        [get](const Element& self) {
          const LibraryLock lock;
          return (self.*get)();
        },
        help);
  };
  text("name", &Element::GetName, "The name; may be empty.");
  text("created", &Element::GetCreationDateTime, "The header field Created, or an empty text.");
  text("modified", &Element::GetModificationDateTime,
       "The header field Modified, or an empty text.");
  text("description", &Element::GetDescription, "The header field Description, or an empty text.");
  text("creator", &Element::GetCreator, "The header field Creator, or an empty text.");
  type.def_property_readonly(
      "header",
      [](const Element& self) {
        const LibraryLock lock;
        return self.GetAttributes();
      },
      "All header fields, as a new dict: Name, Description, Creator, Created, Modified and those "
      "of your own.");
  type.def(
      "set_header",
      [](Element& self, const std::string& key, const std::optional<std::string>& value) {
        const LibraryLock lock;
        if (value) {
          self.SetAttribute(key, *value);
        } else {
          self.RemoveAttribute(key);
        }
      },
      "set_header(self, key, value)\n--\n\nSets a header field, or removes it with None.",
      pybind11::arg("key"), pybind11::arg("value"));
}

/// Attribute, Spectrum, ColorVector and Recipe.
void AddAttributeClasses(pybind11::module_& module);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_ATTRIBUTES_H
