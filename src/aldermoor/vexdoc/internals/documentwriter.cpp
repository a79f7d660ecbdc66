#include "aldermoor/vexdoc/internals/documentwriter.h"

#include <ostream>

#include <xercesc/dom/DOMConfiguration.hpp>
#include <xercesc/dom/DOMImplementationLS.hpp>
#include <xercesc/dom/DOMImplementationRegistry.hpp>
#include <xercesc/dom/DOMLSOutput.hpp>
#include <xercesc/dom/DOMLSSerializer.hpp>
#include <xercesc/dom/DOMLSSerializerFilter.hpp>
#include <xercesc/framework/MemBufFormatTarget.hpp>
#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLUni.hpp>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::DOMNode;
using xercesc::XMLPlatformUtils;
using xercesc::XMLUni;

namespace {

constexpr XMLSize_t kInitialCapacity = 1023;

void SetPretty(xercesc::DOMLSSerializer& serializer, bool pretty) {
  xercesc::DOMConfiguration* const configuration = serializer.getDomConfig();
  if (configuration->canSetParameter(XMLUni::fgDOMWRTFormatPrettyPrint, pretty)) {
    configuration->setParameter(XMLUni::fgDOMWRTFormatPrettyPrint, pretty);
  }
}

// The serialiser asks it in front of every element, and only then writes the line end and the
// indentation of that element.
class MixedContentFilter : public xercesc::DOMLSSerializerFilter {
 public:
  explicit MixedContentFilter(xercesc::DOMLSSerializer& serializer) : serializer_(serializer) {}

  FilterAction acceptNode(const DOMNode* node) const override {
    const DOMNode* const former = node->getPreviousSibling();
    const bool follows_text = former != nullptr && former->getNodeType() == DOMNode::TEXT_NODE &&
                              former->getNodeValue()[0] != 0;
    SetPretty(serializer_, !follows_text);
    return FILTER_ACCEPT;
  }
  ShowType getWhatToShow() const override { return xercesc::DOMNodeFilter::SHOW_ELEMENT; }

 private:
  xercesc::DOMLSSerializer& serializer_;
};

}  // namespace

bool DOMPrintErrorHandler::handleError(const xercesc::DOMError& /*error*/) {
  return false;
}

DocumentWriter::DocumentWriter()
    : implementation_(xercesc::DOMImplementationRegistry::getDOMImplementation(u"Core")),
      document_(implementation_->createDocument(XMLPlatformUtils::fgMemoryManager)) {}

void DocumentWriter::Write(std::ostream& out, bool is_mixed) const {
  const Owner<xercesc::DOMLSSerializer> serializer(
      implementation_->createLSSerializer(XMLPlatformUtils::fgMemoryManager));
  DOMPrintErrorHandler handler;
  serializer->getDomConfig()->setParameter(XMLUni::fgDOMErrorHandler, &handler);
  SetPretty(*serializer, true);
  MixedContentFilter filter(*serializer);
  if (is_mixed) {
    serializer->setFilter(&filter);
  }
  xercesc::MemBufFormatTarget target(kInitialCapacity, XMLPlatformUtils::fgMemoryManager);
  const Owner<xercesc::DOMLSOutput> output(
      implementation_->createLSOutput(XMLPlatformUtils::fgMemoryManager));
  output->setByteStream(&target);
  if (!serializer->write(document_.get(), output.get())) {
    throw VexException("The document could not be serialised",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::DocumentWriter::Write));
  }
  out.write(reinterpret_cast<const char*>(target.getRawBuffer()),
            static_cast<std::streamsize>(target.getLen()));
}

}  // namespace Aldermoor::Vexdoc::Internals
