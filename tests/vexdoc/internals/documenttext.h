#ifndef ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTTEXT_H
#define ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTTEXT_H

#include <string>

#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Testing {

/// The whole content of a document as text, a line per element, then a line per condition block.
///
/// Blocks are lettered in the order in which attributes refer to them; equal letters mean one
/// object.  Floats are in the shortest form that reads back to the same bits, line feeds are
/// shown as "|".  Time stamps appear only if their text begins with "file", since an element
/// without one carries the time of the load.
std::string DocumentText(const VEX& document);

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTTEXT_H
