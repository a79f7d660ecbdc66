#include "benchmarks/barestore.h"

#include <algorithm>
#include <cstdio>
#include <list>
#include <map>
#include <stdexcept>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <unistd.h>
#include <xercesc/dom/DOM.hpp>
#include <xercesc/framework/MemBufFormatTarget.hpp>
#include <xercesc/util/XMLUni.hpp>

#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Benchmarks {
namespace {

using Vexdoc::Spectrum;
using Vexdoc::VEX;
using xercesc::DOMDocument;
using xercesc::DOMElement;

std::u16string Widened(const std::string& text) {
  return {text.begin(), text.end()};
}

DOMElement* AppendElement(DOMElement* parent, const XMLCh* name, const std::string& text) {
  DOMDocument* const document = parent->getOwnerDocument();
  DOMElement* const element = document->createElement(name);
  element->appendChild(document->createTextNode(Widened(text).c_str()));
  parent->appendChild(element);
  return element;
}

void AppendHeader(DOMElement* element, const Vexdoc::Header& header) {
  for (const auto& [key, value] : header.GetAttributes()) {
    if (!value.empty()) {
      AppendElement(element, Widened(key).c_str(), value);
    }
  }
}

void AppendSpectrum(DOMElement* parent, const Spectrum& spectrum) {
  DOMDocument* const document = parent->getOwnerDocument();
  DOMElement* const wrapper = document->createElement(u"SampleAttribute");
  DOMElement* const element = document->createElement(u"Spectrum");
  element->setAttribute(u"Conditions", u"1");
  AppendHeader(element, spectrum);
  // One text for all values and wavelengths: how they are made is no part of the yardstick.
  for (std::size_t i = 0; i < spectrum.GetData().size(); ++i) {
    DOMElement* const value = AppendElement(element, u"Value", "0.123456");
    value->setAttribute(u"Name", u"380");
  }
  wrapper->appendChild(element);
  parent->appendChild(wrapper);
}

}  // namespace

struct BareTree::Node {
  using Header = std::map<std::string, std::string>;
  template <class T>
  using Owner = Utilities::Tools::SmartPointer<T>;
  template <class T>
  using List = std::list<std::pair<std::string, Owner<T>>>;

  struct Leaf {
    Header header;
    std::vector<float> data;
  };
  struct Sample {
    Header header;
    List<Leaf> leaves;
  };

  std::map<std::string, Owner<Sample>> index;
  List<Sample> list;
};

BareTree::BareTree(const VEX& model) : root_(new Node) {
  for (const auto& set : model.GetSampleSets()) {
    for (const auto& [name, sample] : set.second->GetSamples()) {
      const Node::Owner<Node::Sample> copy(new Node::Sample{sample->GetAttributes(), {}});
      for (const auto& [label, attribute] : sample->GetElements()) {
        const auto& spectrum = static_cast<const Spectrum&>(*attribute);
        copy->leaves.emplace_back(label, Node::Owner<Node::Leaf>(new Node::Leaf{
                                             spectrum.GetAttributes(), spectrum.GetData()}));
      }
      root_->list.emplace_back(name, copy);
      root_->index.emplace(name, copy);
    }
  }
}

BareTree::~BareTree() = default;

std::size_t SerialiseBareDom(const VEX& model) {
  xercesc::DOMImplementation* const implementation =
      xercesc::DOMImplementationRegistry::getDOMImplementation(u"Core");
  DOMDocument* const document = implementation->createDocument(nullptr, u"VEX", nullptr);
  DOMElement* const root = document->getDocumentElement();
  AppendHeader(root, model);
  for (const auto& set : model.GetSampleSets()) {
    DOMElement* const set_element = document->createElement(u"SampleSet");
    AppendHeader(set_element, *set.second);
    for (const auto& sample : set.second->GetSamples()) {
      DOMElement* const element = document->createElement(u"Sample");
      AppendHeader(element, *sample.second);
      for (const auto& attribute : sample.second->GetElements()) {
        AppendSpectrum(element, static_cast<const Spectrum&>(*attribute.second));
      }
      set_element->appendChild(element);
    }
    root->appendChild(set_element);
  }
  xercesc::DOMLSSerializer* const serializer = implementation->createLSSerializer();
  serializer->getDomConfig()->setParameter(xercesc::XMLUni::fgDOMWRTFormatPrettyPrint, true);
  xercesc::DOMLSOutput* const output = implementation->createLSOutput();
  xercesc::MemBufFormatTarget target;
  output->setByteStream(&target);
  serializer->write(document, output);
  const std::size_t size = target.getLen();
  output->release();
  serializer->release();
  document->release();
  return size;
}

void WriteBareFile(const std::string& path, const std::string& bytes) {
  constexpr std::size_t kChunk = 65536;
  const std::string beside = path + ".tmp";
  const int file = open(beside.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666);
  std::size_t done = 0;
  while (file >= 0 && done < bytes.size()) {
    const ssize_t written = write(file, bytes.data() + done, std::min(kChunk, bytes.size() - done));
    if (written <= 0) {
      break;
    }
    done += static_cast<std::size_t>(written);
  }
  if (file < 0 || done < bytes.size() || fsync(file) != 0 || close(file) != 0 ||
      std::rename(beside.c_str(), path.c_str()) != 0) {
    throw std::runtime_error("cannot write " + path);
  }
}

}  // namespace Aldermoor::Benchmarks
