#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLLOSSES_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLLOSSES_H

#include <functional>
#include <string>

#include <xercesc/dom/DOMDocument.hpp>

#include "aldermoor/vexdoc/internals/nodeholder.h"

/// What stands in a text and is in no document that is read from it, in words; empty for nothing.
namespace Aldermoor::Vexdoc::Internals {

/// Of the attributes but `kept`, which may be null.
std::string LostAttributes(const NodeHolder& element, const XMLCh* kept);
/// Of all attributes but the first one, in the order of their names, and `kept`, which may be null.
std::string LostFurtherAttributes(const NodeHolder& element, const XMLCh* kept = nullptr);
/// Of the text between the children of an element that holds nothing but elements.
std::string LostText(const NodeHolder& element);
/// Of the text of an element with text: what stands behind its first run.
std::string LostRuns(const NodeHolder& element);

/// Calls `tell(element, words)` for every comment, processing instruction and document type, with
/// the element that holds it, the root for those outside of it.
void FindRemarks(const xercesc::DOMDocument& document,
                 const std::function<void(const NodeHolder&, const std::string&)>& tell);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLLOSSES_H
