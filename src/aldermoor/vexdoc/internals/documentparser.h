#ifndef ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H
#define ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H

#include <map>
#include <string>

#include <xercesc/parsers/XercesDOMParser.hpp>
#include <xercesc/util/SecurityManager.hpp>

#include "aldermoor/vexdoc/internals/parsebudget.h"
#include "aldermoor/vexdoc/internals/xerceserrorreporter.h"

namespace Aldermoor::Vexdoc::Internals {

/// The DOM parser as documents are read with it, and its guards against hostile text.
///
/// - Elements nest to a depth of 256 and have at most 32,768 different names.
/// - Nothing but the source itself is opened; an external entity that is referred to is a failure.
/// - A document type is never validated against: with validation on it is a failure at once, so
///   that the second parse, without, reads the document.
/// - Internal entities are held to 4,096 characters each, expanded, and 1,000 expansions in all;
///   they refer to earlier ones only.  Parameter entities are not read, and a document type makes
///   at most 1,000 declarations.
/// - Memory is held to the budget.
/// Throws: VexXMLParseException with file, line and column; xercesc::OutOfMemoryException beyond
/// the budget.
class DocumentParser : public xercesc::XercesDOMParser {
 public:
  static constexpr unsigned int kDeepestElement = 256;
  static constexpr XMLSize_t kMostElementNames = 32768;
  static constexpr XMLSize_t kLongestEntity = 4096;
  static constexpr XMLSize_t kMostExpansions = 1000;
  static constexpr unsigned int kMostDeclarations = 1000;

  explicit DocumentParser(ParseBudget& budget);

  void resetDocument() override;
  void startElement(const xercesc::XMLElementDecl& decl, unsigned int uri, const XMLCh* prefix,
                    const xercesc::RefVectorOf<xercesc::XMLAttr>& attributes, XMLSize_t count,
                    bool is_empty, bool is_root) override;
  void endElement(const xercesc::XMLElementDecl& decl, unsigned int uri, bool is_root,
                  const XMLCh* prefix) override;

  void doctypeDecl(const xercesc::DTDElementDecl& decl, const XMLCh* public_id,
                   const XMLCh* system_id, bool has_internal, bool has_external) override;
  void attDef(const xercesc::DTDElementDecl& element, const xercesc::DTDAttDef& attribute,
              bool is_ignored) override;
  void elementDecl(const xercesc::DTDElementDecl& decl, bool is_ignored) override;
  void entityDecl(const xercesc::DTDEntityDecl& decl, bool is_parameter_entity,
                  bool is_ignored) override;
  void notationDecl(const xercesc::XMLNotationDecl& decl, bool is_ignored) override;

  xercesc::InputSource* resolveEntity(xercesc::XMLResourceIdentifier* resource) override;

 private:
  XMLSize_t ExpandedLength(const XMLCh* text);
  void CountDeclaration();
  [[noreturn]] void Fail(const std::string& reason);

  XercesErrorReporter reporter_;
  xercesc::SecurityManager limits_;
  unsigned int depth_ = 0;
  unsigned int declarations_ = 0;
  std::map<std::u16string, XMLSize_t> entity_lengths_;  // with what they refer to, in characters
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTPARSER_H
