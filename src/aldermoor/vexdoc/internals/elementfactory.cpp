#include "aldermoor/vexdoc/internals/elementfactory.h"

#include <string_view>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {
namespace {

template <class Element>
Header* Make() {
  return new Element;
}

struct Kind {
  std::string_view type_name;
  std::string_view element_name;
  Header* (*make)();
};

constexpr Kind kKinds[] = {
    {"VEX", "VEX", Make<VEX>},
    {"VEXSampleSet", "SampleSet", Make<SampleSet>},
    {"VEXSample", "Sample", Make<Sample>},
    {"VEXSpectrum", "Spectrum", Make<Spectrum>},
    {"VEXColorVector", "ColorVector", Make<ColorVector>},
    {"VEXRecipe", "Recipe", Make<Recipe>},
};

}  // namespace

Utilities::Tools::SmartPointer<Header> ElementFactory::CreateElement(
    const std::string& typeName) const try {
  using Element = Utilities::Tools::SmartPointer<Header>;
  for (const Kind& kind : kKinds) {
    if (typeName == kind.element_name || typeName == kind.type_name) {
      return Element(kind.make());
    }
  }
  return Element(new UnknownSampleAttribute(UnknownSampleAttribute::Data(new DataTree)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::ElementFactory::CreateElement)

}  // namespace Aldermoor::Vexdoc::Internals
