#include "aldermoor/vexdoc/internals/placedparser.h"

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/internal/XMLScanner.hpp>
#include <xercesc/sax/Locator.hpp>

namespace Aldermoor::Vexdoc::Internals {

Place PlacedParser::GetPlace(const xercesc::DOMNode& element) const {
  const auto found = places_.find(&element);
  return found == places_.end() ? Place() : found->second;
}

void PlacedParser::resetDocument() {
  next_ = {1, 1};
  places_.clear();
  DocumentParser::resetDocument();
}

void PlacedParser::startElement(const xercesc::XMLElementDecl& decl, unsigned int uri,
                                const XMLCh* prefix,
                                const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes,
                                XMLSize_t count, bool is_empty, bool is_root) {
  const Place start = next_;
  DocumentParser::startElement(decl, uri, prefix, attributes, count, is_empty, is_root);
  places_[fCurrentNode] = start;  // the element, also if it is empty and has been left again
  NotePlace();
}

void PlacedParser::endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                              const XMLCh* prefix) {
  DocumentParser::endElement(decl, uri, is_root, prefix);
  NotePlace();
}

void PlacedParser::docCharacters(const XMLCh* text, XMLSize_t length, bool is_cdata) {
  DocumentParser::docCharacters(text, length, is_cdata);
  NotePlace();
}

void PlacedParser::ignorableWhitespace(const XMLCh* text, XMLSize_t length, bool is_cdata) {
  DocumentParser::ignorableWhitespace(text, length, is_cdata);
  NotePlace();
}

void PlacedParser::docComment(const XMLCh* comment) {
  DocumentParser::docComment(comment);
  NotePlace();
}

void PlacedParser::docPI(const XMLCh* target, const XMLCh* data) {
  DocumentParser::docPI(target, data);
  NotePlace();
}

void PlacedParser::XMLDecl(const XMLCh* version, const XMLCh* encoding, const XMLCh* standalone,
                           const XMLCh* actual_encoding) {
  DocumentParser::XMLDecl(version, encoding, standalone, actual_encoding);
  NotePlace();
}

void PlacedParser::NotePlace() {
  const xercesc::Locator* const place = getScanner()->getLocator();
  next_ = {static_cast<unsigned int>(place->getLineNumber()),
           static_cast<unsigned int>(place->getColumnNumber())};
}

}  // namespace Aldermoor::Vexdoc::Internals
