#include "aldermoor/utilities/tools/typename.h"

#include <cstdlib>
#include <memory>

#include <cxxabi.h>

namespace Aldermoor::Utilities::Tools {

std::string TypeName(const std::type_info& type) {
  int status = 0;
  const std::unique_ptr<char, decltype(&std::free)> demangled(
      abi::__cxa_demangle(type.name(), nullptr, nullptr, &status), &std::free);
  const std::string name = status == 0 ? demangled.get() : type.name();
  const bool is_class = dynamic_cast<const abi::__class_type_info*>(&type) != nullptr;
  return is_class ? "class " + name : name;
}

}  // namespace Aldermoor::Utilities::Tools
