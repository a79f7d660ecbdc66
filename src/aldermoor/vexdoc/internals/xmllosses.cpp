#include "aldermoor/vexdoc/internals/xmllosses.h"

#include <algorithm>
#include <utility>

#include <xercesc/dom/DOMElement.hpp>
#include <xercesc/dom/DOMNamedNodeMap.hpp>
#include <xercesc/util/XMLString.hpp>

#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::DOMNode;
using xercesc::XMLString;

namespace {

bool IsText(const DOMNode& node) {
  return node.getNodeType() == DOMNode::TEXT_NODE ||
         node.getNodeType() == DOMNode::CDATA_SECTION_NODE;
}

bool IsBlank(const XMLCh* text) {
  return std::all_of(text, text + XMLString::stringLen(text), [](XMLCh c) { return c <= u' '; });
}

std::string RemarkText(const DOMNode& node) {
  switch (node.getNodeType()) {
    case DOMNode::COMMENT_NODE:
      return "a comment is not kept";
    case DOMNode::PROCESSING_INSTRUCTION_NODE:
      return "the processing instruction " + Quoted(ToNativeString(node.getNodeName())) +
             " is not kept";
    case DOMNode::DOCUMENT_TYPE_NODE:
      return "the document type is not kept";
    default:
      return "";
  }
}

// The node behind `node` in the order of the text; null behind the last one.
const DOMNode* Next(const DOMNode* node) {
  if (const DOMNode* const child = node->getFirstChild();
      child != nullptr && node->getNodeType() != DOMNode::DOCUMENT_TYPE_NODE) {
    return child;
  }
  while (node != nullptr && node->getNextSibling() == nullptr) {
    node = node->getParentNode();
  }
  return node == nullptr ? nullptr : node->getNextSibling();
}

}  // namespace

std::string LostAttributes(const NodeHolder& element, const XMLCh* kept) {
  const xercesc::DOMNamedNodeMap* const attributes = element.GetXMLNode().getAttributes();
  for (XMLSize_t i = 0; i < attributes->getLength(); ++i) {
    const XMLCh* const name = attributes->item(i)->getNodeName();
    if (kept == nullptr || !XMLString::equals(name, kept)) {
      return "the attribute " + Quoted(ToNativeString(name)) + " of " + Quoted(element.GetName()) +
             " is not read";
    }
  }
  return "";
}

std::string LostFurtherAttributes(const NodeHolder& element, const XMLCh* kept) {
  const xercesc::DOMNamedNodeMap* const attributes = element.GetXMLNode().getAttributes();
  for (XMLSize_t i = 1; i < attributes->getLength(); ++i) {
    if (kept == nullptr || !XMLString::equals(attributes->item(i)->getNodeName(), kept)) {
      return "of the attributes of " + Quoted(element.GetName()) + " only " +
             Quoted(ToNativeString(attributes->item(0)->getNodeName())) + " is kept";
    }
  }
  return "";
}

std::string LostText(const NodeHolder& element) {
  for (const DOMNode* child = element.GetXMLNode().getFirstChild(); child != nullptr;
       child = child->getNextSibling()) {
    if (IsText(*child) && !IsBlank(child->getNodeValue())) {
      return "the text in " + Quoted(element.GetName()) + " is not read";
    }
  }
  return "";
}

std::string LostRuns(const NodeHolder& element) {
  bool is_first = true;
  for (const DOMNode* child = element.GetXMLNode().getFirstChild(); child != nullptr;
       child = child->getNextSibling()) {
    if (child->getNodeType() == DOMNode::TEXT_NODE && std::exchange(is_first, false)) {
      continue;
    }
    if (IsText(*child) && !IsBlank(child->getNodeValue())) {
      return "the text of " + Quoted(element.GetName()) +
             " is read up to the first element, comment or CDATA section only";
    }
  }
  return "";
}

void FindRemarks(const xercesc::DOMDocument& document,
                 const std::function<void(const NodeHolder&, const std::string&)>& tell) {
  for (const DOMNode* node = document.getFirstChild(); node != nullptr; node = Next(node)) {
    if (const std::string text = RemarkText(*node); !text.empty()) {
      DOMNode* const parent = node->getParentNode();
      tell(NodeHolder(parent->getNodeType() == DOMNode::ELEMENT_NODE
                          ? parent
                          : document.getDocumentElement()),
           text);
    }
  }
}

}  // namespace Aldermoor::Vexdoc::Internals
