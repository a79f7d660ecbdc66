#ifndef ALDERMOOR_TESTS_VEXDOC_INTERNALS_WRITESUPPORT_H
#define ALDERMOOR_TESTS_VEXDOC_INTERNALS_WRITESUPPORT_H

#include <sstream>
#include <string>

#include "aldermoor/vexdoc/internals/binarydumper.h"
#include "aldermoor/vexdoc/internals/binaryloader.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Testing {

inline std::string XmlOf(const VEX& document) {
  std::ostringstream out;
  document.Store(out);
  return out.str();
}

inline std::string CacheOf(const VEX& document) {
  std::ostringstream out;
  Internals::BinaryDumper dumper(out);
  const_cast<VEX&>(document).AcceptVisitor(dumper);  // the dumper only reads
  return out.str();
}

inline Utilities::Tools::SmartPointer<VEX> LoadedCache(const std::string& bytes) {
  std::istringstream in(bytes);
  return Internals::BinaryLoader(in).Load();
}

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_INTERNALS_WRITESUPPORT_H
