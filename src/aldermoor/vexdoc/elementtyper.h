#ifndef ALDERMOOR_VEXDOC_ELEMENTTYPER_H
#define ALDERMOOR_VEXDOC_ELEMENTTYPER_H

#include <string>

#include "aldermoor/vexdoc/elementvisitor.h"

namespace Aldermoor::Vexdoc {

/// Tells the two names of the kind of element that it visits.
class ElementTyper : public ElementVisitor {
 public:
  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

  /// The long name, by which requests select a kind of attribute: "VEXSpectrum".
  const std::string& GetTypeName() const { return type_name_; }
  /// The name of the element in a file: "Spectrum".  Empty for an unknown kind.
  const std::string& GetElementName() const { return element_name_; }

 private:
  void Set(const char* type_name, const char* element_name);

  std::string type_name_;
  std::string element_name_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_ELEMENTTYPER_H
