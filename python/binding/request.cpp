#include "request.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <string_view>
#include <vector>

#include <pybind11/stl.h>

#include "aldermoor/measure/words.h"
#include "aldermoor/vexdoc/colorvector.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;

constexpr const char* kIllumination = "Colorimetric.Illumination";
constexpr std::string_view kDaylight = "Dxx, Temperature:";

// "6500" of "6500K" and of the library's own "Dxx, Temperature:6500".
std::string_view TemperatureOf(std::string_view word) {
  if (word.starts_with(kDaylight)) {
    return word.substr(kDaylight.size());
  }
  return word.ends_with('K') ? word.substr(0, word.size() - 1) : std::string_view();
}

std::string IlluminationOf(const std::string& word) {
  const std::string_view digits = TemperatureOf(word);
  if (digits.empty()) {
    CheckWord("illuminant", word, "ILLUMINANTS");
    return word;
  }
  short kelvin = 0;  // as wide as the library keeps it
  const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), kelvin);
  if (error != std::errc() || end != digits.data() + digits.size() || kelvin <= 0) {
    throw py::value_error("illuminant: '" + word + "' is no daylight, which is 1K to " +
                          std::to_string(std::numeric_limits<short>::max()) + "K");
  }
  return std::string(kDaylight) + std::to_string(kelvin);
}

}  // namespace

void CheckWord(const char* argument, const std::string& word, const char* list) {
  const py::tuple tuple = py::module_::import("aldermoor._words").attr(list);
  if (!tuple.contains(word)) {
    const auto texts = tuple.cast<std::vector<std::string>>();
    const std::vector<std::string_view> words(texts.begin(), texts.end());
    throw py::value_error(Measure::NoSuchWord(argument, word, words));
  }
}

void CheckFinite(const char* argument, std::span<const float> values) {
  const auto odd = std::ranges::find_if_not(values, [](float v) { return std::isfinite(v); });
  if (odd != values.end()) {
    throw py::value_error(std::string(argument) + ": expected finite numbers, got " +
                          std::to_string(*odd));
  }
}

Bands ReadBands(const char* argument, const py::object& values) {
  std::vector<float> numbers;
  try {
    numbers = values.cast<std::vector<float>>();
  } catch (const py::cast_error&) {
    throw py::type_error(std::string(argument) + ": expected 36 numbers, got " +
                         py::repr(py::type::of(values)).cast<std::string>());
  }
  Bands bands{};
  if (numbers.size() != bands.size()) {
    throw py::value_error(std::string(argument) + ": expected 36 numbers, got " +
                          std::to_string(numbers.size()));
  }
  CheckFinite(argument, numbers);
  std::copy(numbers.begin(), numbers.end(), bands.begin());
  return bands;
}

std::optional<Bands> ReadPaper(const py::object& paper) {
  return paper.is_none() ? std::nullopt : std::optional<Bands>(ReadBands("paper", paper));
}

Vexdoc::Conditions MakeConditions(const Viewing& viewing) {
  CheckWord("observer", viewing.observer, "OBSERVERS");
  Vexdoc::Conditions conditions;
  conditions.AddAttribute("Colorimetric.Observer", viewing.observer);
  if (viewing.HasNamedIlluminant()) {
    conditions.AddAttribute(kIllumination, IlluminationOf(viewing.illuminant.cast<std::string>()));
  } else {
    conditions.AddAttribute(kIllumination, "Userdefined");
    conditions.SetCustomIllumination(MakeSpectrum(ReadBands("illuminant", viewing.illuminant)));
  }
  return conditions;
}

Vexdoc::Conditions MakeConditions(const Viewing& viewing, const std::string& space) {
  CheckWord("space", space, "COLOR_SPACES");
  Vexdoc::Conditions conditions = MakeConditions(viewing);
  conditions.AddAttribute("ColorSpaceDescription.Type", space);
  return conditions;
}

std::vector<std::string> LabelsOf(const std::string& space) {
  const Vexdoc::Conditions conditions = MakeConditions({py::str("D50"), "TwoDegree"}, space);
  const Vexdoc::ColorVector black(conditions, std::vector<float>(CountChannels(space)));
  std::vector<std::string> labels;
  for (const auto& [label, value] : black.GetDatastore()) {
    labels.push_back(label);
  }
  return labels;
}

Vexdoc::Conditions MakeSpectrumConditions(std::size_t count) {
  Vexdoc::Conditions conditions;
  conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", std::to_string(count));
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  if (count == kSpectrumBands) {
    conditions.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
    conditions.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  }
  return conditions;
}

Vexdoc::Spectrum MakeSpectrum(const Bands& values) {
  return {MakeSpectrumConditions(), std::vector<float>(values.begin(), values.end())};
}

}  // namespace Aldermoor::Python
