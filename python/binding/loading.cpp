#include "loading.h"

#include <string_view>

#include <pybind11/pybind11.h>

#include "aldermoor/vexdoc/completion.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "request.h"

namespace Aldermoor::Python {
namespace {

namespace py = pybind11;

Vexdoc::WavelengthUse WavelengthsOf(const std::string& word) {
  CheckWord("wavelengths", word, "WAVELENGTHS");
  return word == "complete"  ? Vexdoc::WavelengthUse::kComplete
         : word == "as told" ? Vexdoc::WavelengthUse::kReport
                             : Vexdoc::WavelengthUse::kRefuse;
}

// Keys go by their kind, or by "Spectrum." or "Color." in front of any other one.
Vexdoc::Completion CompletionOf(const Texts& texts) {
  constexpr std::string_view kSpectrum = "Spectrum.";
  constexpr std::string_view kColor = "Color.";
  Vexdoc::Completion completion;
  for (const auto& [key, value] : texts) {
    if (key.starts_with(kSpectrum)) {
      completion.spectra.emplace(key.substr(kSpectrum.size()), value);
    } else if (key.starts_with(kColor)) {
      completion.colors.emplace(key.substr(kColor.size()), value);
    } else if (!Vexdoc::IsConditionOfSpectra(key) && !Vexdoc::IsConditionOfColors(key)) {
      throw py::value_error("complete: '" + key +
                            "' is a condition of neither kind; write "
                            "Spectrum.KEY or Color.KEY");
    }
    if (Vexdoc::IsConditionOfSpectra(key)) {
      completion.spectra.emplace(key, value);
    }
    if (Vexdoc::IsConditionOfColors(key)) {
      completion.colors.emplace(key, value);
    }
  }
  return completion;
}

// Checks the words that the library would take whatever they are, and puts daylights in its form.
void CheckWords(Vexdoc::Completion& completion) {
  constexpr const char* kIllumination = "Colorimetric.Illumination";
  const auto of = [](Texts& texts, const char* key) {
    const auto found = texts.find(key);
    return found == texts.end() ? nullptr : &found->second;
  };
  if (std::string* const word = of(completion.colors, kIllumination)) {
    *word = MakeConditions({py::str(*word), "TwoDegree"}).GetAttribute(kIllumination);
  }
  if (const std::string* const word = of(completion.colors, "Colorimetric.Observer")) {
    CheckWord("complete", *word, "OBSERVERS");
  }
  if (const std::string* const word = of(completion.spectra, "Physical.SpectrumType")) {
    CheckWord("complete", *word, "SPECTRUM_TYPES");
  }
}

}  // namespace

Vexdoc::LoadOptions OptionsOf(const std::optional<Texts>& complete,
                              const std::string& wavelengths) {
  Vexdoc::LoadOptions options;
  options.wavelengths = WavelengthsOf(wavelengths);
  if (complete) {
    options.completion = CompletionOf(*complete);
    CheckWords(*options.completion);
  }
  return options;
}

void CheckComplete(const Vexdoc::LoadReport& report) {
  if (report.completion.missing_count == 0) {
    return;
  }
  const auto& first = report.completion.missing.front();
  std::string text = "set '" + first.set + "', sample '" + first.sample +
                     "': the conditions of a " + (first.is_spectrum ? "spectrum" : "colour") +
                     " lack ";
  for (const std::string& key : first.keys) {
    text += (&key == &first.keys.front() ? "" : ", ") + key;
  }
  if (report.completion.missing_count > 1) {
    text += "; and " + std::to_string(report.completion.missing_count - 1) + " more attributes";
  }
  throw Vexdoc::MissingConditionException(text + "; complete={KEY: VALUE} gives them", "");
}

}  // namespace Aldermoor::Python
