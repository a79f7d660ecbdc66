#include "aldermoor/vexdoc/elementcloner.h"

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc {

template <class Element>
void ElementCloner::Clone(const Element& element) {
  clone_ = Utilities::Tools::SmartPointer<Header>(new Element(element));
}

void ElementCloner::VisitVex(VEX& vex) try { Clone(vex); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitVex)

void ElementCloner::VisitSampleSet(SampleSet& set) try { Clone(set); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitSampleSet)

void ElementCloner::VisitSample(Sample& sample) try { Clone(sample); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitSample)

void ElementCloner::VisitSpectrum(Spectrum& spectrum) try { Clone(spectrum); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitSpectrum)

void ElementCloner::VisitColorVector(ColorVector& vector) try { Clone(vector); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitColorVector)

void ElementCloner::VisitRecipe(Recipe& recipe) try { Clone(recipe); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitRecipe)

void ElementCloner::VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) try {
  Clone(attribute);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ElementCloner::VisitUnknownSampleAttribute)

}  // namespace Aldermoor::Vexdoc
