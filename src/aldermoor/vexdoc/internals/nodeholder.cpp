#include "aldermoor/vexdoc/internals/nodeholder.h"

#include <xercesc/dom/DOMNamedNodeMap.hpp>
#include <xercesc/util/XMLString.hpp>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::NullPointerException;
using xercesc::DOMNamedNodeMap;
using xercesc::DOMNode;
using xercesc::XMLString;

namespace {}  // namespace

DOMNode& NodeHolder::GetXMLNode() const try {
  if (node_ == nullptr) {
    throw NullPointerException(
        node_, ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::NodeHolder::GetXMLNode));
  }
  return *node_;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::GetXMLNode)

NodeHolder NodeHolder::FindChild(const std::string& name, bool mandatory) const try {
  return FindChild(XMLChBuffer(name).Get(), mandatory);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::FindChild)

NodeHolder NodeHolder::FindChild(const XMLCh* name, bool mandatory) const try {
  return NodeHolder(GetXMLNode().getFirstChild()).FindByName(name, mandatory);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::FindChild)

NodeHolder NodeHolder::NextSibling(const std::string& name, bool mandatory) const try {
  return NextSibling(XMLChBuffer(name).Get(), mandatory);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::NextSibling)

NodeHolder NodeHolder::NextSibling(const XMLCh* name, bool mandatory) const try {
  return NodeHolder(GetXMLNode().getNextSibling()).FindByName(name, mandatory);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::NextSibling)

NodeHolder NodeHolder::FindByName(const std::string& name, bool mandatory) const try {
  return FindByName(XMLChBuffer(name).Get(), mandatory);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::FindByName)

NodeHolder NodeHolder::FindByName(const XMLCh* name, bool mandatory) const try {
  const bool any = XMLString::equals(name, kAnyElement);
  for (DOMNode* node = node_; node != nullptr; node = node->getNextSibling()) {
    if (node->getNodeType() == DOMNode::ELEMENT_NODE &&
        (any || XMLString::equals(node->getNodeName(), name))) {
      return NodeHolder(node);
    }
  }
  if (mandatory) {
    throw VexException(
        Filled("Mandatory ELEMENT child node %NAME% not found", "%NAME%", ToNativeString(name)),
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::NodeHolder::FindByName));
  }
  return NodeHolder(nullptr);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::FindByName)

bool NodeHolder::GetAttribute(std::string& name, std::string& value) const try {
  const DOMNode* attribute = nullptr;
  if (name.empty()) {
    attribute = FirstAttribute();
  } else if (const DOMNamedNodeMap* map = GetXMLNode().getAttributes()) {
    attribute = map->getNamedItem(XMLChBuffer(name).Get());
  }
  if (attribute == nullptr) {
    return false;
  }
  name = ToNativeString(attribute->getNodeName());
  value = ToNativeString(attribute->getNodeValue());
  return !name.empty();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::GetAttribute)

const DOMNode* NodeHolder::FirstAttribute() const try {
  const DOMNamedNodeMap* const map = GetXMLNode().getAttributes();
  return map == nullptr || map->getLength() == 0 ? nullptr : map->item(0);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::FirstAttribute)

const XMLCh* NodeHolder::AttributeValue(const XMLCh* name) const try {
  const DOMNamedNodeMap* const map = GetXMLNode().getAttributes();
  const DOMNode* const attribute = map == nullptr ? nullptr : map->getNamedItem(name);
  return attribute == nullptr ? nullptr : attribute->getNodeValue();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::AttributeValue)

std::string NodeHolder::GetName() const try { return ToNativeString(GetXMLNode().getNodeName()); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::GetName)

bool NodeHolder::IsElement(const XMLCh* name) const {
  return node_ != nullptr && node_->getNodeType() == DOMNode::ELEMENT_NODE &&
         XMLString::equals(node_->getNodeName(), name);
}

std::string NodeHolder::GetText() const try { return ToNativeString(TextOrNull()); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::GetText)

float NodeHolder::GetFloat() const try {
  const XMLCh* const text = TextOrNull();
  return text == nullptr ? 0.0F : ReadFloat(text);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::NodeHolder::GetFloat)

const XMLCh* NodeHolder::TextOrNull() const {
  for (const DOMNode* child = GetXMLNode().getFirstChild(); child != nullptr;
       child = child->getNextSibling()) {
    if (child->getNodeType() == DOMNode::TEXT_NODE) {
      return child->getNodeValue();
    }
  }
  return nullptr;
}

}  // namespace Aldermoor::Vexdoc::Internals
