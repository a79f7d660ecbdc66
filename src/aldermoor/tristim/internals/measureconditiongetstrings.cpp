#include "aldermoor/tristim/internals/measureconditiongetstrings.h"

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <span>
#include <stdexcept>
#include <string_view>

#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/lexicalcast.h"

namespace Aldermoor::Tristim::Internals {
namespace {

namespace Words = Vocabulary;
namespace Type = IlluminationType;

constexpr char kNoWhiteBase[] = " is not a valid whitespacetype";
constexpr char kNoObserver[] = " is not a valid observertype";
constexpr char kNoIllumination[] = " is not a valid illuminationtype";
constexpr char kNoDensityStandard[] = " is not a valid density standard type";
constexpr char kNoDensityFilterMode[] = " is not a valid density filter mode";
constexpr char kNoPhysicalFilter[] = " is not a valid whitespacetype";  // as for the white base
constexpr char kNoVectorKind[] = " is not valid for absolute or relative vectors";
constexpr char kNoColorSpace[] = " is not a valid color space";
constexpr char kNoDeltaEFormula[] = " is not a valid delta E formula";

template <class Number>
struct Pair {
  std::string_view word;
  Number number;
};

constexpr Pair<WhiteBase> kWhiteBases[] = {{"Absolute", WhiteBase::Absolute},
                                           {"Paper", WhiteBase::Paper},
                                           {"Automatic", WhiteBase::Automatic},
                                           {"Undefined", WhiteBase::Undefined}};

constexpr Pair<Observer> kObservers[] = {{"TwoDegree", Observer::TwoDegree},
                                         {"TenDegree", Observer::TenDegree},
                                         {"Undefined", Observer::Undefined}};

constexpr Pair<DensityStandard> kDensityStandards[] = {{"DIN", DensityStandard::DIN},
                                                       {"DINNB", DensityStandard::DINNB},
                                                       {"ANSIA", DensityStandard::ANSIA},
                                                       {"ANSIE", DensityStandard::ANSIE},
                                                       {"ANSII", DensityStandard::ANSII},
                                                       {"ANSIT", DensityStandard::ANSIT},
                                                       {"SPI", DensityStandard::SPI},
                                                       {"User", DensityStandard::User},
                                                       {"Undefined", DensityStandard::Undefined}};

constexpr Pair<DensityFilterMode> kDensityFilterModes[] = {
    {"Black", DensityFilterMode::Black},
    {"Cyan", DensityFilterMode::Cyan},
    {"Magenta", DensityFilterMode::Magenta},
    {"Yellow", DensityFilterMode::Yellow},
    {"Max", DensityFilterMode::Max},
    {"Auto", DensityFilterMode::Auto},
    {"Undefined", DensityFilterMode::Undefined}};

constexpr Pair<PhysicalFilter> kPhysicalFilters[] = {
    {"No", PhysicalFilter::No},
    {"Polarizer", PhysicalFilter::Polarizer},
    {"D65", PhysicalFilter::D65},
    {"UVCut", PhysicalFilter::UVCut},
    {"LastSelectable", PhysicalFilter::LastSelectable},
    {"Custom", PhysicalFilter::Custom},
    {"CalibrationCheck", PhysicalFilter::CalibrationCheck},
    {"ND0", PhysicalFilter::ND0},
    {"Undefined", PhysicalFilter::Undefined}};

// Words that stand before the forms with a number, and those behind them: "F2" is a word of its
// own and no F with the number 2.
constexpr Pair<int> kIlluminations[] = {{"A", Type::kA},
                                        {"B", Type::kB},
                                        {"C", Type::kC},
                                        {"D75", Type::kD75},
                                        {"D65", Type::kD65},
                                        {"D55", Type::kD55},
                                        {"D50", Type::kD50},
                                        {"F2", Type::kF2},
                                        {"F7", Type::kF7},
                                        {"F11", Type::kF11},
                                        {Words::kUndefined, Type::kUndefined},
                                        {Words::kUserdefined, Type::kUserdefined},
                                        {Words::kEmission, Type::kEmission}};

template <class Number, std::size_t kSize>
const Pair<Number>* Find(const Pair<Number> (&table)[kSize], std::string_view word) {
  const auto* const found = std::find_if(std::begin(table), std::end(table),
                                         [word](const auto& pair) { return pair.word == word; });
  return found == std::end(table) ? nullptr : found;
}

template <class Number, std::size_t kSize>
std::string WordOf(const Pair<Number> (&table)[kSize], Number number) {
  const auto* const found = std::find_if(std::begin(table), std::end(table),
                                         [number](const auto& p) { return p.number == number; });
  return std::string(found == std::end(table) ? Words::kUndefined : found->word);
}

bool IsListed(std::span<const std::string_view> list, std::string_view word) {
  return std::find(list.begin(), list.end(), word) != list.end();
}

std::int16_t NumberAt(const std::string& word, std::size_t position) {
  return Utilities::Tools::lexical_cast<std::int16_t>(word.substr(position));
}

}  // namespace

WhiteBase MeasureConditionTranslator::GetWhiteBase(const std::string& value) try {
  if (const auto* const pair = Find(kWhiteBases, value)) {
    return pair->number;
  }
  throw TristimException(
      value + kNoWhiteBase,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetWhiteBase));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetWhiteBase)

Observer MeasureConditionTranslator::GetObserver(const std::string& value) try {
  if (const auto* const pair = Find(kObservers, value)) {
    return pair->number;
  }
  throw TristimException(
      value + kNoObserver,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetObserver));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetObserver)

DensityStandard MeasureConditionTranslator::GetDensityStandard(const std::string& value) try {
  if (const auto* const pair = Find(kDensityStandards, value)) {
    return pair->number;
  }
  throw TristimException(
      value + kNoDensityStandard,
      ALDERMOOR_HERE(
          Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDensityStandard));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDensityStandard)

DensityFilterMode MeasureConditionTranslator::GetDensityFilterMode(const std::string& value) try {
  if (const auto* const pair = Find(kDensityFilterModes, value)) {
    return pair->number;
  }
  throw TristimException(
      value + kNoDensityFilterMode,
      ALDERMOOR_HERE(
          Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDensityFilterMode));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDensityFilterMode)

PhysicalFilter MeasureConditionTranslator::GetPhysicalFilter(const std::string& value) try {
  if (const auto* const pair = Find(kPhysicalFilters, value)) {
    return pair->number;
  }
  throw TristimException(
      value + kNoPhysicalFilter,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetPhysicalFilter));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetPhysicalFilter)

HXIllumination MeasureConditionTranslator::GetIllumination(const std::string& value) try {
  if (const auto* const pair = Find(kIlluminations, value)) {
    return HXIllumination(pair->number);
  }
  if (value.starts_with('F')) {
    HXIllumination illumination(Type::kFluorescent);
    illumination.SetFluorescence(static_cast<std::uint8_t>(NumberAt(value, 1)));
    return illumination;
  }
  if (value.starts_with('D')) {
    if (value.size() < std::size(Words::kDaylightPrefix) - 1) {
      throw std::out_of_range(value + " is no illumination and too short for a daylight");
    }
    HXIllumination illumination(Type::kDaylight);
    illumination.SetColorTemperature(NumberAt(value, std::size(Words::kDaylightPrefix) - 1));
    return illumination;
  }
  throw TristimException(
      value + kNoIllumination,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetIllumination));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetIllumination)

const std::string& MeasureConditionTranslator::GetRelativeOrAbsoluteVector(
    const std::string& value) try {
  if (IsListed(Words::kVectorKinds, value)) {
    return value;
  }
  throw TristimException(
      value + kNoVectorKind,
      ALDERMOOR_HERE(
          Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetRelativeOrAbsoluteVector));
}
ALDERMOOR_FRAME(
    Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetRelativeOrAbsoluteVector)

const std::string& MeasureConditionTranslator::GetColorSpace(const std::string& value) try {
  if (IsListed(Words::kColorSpaces, value)) {
    return value;
  }
  throw TristimException(
      value + kNoColorSpace,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetColorSpace));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetColorSpace)

const std::string& MeasureConditionTranslator::GetDeltaEFormula(const std::string& value) try {
  if (IsListed(Words::kDeltaEFormulas, value)) {
    return value;
  }
  throw TristimException(
      value + kNoDeltaEFormula,
      ALDERMOOR_HERE(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDeltaEFormula));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetDeltaEFormula)

std::string MeasureConditionTranslator::ToString(WhiteBase value) {
  return WordOf(kWhiteBases, value);
}

std::string MeasureConditionTranslator::ToString(Observer value) {
  return WordOf(kObservers, value);
}

std::string MeasureConditionTranslator::ToString(DensityStandard value) {
  return WordOf(kDensityStandards, value);
}

std::string MeasureConditionTranslator::ToString(DensityFilterMode value) {
  return WordOf(kDensityFilterModes, value);
}

std::string MeasureConditionTranslator::ToString(PhysicalFilter value) {
  return WordOf(kPhysicalFilters, value);
}

std::string MeasureConditionTranslator::ToString(const HXIllumination& value) try {
  switch (value.GetIlluminationType()) {
    case Type::kDaylight:
      return std::string(Words::kDaylightPrefix)
          .append(std::to_string(value.GetColorTemperature()));
    case Type::kFluorescent:
      return std::string("F").append(std::to_string(value.GetFluorescence()));
    default:
      return WordOf(kIlluminations, value.GetIlluminationType());
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::MeasureConditionTranslator::ToString)

}  // namespace Aldermoor::Tristim::Internals
