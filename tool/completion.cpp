#include "completion.h"

#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "diagnostics.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

using Utilities::Tools::SmartPointer;
using Vexdoc::Conditions;
using Vexdoc::SampleAttribute;

struct Kind {
  const char* one;
  const char* many;

  std::string Count(std::size_t count) const {
    return fmt::format("{} {}", count, count == 1 ? one : many);
  }
};

constexpr Kind kSpectrum = {"spectrum", "spectra"};
constexpr Kind kColor = {"colour", "colours"};

class Completion {
 public:
  explicit Completion(const KindConditions& given) : given_(given) {}

  bool Run(Vexdoc::VEX& document) {
    for (const auto& [set_key, set] : document.GetSampleSets()) {
      for (const auto& [sample_key, sample] : set->GetSamples()) {
        for (const auto& [key, attribute] : sample->GetElements()) {
          const std::string fault = Complete(*attribute);
          if (!fault.empty()) {
            Fault(
                fmt::format("set '{}', sample '{}': {}", set->GetName(), sample->GetName(), fault));
          }
        }
      }
    }
    if (faults_ > 0) {
      return false;
    }
    ReportResults();
    return true;
  }

 private:
  // Returns what is wrong.
  std::string Complete(SampleAttribute& attribute) {
    if (const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(&attribute)) {
      return CompleteSpectrum(attribute, spectrum->GetData().size());
    }
    const auto* const color = dynamic_cast<const Vexdoc::ColorVector*>(&attribute);
    if (color == nullptr || !color->IsStandardColorSpace()) {
      return "";
    }
    Conditions conditions(*color->GetConditions());
    const std::string type = conditions.GetAttribute(kTypeKey, "");
    std::vector<std::string> keys = {kIlluminationKey, kObserverKey};
    if (type == "RGB" || type == "CMYK") {
      keys.clear();
    }
    return Fill(attribute, conditions, keys, given_.color, kColor);
  }

  std::string CompleteSpectrum(SampleAttribute& attribute, std::size_t points) {
    Conditions conditions(*attribute.GetConditions());
    const std::string count = std::to_string(points);
    if (conditions.GetAttribute(kPointCountKey, "") != count) {
      conditions.AddAttribute(kPointCountKey, count);
      ++counted_[points];
    }
    std::string fault =
        Fill(attribute, conditions, {kSpectrumTypeKey, kWavelengthMinKey, kWavelengthMaxKey},
             given_.spectrum, kSpectrum);
    for (const std::string& key : {kWavelengthMinKey, kWavelengthMaxKey}) {
      const std::string value = conditions.GetAttribute(key, "");
      if (fault.empty() && !Wavelength(value)) {
        fault = fmt::format("{} of a spectrum is '{}', no whole wavelength", key, value);
      }
    }
    return fault;
  }

  // `conditions` are those of `attribute`, perhaps changed.
  std::string Fill(SampleAttribute& attribute, Conditions& conditions,
                   const std::vector<std::string>& keys, const Texts& given, const Kind& kind) {
    std::vector<std::string> missing;
    for (const std::string& key : keys) {
      if (conditions.HasAttribute(key)) {
        continue;
      }
      if (const auto found = given.find(key); found != given.end()) {
        conditions.AddAttribute(key, found->second);
        ++filled_[{kind.one, fmt::format("{}={}", key, found->second)}];
      } else {
        missing.push_back(key);
      }
    }
    if (!missing.empty()) {
      return fmt::format("the conditions of a {} lack {}; --condition KEY=VALUE gives them",
                         kind.one, fmt::join(missing, ", "));
    }
    if (!(conditions == *attribute.GetConditions())) {
      attribute.SetConditions(Vexdoc::SharedConditions(conditions));
    }
    return "";
  }

  void Fault(const std::string& text) {
    constexpr std::size_t kMostReported = 100;
    if (++faults_ <= kMostReported) {
      Report(text);
    }
  }

  void ReportResults() const {
    for (const auto& [points, spectra] : counted_) {
      Report(fmt::format("{} set to {}, the number of values, for {}", kPointCountKey, points,
                         kSpectrum.Count(spectra)));
    }
    ReportGiven(given_.spectrum, kSpectrum);
    ReportGiven(given_.color, kColor);
  }

  void ReportGiven(const Texts& given, const Kind& kind) const {
    for (const auto& [key, value] : given) {
      const std::string text = fmt::format("{}={}", key, value);
      const auto found = filled_.find({kind.one, text});
      Report(found == filled_.end()
                 ? fmt::format("--condition {} is not needed by any {}", text, kind.one)
                 : fmt::format("{} taken for {}", text, kind.Count(found->second)));
    }
  }

  const KindConditions& given_;
  std::map<std::size_t, std::size_t> counted_;                         // points, spectra
  std::map<std::pair<std::string, std::string>, std::size_t> filled_;  // kind and condition
  std::size_t faults_ = 0;
};

}  // namespace

bool CompleteConditions(Vexdoc::VEX& document, const KindConditions& given) {
  return Completion(given).Run(document);
}

}  // namespace Aldermoor::Tool
