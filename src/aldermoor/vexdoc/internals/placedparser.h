#ifndef ALDERMOOR_VEXDOC_INTERNALS_PLACEDPARSER_H
#define ALDERMOOR_VEXDOC_INTERNALS_PLACEDPARSER_H

#include <unordered_map>

#include <xercesc/dom/DOMNode.hpp>

#include "aldermoor/vexdoc/internals/documentparser.h"

namespace Aldermoor::Vexdoc::Internals {

/// A place in a text, counted from 1; 0 if it is not known.
struct Place {
  unsigned int line = 0;
  unsigned int column = 0;
};

/// The document parser with its guards, which also remembers where each element begins.
class PlacedParser : public DocumentParser {
 public:
  using DocumentParser::DocumentParser;

  /// Of the "<" of a start tag.  Elements out of an entity have the place of the reference.
  Place GetPlace(const xercesc::DOMNode& element) const;

  void resetDocument() override;
  void startElement(const xercesc::XMLElementDecl& decl, unsigned int uri, const XMLCh* prefix,
                    const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes, XMLSize_t count,
                    bool is_empty, bool is_root) override;
  void endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                  const XMLCh* prefix) override;
  void docCharacters(const XMLCh* text, XMLSize_t length, bool is_cdata) override;
  void ignorableWhitespace(const XMLCh* text, XMLSize_t length, bool is_cdata) override;
  void docComment(const XMLCh* comment) override;
  void docPI(const XMLCh* target, const XMLCh* data) override;
  void XMLDecl(const XMLCh* version, const XMLCh* encoding, const XMLCh* standalone,
               const XMLCh* actual_encoding) override;

 private:
  void NotePlace();

  // The parser tells of a tag when it stands behind it, so an element begins where the piece
  // before it ended.
  Place next_;
  std::unordered_map<const xercesc::DOMNode*, Place> places_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_PLACEDPARSER_H
