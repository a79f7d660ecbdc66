#ifndef ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H
#define ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H

#include <string>

#include <xercesc/parsers/XercesDOMParser.hpp>
#include <xercesc/sax/EntityResolver.hpp>
#include <xercesc/util/SecurityManager.hpp>

#include "aldermoor/vexdoc/internals/xerceserrorreporter.h"

namespace Aldermoor::Vexdoc::Internals {

/// The DOM parser as documents are read with it, and its guards against hostile text.
///
/// Elements nest to a depth of 256.  Nothing but the source itself is opened: an external entity
/// that is referred to is a failure.  Internal entities are held to 4,096 characters each and
/// 1,000 expansions in all, and parameter entities to text without further ones, so that a small
/// file cannot grow.
/// Throws: VexXMLParseException with file, line and column.
class DocumentParser : public xercesc::XercesDOMParser, private xercesc::EntityResolver {
 public:
  static constexpr unsigned int kDeepestElement = 256;
  static constexpr XMLSize_t kLongestEntity = 4096;
  static constexpr XMLSize_t kMostExpansions = 1000;

  DocumentParser();

  void resetDocument() override;
  void startElement(const xercesc::XMLElementDecl& decl, unsigned int uri, const XMLCh* prefix,
                    const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes, XMLSize_t count,
                    bool is_empty, bool is_root) override;
  void endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                  const XMLCh* prefix) override;
  void entityDecl(const xercesc::DTDEntityDecl& decl, bool is_parameter_entity,
                  bool is_ignored) override;

 private:
  xercesc::InputSource* resolveEntity(const XMLCh* public_id, const XMLCh* system_id) override;

  [[noreturn]] void Fail(const std::string& reason) const;

  XercesErrorReporter reporter_;
  xercesc::SecurityManager limits_;
  unsigned int depth_ = 0;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H
