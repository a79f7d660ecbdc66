#ifndef ALDERMOOR_VEXDOC_INTERNALS_ELEMENTFACTORY_H
#define ALDERMOOR_VEXDOC_INTERNALS_ELEMENTFACTORY_H

#include <string>

#include "aldermoor/utilities/patterns/singleton.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc::Internals {

/// Makes empty document elements by name.
class ElementFactory : public Utilities::Patterns::Singleton<ElementFactory> {
 public:
  /// By element name ("Spectrum") or long type name ("VEXSpectrum").  Any other name makes an
  /// UnknownSampleAttribute.
  Utilities::Tools::SmartPointer<Header> CreateElement(const std::string& typeName) const;

 private:
  friend class Utilities::Patterns::Singleton<ElementFactory>;
  ElementFactory() = default;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_ELEMENTFACTORY_H
