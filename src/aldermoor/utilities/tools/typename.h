#ifndef ALDERMOOR_UTILITIES_TOOLS_TYPENAME_H
#define ALDERMOOR_UTILITIES_TOOLS_TYPENAME_H

#include <string>
#include <typeinfo>

#include "aldermoor/export.h"

namespace Aldermoor::Utilities::Tools {

/// The name of a type as messages and default element names print it: "class " and the qualified
/// name for class types, the plain name for all others.  The same text with every compiler.
ALDERMOOR_EXPORT std::string TypeName(const std::type_info& type);

/// The same for a type known at compile time.
template <class T>
std::string TypeName() {
  return TypeName(typeid(T));
}

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_TYPENAME_H
