#ifndef ALDERMOOR_VEXDOC_ELEMENTCLONER_H
#define ALDERMOOR_VEXDOC_ELEMENTCLONER_H

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc {

/// Copies the element that it visits, as the class that it is.
class ElementCloner : public ElementVisitor {
 public:
  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

  /// The last copy; empty before the first visit.
  const Utilities::Tools::SmartPointer<Header>& GetClone() const { return clone_; }

 private:
  template <class Element>
  void Clone(const Element& element);

  Utilities::Tools::SmartPointer<Header> clone_;
};

/// A deep copy of `element`, of the class that it really is.
template <class T>
Utilities::Tools::SmartPointer<T> CloneElement(const T& element) {
  ElementCloner cloner;
  const_cast<T&>(element).AcceptVisitor(cloner);  // the cloner only reads
  return Utilities::Tools::DynamicCast<T>(cloner.GetClone());
}

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_ELEMENTCLONER_H
