#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLCOMPOSER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLCOMPOSER_H

#include <map>
#include <string>
#include <vector>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMElement.hpp>
#include <xercesc/dom/DOMText.hpp>

#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/conditiontable.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Builds the DOM of a document in the current dialect.
///
/// Serves one document.  The Visit operation of an element's class leaves the DOM element in the
/// current node.  Derived attributes are left out.  The condition blocks of those that are written
/// come last, each once, in the order of the IDs' texts. Throws: VexException for text that is not
/// in the code page; XMLFailure for characters that XML does not have and names that are none;
/// InvalidArgumentException for wavelengths that are no numbers; NullPointerException for an
/// attribute without conditions.  VisitVex puts the set and the sample in front of the message.
class XMLComposer : public ElementVisitor {
 public:
  /// `document` makes all nodes and is kept by reference.
  explicit XMLComposer(xercesc::DOMDocument& document);

  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

  /// The result of the last visit; null for an attribute that is left out.
  xercesc::DOMNode* GetCurrentNode() const { return current_; }
  /// Whether an element has both text and elements in it.
  bool HasMixedContent() const { return has_mixed_content_; }

 protected:
  virtual void ComposeMembers(Recipe& recipe, xercesc::DOMElement* element);
  virtual void ComposeMembers(ColorVector& vector, xercesc::DOMElement* element);
  virtual void ComposeMembers(Spectrum& spectrum, xercesc::DOMElement* element);
  virtual void VEXDataTreeComposer(xercesc::DOMElement* element, const DataTree& tree);

 private:
  template <class Node>
  xercesc::DOMElement* VexNodeComposer(Node& node, const XMLCh* name);
  template <class Attribute>
  xercesc::DOMElement* SampleAttributeComposer(Attribute& attribute, const XMLCh* name);
  void Link(xercesc::DOMElement* element, const Conditions& block);
  xercesc::DOMElement* Wrap(xercesc::DOMElement* element);

  void HeaderComposer(xercesc::DOMElement* element, const Header& header, bool isSampleAttribute);
  void SpectrumVectorComposer(xercesc::DOMElement* element, const Conditions& conditions,
                              const std::vector<float>& data);
  void ConditionsComposer(xercesc::DOMElement* parent);

  void SetAttribute(xercesc::DOMElement* element, const std::string& name,
                    const std::string& value);
  xercesc::DOMElement* NewNode(const XMLCh* name);
  xercesc::DOMElement* NewNode(const XMLCh* name, const XMLCh* text);
  void AppendNode(xercesc::DOMElement* parent, const XMLCh* name, const std::string& text);
  // A child element with an attribute "Name".
  void AppendNamed(xercesc::DOMElement* parent, const XMLCh* element, const std::string& name,
                   const XMLCh* text);

  xercesc::DOMDocument& document_;
  xercesc::DOMNode* current_ = nullptr;
  // In whose content the composer is; what a failure names.
  struct Place {
    const Header* set = nullptr;
    const Header* sample = nullptr;
  };

  ConditionTable conditions_;
  std::map<std::string, Place> users_;  // of the blocks, the first of each
  Place place_;
  bool has_mixed_content_ = false;
  // Scratch space.
  XMLChText name_;
  XMLChText text_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLCOMPOSER_H
