#include "aldermoor/tristim/internals/initialisator.h"

#include <algorithm>

#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

namespace Words = Vocabulary;
using List = std::string_view[];

struct Entry {
  std::string_view key;
  std::span<const std::string_view> words;
};

constexpr List kIlluminations = {"A",   "B",   "C", "D50",         "D55",      "D65",
                                 "D75", "Dxx", "F", "Userdefined", "Emission", "Undefined"};
constexpr List kObservers = {"TwoDegree", "TenDegree", "Undefined"};
constexpr List kWhiteBases = {"Absolute", "Paper", "Automatic", "Undefined"};
constexpr List kDensityStandards = {"DIN", "DINNB", "ANSIA", "ANSIT", "SPI", "User", "Undefined"};
constexpr List kDensityFilterModes = {"Black", "Cyan", "Magenta",  "Yellow",
                                      "Max",   "Auto", "Undefined"};
constexpr List kFilters = {"No",     "Polarizer",        "UVCut", "D65",
                           "Custom", "CalibrationCheck", "ND0",   "Undefined"};
constexpr List kSpectrumTypes = {"Remission",    "Emission", "Transmission",
                                 "AmbientLight", "Flash",    "Undefined"};
constexpr List kNumbersOfDataPoints = {Words::kNumberOfDataPoints, "Undefined"};
constexpr List kWavelengthsMax = {Words::kWavelengthMax, "Undefined"};
constexpr List kWavelengthsMin = {Words::kWavelengthMin, "Undefined"};

constexpr Entry kEntries[] = {
    {Words::kIlluminationKey, kIlluminations},
    {Words::kObserverKey, kObservers},
    {Words::kWhiteBaseKey, kWhiteBases},
    {Words::kDensityStandardKey, kDensityStandards},
    {Words::kDensityFilterModeKey, kDensityFilterModes},
    {Words::kColorSpaceKey, Words::kColorSpaces},
    {Words::kDeltaEFormulaKey, Words::kDeltaEFormulas},
    {Words::kFilterKey, kFilters},
    {Words::kSpectrumTypeKey, kSpectrumTypes},
    {Words::kNumberOfDataPointsKey, kNumbersOfDataPoints},
    {Words::kWavelengthMaxKey, kWavelengthsMax},
    {Words::kWavelengthMinKey, kWavelengthsMin},
    {Words::kVectorKindKey, Words::kVectorKinds},
};

constexpr List kLab = {"L*", "a*", "b*", "delta L*", "delta a*", "delta b*", "Undefined"};
constexpr List kLCh = {"L*", "C*", "h*", "delta L*", "delta C*", "delta H*", "Undefined"};
constexpr List kLuv = {"L", "u*", "v*", "delta L", "delta u*", "delta v*", "Undefined"};
constexpr List kLChuv = {"L", "C", "h", "delta L", "delta C", "delta H", "Undefined"};
constexpr List kUvY1960 = {"u' 1960",       "v' 1960",      "Y 1960",   "delta u' 1960",
                           "delta v' 1960", "delta L 1960", "Undefined"};
constexpr List kUvY1976 = {"u' 1976",       "v' 1976",      "Y 1976",   "delta u' 1976",
                           "delta v' 1976", "delta L 1976", "Undefined"};
constexpr List kXYZ = {"X", "Y", "Z", "delta X", "delta Y", "delta Z", "Undefined"};
constexpr List kXyY = {"x", "y", "Y", "delta x", "delta y", "delta Y", "Undefined"};
constexpr List kHunter = {"L(l)",       "a(l)",       "b(l)",     "delta L(l)",
                          "delta a(l)", "delta b(l)", "Undefined"};
constexpr List kRxyz = {"Rx", "Ry", "Rz", "delta Rx", "delta Ry", "delta Rz", "Undefined"};
constexpr List kLabHx = {"L(hx)",       "a(hx)",       "b(hx)",    "delta L(hx)",
                         "delta a(hx)", "delta b(hx)", "Undefined"};
constexpr List kLChHx = {"L(hx)",       "C(hx)",       "h(hx)",    "delta L(hx)",
                         "delta C(hx)", "delta H(hx)", "Undefined"};
constexpr List kRgb = {"R", "G", "B", "delta R", "delta G", "delta B", "Undefined"};
constexpr List kCmyk = {"C",       "M",       "Y",       "K",        "delta C",
                        "delta M", "delta Y", "delta K", "Undefined"};

constexpr Entry kLabels[] = {
    {Words::kCIELab, kLab},     {Words::kCIELCh, kLCh},         {Words::kCIELuv, kLuv},
    {Words::kCIELChuv, kLChuv}, {Words::kCIEuvY1960, kUvY1960}, {Words::kCIEuvY1976, kUvY1976},
    {Words::kCIEXYZ, kXYZ},     {Words::kCIExyY, kXyY},         {Words::kHunterLab, kHunter},
    {Words::kRxRyRz, kRxyz},    {Words::kLABhx, kLabHx},        {Words::kLCHhx, kLChHx},
    {Words::kRGB, kRgb},        {Words::kCMYK, kCmyk},
};

}  // namespace

Initialisator& Initialisator::Get() {
  static NeverDestroyed<Initialisator> instance;
  return instance.Get();
}

Initialisator::Initialisator() try {
  for (const Entry& entry : kEntries) {
    AddType(entry.key, entry.words);
  }
  for (const Entry& labels : kLabels) {
    AddType(Words::kChannelLabelsPrefix + std::string(labels.key), labels.words);
  }
  DensityCalculator::InitializeDensityCalibration();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Initialisator::Initialisator)

void Initialisator::AddType(std::string_view key, std::span<const std::string_view> words) try {
  const auto end = std::find(words.begin(), words.end(), std::string_view(Words::kUndefined));
  supported_values_.emplace(std::string(key), std::vector<std::string>(words.begin(), end));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Initialisator::AddType)

const std::vector<std::string>& Initialisator::GetSupportedValues(std::string_view key) const {
  const auto found = supported_values_.find(key);
  return found != supported_values_.end() ? found->second : none_;
}

}  // namespace Aldermoor::Tristim::Internals
