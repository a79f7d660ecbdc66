#ifndef ALDERMOOR_TOOL_SETTINGS_H
#define ALDERMOOR_TOOL_SETTINGS_H

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

inline const std::string kWavelengthMinKey = "Physical.WavelengthSpectrumMin";
inline const std::string kWavelengthMaxKey = "Physical.WavelengthSpectrumMax";
inline const std::string kPointCountKey = "Physical.NumberOfDataPointsSpectrum";
inline const std::string kSpectrumTypeKey = "Physical.SpectrumType";

using Texts = std::map<std::string, std::string>;

/// "KEY=VALUE" in two.
struct Setting {
  std::string key;
  std::string value;

  /// Nothing if there is no key.
  static std::optional<Setting> Parse(std::string_view text);
};

/// Conditions of the two kinds that have mandatory ones.
struct KindConditions {
  Texts spectrum;
  Texts color;

  /// Takes over a condition that is not there yet: "Physical." for spectra, "Colorimetric." and
  /// "ColorSpaceDescription." for colours, "CustomCondition" for both, in the words of the
  /// vocabulary and any whole wavelength.  "Spectrum.KEY" and "Color.KEY" take any text for one
  /// kind; a word outside the vocabulary is reported.
  /// Throws: UsageError, with `what` in the text.
  void Add(const std::string& what, const Setting& setting);

 private:
  static void AddAnyText(const std::string& what, const std::string& key, const std::string& value,
                         Texts& conditions);
};

/// The option "--condition".
struct ConditionOption {
  std::vector<std::string> texts;

  void AddTo(CLI::App& app);
  /// Adds them to `conditions`.  Throws: UsageError.
  void ApplyTo(KindConditions& conditions) const;
};

/// Whether KindConditions::Add takes `value` for `key` as it is.
bool IsInVocabulary(const std::string& key, const std::string& value);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_SETTINGS_H
