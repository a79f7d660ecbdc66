#include "vocabulary.h"

#include <algorithm>
#include <charconv>
#include <limits>
#include <optional>
#include <system_error>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/measure/words.h"

#include "diagnostics.h"
#include "exitstatus.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::string_view kDaylight = "Dxx, Temperature:";

// The number in `text`, if it is nothing else.
std::optional<long long> Number(std::string_view text) {
  long long number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (end != text.data() + text.size() || error == std::errc::invalid_argument) {
    return std::nullopt;
  }
  return error == std::errc() ? number : std::numeric_limits<long long>::max();
}

// The temperature of a word of one of the two daylight forms.
std::optional<long long> Temperature(std::string_view word) {
  if (word.starts_with(kDaylight)) {
    return Number(word.substr(kDaylight.size()));
  }
  if (word.ends_with('K')) {
    return Number(word.substr(0, word.size() - 1));
  }
  return std::nullopt;
}

}  // namespace

std::vector<std::string_view> SplitWords(std::string_view list) {
  std::vector<std::string_view> words;
  while (!list.empty()) {
    const std::size_t length = std::min(list.find(' '), list.size());
    words.push_back(list.substr(0, length));
    list.remove_prefix(std::min(length + 1, list.size()));
  }
  return words;
}

void CheckWord(const std::string& what, const std::string& word,
               const std::vector<std::string_view>& words,
               const std::vector<std::string_view>& others) {
  if (std::find(words.begin(), words.end(), word) == words.end()) {
    throw UsageError(Measure::NoSuchWord(what, word, words, others));
  }
}

std::vector<std::string_view> WordsFor(const std::string& key) {
  const auto all = Measure::WordsOf(key);
  std::vector<std::string_view> words(all.begin(), all.end());
  if (key == kIlluminationKey) {
    words.erase(std::find(words.begin(), words.end(), kUserdefined));
  }
  return words;
}

std::string ShownWords(const std::string& key) {
  return fmt::format("{}", fmt::join(WordsFor(key), " "));
}

std::vector<std::string_view> AllKeys() {
  const auto keys = Measure::WordKeys();
  return {keys.begin(), keys.end()};
}

std::string IlluminationValue(const std::string& what, const std::string& word) {
  const std::optional<long long> kelvin = Temperature(word);
  if (!kelvin) {
    CheckWord(what, word, WordsFor(kIlluminationKey),
              {"a daylight such as 6500K", "a spectrum as @FILE:SET/SAMPLE (with --illuminant)"});
    return word;
  }
  // The library keeps temperatures in 16 bits.
  if (*kelvin <= 0 || *kelvin > std::numeric_limits<short>::max()) {
    throw UsageError(
        fmt::format("{}: '{}' is no temperature of daylight, which is defined from {} "
                    "to {} K",
                    what, word, Measure::kColdestDaylight, Measure::kHottestDaylight));
  }
  if (*kelvin < Measure::kColdestDaylight || *kelvin > Measure::kHottestDaylight) {
    Report(fmt::format("warning: daylight is defined from {} to {} K; {} K is extrapolated",
                       Measure::kColdestDaylight, Measure::kHottestDaylight, *kelvin));
  }
  return fmt::format("{}{}", kDaylight, *kelvin);
}

std::string ConditionValue(const std::string& what, const std::string& key,
                           const std::string& value) {
  if (key == kIlluminationKey) {
    return IlluminationValue(what, value);
  }
  CheckWord(what, value, WordsFor(key));
  return value;
}

}  // namespace Aldermoor::Tool
