#include <algorithm>
#include <array>
#include <bitset>
#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include <pybind11/numpy.h>
#include <pybind11/stl.h>

#include "aldermoor/measure/context.h"
#include "aldermoor/measure/words.h"

#include "lock.h"
#include "module.h"
#include "request.h"
#include "rows.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;
using FloatArray = py::array_t<float>;
using Measure::Context;
using Measure::kBands;

constexpr float kNaN = std::numeric_limits<float>::quiet_NaN();
const std::string kReflectances = "Spectrum";
const std::string kLights = "Emission";

/// What an array holds, and under which conditions.
struct Source {
  Source(const std::string& source, const Viewing& viewing, const py::object& paper)
      : word(source), view(viewing), paper_white(ReadPaper(paper)) {
    CheckWord("source", word, "SOURCES");
  }

  bool IsSpectra() const { return word == kReflectances || word == kLights; }
  // Under the illuminant of lights there is nothing else to see.
  bool IsLights() const {
    return word == kLights || (word == kReflectances && view.HasNamedIlluminant() &&
                               view.illuminant.cast<std::string>() == kLights);
  }

  // With what the result is to be under `key`.  Waits for the library only if it must: others may
  // be at work in it for long.
  Context MakeContext(const char* key, const std::string& value) const {
    std::optional<LibraryLock> lock;
    if (!view.HasNamedIlluminant()) {
      lock.emplace();
    }
    Vexdoc::Conditions target = MakeConditions(view);
    if (paper_white) {
      target.AddAttribute("Colorimetric.WhiteBase", "Paper");
    }
    Vexdoc::Conditions own = IsSpectra() ? Vexdoc::Conditions() : Vexdoc::Conditions(target);
    if (IsLights()) {
      own.AddAttribute("Colorimetric.Illumination", kLights);
    } else if (!IsSpectra()) {
      own.AddAttribute("ColorSpaceDescription.Type", word);
    }
    target.AddAttribute(key, value);
    return Context(target, own, paper_white);
  }

  Rows Read(const char* argument, const py::object& values, const Context& context) const {
    return IsSpectra() ? Rows(argument, values, kBands, Rows::Layout::kAnyStride)
                       : Rows(argument, values, context.GetSourceChannels(), Rows::Layout::kDense);
  }

  std::string word;
  Viewing view;
  std::optional<Bands> paper_white;
};

Measure::SpectrumRows Spectra(const Rows& rows) {
  return {rows.GetValues(), rows.GetStride()};
}

bool IsNaN(float value) {
  return std::isnan(value);
}

// Fills the rows of spectra that are not there, for which the library may give numbers all the
// same: always those of `missing`, its result for a spectrum of NaN.  Rows with other numbers need
// no look at their spectra.
void FillMissing(const Rows& spectra, std::span<const float> missing, std::span<float> results) {
  if (std::ranges::all_of(missing, IsNaN)) {
    return;
  }
  for (std::size_t row = 0; row < spectra.GetCount(); ++row) {
    const auto result = results.subspan(row * missing.size(), missing.size());
    if (std::ranges::equal(result, missing) && std::ranges::any_of(spectra.GetRow(row), IsNaN)) {
      std::ranges::fill(result, kNaN);
    }
  }
}

constexpr auto kMissingSpectrum = [] {
  Bands bands{};
  bands.fill(kNaN);
  return bands;
}();

// Colours that miss a channel have none in another colour space either.  They are found block by
// block before the conversion, which may be in place.
void ConvertColors(const Context& context, std::span<const float> colors,
                   std::span<float> converted) {
  constexpr std::size_t kBlock = 1024;
  const std::size_t from = context.GetSourceChannels();
  const std::size_t to = context.GetTargetChannels();
  const std::size_t rows = converted.size() / to;
  std::size_t begin = 0;
  do {  // no rows at all have their errors too
    const std::size_t count = std::min(kBlock, rows - begin);
    const auto block = colors.subspan(from * begin, from * count);
    const auto results = converted.subspan(to * begin, to * count);
    std::bitset<kBlock> missing;
    const bool is_complete =
        std::ranges::count_if(block, IsNaN) == 0;  // quicker than to stop early
    for (std::size_t row = 0; !is_complete && row < count; ++row) {
      missing.set(row, std::ranges::any_of(block.subspan(from * row, from), IsNaN));
    }
    context.ConvertColors(block, results);
    for (std::size_t row = 0; !is_complete && row < count; ++row) {
      if (missing.test(row)) {
        std::ranges::fill(results.subspan(to * row, to), kNaN);
      }
    }
    begin += count;
  } while (begin < rows);
}

constexpr const char* kConvert =
    R"(convert(values, space="CIELab", *, illuminant="D50", observer="TwoDegree", source="Spectrum", paper=None, out=None)
--

Colours of spectra, or of colours, in the colour space `space`.

values: float32, shape (n, 36): spectra at 380 nm to 730 nm by 10 nm; with a colour space as
    `source`, colours of that space, shape (n, channels).  One row alone may come without the axis
    of rows, and the result has none then either.
illuminant: "D65", "F11" ..., a daylight as "6500K", or 36 numbers of relative power.  Colours are
    taken as those of this illuminant, not adapted to it.  "Emission" makes the spectra those of
    lights.  Daylight is defined from 4000K to 25000K; beyond, it is extrapolated without a
    warning, and the white of 1000K has a negative Z.
source: "Spectrum" for reflectances, 1 = perfect reflector; "Emission" for lights, whose colours
    are their own whatever the illuminant; or the colour space of `values`.
paper: 36 reflectances to which the colours are relative, except those of lights.
out: float32, shape (n, channels), C-contiguous: where the result goes.

Returns float32, shape (n, channels), or `out`.  A row without a colour is NaN, and so is one
that has NaN anywhere in `values`.
Raises MeasureError if there is no way from the source to the space.)";

FloatArray Convert(const py::object& values, const std::string& space, const py::object& illuminant,
                   const std::string& observer, const std::string& source_word,
                   const py::object& paper, const py::object& out) {
  CheckWord("space", space, "COLOR_SPACES");
  const Source source(source_word, {illuminant, observer}, paper);
  const Context context = source.MakeContext("ColorSpaceDescription.Type", space);
  const Rows rows = source.Read("values", values, context);
  FloatArray result =
      MakeResult(out, rows.GetCount(), rows.IsSingle(), context.GetTargetChannels());
  const bool in_place = !source.IsSpectra() && result.data() == rows.GetValues().data() &&
                        context.GetSourceChannels() == 3 && context.GetTargetChannels() == 3;
  if (!in_place) {
    CheckApart(result, rows);
  }
  const std::span<float> colors = ValuesOf(result);
  const py::gil_scoped_release release;
  if (source.IsSpectra()) {
    context.ConvertSpectra(Spectra(rows), colors);
    std::array<float, 3> missing{};
    context.ConvertSpectra(kMissingSpectrum, missing);
    FillMissing(rows, missing, colors);
  } else {
    ConvertColors(context, rows.GetValues(), colors);
  }
  return result;
}

constexpr const char* kDeltaE =
    R"(delta_e(a, b, formula="2000", *, weights=(0.0, 0.0, 0.0), illuminant="D50", observer="TwoDegree", source="Spectrum", paper=None, out=None)
--

Colour differences, row by row; one row on either side is compared with all of the other.

a, b: as `values` of `convert`; `a` is the reference where the formula has one: "94", "CMC",
    "FMCII".
formula: "CIELab", "CIELuv", "LABhx", "FMCII", "CMC", "94", "2000"; for colours, one of "CIELab",
    "CMC", "94", "2000".
weights: l and c of "CMC", kL, kC and kH of "94" and "2000"; 0 for the usual one, 2:1 and 1:1:1.
illuminant, paper: as for `convert`.
source: "Spectrum", "Emission", or the colour space of `a` and `b`: "CIELab", "CIEXYZ" or "RGB".
out: float32, shape (n,), C-contiguous: where the result goes.

Returns float32, shape (n,), or `out`.  A difference that cannot be computed is NaN, and so is one
of rows that have NaN anywhere.
Raises MeasureError if the formula does not take what the source says.)";

FloatArray DeltaE(const py::object& a, const py::object& b, const std::string& formula,
                  const std::array<float, 3>& weights, const py::object& illuminant,
                  const std::string& observer, const std::string& source_word,
                  const py::object& paper, const py::object& out) {
  CheckWord("formula", formula, "FORMULAS");
  const Source source(source_word, {illuminant, observer}, paper);
  const Context context = source.MakeContext("ColorSpaceDescription.DeltaEFormula", formula);
  const Rows first = source.Read("a", a, context);
  const Rows second = source.Read("b", b, context);
  const std::size_t counts[] = {first.GetCount(), second.GetCount()};
  if (counts[0] != counts[1] && counts[0] != 1 && counts[1] != 1) {
    throw py::value_error("a, b: " + std::to_string(counts[0]) + " and " +
                          std::to_string(counts[1]) + " rows cannot be compared one by one");
  }
  FloatArray result = MakeResult(out, counts[0] == 1 ? counts[1] : counts[0],
                                 first.IsSingle() && second.IsSingle(), 0);
  CheckApart(result, first);
  CheckApart(result, second);
  const std::span<float> differences = ValuesOf(result);
  const Measure::DifferenceWeights usual{weights[0], weights[1], weights[2]};
  const py::gil_scoped_release release;
  const std::size_t failed =
      source.IsSpectra()
          ? context.CompareSpectra(Spectra(first), Spectra(second), differences, usual)
          : context.CompareColors(first.GetValues(), second.GetValues(), differences, usual);
  if (failed > 0) {
    std::replace(differences.begin(), differences.end(), Measure::kNoDifference, kNaN);
  }
  return result;
}

constexpr const char* kDensity =
    R"(density(values, standard="DIN", *, paper=None, out=None)
--

Densities of reflectance spectra: black (visual), cyan, magenta, yellow; uncalibrated.

values: float32, shape (n, 36) or (36,), as for `convert`.
standard: "DIN", "DINNB", "ANSIA", "ANSIE", "ANSII", "ANSIT", "SPI".
paper: 36 reflectances whose densities are taken off.
out: float32, shape (n, 4), C-contiguous: where the result goes.

Returns float32, shape (n, 4), or `out`; a row that has NaN anywhere in `values` is NaN.)";

FloatArray Density(const py::object& values, const std::string& standard, const py::object& paper,
                   const py::object& out) {
  CheckWord("standard", standard, "DENSITY_STANDARDS");
  const Measure::DensityOptions options{Measure::DensityStandardOf(standard), !paper.is_none()};
  const std::optional<Bands> paper_white = ReadPaper(paper);
  if (paper_white && std::ranges::all_of(*paper_white, [](float v) { return v <= 0.0F; })) {
    throw py::value_error("paper: expected reflectances of which one at least is above 0");
  }
  const Context context({}, {}, paper_white);
  const Rows rows("values", values, kBands, Rows::Layout::kAnyStride);
  FloatArray result = MakeResult(out, rows.GetCount(), rows.IsSingle(), 4);
  CheckApart(result, rows);
  const std::span<float> densities = ValuesOf(result);
  const py::gil_scoped_release release;
  context.MeasureDensities(Spectra(rows), options, densities);
  std::array<float, 4> missing{};
  context.MeasureDensities(kMissingSpectrum, options, missing);
  FillMissing(rows, missing, densities);
  return result;
}

constexpr const char* kChannels = R"(channels(space)
--

The labels of the channels of a colour space, in order: ("L*", "a*", "b*").)";

py::tuple Channels(const std::string& space) {
  const LibraryLock lock;
  return py::tuple(py::cast(LabelsOf(space)));
}

constexpr const char* kWordsOf = R"(_words_of(key)
--

The words of the library for a key of the conditions, in order.)";

py::tuple WordsOf(const std::string& key) {
  const auto words = Measure::WordsOf(key);
  return py::tuple(py::cast(std::vector<std::string>(words.begin(), words.end())));
}

}  // namespace

void AddArrays(py::module_& module) {
  using py::arg;
  module.def("convert", &Convert, kConvert, arg("values"), arg("space") = "CIELab", py::kw_only(),
             arg("illuminant") = "D50", arg("observer") = "TwoDegree",
             arg("source") = kReflectances, arg("paper") = py::none(), arg("out") = py::none());
  module.def("delta_e", &DeltaE, kDeltaE, arg("a"), arg("b"), arg("formula") = "2000",
             py::kw_only(), arg("weights") = std::array<float, 3>{}, arg("illuminant") = "D50",
             arg("observer") = "TwoDegree", arg("source") = kReflectances,
             arg("paper") = py::none(), arg("out") = py::none());
  module.def("density", &Density, kDensity, arg("values"), arg("standard") = "DIN", py::kw_only(),
             arg("paper") = py::none(), arg("out") = py::none());
  module.def("channels", &Channels, kChannels, arg("space"));
  module.def("_words_of", &WordsOf, kWordsOf, arg("key"));
}

}  // namespace Aldermoor::Python
