#include "vocabulary.h"

#include <algorithm>
#include <charconv>
#include <iterator>
#include <limits>
#include <system_error>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "diagnostics.h"
#include "exitstatus.h"

namespace Aldermoor::Tool {
namespace {

struct Entry {
  std::string_view key;
  std::string_view words;
};

constexpr Entry kVocabulary[] = {
    {"ColorSpaceDescription.Type",
     "CIELab CIELCh CIELuv CIELChuv CIEuvY1960 CIEuvY1976 CIEXYZ CIExyY HunterLab RxRyRz LABhx "
     "LCHhx RGB CMYK"},
    {"ColorSpaceDescription.AbsoluteOrDeltaVector", "AbsoluteVector DeltaVector"},
    {"ColorSpaceDescription.DeltaEFormula", "CIELab CIELuv LABhx FMCII CMC 94 2000"},
    {"Colorimetric.Illumination",
     "A B C D50 D55 D65 D75 F1 F2 F3 F4 F5 F6 F7 F8 F9 F10 F11 F12 Emission"},
    {"Colorimetric.Observer", "TwoDegree TenDegree"},
    {"Colorimetric.WhiteBase", "Absolute Paper Automatic"},
    {"Colorimetric.DensityStandard", "DIN DINNB ANSIA ANSIE ANSII ANSIT SPI User"},
    {"Colorimetric.DensityFilterMode", "Black Cyan Magenta Yellow Max Auto"},
    {"Physical.Filter", "No Polarizer UVCut D65 LastSelectable Custom CalibrationCheck ND0"},
    {"Physical.SpectrumType", "Remission Emission Transmission AmbientLight Flash"},
    {"Physical.NumberOfDataPointsSpectrum", "36"},
    {"Physical.WavelengthSpectrumMin", "380nm"},
    {"Physical.WavelengthSpectrumMax", "730nm"},
    {"CustomCondition", "Enable Disable"},
};

constexpr std::string_view kDaylight = "Dxx, Temperature:";

// CIE daylight is defined in this range, kelvin.  Source: CIE 15:2004, 3.1.
constexpr int kColdestDaylight = 4000;
constexpr int kHottestDaylight = 25000;

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
               const std::vector<std::string_view>& words) {
  if (std::find(words.begin(), words.end(), word) == words.end()) {
    throw UsageError(fmt::format("{}: '{}' is not one of {}", what, word, fmt::join(words, ", ")));
  }
}

std::optional<std::string_view> WordsFor(const std::string& key) {
  const auto* const found = std::find_if(std::begin(kVocabulary), std::end(kVocabulary),
                                         [&key](const Entry& entry) { return entry.key == key; });
  if (found == std::end(kVocabulary)) {
    return std::nullopt;
  }
  return found->words;
}

std::vector<std::string_view> AllKeys() {
  std::vector<std::string_view> keys;
  std::transform(std::begin(kVocabulary), std::end(kVocabulary), std::back_inserter(keys),
                 [](const Entry& entry) { return entry.key; });
  return keys;
}

std::string IlluminationValue(const std::string& what, const std::string& word) {
  const std::optional<long long> kelvin = Temperature(word);
  if (!kelvin) {
    std::vector<std::string_view> words = SplitWords(*WordsFor(kIlluminationKey));
    if (std::find(words.begin(), words.end(), word) == words.end()) {
      words.emplace_back("a daylight such as 6500K");
      words.emplace_back("a spectrum as @FILE:SET/SAMPLE (with --illuminant)");
    }
    CheckWord(what, word, words);
    return word;
  }
  // The library keeps temperatures in 16 bits.
  if (*kelvin <= 0 || *kelvin > std::numeric_limits<short>::max()) {
    throw UsageError(
        fmt::format("{}: '{}' is no temperature of daylight, which is defined from {} "
                    "to {} K",
                    what, word, kColdestDaylight, kHottestDaylight));
  }
  if (*kelvin < kColdestDaylight || *kelvin > kHottestDaylight) {
    Report(fmt::format("warning: daylight is defined from {} to {} K; {} K is extrapolated",
                       kColdestDaylight, kHottestDaylight, *kelvin));
  }
  return fmt::format("{}{}", kDaylight, *kelvin);
}

std::string ConditionValue(const std::string& what, const std::string& key,
                           const std::string& value) {
  if (key == kIlluminationKey) {
    return IlluminationValue(what, value);
  }
  CheckWord(what, value, SplitWords(*WordsFor(key)));
  return value;
}

}  // namespace Aldermoor::Tool
