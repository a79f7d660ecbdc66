#include "aldermoor/vexdoc/completion.h"

#include <utility>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/wavelengths.h"
#include "aldermoor/vexdoc/mandatoryconditions.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc {

namespace {

constexpr std::string_view kCustomCondition = "CustomCondition";

using Texts = std::map<std::string, std::string>;
using Counts = std::map<std::string, std::size_t>;

// Legacy documents may say "Undefined" for a wavelength that they do not know.
bool IsValue(const std::string& key, const std::string& value) {
  const bool is_wavelength =
      key == ConditionKeys::kWavelengthMin || key == ConditionKeys::kWavelengthMax;
  return !is_wavelength || Internals::ReadWavelength(value);
}

bool Names(const Conditions& conditions, const std::string& key) {
  return conditions.HasAttribute(key) && IsValue(key, conditions.GetAttribute(key));
}

// Returns those of the mandatory `keys` that are missing in the end.
std::vector<std::string> Fill(Conditions& conditions, const std::vector<std::string>& keys,
                              const Texts& given, std::vector<std::string>& taken) {
  std::vector<std::string> missing;
  for (const std::string& key : keys) {
    if (Names(conditions, key)) {
      continue;
    }
    if (const auto found = given.find(key); found != given.end() && IsValue(key, found->second)) {
      conditions.AddAttribute(key, found->second);
      taken.push_back(key);
    } else {
      missing.push_back(key);
    }
  }
  return missing;
}

void Share(SampleAttribute& attribute, Conditions conditions) {
  if (!(conditions == *attribute.GetConditions())) {
    attribute.SetConditions(
        Internals::ConditionManager::GetInstance().GetOrCreateConditions(std::move(conditions)));
  }
}

/// One run over a document.
class Completer {
 public:
  explicit Completer(const Completion& completion) : completion_(completion) {}

  CompletionReport Run(const VEX& document) {
    for (const auto& [set_key, set] : document.GetSampleSets()) {
      for (const auto& [sample_key, sample] : set->GetSamples()) {
        for (const auto& [key, attribute] : sample->GetElements()) {
          CompletionReport::Missing missing = Complete(*attribute);
          if (missing.keys.empty() || ++report_.missing_count > CompletionReport::kMostListed) {
            continue;
          }
          missing.set = set->GetName();
          missing.sample = sample->GetName();
          report_.missing.push_back(std::move(missing));
        }
      }
    }
    return std::move(report_);
  }

 private:
  // What is missing; the place is still to be named.
  CompletionReport::Missing Complete(SampleAttribute& attribute) {
    if (const auto* const spectrum = dynamic_cast<const Spectrum*>(&attribute)) {
      return {"", "", true, CompleteSpectrum(attribute, spectrum->GetData().size())};
    }
    const auto* const color = dynamic_cast<const ColorVector*>(&attribute);
    if (color == nullptr || !color->IsStandardColorSpace()) {
      return {};
    }
    const std::string space = color->GetConditions()->GetAttribute(ConditionKeys::kColorSpace, "");
    return {"", "", false,
            Settle(attribute, *color->GetConditions(), MandatoryConditionsOfColors(space),
                   completion_.colors, report_.colors)};
  }

  std::vector<std::string> CompleteSpectrum(SampleAttribute& attribute, std::size_t points) {
    Conditions conditions(*attribute.GetConditions());
    const std::string count = std::to_string(points);
    const bool is_counted = conditions.GetAttribute(ConditionKeys::kPointCount, "") != count;
    if (is_counted) {
      conditions.AddAttribute(ConditionKeys::kPointCount, count);
    }
    const auto missing = Settle(attribute, conditions, MandatoryConditionsOfSpectra(),
                                completion_.spectra, report_.spectra);
    if (is_counted && missing.empty()) {
      ++report_.counted[points];
    }
    return missing;
  }

  static std::vector<std::string> Settle(SampleAttribute& attribute, Conditions conditions,
                                         const std::vector<std::string>& keys, const Texts& given,
                                         Counts& counts) {
    std::vector<std::string> taken;
    std::vector<std::string> missing = Fill(conditions, keys, given, taken);
    if (missing.empty()) {
      Share(attribute, std::move(conditions));
      for (const std::string& key : taken) {
        ++counts[key];
      }
    }
    return missing;
  }

  const Completion& completion_;
  CompletionReport report_;
};

}  // namespace

bool IsConditionOfSpectra(std::string_view key) {
  return key.starts_with("Physical.") || key == kCustomCondition;
}

bool IsConditionOfColors(std::string_view key) {
  return key.starts_with("Colorimetric.") || key.starts_with("ColorSpaceDescription.") ||
         key == kCustomCondition;
}

CompletionReport CompleteConditions(VEX& document, const Completion& completion) try {
  return Completer(completion).Run(document);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CompleteConditions)

}  // namespace Aldermoor::Vexdoc
