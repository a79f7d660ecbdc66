#include "aldermoor/vexdoc/internals/xerceserrorreporter.h"

#include <iostream>
#include <string>

#include <xercesc/sax/SAXParseException.hpp>

#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vexexception.h"

using Aldermoor::Vexdoc::VexXMLParseException;
using Aldermoor::Vexdoc::Internals::ToNativeString;

namespace {

[[noreturn]] void Throw(const std::string& title, const xercesc::SAXParseException& exception) {
  const std::string message = ToNativeString(exception.getMessage());
  throw VexXMLParseException(message.empty() ? title : title + "\n" + message,
                             ToNativeString(exception.getSystemId()),
                             static_cast<unsigned int>(exception.getLineNumber()),
                             static_cast<unsigned int>(exception.getColumnNumber()), "");
}

}  // namespace

void XercesErrorReporter::warning(const xercesc::SAXParseException& exception) {
  std::cout << "XercesErrorReporter: warning: " << std::endl
            << ToNativeString(exception.getSystemId()) << exception.getLineNumber() << ":"
            << exception.getColumnNumber() << std::endl
            << ToNativeString(exception.getMessage()) << std::endl;
}

void XercesErrorReporter::error(const xercesc::SAXParseException& exception) {
  Throw("Error while parsing XML", exception);
}

void XercesErrorReporter::fatalError(const xercesc::SAXParseException& exception) {
  Throw("Fatal error while parsing XML", exception);
}

void XercesErrorReporter::resetErrors() {}
