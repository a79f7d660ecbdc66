#include "aldermoor/vexdoc/internals/documentparser.h"

#include <xercesc/internal/XMLScanner.hpp>
#include <xercesc/sax/Locator.hpp>
#include <xercesc/util/XMLResourceIdentifier.hpp>
#include <xercesc/validators/DTD/DTDEntityDecl.hpp>

#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::XercesDOMParser;

DocumentParser::DocumentParser(ParseBudget& budget) : XercesDOMParser(nullptr, &budget, nullptr) {
  setValidationScheme(Val_Auto);
  setDoNamespaces(false);
  setErrorHandler(&reporter_);
  setCreateEntityReferenceNodes(false);
  // Guards; a document without a document type meets only those of memory and of depth.
  setLoadExternalDTD(false);
  getScanner()->setEntityHandler(this);  // without it the scanner opens entities by itself
  limits_.setEntityExpansionLimit(kMostExpansions);
  setSecurityManager(&limits_);
}

void DocumentParser::resetDocument() {
  depth_ = 0;
  declarations_ = 0;
  entity_lengths_ = {{u"amp", 1}, {u"lt", 1}, {u"gt", 1}, {u"quot", 1}, {u"apos", 1}};
  XercesDOMParser::resetDocument();
}

void DocumentParser::startElement(const xercesc::XMLElementDecl& decl, unsigned int uri,
                                  const XMLCh* prefix,
                                  const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes,
                                  XMLSize_t count, bool is_empty, bool is_root) {
  if (++depth_ > kDeepestElement) {
    Fail("Elements nest deeper than " + std::to_string(kDeepestElement) + " levels");
  }
  // The parser's table of names has a fixed number of slots.
  if (decl.getId() > kMostElementNames &&
      decl.getId() != xercesc::XMLElementDecl::fgInvalidElemId) {
    Fail("There are more than " + std::to_string(kMostElementNames) +
         " different names of elements");
  }
  // For an empty element the base calls endElement itself.
  XercesDOMParser::startElement(decl, uri, prefix, attributes, count, is_empty, is_root);
}

void DocumentParser::endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                                const XMLCh* prefix) {
  --depth_;
  XercesDOMParser::endElement(decl, uri, is_root, prefix);
}

void DocumentParser::doctypeDecl(const xercesc::DTDElementDecl& decl, const XMLCh* public_id,
                                 const XMLCh* system_id, bool has_internal, bool has_external) {
  // The automaton of a content model can be exponentially larger than its text, and nothing that
  // validation finds would keep a document from being read.
  if (getValidationScheme() != Val_Never) {
    Fail("Document types are not validated against");
  }
  XercesDOMParser::doctypeDecl(decl, public_id, system_id, has_internal, has_external);
}

void DocumentParser::attDef(const xercesc::DTDElementDecl& element,
                            const xercesc::DTDAttDef& attribute, bool is_ignored) {
  CountDeclaration();
  XercesDOMParser::attDef(element, attribute, is_ignored);
}

void DocumentParser::elementDecl(const xercesc::DTDElementDecl& decl, bool is_ignored) {
  CountDeclaration();
  XercesDOMParser::elementDecl(decl, is_ignored);
}

void DocumentParser::entityDecl(const xercesc::DTDEntityDecl& decl, bool is_parameter_entity,
                                bool is_ignored) {
  CountDeclaration();
  if (decl.getValue() != nullptr) {
    if (is_parameter_entity) {
      Fail("Parameter entity '" + ToNativeString(decl.getName()) + "' is not read");
    }
    const XMLSize_t length = ExpandedLength(decl.getValue());
    if (length > kLongestEntity) {
      Fail("Entity '" + ToNativeString(decl.getName()) + "' is longer than " +
           std::to_string(kLongestEntity) + " characters");
    }
    entity_lengths_.emplace(decl.getName(), length);  // the first declaration of a name counts
  }
  XercesDOMParser::entityDecl(decl, is_parameter_entity, is_ignored);
}

void DocumentParser::notationDecl(const xercesc::XMLNotationDecl& decl, bool is_ignored) {
  CountDeclaration();
  XercesDOMParser::notationDecl(decl, is_ignored);
}

xercesc::InputSource* DocumentParser::resolveEntity(xercesc::XMLResourceIdentifier* resource) {
  Fail("External entity '" + ToNativeString(resource->getSystemId()) + "' is not opened");
}

// With the entities that the text refers to, and those that they refer to.  The parser counts no
// expansions in the default of an attribute, so none may be large.
XMLSize_t DocumentParser::ExpandedLength(const XMLCh* text) {
  XMLSize_t length = 0;
  for (const XMLCh* c = text; *c != 0 && length <= kLongestEntity; ++c) {
    ++length;
    if (*c != u'&' || c[1] == u'#') {
      continue;
    }
    const XMLCh* const name = c + 1;
    while (*c != 0 && *c != u';') {
      ++c;
    }
    const auto entity = entity_lengths_.find(std::u16string(name, c));
    if (entity == entity_lengths_.end()) {
      Fail("Entity '" + ToNativeString(std::u16string(name, c).c_str()) +
           "' is not declared before another one refers to it");
    }
    length += entity->second;
    if (*c == 0) {
      break;
    }
  }
  return length;
}

void DocumentParser::CountDeclaration() {
  if (++declarations_ > kMostDeclarations) {
    Fail("The document type makes more than " + std::to_string(kMostDeclarations) +
         " declarations");
  }
}

void DocumentParser::Fail(const std::string& reason) {
  const xercesc::Locator* const place = getScanner()->getLocator();
  throw VexXMLParseException("Fatal error while parsing XML\n" + reason,
                             ToNativeString(place->getSystemId()),
                             static_cast<unsigned int>(place->getLineNumber()),
                             static_cast<unsigned int>(place->getColumnNumber()), "");
}

}  // namespace Aldermoor::Vexdoc::Internals
