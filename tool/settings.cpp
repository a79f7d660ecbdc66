#include "settings.h"

#include <algorithm>
#include <charconv>
#include <cstdint>
#include <system_error>
#include <vector>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/vexdoc/completion.h"

#include "diagnostics.h"
#include "exitstatus.h"
#include "options.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::string_view kSpectrumPrefix = "Spectrum.";
constexpr std::string_view kColorPrefix = "Color.";

std::string_view Trimmed(std::string_view text) {
  const std::size_t first = std::min(text.find_first_not_of(' '), text.size());
  return text.substr(first, text.find_last_not_of(' ') + 1 - first);
}

bool IsWavelengthKey(const std::string& key) {
  return key == kWavelengthMinKey || key == kWavelengthMaxKey;
}

// Who types a wavelength means all of what is typed.
bool IsWholeWavelength(std::string_view text) {
  if (text.ends_with("nm")) {
    text.remove_suffix(2);
  }
  std::int16_t wavelength = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), wavelength);
  return error == std::errc() && end == text.data() + text.size();
}

// `value` in the form that the library reads.
std::string Checked(const std::string& what, const std::string& key, const std::string& value) {
  if (!IsWavelengthKey(key)) {
    return ConditionValue(what, key, value);
  }
  if (!IsWholeWavelength(value)) {
    throw UsageError(fmt::format("{}: '{}' is no whole wavelength such as 380nm", what, value));
  }
  return value;
}

}  // namespace

std::optional<Setting> Setting::Parse(std::string_view text) {
  const std::size_t equals = text.find('=');
  if (equals == std::string_view::npos || equals == 0) {
    return std::nullopt;
  }
  return Setting{std::string(text.substr(0, equals)), std::string(text.substr(equals + 1))};
}

bool IsInVocabulary(const std::string& key, const std::string& value) {
  if (!IsKey(key)) {
    return false;
  }
  if (key == kIlluminationKey && value.starts_with("Dxx")) {
    return false;  // its temperature would be checked, with a message
  }
  try {
    return Checked("", key, value) == value;
  } catch (const UsageError&) {
    return false;
  }
}

void KindConditions::Add(const std::string& what, const Setting& setting) {
  if (setting.key.starts_with(kSpectrumPrefix)) {
    AddAnyText(what, setting.key.substr(kSpectrumPrefix.size()), setting.value, spectrum);
    return;
  }
  if (setting.key.starts_with(kColorPrefix)) {
    AddAnyText(what, setting.key.substr(kColorPrefix.size()), setting.value, color);
    return;
  }
  const std::string key(Trimmed(setting.key));
  if (!IsKey(key)) {
    throw UsageError(fmt::format(
        "{}: '{}' is not one of {}; a key of your own is written Spectrum.KEY or Color.KEY", what,
        key, fmt::join(AllKeys(), ", ")));
  }
  const std::string value = Checked(what + " " + key, key, std::string(Trimmed(setting.value)));
  if (Vexdoc::IsConditionOfSpectra(key)) {
    spectrum.emplace(key, value);
  }
  if (Vexdoc::IsConditionOfColors(key)) {
    color.emplace(key, value);
  }
}

void KindConditions::AddAnyText(const std::string& what, const std::string& key,
                                const std::string& value, Texts& conditions) {
  if (key.empty()) {
    throw UsageError(fmt::format("{}: a condition without a key", what));
  }
  if (IsKey(key) && !IsInVocabulary(key, value) && !value.starts_with("Dxx")) {
    Report(fmt::format("{}: '{}' is no word of {}; it is taken as it is", what, value, key));
  }
  conditions.emplace(key, value);
}

void ConditionOption::AddTo(CLI::App& app) {
  AddOption(app, "--condition", texts, "KEY=VALUE",
            "Condition as KEY=VALUE, for what the input does not give; may be repeated.  "
            "Spectrum.KEY=VALUE and Color.KEY=VALUE take any key and text");
}

void ConditionOption::ApplyTo(KindConditions& conditions) const {
  for (const std::string& text : texts) {
    const std::optional<Setting> setting = Setting::Parse(text);
    if (!setting) {
      throw UsageError(fmt::format("--condition: '{}' is not of the form KEY=VALUE", text));
    }
    conditions.Add("--condition", *setting);
  }
}

}  // namespace Aldermoor::Tool
