#include "benchmarks/operations.h"

#include <istream>
#include <stdexcept>
#include <streambuf>
#include <string>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/framework/LocalFileInputSource.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/parsers/XercesDOMParser.hpp>
#include <xercesc/sax/HandlerBase.hpp>
#include <xercesc/util/SecurityManager.hpp>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/documentparser.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"

namespace Aldermoor::Benchmarks {
namespace {

using Vexdoc::Internals::DocumentParser;

/// Reads a text where it stands; a std::istringstream would count a copy of its own.
class TextBuffer : public std::streambuf {
 public:
  explicit TextBuffer(const std::string& text) {
    char* const begin = const_cast<char*>(text.data());  // a get area is never written to
    setg(begin, begin, begin + text.size());
  }
};

void ParseFrom(const xercesc::InputSource& source) {
  xercesc::HandlerBase silent;
  xercesc::SecurityManager limits;
  limits.setEntityExpansionLimit(DocumentParser::kMostExpansions);
  xercesc::XercesDOMParser parser;
  parser.setValidationScheme(xercesc::XercesDOMParser::Val_Auto);
  parser.setDoNamespaces(false);
  parser.setErrorHandler(&silent);
  parser.setCreateEntityReferenceNodes(false);
  parser.setLoadExternalDTD(false);
  parser.setSecurityManager(&limits);
  parser.parse(source);
  if (parser.getDocument() == nullptr || parser.getDocument()->getDocumentElement() == nullptr) {
    throw std::runtime_error("the bare parser gave no document");
  }
}

}  // namespace

const char* NameOf(Source source) {
  return source == Source::kStream ? "stream" : "file";
}

void Load(Vexdoc::VEX& vex, const Document& document, Source source) {
  if (source == Source::kFile) {
    vex.LoadXML(Utilities::FileSystem::File(document.path), false);
    return;
  }
  TextBuffer buffer(document.text);
  std::istream in(&buffer);
  vex.Load(in);
}

void Parse(const Document& document, Source source) {
  if (source == Source::kFile) {
    ParseFrom(xercesc::LocalFileInputSource(Vexdoc::Internals::XMLChBuffer(document.path).Get()));
    return;
  }
  ParseFrom(xercesc::MemBufInputSource(reinterpret_cast<const XMLByte*>(document.text.data()),
                                       document.text.size(), "VEX"));
}

void ForgetConditions() {
  Vexdoc::Internals::ConditionManager::GetInstance().RemoveAllConditions(true);
}

}  // namespace Aldermoor::Benchmarks
