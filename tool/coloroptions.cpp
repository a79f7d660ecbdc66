#include "coloroptions.h"

#include <CLI/CLI.hpp>
#include <fmt/format.h>
#include <fmt/ranges.h>

#include "exitstatus.h"
#include "illuminant.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {

void ColorOptions::AddTo(CLI::App& app) {
  const auto words = [](const std::string& key) {
    return std::string(*WordsFor(key));
  };
  app.add_option("--space", space, "Colour space: " + words(kTypeKey))
      ->type_name("WORD")
      ->capture_default_str();
  app.add_option("--illuminant", illuminant,
                 "Illuminant: " + words(kIlluminationKey) +
                     "; a daylight of 4000K to 25000K, such as 6500K; a spectrum of a document as "
                     "@FILE:SET/SAMPLE")
      ->type_name("WORD")
      ->capture_default_str();
  app.add_option("--observer", observer, "Observer: " + words(kObserverKey))
      ->type_name("WORD")
      ->capture_default_str();
  app.add_option("--white-base", white_base, "White base: " + words(kWhiteBaseKey))
      ->type_name("WORD");
  app.add_option("--condition", conditions,
                 "Further condition as KEY=VALUE; may be repeated.  A key outside the vocabulary "
                 "needs CustomCondition=Enable in front of it")
      ->type_name("KEY=VALUE")
      ->allow_extra_args(false);
}

std::string ColorOptions::GetIlluminantFile() const {
  return illuminant.starts_with(kSpectrumMark) ? SpectrumPath::Parse(illuminant).file : "";
}

Vexdoc::Conditions ColorOptions::MakeConditions() const {
  Vexdoc::Conditions request;
  request.AddAttribute(kTypeKey, ConditionValue("--space", kTypeKey, space));
  request.AddAttribute(kObserverKey, ConditionValue("--observer", kObserverKey, observer));
  if (white_base) {
    request.AddAttribute(kWhiteBaseKey, ConditionValue("--white-base", kWhiteBaseKey, *white_base));
  }
  ApplyIlluminant(request);
  ApplyConditions(request);
  return request;
}

void ColorOptions::ApplyIlluminant(Vexdoc::Conditions& request) const {
  if (illuminant.starts_with(kSpectrumMark)) {
    request.SetCustomIllumination(SpectrumPath::Parse(illuminant).Load());
    request.AddAttribute(kIlluminationKey, kUserdefined);
  } else {
    request.AddAttribute(kIlluminationKey,
                         ConditionValue("--illuminant", kIlluminationKey, illuminant));
  }
}

void ColorOptions::ApplyConditions(Vexdoc::Conditions& request) const {
  for (const std::string& condition : conditions) {
    const std::size_t equals = condition.find('=');
    if (equals == std::string::npos || equals == 0) {
      throw UsageError(fmt::format("--condition: '{}' is not of the form KEY=VALUE", condition));
    }
    const std::string key = condition.substr(0, equals);
    const std::string value = condition.substr(equals + 1);
    if (WordsFor(key)) {
      request.AddAttribute(key, ConditionValue("--condition " + key, key, value));
    } else if (request.GetAttribute(kCustomKey, "") == kEnable) {
      request.AddAttribute(key, value);
    } else {
      throw UsageError(fmt::format(
          "--condition: '{}' is not one of {}; other keys need --condition {}={} in front", key,
          fmt::join(AllKeys(), ", "), kCustomKey, kEnable));
    }
  }
}

}  // namespace Aldermoor::Tool
