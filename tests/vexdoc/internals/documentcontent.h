#ifndef ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTCONTENT_H
#define ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTCONTENT_H

#include <string>

#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Testing {

/// What a file has to bring back of a document, as text: without derived attributes, digits beyond
/// the sixth, IDs of condition blocks, the conditions of a custom illumination, and dates.
std::string ContentOf(const VEX& document);

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_INTERNALS_DOCUMENTCONTENT_H
