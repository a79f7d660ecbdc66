#include "attributes.h"

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

#include "samplevalues.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;
using Vexdoc::ColorVector;
using Vexdoc::Recipe;
using Vexdoc::SampleAttribute;
using Vexdoc::Spectrum;

using Texts = std::map<std::string, std::string>;

py::object ToItem(const Vexdoc::DataTree& tree) {
  py::list children;
  for (const auto& child : tree.GetChildren()) {
    children.append(ToItem(*child));
  }
  return py::module_::import("aldermoor._results")
      .attr("Item")(tree.GetName(), tree.GetValue(), tree.GetAttributes(), py::tuple(children));
}

py::object ContentOf(const SampleAttribute& attribute) {
  const LibraryLock lock;
  if (attribute.GetType() != "VEXUnknownSampleAttribute") {
    return py::none();
  }
  // By what it says of itself: the class is none that a program can name.
  const auto data = static_cast<const Vexdoc::UnknownSampleAttribute&>(attribute).GetData();
  return data.IsNull() ? py::object(py::none()) : ToItem(*data);
}

py::object CustomIlluminationOf(const SampleAttribute& attribute) {
  const LibraryLock lock;
  const auto& conditions = attribute.GetConditions();
  return conditions.IsNull() || !conditions->HasCustomIllumination()
             ? py::object(py::none())
             : ToArray(conditions->GetCustomIllumination().GetData());
}

void AddBaseClass(py::module_& module) {
  py::class_<SampleAttribute, Owner<SampleAttribute>> type(
      module, "Attribute", "What a sample holds: a value under conditions.");
  AddHeader(type);
  type.def_property_readonly(
      "kind",
      [](const SampleAttribute& self) {
        const LibraryLock lock;
        return self.GetType();
      },
      "\"VEXSpectrum\", \"VEXColorVector\", \"VEXRecipe\" or \"VEXUnknownSampleAttribute\".");
  type.def_property_readonly(
      "conditions",
      [](const SampleAttribute& self) {
        const LibraryLock lock;
        return self.GetConditions().IsNull() ? Texts() : self.GetConditions()->GetAttributes();
      },
      "The conditions of the value, as a new dict.");
  type.def_property_readonly(
      "custom_illumination", &CustomIlluminationOf,
      "The illuminant of the conditions where they say \"Userdefined\": float32, shape (36,).");
  type.def_property_readonly("content", &ContentOf,
                             "What an attribute of an unknown kind holds, as an Item; else None.");
}

void AddSpectrumClass(py::module_& module) {
  py::class_<Spectrum, SampleAttribute, Owner<Spectrum>> type(
      module, "Spectrum", "A measured spectrum; reflectance, 1 = perfect reflector.");
  type.def_property_readonly(
      "values",
      [](const Spectrum& self) {
        const LibraryLock lock;
        return ToArray(self.GetData());
      },
      "float32, shape (36,) as a rule; a copy.");
}

void AddColorVectorClass(py::module_& module) {
  py::class_<ColorVector, SampleAttribute, Owner<ColorVector>> type(
      module, "ColorVector", "A stored colour: named channels under conditions.");
  type.def_property_readonly(
      "space",
      [](const ColorVector& self) {
        const LibraryLock lock;
        return self.GetConditions().IsNull()
                   ? std::string()
                   : self.GetConditions()->GetAttribute("ColorSpaceDescription.Type", "");
      },
      "The word of the colour space; not only those of COLOR_SPACES.");
  type.def_property_readonly(
      "labels",
      [](const ColorVector& self) {
        const LibraryLock lock;
        py::list labels;
        for (const auto& [label, value] : self.GetDatastore()) {
          labels.append(label);
        }
        return py::tuple(labels);
      },
      "The names of the channels.");
  type.def_property_readonly(
      "values",
      [](const ColorVector& self) {
        const LibraryLock lock;
        std::vector<float> values;
        for (const auto& [label, value] : self.GetDatastore()) {
          values.push_back(value);
        }
        return ToArray(values);
      },
      "float32, shape (channels,); a copy.");
}

void AddRecipeClass(py::module_& module) {
  py::class_<Recipe, SampleAttribute, Owner<Recipe>> type(
      module, "Recipe", "How a colour is mixed.  Units are those of the application.");
  const auto member = [&type](const char* name, auto get, const char* help) {
    type.def_property_readonly(
        name,
        [get](const Recipe& self) {
          const LibraryLock lock;
          return (self.*get)();
        },
        help);
  };
  member("assortment", &Recipe::GetAssortmentName, "The name of the assortment of the components.");
  member("thickness", &Recipe::GetThickness, "The thickness of the layer.");
  member("substrate", &Recipe::GetSubstrateLinkName, "The name of what lies under the layer.");
  type.def_property_readonly(
      "components",
      [](const Recipe& self) {
        const LibraryLock lock;
        return std::vector<std::pair<std::string, float>>(self.GetComponents().begin(),
                                                          self.GetComponents().end());
      },
      "Name and concentration of each, as a new list.");
}

}  // namespace

void AddAttributeClasses(py::module_& module) {
  AddBaseClass(module);
  AddSpectrumClass(module);
  AddColorVectorClass(module);
  AddRecipeClass(module);
}

}  // namespace Aldermoor::Python
