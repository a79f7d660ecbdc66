#ifndef ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTCHECKER_H
#define ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTCHECKER_H

#include <map>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Walks over a document as XMLComposer does, but builds nothing and goes on behind a fault.  What
/// the composer, XMLLoader or the parser with its guards would refuse is a fault, and what they
/// would change.  Serves one document.
class DocumentChecker : public ElementVisitor {
 public:
  /// Throws: VexException if the XML platform is not initialised.
  std::vector<DocumentFault> Check(const VEX& document);

  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

 private:
  // Notes the attribute, and checks its header and its conditions; false if it is not written.
  template <class Attribute>
  bool EnterAttribute(Attribute& attribute, const char* kind);
  void NamePlace(const std::string& kind, const std::string& name);
  void CheckHeader(const Header& header);
  // Null for attributes without conditions, and then that is told.
  const Conditions* CheckConditions(const SampleAttribute& attribute);
  void CheckBlock(const Conditions& block);
  void CheckIllumination(const Conditions& block);
  void CheckRange(const Conditions& conditions);
  void CheckSteps(const std::string& whose, const Conditions& conditions, std::size_t points);
  void CheckTree(const DataTree& tree, unsigned int depth);
  void CheckTreeName(const std::string& what, const std::string& name);
  void CheckTreeAttributes(const DataTree& tree, unsigned int depth);
  void CheckTreeHeader(const Header& header, const DataTree& tree);

  void CheckText(const std::string& what, const std::string& text);
  void CheckNumber(const std::string& what, float value);
  void CheckNumbers(const std::string& what, const std::vector<float>& values);
  // The name of an element that is written; the parser takes so many and no more.
  void UseName(std::string_view name);
  void Add(const std::string& reason);

  DocumentFault place_;
  unsigned int index_ = 0;  // of the attribute in its sample, from 1
  std::set<std::string, std::less<>> names_;
  std::set<const Conditions*> blocks_;
  std::vector<DocumentFault> faults_;
  XMLChText text_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTCHECKER_H
