// What goes through document classes and state of the process, one row at a time: it has the
// library for itself, while the interpreter is left to others.

#include <algorithm>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include <pybind11/numpy.h>
#include <pybind11/stl.h>

#include "aldermoor/measure/judgement.h"
#include "aldermoor/measure/light.h"
#include "aldermoor/measure/measureexception.h"
#include "aldermoor/vexdoc/colorvector.h"

#include "lock.h"
#include "module.h"
#include "request.h"
#include "rows.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;
using FloatArray = py::array_t<float>;

constexpr float kNaN = std::numeric_limits<float>::quiet_NaN();

Rows ReadLights(const py::object& values) {
  return {"values", values, kSpectrumBands, Rows::Layout::kAnyStride};
}

// Calls `use` for every row as a light, with the row's number.
void ForEachLight(const Rows& rows, const std::string& observer,
                  const std::function<void(const Vexdoc::Spectrum&, std::size_t)>& use) {
  const LibraryAlone library;
  Vexdoc::Conditions conditions = MakeSpectrumConditions();
  conditions.AddAttribute("Colorimetric.Illumination", "Emission");
  conditions.AddAttribute("Colorimetric.Observer", observer);
  for (std::size_t i = 0; i < rows.GetCount(); ++i) {
    const std::span<const float> row = rows.GetRow(i);
    use(Vexdoc::Spectrum(conditions, std::vector<float>(row.begin(), row.end())), i);
  }
}

constexpr const char* kColorTemperature =
    R"(color_temperature(values, *, observer="TwoDegree", out=None)
--

Correlated colour temperatures of lights in whole kelvin.

values: float32, shape (n, 36) or (36,): power at 380 nm to 730 nm by 10 nm, in any unit.

Returns float32, shape (n,), or `out`; NaN for a light without a colour temperature.
Raises MeasureError for such a light under "TenDegree": for that observer the search misses the
upper end of the black-body locus, and white lights have no temperature.)";

FloatArray ColorTemperature(const py::object& values, const std::string& observer,
                            const py::object& out) {
  CheckWord("observer", observer, "OBSERVERS");
  const Rows rows = ReadLights(values);
  FloatArray result = MakeResult(out, rows.GetCount(), rows.IsSingle(), 0);
  CheckApart(result, rows);
  const std::span<float> kelvins = ValuesOf(result);
  ForEachLight(rows, observer, [&](const Vexdoc::Spectrum& light, std::size_t i) {
    kelvins[i] = Measure::ColorTemperature(light).value_or(kNaN);
  });
  return result;
}

constexpr const char* kColorRendering = R"(color_rendering(values)
--

General colour rendering indices Ra of lights, by CIE 13.3-1995, for the two-degree observer.

values: float32, shape (n, 36) or (36,), as for `color_temperature`.

Returns a ColorRendering with the arrays `ra`, `valid` and `reference`, shape (n,).)";

py::object ColorRendering(const py::object& values) {
  const Rows rows = ReadLights(values);
  FloatArray ra = MakeResult(py::none(), rows.GetCount(), rows.IsSingle(), 0);
  py::array_t<bool> valid(std::vector<py::ssize_t>(ra.shape(), ra.shape() + ra.ndim()));
  const std::span<float> values_of_ra = ValuesOf(ra);
  bool* const validities = valid.mutable_data();
  std::vector<std::string> references(rows.GetCount());
  ForEachLight(rows, "TwoDegree", [&](const Vexdoc::Spectrum& light, std::size_t i) {
    // Without a colour temperature there is nothing to take the rendering against.
    const bool possible = Measure::ColorTemperature(light).has_value();
    const auto rendering =
        possible ? Measure::ColorRenderingOf(light) : Measure::ColorRendering{kNaN, false, ""};
    values_of_ra[i] = rendering.index;
    validities[i] = rendering.valid;
    references[i] = possible && rendering.reference.empty() ? "black body" : rendering.reference;
  });
  const py::object texts = py::module_::import("numpy")
                               .attr("array")(references, py::arg("dtype") = "U10")
                               .attr("reshape")(ra.attr("shape"));
  return py::module_::import("aldermoor._results").attr("ColorRendering")(ra, valid, texts);
}

constexpr const char* kReconstruct =
    R"(reconstruct(colors, source="CIELab", *, illuminant="D50", observer="TwoDegree", out=None)
--

Reflectance spectra for colours, whose CIELab differs from that of the colour by less than 0.1.

A spectrum is one of the many with that colour, not that of any real surface: jagged, since a
search moves one band after the other away from a grey of 0.5, and a match under this illuminant
and observer only.

colors: float32, shape (n, 3) or (3,).
source: their colour space: "CIELab", "CIEXYZ" or "RGB".

Returns float32, shape (n, 36), or `out`: reflectances from 0 to 1; NaN in the rows of colours that
no such spectrum has.)";

FloatArray Reconstruct(const py::object& colors, const std::string& source,
                       const py::object& illuminant, const std::string& observer,
                       const py::object& out) {
  CheckWord("source", source, "RECONSTRUCTIBLE");
  const Rows rows("colors", colors, 3, Rows::Layout::kDense);
  FloatArray result = MakeResult(out, rows.GetCount(), rows.IsSingle(), kSpectrumBands);
  CheckApart(result, rows);
  const std::span<float> spectra = ValuesOf(result);
  const LibraryLock lock;
  const Vexdoc::Conditions conditions = MakeConditions({illuminant, observer}, source);
  const LibraryAlone library;
  for (std::size_t i = 0; i < rows.GetCount(); ++i) {
    const std::span<const float> row = rows.GetRow(i);
    const std::span<float> spectrum = spectra.subspan(i * kSpectrumBands, kSpectrumBands);
    try {
      const Vexdoc::ColorVector color(conditions, std::vector<float>(row.begin(), row.end()));
      std::ranges::copy(Measure::SpectrumOfColor(color).GetData(), spectrum.begin());
    } catch (const Measure::MeasureException&) {
      std::ranges::fill(spectrum, kNaN);
    }
  }
  return result;
}

}  // namespace

void AddSingles(py::module_& module) {
  using py::arg;
  module.def("color_temperature", &ColorTemperature, kColorTemperature, arg("values"),
             py::kw_only(), arg("observer") = "TwoDegree", arg("out") = py::none());
  module.def("color_rendering", &ColorRendering, kColorRendering, arg("values"));
  module.def("reconstruct", &Reconstruct, kReconstruct, arg("colors"), arg("source") = "CIELab",
             py::kw_only(), arg("illuminant") = "D50", arg("observer") = "TwoDegree",
             arg("out") = py::none());
}

}  // namespace Aldermoor::Python
