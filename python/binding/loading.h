#ifndef ALDERMOOR_PYTHON_LOADING_H
#define ALDERMOOR_PYTHON_LOADING_H

#include <map>
#include <optional>
#include <string>

#include "aldermoor/vexdoc/loadoptions.h"

namespace Aldermoor::Python {

using Texts = std::map<std::string, std::string>;

/// The options of a load from the arguments of Python.  Throws: ValueError for words that are none
/// and keys that are of no kind.
Vexdoc::LoadOptions OptionsOf(const std::optional<Texts>& complete, const std::string& wavelengths);

/// Throws: MissingConditionException if something was still missing after a completion: who asks
/// for one wants a document that can be saved.
void CheckComplete(const Vexdoc::LoadReport& report);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_LOADING_H
