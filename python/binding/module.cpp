#include "module.h"

#include "aldermoor/version.h"
#include "aldermoor/vexdoc/xmlplatform.h"

PYBIND11_MODULE(_core, module) {
  // For good: nobody knows which document is the last.
  static const auto* const platform = new Aldermoor::Vexdoc::XMLPlatform;
  static_cast<void>(platform);

  pybind11::options options;
  options.disable_function_signatures();  // the texts begin with those of Python
  module.attr("__version__") = ALDERMOOR_VERSION;
  Aldermoor::Python::AddErrors();
  Aldermoor::Python::AddDocuments(module);
  Aldermoor::Python::AddArrays(module);
  Aldermoor::Python::AddSingles(module);
}
