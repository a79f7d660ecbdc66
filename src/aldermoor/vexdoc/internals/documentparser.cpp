#include "aldermoor/vexdoc/internals/documentparser.h"

#include <xercesc/internal/XMLScanner.hpp>
#include <xercesc/sax/Locator.hpp>
#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLString.hpp>
#include <xercesc/validators/DTD/DTDEntityDecl.hpp>

#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::XercesDOMParser;
using xercesc::XMLPlatformUtils;

DocumentParser::DocumentParser()
    : XercesDOMParser(nullptr, XMLPlatformUtils::fgMemoryManager, nullptr) {
  setValidationScheme(Val_Auto);
  setDoNamespaces(false);
  setErrorHandler(&reporter_);
  setCreateEntityReferenceNodes(false);
  // Guards; none of them changes what a harmless document looks like.
  setLoadExternalDTD(false);
  setEntityResolver(this);
  limits_.setEntityExpansionLimit(kMostExpansions);
  setSecurityManager(&limits_);
}

void DocumentParser::resetDocument() {
  depth_ = 0;
  XercesDOMParser::resetDocument();
}

void DocumentParser::startElement(const xercesc::XMLElementDecl& decl, unsigned int uri,
                                  const XMLCh* prefix,
                                  const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes,
                                  XMLSize_t count, bool is_empty, bool is_root) {
  if (++depth_ > kDeepestElement) {
    Fail("Elements nest deeper than " + std::to_string(kDeepestElement) + " levels");
  }
  // For an empty element the base calls endElement itself.
  XercesDOMParser::startElement(decl, uri, prefix, attributes, count, is_empty, is_root);
}

void DocumentParser::endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                                const XMLCh* prefix) {
  --depth_;
  XercesDOMParser::endElement(decl, uri, is_root, prefix);
}

void DocumentParser::entityDecl(const xercesc::DTDEntityDecl& decl, bool is_parameter_entity,
                                bool is_ignored) {
  const XMLCh* const text = decl.getValue();
  if (text != nullptr) {
    if (decl.getValueLen() > kLongestEntity) {
      Fail("Entity '" + ToNativeString(decl.getName()) + "' is longer than " +
           std::to_string(kLongestEntity) + " characters");
    }
    if (is_parameter_entity && xercesc::XMLString::indexOf(text, u'%') >= 0) {
      Fail("Parameter entity '" + ToNativeString(decl.getName()) + "' refers to another one");
    }
  }
  XercesDOMParser::entityDecl(decl, is_parameter_entity, is_ignored);
}

xercesc::InputSource* DocumentParser::resolveEntity(const XMLCh* /*public_id*/,
                                                    const XMLCh* system_id) {
  Fail("External entity '" + ToNativeString(system_id) + "' is not opened");
}

void DocumentParser::Fail(const std::string& reason) const {
  const xercesc::Locator* const place = getScanner()->getLocator();
  throw VexXMLParseException("Fatal error while parsing XML\n" + reason,
                             ToNativeString(place->getSystemId()),
                             static_cast<unsigned int>(place->getLineNumber()),
                             static_cast<unsigned int>(place->getColumnNumber()), "");
}

}  // namespace Aldermoor::Vexdoc::Internals
