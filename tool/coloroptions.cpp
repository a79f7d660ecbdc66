#include "coloroptions.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "exitstatus.h"
#include "illuminant.h"
#include "options.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {

void SetIlluminant(Vexdoc::Conditions& request, const std::string& option,
                   const std::string& word) {
  if (word.starts_with(kSpectrumMark)) {
    request.SetCustomIllumination(SpectrumPath::Parse(word, option).Load());
    request.AddAttribute(kIlluminationKey, kUserdefined);
  } else {
    request.AddAttribute(kIlluminationKey, ConditionValue(option, kIlluminationKey, word));
  }
}

void SetReflectionIlluminant(Vexdoc::Conditions& request, const std::string& option,
                             const std::string& word) {
  SetIlluminant(request, option, word);
  if (word == kEmission) {
    throw UsageError(
        fmt::format("{}: '{}' is for lights, and these are reflecting samples", option, word));
  }
}

std::string IlluminantFile(const std::string& word) {
  return word.starts_with(kSpectrumMark) ? SpectrumPath::Parse(word).file : "";
}

std::string IlluminantHelp() {
  return ShownWords(kIlluminationKey) +
         "; a daylight of 4000K to 25000K, such as 6500K; a spectrum of a document as "
         "@FILE:SET/SAMPLE";
}

void ColorOptions::AddTo(CLI::App& app) {
  AddOption(app, "--space", space, "WORD", "Colour space: " + ShownWords(kTypeKey));
  AddViewingTo(app);
  AddOption(app, "--white-base", white_base, "WORD", "White base: " + ShownWords(kWhiteBaseKey));
  AddOption(app, "--condition", conditions, "KEY=VALUE",
            "Further condition as KEY=VALUE; may be repeated.  A key outside the vocabulary "
            "needs CustomCondition=Enable in front of it");
}

void ColorOptions::AddViewingTo(CLI::App& app) {
  AddOption(app, "--illuminant", illuminant, "WORD", "Illuminant: " + IlluminantHelp());
  AddOption(app, "--observer", observer, "WORD", "Observer: " + ShownWords(kObserverKey));
}

Vexdoc::Conditions ColorOptions::MakeConditions() const {
  Vexdoc::Conditions request;
  request.AddAttribute(kTypeKey, ConditionValue("--space", kTypeKey, space));
  request.AddAttribute(kObserverKey, ConditionValue("--observer", kObserverKey, observer));
  if (white_base) {
    request.AddAttribute(kWhiteBaseKey, ConditionValue("--white-base", kWhiteBaseKey, *white_base));
  }
  SetIlluminant(request, "--illuminant", illuminant);
  ApplyConditions(request);
  return request;
}

void ColorOptions::ApplyConditions(Vexdoc::Conditions& request) const {
  for (const std::string& condition : conditions) {
    const std::size_t equals = condition.find('=');
    if (equals == std::string::npos || equals == 0) {
      throw UsageError(fmt::format("--condition: '{}' is not of the form KEY=VALUE", condition));
    }
    const std::string key = condition.substr(0, equals);
    const std::string value = condition.substr(equals + 1);
    if (IsKey(key)) {
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
