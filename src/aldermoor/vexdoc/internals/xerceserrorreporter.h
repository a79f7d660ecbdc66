#ifndef ALDERMOOR_VEXDOC_INTERNALS_XERCESERRORREPORTER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XERCESERRORREPORTER_H

#include <xercesc/sax/ErrorHandler.hpp>

/// Turns what the parser reports into exceptions; warnings go to standard output.
class XercesErrorReporter : public xercesc::ErrorHandler {
 public:
  ~XercesErrorReporter() override = default;

  void warning(const xercesc::SAXParseException& exception) override;
  /// Throws: VexXMLParseException with file, line and column.
  void error(const xercesc::SAXParseException& exception) override;
  /// Throws: VexXMLParseException with file, line and column.
  void fatalError(const xercesc::SAXParseException& exception) override;
  void resetErrors() override;
};

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XERCESERRORREPORTER_H
