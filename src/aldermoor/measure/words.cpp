#include "aldermoor/measure/words.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <numeric>
#include <optional>
#include <system_error>
#include <vector>

#include "aldermoor/measure/measureexception.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Measure {
namespace {

namespace Vocabulary = Tristim::Vocabulary;
using Words = std::span<const std::string_view>;
using List = std::string_view[];

constexpr List kIlluminations = {"A",  "B",  "C",   "D50", "D55", "D65",      "D75",
                                 "F1", "F2", "F3",  "F4",  "F5",  "F6",       "F7",
                                 "F8", "F9", "F10", "F11", "F12", "Emission", "Userdefined"};
constexpr List kObservers = {"TwoDegree", "TenDegree"};
constexpr List kWhiteBases = {"Absolute", "Paper", "Automatic"};
constexpr List kDensityStandards = {"DIN",   "DINNB", "ANSIA", "ANSIE",
                                    "ANSII", "ANSIT", "SPI",   "User"};
constexpr List kDensityFilterModes = {"Black", "Cyan", "Magenta", "Yellow", "Max", "Auto"};
constexpr List kFilters = {"No",     "Polarizer",        "UVCut", "D65", "LastSelectable",
                           "Custom", "CalibrationCheck", "ND0"};
constexpr List kSpectrumTypes = {"Remission", "Emission", "Transmission", "AmbientLight", "Flash"};
constexpr List kNumbersOfDataPoints = {Vocabulary::kNumberOfDataPoints};
constexpr List kWavelengthsMin = {Vocabulary::kWavelengthMin};
constexpr List kWavelengthsMax = {Vocabulary::kWavelengthMax};
constexpr List kCustom = {Vocabulary::kEnable, "Disable"};

// Without the end mark, which is no word to be shown.
template <class Array>
constexpr Words Shown(const Array& list) {
  return Words(list).first(list.size() - 1);
}

struct Entry {
  std::string_view key;
  Words words;
};

constexpr Entry kEntries[] = {
    {Vocabulary::kColorSpaceKey, Shown(Vocabulary::kColorSpaces)},
    {Vocabulary::kVectorKindKey, Shown(Vocabulary::kVectorKinds)},
    {Vocabulary::kDeltaEFormulaKey, Shown(Vocabulary::kDeltaEFormulas)},
    {Vocabulary::kIlluminationKey, kIlluminations},
    {Vocabulary::kObserverKey, kObservers},
    {Vocabulary::kWhiteBaseKey, kWhiteBases},
    {Vocabulary::kDensityStandardKey, kDensityStandards},
    {Vocabulary::kDensityFilterModeKey, kDensityFilterModes},
    {Vocabulary::kFilterKey, kFilters},
    {Vocabulary::kSpectrumTypeKey, kSpectrumTypes},
    {Vocabulary::kNumberOfDataPointsKey, kNumbersOfDataPoints},
    {Vocabulary::kWavelengthMinKey, kWavelengthsMin},
    {Vocabulary::kWavelengthMaxKey, kWavelengthsMax},
    {Vocabulary::kCustomConditionKey, kCustom},
};

constexpr auto kKeys = [] {
  std::array<std::string_view, std::size(kEntries)> keys;
  std::ranges::transform(kEntries, keys.begin(), &Entry::key);
  return keys;
}();

constexpr List kOtherIlluminations = {"a daylight such as \"Dxx, Temperature:6500\""};

bool IsOneOf(std::string_view word, Words words) {
  return std::ranges::find(words, word) != words.end();
}

/// Words are ASCII; no locale has a say.
std::string Lowered(std::string_view text) {
  std::string lowered(text);
  std::ranges::transform(lowered, lowered.begin(), [](char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
  });
  return lowered;
}

/// How many characters have to be changed, put in or left out.
std::size_t EditsBetween(std::string_view from, std::string_view to) {
  std::vector<std::size_t> row(to.size() + 1);
  std::iota(row.begin(), row.end(), std::size_t{0});
  for (std::size_t i = 0; i < from.size(); ++i) {
    std::size_t diagonal = row[0];
    row[0] = i + 1;
    for (std::size_t k = 0; k < to.size(); ++k) {
      const std::size_t changed = diagonal + (from[i] == to[k] ? 0 : 1);
      diagonal = row[k + 1];
      row[k + 1] = std::min({changed, row[k] + 1, diagonal + 1});
    }
  }
  return row.back();
}

bool IsPart(std::string_view one, std::string_view other) {
  constexpr std::size_t kLeast = 2;  // characters; a shorter part is one of anything
  return one.size() < other.size()
             ? one.size() >= kLeast && other.find(one) != std::string_view::npos
             : other.size() >= kLeast && one.find(other) != std::string_view::npos;
}

/// How far `word` is from `candidate`; nothing if it is not near.  A part comes behind all that
/// differ by a few characters, and one in another case behind that.
std::optional<std::size_t> Farness(std::string_view word, std::string_view candidate) {
  constexpr std::size_t kPart = 100;
  constexpr std::size_t kPartInOtherCase = 200;
  const std::string lowered = Lowered(word);
  const std::string other = Lowered(candidate);
  const std::size_t edits = EditsBetween(lowered, other);
  if (edits <= std::max(word.size(), candidate.size()) / 3) {
    return edits;
  }
  if (IsPart(word, candidate)) {
    return kPart + edits;
  }
  return IsPart(lowered, other) ? std::optional(kPartInOtherCase + edits) : std::nullopt;
}

void Append(Words words, std::string& text) {
  for (const std::string_view word : words) {
    text.append(text.ends_with(' ') ? "" : ", ").append(word);
  }
}

template <class Number>
std::optional<Number> WholeNumber(std::string_view text) {
  Number number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool is_whole = error == std::errc() && end == text.data() + text.size();
  return is_whole ? std::optional(number) : std::nullopt;
}

// The forms beside the list: a daylight, and a fluorescent lamp that is written with blanks behind
// its number.
bool IsIllumination(std::string_view word) {
  constexpr std::string_view kDaylight = Vocabulary::kDaylightPrefix;
  if (word.starts_with(kDaylight)) {
    // As wide as temperatures are kept.
    return WholeNumber<std::int16_t>(word.substr(kDaylight.size())).value_or(0) > 0;
  }
  const std::size_t length = word.find_last_not_of(' ') + 1;
  return word.starts_with('F') && IsOneOf(word.substr(0, length), kIlluminations);
}

}  // namespace

std::span<const std::string_view> WordKeys() {
  return kKeys;
}

std::span<const std::string_view> WordsOf(std::string_view key) {
  const auto* const found = std::ranges::find(kEntries, key, &Entry::key);
  return found == std::end(kEntries) ? Words() : found->words;
}

std::string_view NearestWord(std::string_view word, std::span<const std::string_view> words) try {
  std::string_view nearest;
  std::optional<std::size_t> least;
  for (const std::string_view candidate : words) {
    const auto farness = Farness(word, candidate);
    if (farness && (!least || *farness < *least)) {
      least = farness;
      nearest = candidate;
    }
  }
  return nearest;
}
ALDERMOOR_FRAME(Aldermoor::Measure::NearestWord)

std::string NoSuchWord(std::string_view what, std::string_view word,
                       std::span<const std::string_view> words,
                       std::span<const std::string_view> others) try {
  std::string text(what);
  text.append(": '").append(word).append("' is not one of ");
  Append(words, text);
  Append(others, text);
  const std::string_view nearest = NearestWord(word, words);
  if (!nearest.empty()) {
    text.append("; did you mean '").append(nearest).append("'?");
  }
  return text;
}
ALDERMOOR_FRAME(Aldermoor::Measure::NoSuchWord)

bool IsWordOf(std::string_view key, std::string_view word) {
  const Words words = WordsOf(key);
  return words.empty() || word == Vocabulary::kUndefined || key == Vocabulary::kSpectrumTypeKey ||
         IsOneOf(word, words) || (key == Vocabulary::kIlluminationKey && IsIllumination(word));
}

void CheckWord(std::string_view key, std::string_view word) try {
  if (!IsWordOf(key, word)) {
    const Words others = key == Vocabulary::kIlluminationKey ? Words(kOtherIlluminations) : Words();
    throw MeasureException(NoSuchWord(key, word, WordsOf(key), others),
                           ALDERMOOR_HERE(Aldermoor::Measure::CheckWord));
  }
}
ALDERMOOR_FRAME(Aldermoor::Measure::CheckWord)

}  // namespace Aldermoor::Measure
