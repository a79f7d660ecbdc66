#include "aldermoor/vexdoc/elementtyper.h"

namespace Aldermoor::Vexdoc {

void ElementTyper::VisitVex(VEX& /*vex*/) {
  Set("VEX", "VEX");
}

void ElementTyper::VisitSampleSet(SampleSet& /*set*/) {
  Set("VEXSampleSet", "SampleSet");
}

void ElementTyper::VisitSample(Sample& /*sample*/) {
  Set("VEXSample", "Sample");
}

void ElementTyper::VisitSpectrum(Spectrum& /*spectrum*/) {
  Set("VEXSpectrum", "Spectrum");
}

void ElementTyper::VisitColorVector(ColorVector& /*vector*/) {
  Set("VEXColorVector", "ColorVector");
}

void ElementTyper::VisitRecipe(Recipe& /*recipe*/) {
  Set("VEXRecipe", "Recipe");
}

void ElementTyper::VisitUnknownSampleAttribute(UnknownSampleAttribute& /*attribute*/) {
  Set("VEXUnknownSampleAttribute", "");
}

void ElementTyper::Set(const char* type_name, const char* element_name) {
  type_name_ = type_name;
  element_name_ = element_name;
}

}  // namespace Aldermoor::Vexdoc
