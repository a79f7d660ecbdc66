#ifndef ALDERMOOR_VEXDOC_ELEMENTVISITOR_H
#define ALDERMOOR_VEXDOC_ELEMENTVISITOR_H

namespace Aldermoor::Vexdoc {

class VEX;
class SampleSet;
class Sample;
class Spectrum;
class ColorVector;
class Recipe;
class UnknownSampleAttribute;

/// One operation per class of document element; an element calls the one for its own class.
class ElementVisitor {
 public:
  virtual void VisitVex(VEX& vex) = 0;
  virtual void VisitSampleSet(SampleSet& set) = 0;
  virtual void VisitSample(Sample& sample) = 0;
  virtual void VisitSpectrum(Spectrum& spectrum) = 0;
  virtual void VisitColorVector(ColorVector& vector) = 0;
  virtual void VisitRecipe(Recipe& recipe) = 0;
  virtual void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) = 0;
  virtual ~ElementVisitor() = default;

 protected:
  ElementVisitor() = default;
  ElementVisitor(const ElementVisitor&) = default;
  ElementVisitor& operator=(const ElementVisitor&) = default;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_ELEMENTVISITOR_H
