#include "aldermoor/vexdoc/internals/wavelengths.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <stdexcept>
#include <system_error>

#include "aldermoor/utilities/tools/lexicalcast.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/attributerules.h"
#include "aldermoor/vexdoc/internals/customillumination.h"
#include "aldermoor/vexdoc/internals/faulttext.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

constexpr const char* kBlanks = " \t\n\v\f\r";
constexpr const char* kDigits = "0123456789";
constexpr const char* kDefaultMin = "380";
constexpr const char* kDefaultMax = "730";

std::int16_t RangeEnd(const Conditions& conditions, const char* key, const char* fallback) {
  const auto read = ReadWavelength(conditions.GetAttribute(key, fallback));
  return read ? *read : *ReadWavelength(fallback);
}

std::string PointsText(const Wavelengths& points) {
  constexpr std::size_t kShownInFront = 3;
  std::string text = Counted(points.size(), "point");
  for (std::size_t i = 0; i < points.size(); ++i) {
    const bool is_last = i + 1 == points.size();
    if (i >= kShownInFront && !is_last) {
      continue;
    }
    text += i == 0 ? " at " : is_last && i > kShownInFront ? " ... " : ", ";
    text += std::to_string(static_cast<std::int32_t>(points[i]));  // as the file had it
  }
  return points.empty() ? text : text + " nm";
}

}  // namespace

std::optional<std::int16_t> ReadWavelength(const std::string& text) {
  // The common form without a stream; samples in great numbers are asked for theirs.
  std::int16_t wavelength = 0;
  const char* const end = text.data() + text.size();
  const auto [stopped, error] = std::from_chars(text.data(), end, wavelength);
  if (error == std::errc() && (stopped == end || *stopped == 'n')) {
    return wavelength;
  }
  try {
    return Utilities::Tools::lexical_cast<std::int16_t>(text);
  } catch (const std::invalid_argument&) {
    return std::nullopt;
  }
}

bool IsWavelengthMisread(const std::string& text) {
  return ReadWavelength(text) && SaysOtherThanItsNumber(text);
}

bool SaysOtherThanItsNumber(const std::string& text) {
  const std::size_t digits = text.find_first_of(kDigits);
  const std::size_t point = text.find_first_not_of(kDigits, digits);
  const bool has_part =
      point != std::string::npos && text[point] == '.' &&
      text.find_first_of("123456789", point) < text.find_first_not_of(kDigits, point + 1);
  return has_part || !IsInNanometres(text);
}

bool IsInNanometres(const std::string& text) {
  const std::size_t digits = text.find_first_of(kDigits);
  std::size_t unit = text.find_first_not_of(kDigits, digits);
  if (unit != std::string::npos && text[unit] == '.') {
    unit = text.find_first_not_of(kDigits, unit + 1);
  }
  unit = unit == std::string::npos ? unit : text.find_first_not_of(kBlanks, unit);
  return unit == std::string::npos ||
         text.substr(unit, text.find_last_not_of(kBlanks) + 1 - unit) == "nm";
}

bool AreOfConditions(const Wavelengths& points, const Conditions& conditions) {
  const WavelengthSteps steps(RangeEnd(conditions, ConditionKeys::kWavelengthMin, kDefaultMin),
                              RangeEnd(conditions, ConditionKeys::kWavelengthMax, kDefaultMax),
                              points.size());
  std::int64_t expected = steps.first;
  return std::all_of(points.begin(), points.end(), [&](unsigned int point) {
    const bool is_it = point == expected;
    expected += steps.step;
    return is_it;
  });
}

bool AreOfIllumination(const Wavelengths& points, const Conditions& conditions) {
  return AreOfConditions(points, CustomIlluminationConditions()) ||
         AreOfConditions(points, conditions);
}

bool AreRegular(const Wavelengths& points) {
  if (points.empty() || points.back() > std::numeric_limits<std::int16_t>::max()) {
    return false;
  }
  for (std::size_t i = 2; i < points.size(); ++i) {
    if (points[i] - points[i - 1] != points[1] - points[0]) {
      return false;
    }
  }
  return true;
}

void TakeRange(const Wavelengths& points, Conditions& conditions) {
  conditions.AddAttribute(ConditionKeys::kWavelengthMin, std::to_string(points.front()) + "nm");
  conditions.AddAttribute(ConditionKeys::kWavelengthMax, std::to_string(points.back()) + "nm");
  conditions.AddAttribute(ConditionKeys::kPointCount, std::to_string(points.size()));
}

std::string ContradictionText(const Wavelengths& points, const Conditions& conditions) {
  const auto told = [&](const char* key, const char* fallback) {
    return conditions.HasAttribute(key) ? Quoted(conditions.GetAttribute(key))
                                        : std::string(fallback) + " (not named)";
  };
  std::string text = PointsText(points) + ", but the conditions say ";
  if (const std::string count = conditions.GetAttribute(ConditionKeys::kPointCount, "");
      !count.empty() && count != std::to_string(points.size())) {
    text += count + " ";
  }
  return text + "from " + told(ConditionKeys::kWavelengthMin, kDefaultMin) + " to " +
         told(ConditionKeys::kWavelengthMax, kDefaultMax);
}

}  // namespace Aldermoor::Vexdoc::Internals
